#include "platform/glob/DirtyRegion.h"

void DirtyRegion::add(const Kw::Box<int>& area) {
  if (area.empty()) return;
  Kw::Box<int> merged = area;
  // Absorb every rectangle the new area touches; repeat because the union may reach others.
  bool grew = true;
  while (grew) {
    grew = false;
    for (size_t i = 0; i < rects_.size();) {
      if (rects_[i].contains(merged)) return;
      if (rects_[i].intersects(merged)) {
        merged = merged.united(rects_[i]);
        rects_[i] = rects_.back();
        rects_.pop_back();
        grew = true;
      } else {
        ++i;
      }
    }
  }
  rects_.push_back(merged);
  if (rects_.size() > maxRects_) {
    const Kw::Box<int> all = bounds();
    rects_.assign(1, all);
  }
}

Kw::Box<int> DirtyRegion::bounds() const {
  Kw::Box<int> b;
  for (const auto& r : rects_) b = b.united(r);
  return b;
}

std::vector<Kw::Box<int>> DirtyRegion::take() {
  std::vector<Kw::Box<int>> out;
  out.swap(rects_);
  return out;
}
