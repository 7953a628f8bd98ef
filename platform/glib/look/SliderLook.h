#pragma once
// How a slider looks: a narrow sunken groove along the track, a short highlight-coloured mark
// where the point of interest lies, and the thumb: a raised block in the thumb's own colour
// with a needle of the same colour that carries its place across the groove. The thumb
// brightens under the pointer and darkens while held; inactive, the thumb sinks halfway into
// the base colour and the groove fades into what the slider stands on. The keyboard focus
// shows as the dotted mark round the whole slider.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"

namespace Glib {

class Painter;

class SliderLook {
 public:
  static constexpr int kGrooveThickness = 4;

  explicit SliderLook(const Palette& palette) : palette_(palette) {}

  // The thumb's face as drawn.
  Colour thumbFace(const Colour& thumb, bool hover, bool held, bool active) const;

  void groove(Painter& p, const Kw::Box<int>& box, bool active) const;
  void pointOfInterest(Painter& p, const Kw::Box<int>& box, bool active) const;
  // `block` is the thumb's body, `needle` the strip that crosses the groove.
  void thumb(Painter& p, const Kw::Box<int>& block, const Kw::Box<int>& needle, const Colour& thumb,
             bool hover, bool held, bool active) const;
  void focusMark(Painter& p, const Kw::Box<int>& box) const;

 private:
  static constexpr double kHoverBrighten = 1.2;
  static constexpr double kHeldDarken = 0.8;
  static constexpr double kInactiveSink = 0.5;        // toward the base colour
  static constexpr double kInactiveGrooveFade = 0.5;  // toward the window colour
  static constexpr double kEdgeLight = 0.5;           // how far the bevel's light edge goes

  const Palette& palette_;
};

}  // namespace Glib
