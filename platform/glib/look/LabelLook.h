#pragma once
// How static text looks: labels in the window-text colour (the disabled colour while
// inactive), over a background only when one is given; and the titles of titled text boxes,
// either plain beside or above the box, or on a tab joined to the box's left edge, filled
// with the box's colour tinted toward the highlight and edged with the border colour.
#include "platform/glib/TextAlignment.h"
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;
class iFont;

class LabelLook {
 public:
  // How far a title tab's face goes from the box colour toward the highlight.
  static constexpr double kTabTint = 0.22;

  explicit LabelLook(const Palette& palette) : palette_(palette) {}

  // --- Colours ---
  Colour text(bool active) const;
  Colour tabFace(const Colour& colour) const;

  // --- Recipes ---
  static void background(Painter& p, const Kw::Box<int>& box, const Colour& colour);
  // One line of text in `colour`, centred vertically in `box`, clipped to it.
  static void text(Painter& p, const WString& s, const Kw::Box<int>& box, const iFont& font,
                   const Colour& colour, TextAlignment align = TextAlignment::Left);
  // A title as plain text in the label colour.
  void title(Painter& p, const WString& s, const Kw::Box<int>& box, const iFont& font,
             bool active) const;
  // A title on a tab in the tint of `colour`, outlined except on its right edge, where the
  // box it belongs to joins it.
  void titleTab(Painter& p, const WString& s, const Kw::Box<int>& box, const iFont& font,
                const Colour& colour, bool active) const;

 private:
  static constexpr int kTabTextInset = 6;

  const Palette& palette_;
};

}  // namespace Glib
