#include "platform/glib/look/ValueBoxLook.h"

#include <algorithm>

#include "platform/glib/Painter.h"

namespace Glib {

Colour ValueBoxLook::thermometer() const {
  return mix(palette_.get(Palette::Base), palette_.get(Palette::Highlight), kThermometerStrength);
}

Colour ValueBoxLook::text(bool active) const {
  return palette_.get(active ? Palette::Text : Palette::Disabled);
}

void ValueBoxLook::well(Painter& p, const Kw::Box<int>& box, bool flat, bool active) const {
  const Colour base = palette_.get(active ? Palette::Base : Palette::Window);
  if (flat) {
    p.fillRect(box, base);
    p.outlineRect(box, palette_.get(Palette::Border));
    return;
  }
  p.depthBox(box, Bevel::Sunken, 1, mix(base, palette_.get(Palette::Light), kEdgeLight),
             palette_.get(Palette::Shadow), base);
}

void ValueBoxLook::thermometer(Painter& p, const Kw::Box<int>& inside, int width,
                               const Colour& colour, bool active) const {
  const int w = std::clamp(width, 0, inside.width());
  if (w == 0) return;
  const Colour c = active ? colour : mix(colour, palette_.get(Palette::Window), kInactiveFade);
  p.fillRect(Kw::Box<int>(inside.x0, inside.y0, inside.x0 + w, inside.y1), c);
}

void ValueBoxLook::grip(Painter& p, const Kw::Box<int>& box, bool dragging, bool active) const {
  const Colour ridge =
      !active    ? palette_.get(Palette::Disabled)
      : dragging ? palette_.get(Palette::Caret)
                 : mix(palette_.get(Palette::Base), palette_.get(Palette::Text), kRidgeStrength);
  const int cx = (box.x0 + box.x1) / 2;
  const int cy = (box.y0 + box.y1) / 2;
  for (int i = -1; i <= 1; ++i) {
    const int y = cy + i * kRidgeGap;
    p.fillRect(Kw::Box<int>(cx - kRidgeLength / 2, y, cx + kRidgeLength / 2, y + 1), ridge);
  }
}

void ValueBoxLook::focusOutline(Painter& p, const Kw::Box<int>& box) const {
  p.outlineRect(box, palette_.get(Palette::Focus));
}

}  // namespace Glib
