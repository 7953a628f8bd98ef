#pragma once
// The size button of a panel's title strip: a plain button reporting "minify" that flips
// between the panel's two sizes on each press. Its label is the arrow of the size it leads to
// (">" while `size` is set, "H" otherwise), drawn with the symbol glyphs; its help text is the
// resource string 2714 while `size` is set and 2713 otherwise. While the label freeze is
// non-zero, set_size leaves the label alone (a panel that labels the button itself sets it).
// Like every title-strip button it has the thin bevel kTitleBevelWidth.
#include <cstdint>

#include "buttons/Button.h"

class SizeButton : public Button {
 public:
  static constexpr unsigned kContextStringSizeSet = 2714;
  static constexpr unsigned kContextStringSizeClear = 2713;

  // `height` 0 makes the button square.
  SizeButton(bool size, unsigned short width, unsigned short height, Canvas* parent);
  SizeButton(const SizeButton& other);
  SizeButton& operator=(const SizeButton& other);

  void set_size(bool size);
  bool get_size() const { return size; }
  void setLabelFreeze(uint32_t freeze) { labelFreeze = freeze; }
  uint32_t getLabelFreeze() const { return labelFreeze; }

  // Flips the size (label and help text) before the ordinary report.
  void switch_state(button_state newState, bool silent) override;
  // A one-character label naming a symbol glyph is drawn as that glyph.
  void drawText() override;

 private:
  void applyContextString();

  bool size = false;
  uint32_t labelFreeze = 0;
};
