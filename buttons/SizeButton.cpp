#include "buttons/SizeButton.h"

#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"
#include "platform/misc/UIString.h"

SizeButton::SizeButton(bool s, unsigned short width, unsigned short height, Canvas* parent)
    : Button(WString(), "minify", width, height == 0 ? width : height, 1, parent) {
  set_bevel_width(kTitleBevelWidth);
  set_size(s);
}

SizeButton::SizeButton(const SizeButton& other)
    : Button(other), size(other.size), labelFreeze(other.labelFreeze) {
  applyContextString();
}

SizeButton& SizeButton::operator=(const SizeButton& other) {
  if (this == &other) return *this;
  Button::operator=(other);
  size = other.size;
  labelFreeze = other.labelFreeze;
  applyContextString();
  return *this;
}

void SizeButton::set_size(bool s) {
  if (labelFreeze == 0) setString(s ? L">" : L"H");
  size = s;
  applyContextString();
}

void SizeButton::applyContextString() {
  setContextString(UIString(size ? kContextStringSizeSet : kContextStringSizeClear).toString());
}

void SizeButton::switch_state(button_state newState, bool silent) {
  set_size(!size);
  Button::switch_state(newState, silent);
}

void SizeButton::drawText() {
  const WString& label = getString();
  if (label.size() != 1 || !Glib::Symbols::known(static_cast<int>(label[0]))) {
    Button::drawText();
    return;
  }
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::ButtonLook::glyph(p, static_cast<int>(label[0]), symbolBox(), labelColour());
}
