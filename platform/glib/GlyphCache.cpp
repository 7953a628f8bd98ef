#include "platform/glib/GlyphCache.h"

#include <algorithm>
#include <cmath>
#include <cstring>

namespace Glib {

GlyphCache::~GlyphCache() {
  clear();
}

void GlyphCache::clear() {
  glyphs_.clear();
  for (cairo_scaled_font_t* f : fonts_) cairo_scaled_font_destroy(f);
  fonts_.clear();
}

const GlyphCache::Bitmap& GlyphCache::get(cairo_scaled_font_t* font, unsigned long glyph) {
  const Key key{font, glyph};
  if (auto it = glyphs_.find(key); it != glyphs_.end()) return it->second;
  if (glyphs_.size() >= kMaxGlyphs) clear();
  if (std::find(fonts_.begin(), fonts_.end(), font) == fonts_.end()) {
    fonts_.push_back(cairo_scaled_font_reference(font));
  }

  Bitmap b;
  cairo_glyph_t g{glyph, 0.0, 0.0};
  cairo_text_extents_t ext;
  cairo_scaled_font_glyph_extents(font, &g, 1, &ext);
  if (ext.width > 0 && ext.height > 0) {
    // A pixel to spare on each side for anti-aliasing and hinting.
    b.x = static_cast<int>(std::floor(ext.x_bearing)) - 1;
    b.y = static_cast<int>(std::floor(ext.y_bearing)) - 1;
    b.width = static_cast<int>(std::ceil(ext.x_bearing + ext.width)) + 1 - b.x;
    b.height = static_cast<int>(std::ceil(ext.y_bearing + ext.height)) + 1 - b.y;
    cairo_surface_t* s = cairo_image_surface_create(CAIRO_FORMAT_A8, b.width, b.height);
    cairo_t* cr = cairo_create(s);
    cairo_set_scaled_font(cr, font);
    g.x = -b.x;
    g.y = -b.y;
    cairo_show_glyphs(cr, &g, 1);
    cairo_destroy(cr);
    cairo_surface_flush(s);
    const unsigned char* data = cairo_image_surface_get_data(s);
    const int stride = cairo_image_surface_get_stride(s);
    b.coverage.resize(static_cast<size_t>(b.width) * b.height);
    for (int y = 0; y < b.height; ++y) {
      std::memcpy(&b.coverage[static_cast<size_t>(y) * b.width], data + y * stride,
                  static_cast<size_t>(b.width));
    }
    cairo_surface_destroy(s);
  }
  return glyphs_.emplace(key, std::move(b)).first->second;
}

}  // namespace Glib
