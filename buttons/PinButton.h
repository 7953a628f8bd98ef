#pragma once
// The pin button of a panel's title strip: an image button showing "pin.png" when up and
// "pinned.png" when down, reporting "freeze_flip". It latches, so that it shows whether the
// panel is pinned: a press reports "freeze_flip on" (pinned) or "freeze_flip off". A panel that
// wants "pin on" / "pin off" gives it the message "pin".
// Like every title-strip button it has the thin bevel kTitleBevelWidth.
#include "buttons/ImageButton.h"

class PinButton : public ImageButton {
 public:
  PinButton(unsigned short width, unsigned short height, Canvas* parent);
  PinButton(const PinButton& other) = default;
  PinButton& operator=(const PinButton& other) = default;
};
