#pragma once
// Rendered glyphs as 8-bit coverage, by Cairo font and glyph index, so that building a text's
// mask is a few small copies instead of a pass through the full glyph machinery. Glyphs land
// on whole pixels, as Cairo places them on image surfaces.
#include <cairo.h>

#include <cstddef>
#include <cstdint>
#include <functional>
#include <unordered_map>
#include <vector>

namespace Glib {

class GlyphCache {
 public:
  // Past this many glyphs the cache starts again from empty.
  static constexpr size_t kMaxGlyphs = 8192;

  struct Bitmap {
    int x = 0, y = 0;  // top-left corner relative to the glyph's origin on the baseline
    int width = 0, height = 0;
    std::vector<uint8_t> coverage;  // rows of `width` bytes
  };

  GlyphCache() = default;
  ~GlyphCache();
  GlyphCache(const GlyphCache&) = delete;
  GlyphCache& operator=(const GlyphCache&) = delete;

  const Bitmap& get(cairo_scaled_font_t* font, unsigned long glyph);
  size_t size() const { return glyphs_.size(); }
  void clear();

 private:
  struct Key {
    cairo_scaled_font_t* font;
    unsigned long glyph;
    bool operator==(const Key& o) const { return font == o.font && glyph == o.glyph; }
  };
  struct KeyHash {
    size_t operator()(const Key& k) const {
      return std::hash<const void*>()(k.font) ^
             (static_cast<size_t>(k.glyph) * 0x9E3779B97F4A7C15ull);
    }
  };

  std::unordered_map<Key, Bitmap, KeyHash> glyphs_;
  // The fonts the keys name stay alive while they are keys.
  std::vector<cairo_scaled_font_t*> fonts_;
};

}  // namespace Glib
