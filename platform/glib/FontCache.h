#pragma once
// The font service: one font object per description. Faces come from the library's own font
// configuration (FontLibrary), shaped through a Pango context whose rendering options are fixed
// (grey-scale anti-aliasing, slight hinting, hinted metrics, no subpixel order), so that text
// renders identically from run to run and from machine to machine whatever the desktop's and
// the user's font settings.
//
// A face the library does not carry is looked up among the system's fonts instead, through a
// second context with the same fixed options; the first request for each such face is
// reported. An application adds faces of its own with addFontFile().
#include <pango/pango.h>

#include <set>
#include <unordered_map>

#include "platform/glib/FontDesc.h"
#include "platform/glib/FontLibrary.h"
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

  // Adds an application's TrueType or OpenType file to the library's configuration; its
  // families can be asked for by name from then on. Fonts handed out before keep the faces
  // they had; every later request is resolved afresh. False, with a diagnostic and nothing
  // changed, when the file is not a usable font.
  bool addFontFile(const String& path);
  // True when `face` is drawn from a file of the library's configuration.
  bool carries(const String& face) const { return !library_.family(face).empty(); }
  const FontLibrary& library() const { return library_; }

  LayoutCache& layouts() { return layouts_; }
  size_t fontCount() const { return fonts_.size(); }

 private:
  // A Pango font map and the context that shapes with it.
  struct Shaper {
    PangoFontMap* map = nullptr;
    PangoContext* context = nullptr;
    void release();
  };
  static Shaper makeShaper(FcConfig* config);
  PangoContext* systemContext();
  Kw::Ptr<ShapedFont> find(const FontDesc& desc);

  FontLibrary library_;
  Shaper own_;
  Shaper system_;  // made on the first face the library does not carry
  GlyphCache glyphs_;
  LayoutCache layouts_;
  std::unordered_map<FontDesc, Kw::Ptr<ShapedFont>, FontDescHash> fonts_;
  // The last font asked for, as asked: controls built or drawn in a row nearly always ask for
  // the same one, and this answers them without resolving and hashing the description.
  FontDesc lastAsked_;
  Kw::Ptr<ShapedFont> lastFont_;
  std::set<String> reported_;  // faces already reported as falling back
  int nextId_ = 1;
};

// The process's font service (GUI thread only).
FontCache& fonts();

}  // namespace Glib
