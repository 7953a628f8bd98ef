#pragma once
// One line of text shaped once and kept ready to draw: its glyph runs with their Cairo fonts,
// its size, and the caret position before every character. Characters map one to one onto
// caret indices; control characters and invalid code points show as replacement marks.
#include <cairo.h>
#include <pango/pango.h>

#include <vector>

#include "platform/kw/Ptr.h"
#include "platform/kw/String.h"

namespace Glib {

class TextLayout : public Kw::RefCounted {
 public:
  // Longer text is shaped only up to this many characters; the rest is never visible in a
  // single-line box and would overflow the shaper's coordinates.
  static constexpr int kMaxChars = 65536;

  TextLayout(PangoContext* context, const PangoFontDescription* font, const WString& text);
  ~TextLayout() override;
  TextLayout(const TextLayout&) = delete;
  TextLayout& operator=(const TextLayout&) = delete;

  int width() const { return width_; }
  int height() const { return height_; }
  // Distance of the baseline below the layout's top.
  int baseline() const { return baseline_; }
  // Characters shaped (the text's length, up to kMaxChars).
  int length() const { return static_cast<int>(caretX_.size()) - 1; }
  // Caret x before character `index` (clamped to 0..length()).
  int caretX(int index) const;
  // The caret index nearest to `x`.
  int nearestIndex(int x) const;

  // Draws with the current source of `cr`; (left, top) in Cairo's top-down user space.
  void draw(cairo_t* cr, double left, double top) const;

  // The text as it is shaped: one character per input character, unprintable ones replaced.
  static WString displayText(const WString& text);

 private:
  struct Run {
    cairo_scaled_font_t* font = nullptr;
    std::vector<cairo_glyph_t> glyphs;
  };
  // A character no installed font has: drawn as an outlined box.
  struct MissingGlyph {
    double x, width;
  };

  void extractRuns(PangoLayout* layout);
  void extractCarets(PangoLayout* layout, const std::vector<int>& byteOfChar, int totalBytes);

  std::vector<Run> runs_;
  std::vector<MissingGlyph> missing_;
  std::vector<int> caretX_;
  int width_ = 0;
  int height_ = 0;
  int baseline_ = 0;
};

}  // namespace Glib
