#include "platform/glib/look/MenuLook.h"

#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"
#include "platform/glib/look/FaceLook.h"

namespace Glib {

Colour MenuLook::subHeadingText() const {
  return mix(palette_.get(Palette::WindowText), palette_.get(Palette::Highlight), kSubHeadingTint);
}

void MenuLook::background(Painter& p, const Kw::Box<int>& box, const Colour& face) const {
  p.fillRect(box, face);
}

void MenuLook::frame(Painter& p) const {
  p.outlineRect(p.bounds(), palette_.get(Palette::Border));
}

void MenuLook::titleStrip(Painter& p, const Kw::Box<int>& box, const WString& title,
                          const Colour& text, const iFont& font) const {
  FaceLook(palette_).headerStrip(p, box);
  p.text(title, box, font, text, TextAlignment::Centred);
}

void MenuLook::iconStrip(Painter& p, const Kw::Box<int>& box) const {
  p.fillRect(box, palette_.windowShade(3));
  p.line(XY<int>(box.x0, box.y0), XY<int>(box.x1 - 1, box.y0), palette_.get(Palette::Shadow));
}

void MenuLook::row(Painter& p, const Kw::Box<int>& box, const Colour& itemCol, bool header,
                   bool highlighted) const {
  Colour face = itemCol;
  if (highlighted) {
    face = palette_.get(Palette::Highlight);
  } else if (header) {
    face = mix(itemCol, palette_.get(Palette::Shadow), kHeaderSink);
  }
  p.fillRect(box, face);
}

Colour MenuLook::rowText(const Colour& itemText, bool highlighted, bool active) const {
  if (!active) return palette_.get(Palette::Disabled);
  return highlighted ? palette_.get(Palette::HighlightedText) : itemText;
}

void MenuLook::groupGlyph(Painter& p, const Kw::Box<int>& row, bool expanded,
                          const Colour& c) const {
  const int size = expanded ? kExpandedGlyphSize : kCompressedGlyphSize;
  const int top = row.y1 - kGlyphDrop;
  const int x0 = row.x0 + kGlyphInset;
  drawSymbol(p, expanded ? kSymbolDown : kSymbolRight, Kw::Box<int>(x0, top - size, x0 + size, top),
             c);
}

void MenuLook::choiceMark(Painter& p, const Kw::Box<int>& box, const Colour& c) const {
  const int cy = (box.y0 + box.y1) / 2;
  const int half = kChoiceMarkSize / 2;
  drawSymbol(p, kSymbolDown,
             Kw::Box<int>(box.x1 - kChoiceMarkSize, cy - half, box.x1, cy - half + kChoiceMarkSize),
             c);
}

}  // namespace Glib
