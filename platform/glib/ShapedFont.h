#pragma once
// The font service's font: Pango shapes its text, the layout cache keeps the results.
#include <pango/pango.h>

#include <vector>

#include "platform/glib/TextLayout.h"
#include "platform/glib/iFont.h"

namespace Glib {

class GlyphCache;
class LayoutCache;

class ShapedFont : public iFont {
 public:
  // `desc` is resolved (face and size filled in); `family` is the name `context` knows its face
  // by. The font keeps a reference on `context`.
  ShapedFont(const FontDesc& desc, const String& family, PangoContext* context,
             LayoutCache& layouts, GlyphCache& glyphs, int id);
  ~ShapedFont() override;
  ShapedFont(const ShapedFont&) = delete;
  ShapedFont& operator=(const ShapedFont&) = delete;

  int height() const override { return height_; }
  int ascent() const override { return ascent_; }
  int textWidth(const WString& text) const override;
  CharacterLocation charSeek(const WString& text, int fromIndex, eCharSeekMethod method,
                             int toIndex = 0) const override;
  CharacterLocation locate(const WString& text, int x) const override;

  // The shaped text, from the layout cache when it is there.
  Kw::Ptr<TextLayout> layout(const WString& text) const;
  // The file the face is read from (empty when the font system does not say).
  String fileName() const;

 private:
  PangoContext* context_;
  PangoFontDescription* pangoDesc_;
  TextLayout::FontInfo info_;
  std::vector<uint8_t> coverage_;
  LayoutCache& layouts_;
  int id_;
  int height_ = 0;
  int ascent_ = 0;
};

}  // namespace Glib
