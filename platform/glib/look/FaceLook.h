#pragma once
// Plain faces that are not a particular control: raised tiles and sunken wells with a one-pixel
// bevel whose light edge is mixed from the face, small status lamps, the header strip of an
// application window, a thick focus ring and the segmented bar of a level meter.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"

namespace Glib {

class Painter;

class FaceLook {
 public:
  explicit FaceLook(const Palette& palette) : palette_(palette) {}

  // A raised face with a one-pixel bevel, as panels have.
  void raised(Painter& p, const Kw::Box<int>& box, const Colour& face) const;
  // A sunken well one pixel deep.
  void sunken(Painter& p, const Kw::Box<int>& box, const Colour& face) const;
  // A small sunken square lamp centred on `centre`.
  void lamp(Painter& p, XY<int> centre, const Colour& c) const;
  // A header strip: a gentle gradient over the window colour, a dark line below.
  void headerStrip(Painter& p, const Kw::Box<int>& box) const;
  // A focus ring two pixels wide, two pixels inside `box`.
  static void focusRing(Painter& p, const Kw::Box<int>& box, const Colour& c);
  // A level meter in a base-coloured well: `count` segments, the first `lit` of them lit in a
  // blend from `low` to `high`, the rest in the window's lighter shade.
  void meter(Painter& p, const Kw::Box<int>& box, int count, int lit, const Colour& low,
             const Colour& high) const;

 private:
  static constexpr double kEdgeLight = 0.45;  // how far the light edge goes from the face

  const Palette& palette_;
};

}  // namespace Glib
