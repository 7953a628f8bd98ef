#pragma once
// One line of text shaped once and kept ready to draw: its glyph runs with their Cairo fonts,
// its size, and the caret position before every character. Characters map one to one onto
// caret indices; control characters and invalid code points show as replacement marks.
#include <cairo.h>
#include <pango/pango.h>
#include <pixman.h>

#include <vector>

#include "platform/kw/Box.h"
#include "platform/kw/Ptr.h"
#include "platform/kw/String.h"

namespace Glib {

class GlyphCache;

class TextLayout : public Kw::RefCounted {
 public:
  // Longer text is shaped only up to this many characters; the rest is never visible in a
  // single-line box and would overflow the shaper's coordinates.
  static constexpr int kMaxChars = 65536;
  static constexpr uint32_t kCoverageLimit = 0x2100;

  // The font's line box and primary face, which simple text is shaped with directly.
  struct FontInfo {
    PangoContext* context = nullptr;
    const PangoFontDescription* desc = nullptr;
    PangoFont* primary = nullptr;  // may be null: every text then takes the full layout
    // Whether the primary face has a glyph, by code point below kCoverageLimit: 0 not known
    // yet, 1 yes, 2 no. Filled as text is shaped.
    std::vector<uint8_t>* coverage = nullptr;
    GlyphCache* glyphs = nullptr;  // where masks take their glyphs from
    int lineHeight = 0;
    int baseline = 0;
  };

  TextLayout(const FontInfo& font, const WString& text);
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

  // The text's coverage as an 8-bit mask, made on first use and kept: compositing it is one
  // operation however many glyphs the text has. (x, y) is the mask's top-left corner relative
  // to the layout's; the image is null for text that shows nothing and for text too large to
  // keep as a picture (see hasMask).
  struct Mask {
    pixman_image_t* image = nullptr;
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
  };
  const Mask& mask() const;
  // False when the text is drawn glyph by glyph instead (wider than kMaxMaskWidth).
  bool hasMask() const;
  static constexpr int kMaxMaskWidth = 4096;

  // The text as it is shaped: one character per input character, unprintable ones replaced.
  static WString displayText(const WString& text);

 private:
  struct Run {
    cairo_scaled_font_t* font = nullptr;
    std::vector<cairo_glyph_t> glyphs;
  };
  // A character that no face of the font configuration has: drawn as an outlined box.
  struct MissingGlyph {
    double x, width;
  };

  // A glyph cluster: where its characters start in the UTF-8 text and its extent (Pango units).
  struct Cluster {
    int startByte, x0, x1;
    bool rtl;
  };

  // Text of one script that the primary face covers, left to right, is shaped as one item;
  // anything else takes Pango's full layout (fallback fonts, bidirectional text).
  bool shapeSimple(const FontInfo& font, const WString& shown, const std::string& utf8,
                   const std::vector<int>& byteOfChar);
  void shapeWithLayout(const FontInfo& font, const std::string& utf8,
                       const std::vector<int>& byteOfChar);
  // Takes the glyphs of one run starting `x` Pango units into the line; its clusters count
  // bytes from `byteOffset`.
  void addRun(PangoFont* font, const PangoGlyphString* glyphs, int x, int baseline, int byteOffset,
              bool rtl, std::vector<Cluster>& clusters);
  void setCarets(std::vector<Cluster>& clusters, const std::vector<int>& byteOfChar,
                 int totalBytes);

  std::vector<Run> runs_;
  std::vector<MissingGlyph> missing_;
  std::vector<int> caretX_;
  Kw::Box<int> ink_;  // ink extents relative to the layout's top-left, top-down
  GlyphCache* glyphCache_ = nullptr;
  mutable Mask mask_;
  mutable cairo_surface_t* maskSurface_ = nullptr;
  mutable bool maskMade_ = false;
  int width_ = 0;
  int height_ = 0;
  int baseline_ = 0;
};

}  // namespace Glib
