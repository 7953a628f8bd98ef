#include "platform/glib/FontCache.h"

#include <pango/pangocairo.h>

namespace Glib {

FontCache::FontCache()
    : fontMap_(pango_cairo_font_map_new()), context_(pango_font_map_create_context(fontMap_)) {
  cairo_font_options_t* options = cairo_font_options_create();
  cairo_font_options_set_antialias(options, CAIRO_ANTIALIAS_GRAY);
  cairo_font_options_set_subpixel_order(options, CAIRO_SUBPIXEL_ORDER_DEFAULT);
  cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_SLIGHT);
  cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_ON);
  pango_cairo_context_set_font_options(context_, options);
  cairo_font_options_destroy(options);
  pango_cairo_context_set_resolution(context_, 96.0);
  pango_context_set_round_glyph_positions(context_, TRUE);
  pango_context_set_base_dir(context_, PANGO_DIRECTION_LTR);
}

FontCache::~FontCache() {
  layouts_.clear();
  fonts_.clear();
  glyphs_.clear();
  g_object_unref(context_);
  g_object_unref(fontMap_);
}

Kw::Ptr<ShapedFont> FontCache::get(const FontDesc& desc) {
  const FontDesc key = desc.resolved();
  if (auto it = fonts_.find(key); it != fonts_.end()) return it->second;
  Kw::Ptr<ShapedFont> font(new ShapedFont(key, context_, layouts_, glyphs_, nextId_++));
  fonts_.emplace(key, font);
  return font;
}

FontCache& fonts() {
  static FontCache cache;
  return cache;
}

}  // namespace Glib
