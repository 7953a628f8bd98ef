#include "panels/DropDownButtonImposter.h"

#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"
#include "platform/glib/look/ButtonLook.h"

DropDownButtonImposter::DropDownButtonImposter(const WString& label, const String& message,
                                               const GlobCreationInfo& info)
    : Button(label, message, info) {
  setTextAlignment(TextAlignment::Left);
  set_name(Kw::toUtf8(label));
}

void DropDownButtonImposter::drawText() {
  Button::drawText();
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const int w = width(), h = height();
  const Kw::Box<int> arrow(w - kArrowWidth, h / 2 - 4, w - 5, h / 2 + 4);
  Glib::ButtonLook::glyph(p, Glib::kSymbolDown, arrow, labelColour());
}
