#include "platform/glib/look/FaceLook.h"

#include <algorithm>

#include "platform/glib/Painter.h"

namespace Glib {

void FaceLook::raised(Painter& p, const Kw::Box<int>& box, const Colour& face) const {
  p.depthBox(box, Bevel::Raised, 1, mix(face, palette_.get(Palette::Light), kEdgeLight),
             palette_.get(Palette::Shadow), face);
}

void FaceLook::sunken(Painter& p, const Kw::Box<int>& box, const Colour& face) const {
  p.depthBox(box, Bevel::Sunken, 1, mix(face, palette_.get(Palette::Light), kEdgeLight),
             palette_.get(Palette::Shadow), face);
}

void FaceLook::lamp(Painter& p, XY<int> centre, const Colour& c) const {
  const Kw::Box<int> box(centre.x - 4, centre.y - 4, centre.x + 4, centre.y + 4);
  p.depthBox(box, Bevel::Sunken, 1, mix(c, palette_.get(Palette::Light), 0.5),
             palette_.get(Palette::Shadow), c);
}

void FaceLook::headerStrip(Painter& p, const Kw::Box<int>& box) const {
  p.verticalGradient(box, palette_.windowShade(2), palette_.get(Palette::Window));
  p.fillRect(Kw::Box<int>(box.x0, box.y0, box.x1, box.y0 + 1), palette_.get(Palette::Border));
}

void FaceLook::focusRing(Painter& p, const Kw::Box<int>& box, const Colour& c) {
  p.outlineRect(Kw::Box<int>(box.x0 + 2, box.y0 + 2, box.x1 - 2, box.y1 - 2), c, 2);
}

void FaceLook::meter(Painter& p, const Kw::Box<int>& box, int count, int lit, const Colour& low,
                     const Colour& high) const {
  sunken(p, box, palette_.get(Palette::Base));
  if (count <= 0) return;
  const int segment = std::max(1, (box.width() - 4) / count);
  for (int i = 0; i < count; ++i) {
    const Kw::Box<int> seg(box.x0 + 2 + i * segment + 1, box.y0 + 3,
                           box.x0 + 2 + (i + 1) * segment - 1, box.y1 - 3);
    p.fillRect(seg, i < lit ? mix(low, high, double(i) / count) : palette_.windowShade(2));
  }
}

}  // namespace Glib
