#pragma once
// The user-interface scale: how many screen pixels one layout pixel takes. Controls lay
// themselves out in layout pixels; glib_rescalecanvas turns a freshly made canvas into
// screen pixels.
class Canvas;

namespace Glib {

class UiScale {
 public:
  // 1.0 unless set; values outside 0.5..4 are refused and the old scale kept.
  static double factor();
  static bool setFactor(double factor);
};

}  // namespace Glib

// With a scale of 1 the canvas is left exactly as it is. With another scale the canvas's
// position in its parent and its size are multiplied by it and rounded to whole pixels
// (edges rounded, so neighbours stay adjacent). Meant to be called once per canvas, right
// after creation (a button's post_init does); a null canvas is ignored.
void glib_rescalecanvas(Canvas* canvas);
