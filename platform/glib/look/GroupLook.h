#pragma once
// How widget groups look: a frame round the group in its edge colour (an etched double line,
// a raised or a sunken bevel, or nothing), broken at the top where the title sits; the title
// in plain or bold text; the separator between the title strip and the grouped widgets; and
// the size toggle of a group that can be minimised (an arrow pointing right while minimised,
// down while open).
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;

class GroupLook {
 public:
  enum class Frame : int { None = 0, Raised = 1, Etched = 2, Sunken = 3 };
  enum class Separator : int { None = 0, Line = 1, Etched = 2 };

  // The gap left in the frame's top edge either side of the title.
  static constexpr int kTitleGap = 4;
  // How far in luminance (0..1) the light side of a raised or sunken frame must stand from the
  // window face to be seen; a palette whose light colour is closer (a light palette, where it
  // is white on near white) gets a softened edge colour there instead.
  static constexpr double kMinLightContrast = 0.15;

  explicit GroupLook(const Palette& palette) : palette_(palette) {}

  // The edge colour of a group that was given none.
  Colour defaultEdge() const;
  Colour defaultTitle() const;
  // The face inside the group.
  void face(Painter& p, const Kw::Box<int>& box, const Colour& colour) const;
  // The frame round `box`, its top edge `topInset` pixels below box's top, and left open
  // between gapX0 and gapX1 (no gap when they are equal).
  void frame(Painter& p, const Kw::Box<int>& box, Frame kind, const Colour& edge, int topInset,
             int gapX0, int gapX1) const;
  void title(Painter& p, const WString& text, const Kw::Box<int>& box, const Colour& colour,
             bool bold, bool active) const;
  // The width of a title as title() draws it.
  static int titleWidth(const WString& text, bool bold);
  void separator(Painter& p, int x0, int x1, int y, Separator kind, const Colour& edge) const;
  void sizeToggle(Painter& p, const Kw::Box<int>& box, bool minimised, bool active) const;

 private:
  // The colour of the light side of a raised or sunken frame drawn with `edge`.
  Colour lightSide(const Colour& edge) const;

  const Palette& palette_;
};

}  // namespace Glib
