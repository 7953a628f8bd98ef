#pragma once
// How a tooltip's text is broken into lines, apart from any canvas so that it can be tested
// alone: line breaks (10) end lines, a carriage return before one is dropped, and blank lines
// at either end are left out.
//
// Choices made here, for texts nobody meant to show whole:
// - A line wider than the widest line allowed wraps at spaces, and a word wider than that by
//   itself breaks between characters.
// - Only the first kMaxCharacters characters and the first kMaxLines lines are laid out; a
//   text cut short ends in an ellipsis.
// - A text of nothing but spaces and line breaks has nothing to show.
#include <cstddef>
#include <vector>

#include "platform/kw/String.h"

namespace Glib {
class iFont;
}

class ToolTipLayout {
 public:
  static constexpr int kMaxLineWidth = 480;
  static constexpr std::size_t kMaxLines = 24;
  static constexpr std::size_t kMaxCharacters = 2000;
  static constexpr wchar_t kEllipsis = 0x2026;

  static bool hasSomethingToShow(const WString& text);
  static std::vector<WString> lines(const WString& text, const Glib::iFont& font,
                                    int maxWidth = kMaxLineWidth);
  // The widest of `lines` in `font`.
  static int widest(const std::vector<WString>& lines, const Glib::iFont& font);

 private:
  static void wrap(const WString& paragraph, const Glib::iFont& font, int maxWidth,
                   std::vector<WString>& out);
  // The longest prefix of `word` (at least one character) that fits in `maxWidth`.
  static std::size_t fittingPrefix(const WString& word, const Glib::iFont& font, int maxWidth);
};
