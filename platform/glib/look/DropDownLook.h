#pragma once
// How a drop-down looks: a button face (ButtonLook) with a down arrow in a column at its right
// end, optionally parted from the label by an etched line; in its open list, a tick beside the
// selected entry; and the suffix a combo box shows after
// its number. Every drop-down control (drop-down buttons, combo boxes, the imposter, the image
// drop-down) draws its arrow column through it.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;
class iFont;

class DropDownLook {
 public:
  // The width of the arrow column at the right of a drop-down face.
  static constexpr int kArrowColumn = 18;
  // The arrow's box: kArrowWidth by kArrowHeight, kArrowRightInset from the face's right edge,
  // centred vertically.
  static constexpr int kArrowWidth = 9;
  static constexpr int kArrowHeight = 8;
  static constexpr int kArrowRightInset = 5;
  // How far the separator stays from the face's top and bottom.
  static constexpr int kSeparatorInset = 4;
  // How far the suffix text goes from the label colour toward the face.
  static constexpr double kSuffixFade = 0.35;
  // The height of the add row at the foot of a list.
  static constexpr int kAddRowHeight = 22;

  explicit DropDownLook(const Palette& palette) : palette_(palette) {}

  // The arrow column of a face `face` (the whole canvas, bottom-up).
  static Kw::Box<int> arrowColumn(const Kw::Box<int>& face);
  // The room left of the arrow column for the label.
  static Kw::Box<int> labelRoom(const Kw::Box<int>& face);

  // The down arrow in the arrow column of `face`, moved by `shift` as pressed content is, in
  // `c` (the label colour as drawn).
  void arrow(Painter& p, const Kw::Box<int>& face, int shift, const Colour& c) const;
  // The etched line parting the label from the arrow column.
  void separator(Painter& p, const Kw::Box<int>& face, bool active) const;
  // The tick that marks the selected entry in the glyph column of its row.
  void selectionMark(Painter& p, const Kw::Box<int>& row, int glyphColumn, const Colour& c) const;
  Colour suffixText(const Colour& label) const;
  // The rule along the top edge of a list's add row `row`.
  void addRowRule(Painter& p, const Kw::Box<int>& row) const;

 private:
  const Palette& palette_;
};

}  // namespace Glib
