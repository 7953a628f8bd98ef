#pragma once
// An arrow button of a scroll bar: a plain auto-repeating button that shows a glyph of the
// symbol font (its label's one character names the glyph) instead of text.
#include "buttons/Button.h"

class ScrollBarArrow : public Button {
 public:
  ScrollBarArrow(int symbol, const char* message, unsigned short side, Canvas* parent);

  void drawText() override;
  const char* idstring() const override { return "scrollbararrow"; }
};
