#include "platform/glib/look/TableLook.h"

#include "platform/glib/Painter.h"

namespace Glib {

Colour TableLook::cellFace(const Colour& cell, int row, bool tagged) const {
  const Colour striped = row % 2 == 1 ? mix(cell, palette_.get(Palette::Window), kStripe) : cell;
  return tagged ? mix(striped, palette_.get(Palette::Highlight), kTagBlend) : striped;
}

Colour TableLook::cellText(bool tagged, bool readOnly, bool active) const {
  if (!active) return palette_.get(Palette::Disabled);
  const Colour text = palette_.get(tagged ? Palette::HighlightedText : Palette::Text);
  return readOnly ? mix(text, palette_.get(Palette::Disabled), kReadOnlyFade) : text;
}

void TableLook::well(Painter& p, const Kw::Box<int>& box, bool active) const {
  p.depthBox(box, Bevel::Sunken, 1, palette_.get(Palette::Light), palette_.get(Palette::Shadow),
             palette_.get(active ? Palette::Base : Palette::Window));
}

void TableLook::header(Painter& p, const Kw::Box<int>& box, const WString& name, const iFont& font,
                       TextAlignment align, bool active) const {
  const Colour face = palette_.get(Palette::Button);
  p.verticalGradient(box, face, mix(face, palette_.get(Palette::Light), kHeaderLight));
  p.fillRect(Kw::Box<int>(box.x0, box.y0, box.x1, box.y0 + 1), palette_.get(Palette::Shadow));
  p.fillRect(Kw::Box<int>(box.x1 - 1, box.y0, box.x1, box.y1), palette_.get(Palette::Shadow));
  const Kw::Box<int> text(box.x0 + 4, box.y0 + 1, box.x1 - 5, box.y1);
  p.text(name, text, font, palette_.get(active ? Palette::ButtonText : Palette::Disabled), align,
         TextStyles::Plain);
}

void TableLook::cell(Painter& p, const Kw::Box<int>& box, const Colour& face) const {
  p.fillRect(box, face);
}

void TableLook::columnLine(Painter& p, int x, int y0, int y1) const {
  p.fillRect(Kw::Box<int>(x, y0, x + 1, y1),
             mix(palette_.get(Palette::Base), palette_.get(Palette::Shadow), kLineBlend));
}

void TableLook::stickyEdge(Painter& p, int x, int y0, int y1) const {
  p.fillRect(Kw::Box<int>(x, y0, x + 1, y1), palette_.get(Palette::Border));
}

void TableLook::currentCell(Painter& p, const Kw::Box<int>& box, bool focused) const {
  p.outlineRect(box, palette_.get(focused ? Palette::Focus : Palette::Shadow));
}

void TableLook::addRow(Painter& p, const Kw::Box<int>& box, const iFont& font) const {
  p.text(L"+", Kw::Box<int>(box.x0 + 4, box.y0, box.x1, box.y1), font, palette_.get(Palette::Ghost),
         TextAlignment::Left, TextStyles::Plain);
}

void TableLook::choiceFace(Painter& p, const Kw::Box<int>& box) const {
  const Colour face = palette_.get(Palette::Base);
  p.depthBox(box, Bevel::Raised, 1, palette_.get(Palette::Light), palette_.get(Palette::Shadow),
             face);
}

void TableLook::choice(Painter& p, const Kw::Box<int>& box, const WString& text, const iFont& font,
                       bool highlighted) const {
  if (highlighted) p.fillRect(box, palette_.get(Palette::Highlight));
  p.text(text, Kw::Box<int>(box.x0 + 4, box.y0, box.x1 - 4, box.y1), font,
         palette_.get(highlighted ? Palette::HighlightedText : Palette::Text), TextAlignment::Left,
         TextStyles::Plain);
}

}  // namespace Glib
