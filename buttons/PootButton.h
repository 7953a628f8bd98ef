#pragma once
// The close button of a panel's title strip: a plain button reporting "poot". With no label it
// shows a cross.
// Like every title-strip button it has the thin bevel kTitleBevelWidth.
#include "buttons/Button.h"

class PootButton : public Button {
 public:
  // `height` 0 makes the button square.
  PootButton(unsigned short width, unsigned short height, Canvas* parent);
  PootButton(const PootButton& other) = default;
  PootButton& operator=(const PootButton& other) = default;

  void drawText() override;
};
