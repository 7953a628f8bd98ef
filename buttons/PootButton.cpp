#include "buttons/PootButton.h"

#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"

PootButton::PootButton(unsigned short width, unsigned short height, Canvas* parent)
    : Button(WString(), "poot", width, height == 0 ? width : height, 1, parent) {
  set_bevel_width(kTitleBevelWidth);
}

void PootButton::drawText() {
  if (!getString().empty()) {
    Button::drawText();
    return;
  }
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::ButtonLook::glyph(p, Glib::kSymbolCross, symbolBox(), labelColour());
}
