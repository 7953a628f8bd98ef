#include "platform/glib/look/TextFieldLook.h"

#include "platform/glib/Painter.h"

namespace Glib {

Colour TextFieldLook::text(bool active) const {
  return palette_.get(active ? Palette::Text : Palette::Disabled);
}

void TextFieldLook::well(Painter& p, const Kw::Box<int>& box, bool active) const {
  const Colour well = palette_.get(active ? Palette::Base : Palette::Window);
  p.depthBox(box, Bevel::Sunken, 1, palette_.get(Palette::Light), palette_.get(Palette::Shadow),
             well);
}

void TextFieldLook::selection(Painter& p, const Kw::Box<int>& box, bool focused) const {
  p.fillRect(box, palette_.get(focused ? Palette::Highlight : Palette::Shadow));
}

void TextFieldLook::focusOutline(Painter& p, const Kw::Box<int>& box) const {
  p.outlineRect(box, palette_.get(Palette::Focus));
}

void TextFieldLook::caretBlock(Painter& p, const Colour& colour, bool block, wchar_t under,
                               const iFont& font, const Colour& inside) {
  p.fillRect(p.bounds(), colour);
  if (block && under != 0 && under != L' ')
    p.textAt(WString(1, under), XY<int>(0, 0), font, inside);
}

}  // namespace Glib
