#include "buttons/PinButton.h"

PinButton::PinButton(unsigned short width, unsigned short height, Canvas* parent)
    : ImageButton(L"pin.png", L"pinned.png", "freeze_flip", width, height, parent) {
  set_bevel_width(kTitleBevelWidth);
  set_latching(true);
}
