#pragma once
// The flashing caret of an editable text widget: a small Glob on the widget's canvas that the
// widget moves to the caret position. It is drawn in the caret colour; the thin style is a
// bar as tall as the font, the block style covers the character under it and shows that
// character in the inverse colour (overwrite mode).
//
// Flashing: while flashing, the caret toggles between shown and hidden on the first tick that
// comes more than kTogglePeriodMs after the previous toggle; sooner ticks do nothing.
// restartFlash shows the caret at once and makes the next toggle a no-op show, so the caret
// stays up for a whole period after it moves. Showing and hiding map and unmap the caret's
// canvas, so the text under it is repainted by its owner.
//
// Geometry: the caret's canvas is as tall as the font. The thin caret is kThinWidth pixels wide
// and centred on the caret position; the block is as wide as the character under it (at least
// kThinWidth), from the caret position rightward.
#include <cstdint>

#include "platform/glib/FontDesc.h"
#include "platform/glib/iFont.h"
#include "platform/glob/Glob.h"

class TextCursor : public Glob {
 public:
  enum eStyle : int32_t { StyleInsert = 0, StyleBlock = 1 };
  static constexpr double kTogglePeriodMs = 530.0;
  static constexpr int kThinWidth = 2;

  TextCursor(const Glib::FontDesc& font, Canvas* canvas);
  // With a font the owner already holds.
  TextCursor(Glib::FontPtr font, Canvas* canvas);

  void setFont(const Glib::FontDesc& font);
  const Glib::FontPtr& font() const { return font_; }
  void setCursorStyle(eStyle style);
  eStyle getCursorStyle() const { return style_; }
  // The character shown inside the block; kept only in the block style.
  void setCurrentChar(wchar_t ch);
  wchar_t currentChar() const { return current_; }
  // The caret colour, and the colour of the character drawn inside the block.
  void setColours(const Colour& caret, const Colour& inverseText);

  // Puts the caret before the character whose left edge is at `x`, with the bottom of the
  // caret at `y` (the owner's canvas coordinates).
  void placeAt(XY<int> pos);
  XY<int> position() const { return pos_; }

  void show();
  void hide();

  void activateFlash();
  void deactivateFlash();
  void restartFlash();
  bool isFlashing() const { return flashing_; }
  bool isRestartPending() const { return restartPending_; }

  void draw() override;
  int react(Event* e) override;
  const char* idstring() const override { return "textcursor"; }
  // The caret never takes a click: presses fall through to the text under it.
  bool isOpaqueAt(const XY<int>& pos) override { return false; }

 private:
  void reshapeToFit();
  int blockWidth() const;

  Glib::FontPtr font_;
  eStyle style_ = StyleInsert;
  wchar_t current_ = 0;
  Colour caretColour_;
  Colour inverseColour_;
  XY<int> pos_;
  double lastToggle_ = 0.0;
  bool restartPending_ = false;
  bool flashing_ = false;
};
