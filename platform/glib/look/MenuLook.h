#pragma once
// How a pop-up menu looks: a face a shade darker than the window behind its rows, a one-pixel
// outline in the border colour, a title strip like a window's header strip, rows in their
// items' colours (group headers sunk a little toward the shadow), the highlighted row in the
// highlight colours, inactive rows in the disabled text colour, group glyphs at the left of
// header rows and a small arrow beside the current choice of a multi-choice row.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;
class iFont;

class MenuLook {
 public:
  // How far a header row's face goes from the item colour toward the shadow colour.
  static constexpr double kHeaderSink = 0.25;
  // How far the sub-heading text goes from the window text toward the highlight colour.
  static constexpr double kSubHeadingTint = 0.45;
  // The group glyphs: their sizes and how far below the row's top they start.
  static constexpr int kExpandedGlyphSize = 14;
  static constexpr int kCompressedGlyphSize = 16;
  static constexpr int kGlyphDrop = 5;
  static constexpr int kGlyphInset = 3;
  // The choice arrow's side.
  static constexpr int kChoiceMarkSize = 9;

  explicit MenuLook(const Palette& palette) : palette_(palette) {}

  Colour face() const { return palette_.windowShade(2); }
  // The row and text colours new items take.
  Colour itemFace() const { return palette_.windowShade(3); }
  Colour itemText() const { return palette_.get(Palette::WindowText); }
  Colour subHeadingText() const;
  Colour titleText() const { return palette_.get(Palette::WindowText); }

  // The face over `box` and the outline around the whole canvas.
  void background(Painter& p, const Kw::Box<int>& box, const Colour& face) const;
  void frame(Painter& p) const;
  // The title strip with `title` centred in it.
  void titleStrip(Painter& p, const Kw::Box<int>& box, const WString& title, const Colour& text,
                  const iFont& font) const;
  // The strip that holds the iconic items' buttons.
  void iconStrip(Painter& p, const Kw::Box<int>& box) const;
  // A row's face.
  void row(Painter& p, const Kw::Box<int>& box, const Colour& itemCol, bool header,
           bool highlighted) const;
  Colour rowText(const Colour& itemText, bool highlighted, bool active) const;
  // The size-state glyph of a header row at the left of `row`.
  void groupGlyph(Painter& p, const Kw::Box<int>& row, bool expanded, const Colour& c) const;
  // The arrow that marks a multi-choice value, centred vertically in `box` at its right.
  void choiceMark(Painter& p, const Kw::Box<int>& box, const Colour& c) const;

 private:
  const Palette& palette_;
};

}  // namespace Glib
