#include "values/ScrollBarArrow.h"

#include "platform/glib/Painter.h"
#include "platform/glib/look/ButtonLook.h"

ScrollBarArrow::ScrollBarArrow(int symbol, const char* message, unsigned short side, Canvas* parent)
    : Button(WString(1, static_cast<wchar_t>(symbol)), message, side, side, 0, parent) {
  set_bevel_width(kTitleBevelWidth);
}

void ScrollBarArrow::drawText() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::ButtonLook::glyph(p, static_cast<int>(getString()[0]), symbolBox(), labelColour());
}
