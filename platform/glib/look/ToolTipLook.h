#pragma once
// How a tooltip looks: a face lifted from the window colour toward the light edge colour, a
// one-pixel outline in the border colour, and its lines of text in the window-text colour,
// from the top down, in the standard font.
#include <vector>

#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;
class iFont;

class ToolTipLook {
 public:
  // How far the face goes from the window colour toward the light edge colour.
  static constexpr double kFaceLift = 0.3;

  explicit ToolTipLook(const Palette& palette) : palette_(palette) {}

  Colour face() const;
  Colour text() const { return palette_.get(Palette::WindowText); }

  // The face and outline over the whole canvas.
  void frame(Painter& p) const;
  // `lines`, one line-height apart, the first with its top at `inner.y1`, clipped to `inner`.
  void lines(Painter& p, const std::vector<WString>& lines, const Kw::Box<int>& inner,
             const iFont& font) const;

 private:
  const Palette& palette_;
};

}  // namespace Glib
