#include "buttons/PootButton.h"

PootButton::PootButton(unsigned short width, unsigned short height, Canvas* parent)
    : Button(WString(), "poot", width, height == 0 ? width : height, 1, parent) {}

void PootButton::drawText() {
  Button::drawText();
}
