#pragma once
// How a table of data columns looks: a sunken well in the base colour; a header strip of
// button-coloured faces with the field names in the button-text colour and a shadow line
// between headers; rows alternating the base colour with a faint stripe, tagged rows in a
// blend of the cell colour and the highlight with text in the highlighted-text colour;
// read-only cells' text a third of the way to the disabled colour; thin grid lines; the
// current cell framed in the focus colour while the table holds the focus and in the shadow
// colour otherwise; the last "add" row's plus sign in the ghost colour; a border-coloured
// line at the right of the sticky columns; and the list of a cell's choices.
// An inactive table draws its text in the disabled colour and its well in the window colour.
#include "platform/glib/TextAlignment.h"
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;
class iFont;

class TableLook {
 public:
  explicit TableLook(const Palette& palette) : palette_(palette) {}

  // --- Colours ---
  // The face of a cell in a column of colour `cell` (the base colour when none is given).
  Colour cellFace(const Colour& cell, int row, bool tagged) const;
  Colour cellText(bool tagged, bool readOnly, bool active) const;
  Colour defaultCell() const { return palette_.get(Palette::Base); }

  // --- Recipes ---
  void well(Painter& p, const Kw::Box<int>& box, bool active) const;
  void header(Painter& p, const Kw::Box<int>& box, const WString& name, const iFont& font,
              TextAlignment align, bool active) const;
  void cell(Painter& p, const Kw::Box<int>& box, const Colour& face) const;
  void columnLine(Painter& p, int x, int y0, int y1) const;
  void stickyEdge(Painter& p, int x, int y0, int y1) const;
  void currentCell(Painter& p, const Kw::Box<int>& box, bool focused) const;
  void addRow(Painter& p, const Kw::Box<int>& box, const iFont& font) const;
  // The list of choices offered for a cell: a raised face in the base colour, each choice
  // in the text colour, the highlighted one on the highlight.
  void choiceFace(Painter& p, const Kw::Box<int>& box) const;
  void choice(Painter& p, const Kw::Box<int>& box, const WString& text, const iFont& font,
              bool highlighted) const;

 private:
  static constexpr double kStripe = 0.06;    // how far odd rows go toward the window colour
  static constexpr double kTagBlend = 0.65;  // how far tagged rows go toward the highlight
  static constexpr double kReadOnlyFade = 0.35;
  static constexpr double kLineBlend = 0.35;  // grid lines: the shadow over the base
  static constexpr double kHeaderLight = 0.12;

  const Palette& palette_;
};

}  // namespace Glib
