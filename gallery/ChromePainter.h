#pragma once
// Drawing for the gallery's own chrome (header, page selector, cards, message log), in a
// canvas's own coordinates: origin at the bottom-left corner, y upward. Only valid inside a
// Glob's draw(); made at any other time it is inert and draws nothing.
#include <cairo.h>

#include "platform/glob/Colour.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

class Canvas;

struct ChromeFont {
  int size = 13;  // pixels
  bool bold = false;
  bool mono = false;
};

enum class ChromeAlign { Left, Right, Centre };

class ChromePainter {
 public:
  explicit ChromePainter(Canvas& canvas);
  ChromePainter(const ChromePainter&) = delete;
  ChromePainter& operator=(const ChromePainter&) = delete;

  bool active() const { return cr_ != nullptr; }
  int width() const { return width_; }
  int height() const { return height_; }
  Kw::Box<int> bounds() const { return Kw::Box<int>(0, 0, width_, height_); }

  void fillRect(const Kw::Box<int>& box, const Colour& c);
  void roundedRect(const Kw::Box<int>& box, double radius, const Colour& fill);
  void roundedOutline(const Kw::Box<int>& box, double radius, const Colour& c);
  void outlineRect(const Kw::Box<int>& box, const Colour& c);
  // A one-pixel line along the pixels from `x0` to `x1` (exclusive) on row `y`.
  void hline(int x0, int x1, int y, const Colour& c);
  void vline(int x, int y0, int y1, const Colour& c);
  void verticalGradient(const Kw::Box<int>& box, const Colour& bottom, const Colour& top);
  void dot(XY<int> centre, double radius, const Colour& c);
  // One line of UTF-8 text, vertically centred in `box`, ended with an ellipsis when too wide.
  void text(const String& utf8, const Kw::Box<int>& box, const ChromeFont& font, const Colour& c,
            ChromeAlign align = ChromeAlign::Left);
  int textWidth(const String& utf8, const ChromeFont& font);

 private:
  void setSource(const Colour& c);
  void roundedPath(const Kw::Box<int>& box, double radius);

  cairo_t* cr_ = nullptr;
  int width_ = 0;
  int height_ = 0;
};
