#pragma once
// The utility symbol font: small glyphs that controls name by a character code, drawn as
// vector shapes centred in a box, sized to the box's smaller side.
//
// The arrow codes are characters: '<' (60) points left and '>' (62) right; 'H' (72) points
// down and 'I' (73) up. A menu group shows 'H' when expanded and '>' when compressed; a
// scroll bar's arrow buttons show 73/72 (vertical) or 60/62 (horizontal), its decrementing
// button first. The window-furniture glyphs use the Unicode code points of the same shapes.
#include "platform/glob/Colour.h"
#include "platform/kw/Box.h"

namespace Glib {

class Painter;

enum Symbol : int {
  kSymbolLeft = '<',
  kSymbolRight = '>',  // also the compressed menu group
  kSymbolDown = 'H',   // also the expanded menu group
  kSymbolUp = 'I',
  kSymbolTick = 0x2713,      // check mark
  kSymbolCross = 0x2715,     // close
  kSymbolMinimise = 0x2581,  // the size button's bar
  kSymbolPin = 0x1F4CC,      // pin
};

class Symbols {
 public:
  // True when `code` names a glyph.
  static bool known(int code);
  // Draws the glyph `code` centred in `box` (canvas coordinates) in `colour`. Unknown codes
  // draw nothing and return false.
  static bool draw(Painter& painter, int code, const Kw::Box<int>& box, const Colour& colour);
};

inline bool drawSymbol(Painter& painter, int code, const Kw::Box<int>& box, const Colour& colour) {
  return Symbols::draw(painter, code, box, colour);
}

}  // namespace Glib
