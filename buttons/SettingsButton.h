#pragma once
// The settings button of a panel's title strip: an image button showing "settings.png" and
// reporting "screwdriver". It is at least 20 pixels wide.
// Like every title-strip button it has the thin bevel kTitleBevelWidth.
#include "buttons/ImageButton.h"

class SettingsButton : public ImageButton {
 public:
  static constexpr unsigned short kMinWidth = 20;

  // `height` 0 makes the button square (as high as it ends up wide).
  SettingsButton(unsigned short width, unsigned short height, Canvas* parent);
  SettingsButton(const SettingsButton& other) = default;
  SettingsButton& operator=(const SettingsButton& other) = default;
};
