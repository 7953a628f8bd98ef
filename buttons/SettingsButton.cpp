#include "buttons/SettingsButton.h"

#include <algorithm>

namespace {
unsigned short widthFor(unsigned short width) {
  return std::max(width, SettingsButton::kMinWidth);
}
}  // namespace

SettingsButton::SettingsButton(unsigned short width, unsigned short height, Canvas* parent)
    : ImageButton(L"settings.png", L"settings.png", "screwdriver", widthFor(width),
                  height == 0 ? widthFor(width) : height, parent) {
  set_bevel_width(kTitleBevelWidth);
}
