#pragma once
// How single-line text entry looks: a well one pixel deep in the base colour (the window
// colour while inactive), text in the text colour (disabled while inactive), a selection fill
// in the highlight colour while focused and in the shadow colour otherwise, with the selected
// text in the highlighted-text colour, ghost labels in the ghost colour, a focus-coloured
// outline, and the caret: a block in the caret colour, the character under it drawn inside in
// the base colour.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;
class iFont;

class TextFieldLook {
 public:
  explicit TextFieldLook(const Palette& palette) : palette_(palette) {}

  // --- Colours ---
  Colour text(bool active) const;
  Colour selectedText() const { return palette_.get(Palette::HighlightedText); }
  Colour ghost() const { return palette_.get(Palette::Ghost); }
  Colour caret() const { return palette_.get(Palette::Caret); }
  // The colour of the character drawn inside a block caret.
  Colour caretInside() const { return palette_.get(Palette::Base); }

  // --- Recipes ---
  void well(Painter& p, const Kw::Box<int>& box, bool active) const;
  void selection(Painter& p, const Kw::Box<int>& box, bool focused) const;
  void focusOutline(Painter& p, const Kw::Box<int>& box) const;
  // The caret over its whole canvas; `under` (0 or a space for none) is drawn inside it in
  // `inside` when `block`.
  static void caretBlock(Painter& p, const Colour& colour, bool block, wchar_t under,
                         const iFont& font, const Colour& inside);

 private:
  const Palette& palette_;
};

}  // namespace Glib
