#include "platform/glob/Palette.h"

#include <algorithm>

Palette::Palette() {
  colours_[Window] = Colour::fromHex(0x3C3F44);
  colours_[WindowText] = Colour::fromHex(0xDCDEE2);
  colours_[Button] = Colour::fromHex(0x545962);
  colours_[ButtonText] = Colour::fromHex(0xEEF0F3);
  colours_[Base] = Colour::fromHex(0x25272B);
  colours_[Text] = Colour::fromHex(0xE8EAED);
  colours_[Highlight] = Colour::fromHex(0x3D8FD6);
  colours_[HighlightedText] = Colour::fromHex(0xFFFFFF);
  colours_[Light] = Colour::fromHex(0x7A808A);
  colours_[Shadow] = Colour::fromHex(0x1E2024);
  colours_[Disabled] = Colour::fromHex(0x8A8E95);
  colours_[Caret] = Colour::fromHex(0xF5C542);
  colours_[Focus] = Colour::fromHex(0x6FB3F2);
  colours_[Border] = Colour::fromHex(0x16181B);
  colours_[Ghost] = Colour::fromHex(0x7C8088);
}

Palette::Palette(const Colour& fore, const Colour& back) : Palette() {
  colours_[WindowText] = fore;
  colours_[ButtonText] = fore;
  colours_[Text] = fore;
  colours_[Window] = back;
  colours_[Button] = back;
}

Colour Palette::windowShade(int level) const {
  level = std::clamp(level, 0, 6);
  // Shade 3 is the window colour itself; each step is 12% darker or lighter.
  return scale(colours_[Window], 1.0 + 0.12 * (level - 3));
}
