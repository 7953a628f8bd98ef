#include "platform/glob/BoxRegion.h"

bool BoxRegion::contains(XY<int> p) const {
  for (const auto& b : boxes_) {
    if (b.contains(p)) return true;
  }
  return false;
}

Kw::Box<int> BoxRegion::bounds() const {
  Kw::Box<int> r;
  for (const auto& b : boxes_) r = r.united(b);
  return r;
}

Kw::Ptr<iRegion> BoxRegion::translated(int dx, int dy) const {
  auto* moved = new BoxRegion;
  for (const auto& b : boxes_) moved->add(b.translated(dx, dy));
  return Kw::Ptr<iRegion>(moved);
}
