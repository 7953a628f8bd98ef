#pragma once
// How a scroll bar looks: a sunken trough in a darker window shade and a raised thumb in the
// thumb's colour with three short grip lines at its middle. A resizable thumb marks each end's
// handle with a line across the thumb. The thumb sinks and darkens while it is dragged; an
// inactive bar fades its trough into the window colour and its thumb into the base colour.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"

namespace Glib {

class Painter;

class ScrollBarLook {
 public:
  explicit ScrollBarLook(const Palette& palette) : palette_(palette) {}

  // The thumb colour a bar uses when it is given none.
  Colour defaultThumb() const { return palette_.get(Palette::Button); }
  Colour thumbFace(const Colour& thumb, bool held, bool active) const;

  void trough(Painter& p, const Kw::Box<int>& box, bool active) const;
  // `handle` is how far each end's resize handle reaches into the thumb; 0 for a thumb that
  // cannot be resized.
  void thumb(Painter& p, const Kw::Box<int>& box, const Colour& thumb, bool vertical, bool held,
             int handle, bool active) const;

 private:
  static constexpr double kHeldDarken = 0.82;
  static constexpr double kInactiveSink = 0.5;
  static constexpr double kInactiveTroughFade = 0.5;
  static constexpr double kEdgeLight = 0.5;
  static constexpr int kGripLines = 3;
  static constexpr int kGripGap = 3;

  const Palette& palette_;
};

}  // namespace Glib
