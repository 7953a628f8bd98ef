#include "platform/glib/look/LabelLook.h"

#include "platform/glib/Painter.h"

namespace Glib {

Colour LabelLook::text(bool active) const {
  return palette_.get(active ? Palette::WindowText : Palette::Disabled);
}

Colour LabelLook::tabFace(const Colour& colour) const {
  return mix(colour, palette_.get(Palette::Highlight), kTabTint);
}

void LabelLook::background(Painter& p, const Kw::Box<int>& box, const Colour& colour) {
  p.fillRect(box, colour);
}

void LabelLook::text(Painter& p, const WString& s, const Kw::Box<int>& box, const iFont& font,
                     const Colour& colour, TextAlignment align) {
  if (s.empty() || box.empty()) return;
  p.text(s, box, font, colour, align);
}

void LabelLook::title(Painter& p, const WString& s, const Kw::Box<int>& box, const iFont& font,
                      bool active) const {
  text(p, s, box, font, this->text(active), TextAlignment::Left);
}

void LabelLook::titleTab(Painter& p, const WString& s, const Kw::Box<int>& box, const iFont& font,
                         const Colour& colour, bool active) const {
  if (box.empty()) return;
  p.fillRect(box, tabFace(colour));
  const Colour edge = palette_.get(Palette::Border);
  p.fillRect(Kw::Box<int>(box.x0, box.y0, box.x1, box.y0 + 1), edge);
  p.fillRect(Kw::Box<int>(box.x0, box.y1 - 1, box.x1, box.y1), edge);
  p.fillRect(Kw::Box<int>(box.x0, box.y0, box.x0 + 1, box.y1), edge);
  const Kw::Box<int> inner(box.x0 + kTabTextInset, box.y0 + 1, box.x1 - 2, box.y1 - 1);
  text(p, s, inner, font, this->text(active), TextAlignment::Left);
}

}  // namespace Glib
