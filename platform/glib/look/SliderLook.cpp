#include "platform/glib/look/SliderLook.h"

#include "platform/glib/Painter.h"

namespace Glib {

Colour SliderLook::thumbFace(const Colour& thumb, bool hover, bool held, bool active) const {
  if (!active) return mix(thumb, palette_.get(Palette::Base), kInactiveSink);
  if (held) return scale(thumb, kHeldDarken);
  return hover ? scale(thumb, kHoverBrighten) : thumb;
}

void SliderLook::groove(Painter& p, const Kw::Box<int>& box, bool active) const {
  const Colour window = palette_.get(Palette::Window);
  Colour well = palette_.windowShade(1);
  Colour shadow = palette_.get(Palette::Shadow);
  Colour light = palette_.get(Palette::Light);
  if (!active) {
    well = mix(well, window, kInactiveGrooveFade);
    shadow = mix(shadow, window, kInactiveGrooveFade);
    light = mix(light, window, kInactiveGrooveFade);
  }
  p.depthBox(box, Bevel::Sunken, 1, mix(well, light, kEdgeLight), shadow, well);
}

void SliderLook::pointOfInterest(Painter& p, const Kw::Box<int>& box, bool active) const {
  p.fillRect(box, palette_.get(active ? Palette::Highlight : Palette::Disabled));
}

void SliderLook::thumb(Painter& p, const Kw::Box<int>& block, const Kw::Box<int>& needle,
                       const Colour& colour, bool hover, bool held, bool active) const {
  const Colour face = thumbFace(colour, hover, held, active);
  p.fillRect(needle, face);
  p.depthBox(block, held ? Bevel::Sunken : Bevel::Raised, 1,
             mix(face, palette_.get(Palette::Light), kEdgeLight), palette_.get(Palette::Shadow),
             face);
}

void SliderLook::focusMark(Painter& p, const Kw::Box<int>& box) const {
  p.focusRect(box, palette_.get(Palette::Focus));
}

}  // namespace Glib
