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

Palette Palette::dark() {
  return Palette();
}

Palette Palette::light() {
  Palette p;
  p.colours_[Window] = Colour::fromHex(0xE9ECF0);
  p.colours_[WindowText] = Colour::fromHex(0x1D2127);
  p.colours_[Button] = Colour::fromHex(0xD5DAE1);
  p.colours_[ButtonText] = Colour::fromHex(0x14171C);
  p.colours_[Base] = Colour::fromHex(0xFFFFFF);
  p.colours_[Text] = Colour::fromHex(0x14171C);
  p.colours_[Highlight] = Colour::fromHex(0x2A72C4);
  p.colours_[HighlightedText] = Colour::fromHex(0xFFFFFF);
  p.colours_[Light] = Colour::fromHex(0xFFFFFF);
  p.colours_[Shadow] = Colour::fromHex(0x8F96A0);
  p.colours_[Disabled] = Colour::fromHex(0x70767F);
  p.colours_[Caret] = Colour::fromHex(0xB5470B);
  p.colours_[Focus] = Colour::fromHex(0x1F6FD1);
  p.colours_[Border] = Colour::fromHex(0x737B86);
  p.colours_[Ghost] = Colour::fromHex(0x878E98);
  p.shadeStep_ = 0.05;
  return p;
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
  // Shade 3 is the window colour itself.
  return scale(colours_[Window], 1.0 + shadeStep_ * (level - 3));
}
