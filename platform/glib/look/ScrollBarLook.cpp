#include "platform/glib/look/ScrollBarLook.h"

#include "platform/glib/Painter.h"

namespace Glib {

Colour ScrollBarLook::thumbFace(const Colour& thumb, bool held, bool active) const {
  if (!active) return mix(thumb, palette_.get(Palette::Base), kInactiveSink);
  return held ? scale(thumb, kHeldDarken) : thumb;
}

void ScrollBarLook::trough(Painter& p, const Kw::Box<int>& box, bool active) const {
  const Colour window = palette_.get(Palette::Window);
  Colour well = palette_.windowShade(1);
  Colour shadow = palette_.get(Palette::Shadow);
  if (!active) {
    well = mix(well, window, kInactiveTroughFade);
    shadow = mix(shadow, window, kInactiveTroughFade);
  }
  p.depthBox(box, Bevel::Sunken, 1, mix(well, palette_.get(Palette::Light), kEdgeLight * 0.5),
             shadow, well);
}

void ScrollBarLook::thumb(Painter& p, const Kw::Box<int>& box, const Colour& colour, bool vertical,
                          bool held, int handle, bool active) const {
  if (box.empty()) return;
  const Colour face = thumbFace(colour, held, active);
  const Colour light = mix(face, palette_.get(Palette::Light), kEdgeLight);
  const Colour shadow = palette_.get(Palette::Shadow);
  p.depthBox(box, held ? Bevel::Sunken : Bevel::Raised, 1, light, shadow, face);

  // Grip lines across the middle, and a line across each handle's inner edge.
  const Colour grip = mix(face, shadow, 0.7);
  const int midX = (box.x0 + box.x1) / 2, midY = (box.y0 + box.y1) / 2;
  const int span = (kGripLines - 1) * kGripGap;
  for (int i = 0; i < kGripLines; ++i) {
    const int o = i * kGripGap - span / 2;
    if (vertical) {
      p.fillRect(Kw::Box<int>(box.x0 + 4, midY + o, box.x1 - 4, midY + o + 1), grip);
    } else {
      p.fillRect(Kw::Box<int>(midX + o, box.y0 + 4, midX + o + 1, box.y1 - 4), grip);
    }
  }
  if (handle <= 0) return;
  if (vertical) {
    p.fillRect(Kw::Box<int>(box.x0 + 2, box.y1 - handle, box.x1 - 2, box.y1 - handle + 1), grip);
    p.fillRect(Kw::Box<int>(box.x0 + 2, box.y0 + handle - 1, box.x1 - 2, box.y0 + handle), grip);
  } else {
    p.fillRect(Kw::Box<int>(box.x0 + handle - 1, box.y0 + 2, box.x0 + handle, box.y1 - 2), grip);
    p.fillRect(Kw::Box<int>(box.x1 - handle, box.y0 + 2, box.x1 - handle + 1, box.y1 - 2), grip);
  }
}

}  // namespace Glib
