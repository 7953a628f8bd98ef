#include "platform/glib/look/DropDownLook.h"

#include <algorithm>

#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"
#include "platform/glib/look/ButtonLook.h"
#include "platform/glib/look/FaceLook.h"

namespace Glib {

Kw::Box<int> DropDownLook::arrowColumn(const Kw::Box<int>& face) {
  const int x0 = std::max(face.x0, face.x1 - kArrowColumn);
  return Kw::Box<int>(x0, face.y0, face.x1, face.y1);
}

Kw::Box<int> DropDownLook::labelRoom(const Kw::Box<int>& face) {
  return Kw::Box<int>(face.x0, face.y0, arrowColumn(face).x0, face.y1);
}

void DropDownLook::arrow(Painter& p, const Kw::Box<int>& face, int shift, const Colour& c) const {
  const int x0 = face.x1 - kArrowRightInset - kArrowWidth + shift;
  const int y0 = (face.y0 + face.y1) / 2 - kArrowHeight / 2 - shift;
  ButtonLook::glyph(p, kSymbolDown, Kw::Box<int>(x0, y0, x0 + kArrowWidth, y0 + kArrowHeight), c);
}

void DropDownLook::separator(Painter& p, const Kw::Box<int>& face, bool active) const {
  const int x = arrowColumn(face).x0;
  const int y0 = face.y0 + kSeparatorInset;
  const int y1 = face.y1 - kSeparatorInset;
  if (y1 <= y0) return;
  Colour dark = palette_.get(Palette::Shadow);
  Colour light = palette_.get(Palette::Light);
  if (!active) {
    dark = mix(dark, palette_.get(Palette::Button), 0.5);
    light = mix(light, palette_.get(Palette::Button), 0.5);
  }
  p.line(XY<int>(x, y0), XY<int>(x, y1), dark);
  p.line(XY<int>(x + 1, y0), XY<int>(x + 1, y1), light);
}

void DropDownLook::selectionMark(Painter& p, const Kw::Box<int>& row, int glyphColumn,
                                 const Colour& c) const {
  const int side = std::min(glyphColumn, row.height()) - 6;
  if (side <= 0) return;
  const int cy = (row.y0 + row.y1) / 2;
  const int x0 = row.x0 + (glyphColumn - side) / 2;
  drawSymbol(p, kSymbolTick, Kw::Box<int>(x0, cy - side / 2, x0 + side, cy + side / 2), c);
}

Colour DropDownLook::suffixText(const Colour& label) const {
  return mix(label, palette_.get(Palette::Base), kSuffixFade);
}

void DropDownLook::addRowRule(Painter& p, const Kw::Box<int>& row) const {
  if (row.empty()) return;
  p.fillRect(Kw::Box<int>(row.x0, row.y1 - 1, row.x1, row.y1), palette_.get(Palette::Shadow));
}

}  // namespace Glib
