#include "platform/glib/FontCache.h"

#include <pango/pangocairo.h>
#include <pango/pangofc-fontmap.h>

#include "platform/misc/Diagnostics.h"

namespace Glib {

FontCache::Shaper FontCache::makeShaper(FcConfig* config) {
  Shaper s;
  // FreeType fonts through fontconfig: the only kind of font map that takes a configuration.
  s.map = pango_cairo_font_map_new_for_font_type(CAIRO_FONT_TYPE_FT);
  // A null configuration leaves the map on the system's.
  if (config && s.map) pango_fc_font_map_set_config(PANGO_FC_FONT_MAP(s.map), config);
  if (!s.map) s.map = pango_cairo_font_map_new();
  s.context = pango_font_map_create_context(s.map);
  cairo_font_options_t* options = cairo_font_options_create();
  cairo_font_options_set_antialias(options, CAIRO_ANTIALIAS_GRAY);
  cairo_font_options_set_subpixel_order(options, CAIRO_SUBPIXEL_ORDER_DEFAULT);
  cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_SLIGHT);
  cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_ON);
  pango_cairo_context_set_font_options(s.context, options);
  cairo_font_options_destroy(options);
  pango_cairo_context_set_resolution(s.context, 96.0);
  pango_context_set_round_glyph_positions(s.context, TRUE);
  pango_context_set_base_dir(s.context, PANGO_DIRECTION_LTR);
  return s;
}

void FontCache::Shaper::release() {
  if (context) g_object_unref(context);
  if (map) g_object_unref(map);
  context = nullptr;
  map = nullptr;
}

FontCache::FontCache() : own_(makeShaper(library_.config())) {}

FontCache::~FontCache() {
  lastFont_.reset();
  layouts_.clear();
  fonts_.clear();
  glyphs_.clear();
  own_.release();
  system_.release();
}

PangoContext* FontCache::systemContext() {
  if (!system_.context) system_ = makeShaper(nullptr);
  return system_.context;
}

Kw::Ptr<ShapedFont> FontCache::get(const FontDesc& desc) {
  if (lastFont_ && desc == lastAsked_) return lastFont_;
  Kw::Ptr<ShapedFont> font = find(desc);
  lastAsked_ = desc;
  lastFont_ = font;
  return font;
}

Kw::Ptr<ShapedFont> FontCache::find(const FontDesc& desc) {
  const FontDesc key = desc.resolved();
  if (auto it = fonts_.find(key); it != fonts_.end()) return it->second;
  String family = library_.family(key.face);
  PangoContext* context = own_.context;
  if (family.empty()) {
    if (reported_.insert(key.face).second) {
      diagWarning("font face \"" + key.face +
                  "\" is not among the library's fonts; the system's fonts stand in for it\n");
    }
    family = key.face;
    context = systemContext();
  }
  Kw::Ptr<ShapedFont> font(new ShapedFont(key, family, context, layouts_, glyphs_, nextId_++));
  fonts_.emplace(key, font);
  return font;
}

bool FontCache::addFontFile(const String& path) {
  if (!library_.addFile(path)) return false;
  // Fonts already handed out hold the old map through their context and stay usable.
  own_.release();
  own_ = makeShaper(library_.config());
  lastFont_.reset();
  fonts_.clear();
  return true;
}

FontCache& fonts() {
  static FontCache cache;
  return cache;
}

}  // namespace Glib
