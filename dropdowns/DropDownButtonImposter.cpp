#include "dropdowns/DropDownButtonImposter.h"

#include "platform/glib/Painter.h"
#include "platform/glib/look/DropDownLook.h"

DropDownButtonImposter::DropDownButtonImposter(const WString& label, const String& message,
                                               const GlobCreationInfo& info)
    : Button(label, message, info) {
  setTextAlignment(TextAlignment::Left);
  set_name(Kw::toUtf8(label));
}

DropDownButtonImposter::DropDownButtonImposter(const WString& label, const String& message,
                                               unsigned short width, unsigned short height,
                                               Canvas* parent)
    : Button(label, message.c_str(), width, height, 0, parent) {
  setTextAlignment(TextAlignment::Left);
  set_name(Kw::toUtf8(label));
}

void DropDownButtonImposter::setHasDropDownAppearance(bool on) {
  if (on == dropDownAppearance_) return;
  dropDownAppearance_ = on;
  update();
}

void DropDownButtonImposter::setDrawSeparator(bool on) {
  if (on == drawSeparator_) return;
  drawSeparator_ = on;
  update();
}

void DropDownButtonImposter::drawText() {
  Button::drawText();
  if (!dropDownAppearance_) return;
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::DropDownLook look(getPalette());
  look.arrow(p, p.bounds(), 0, labelColour());
  if (drawSeparator_) look.separator(p, p.bounds(), isActive());
}
