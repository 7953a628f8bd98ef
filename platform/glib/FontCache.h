#pragma once
// The font service: one font object per description, all sharing one Pango context whose
// rendering options are fixed (grey-scale anti-aliasing, slight hinting, hinted metrics), so
// that text renders identically from run to run whatever the desktop's settings.
#include <pango/pango.h>

#include <unordered_map>

#include "platform/glib/FontDesc.h"
#include "platform/glib/GlyphCache.h"
#include "platform/glib/LayoutCache.h"
#include "platform/glib/ShapedFont.h"

namespace Glib {

class FontCache {
 public:
  FontCache();
  ~FontCache();
  FontCache(const FontCache&) = delete;
  FontCache& operator=(const FontCache&) = delete;

  // The font for `desc` (defaults filled in); the same object for equal descriptions.
  Kw::Ptr<ShapedFont> get(const FontDesc& desc);
  // The standard UI font.
  Kw::Ptr<ShapedFont> standard() { return get(FontDesc()); }

  LayoutCache& layouts() { return layouts_; }
  size_t fontCount() const { return fonts_.size(); }

 private:
  PangoFontMap* fontMap_;
  PangoContext* context_;
  GlyphCache glyphs_;
  LayoutCache layouts_;
  std::unordered_map<FontDesc, Kw::Ptr<ShapedFont>, FontDescHash> fonts_;
  int nextId_ = 1;
};

// The process's font service (GUI thread only).
FontCache& fonts();

}  // namespace Glib
