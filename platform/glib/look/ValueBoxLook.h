#pragma once
// How a value box looks: a well in the base colour (sunken with a one-pixel bevel, or flat
// with a border line for the flat appearance), the thermometer bar inside it from the left,
// a grip of three ridges at the right end where a left drag takes hold (lit while dragging),
// the number's text in the text colour and, while dragging, in the caret colour so the hand
// on the value shows, and a one-pixel focus-coloured outline round the text while it is
// edited. Inactive boxes dim the bar towards the base colour and grey the text.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"

namespace Glib {

class Painter;

class ValueBoxLook {
 public:
  explicit ValueBoxLook(const Palette& palette) : palette_(palette) {}

  // --- Colours ---
  Colour thermometer() const;
  Colour text(bool active) const;
  Colour draggingText() const { return palette_.get(Palette::Caret); }

  // --- Recipes ---
  // The well over `box`; `flat` draws the border line instead of the bevel.
  void well(Painter& p, const Kw::Box<int>& box, bool flat, bool active) const;
  // The bar: the first `width` pixels of `inside` (the well's inside), in `colour`.
  void thermometer(Painter& p, const Kw::Box<int>& inside, int width, const Colour& colour,
                   bool active) const;
  // Three ridges centred in `box`.
  void grip(Painter& p, const Kw::Box<int>& box, bool dragging, bool active) const;
  void focusOutline(Painter& p, const Kw::Box<int>& box) const;

  // The inside of the well: one pixel in from every edge.
  static Kw::Box<int> inside(const Kw::Box<int>& box) {
    return Kw::Box<int>(box.x0 + 1, box.y0 + 1, box.x1 - 1, box.y1 - 1);
  }

 private:
  static constexpr double kThermometerStrength = 0.45;  // from the base towards the highlight
  static constexpr double kInactiveFade = 0.5;          // an inactive bar, towards the base
  static constexpr double kEdgeLight = 0.45;
  static constexpr double kRidgeStrength = 0.4;  // a ridge, from the base towards the text
  static constexpr int kRidgeLength = 6;
  static constexpr int kRidgeGap = 3;

  const Palette& palette_;
};

}  // namespace Glib
