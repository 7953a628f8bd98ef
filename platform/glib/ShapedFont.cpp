#include "platform/glib/ShapedFont.h"

#include <pango/pangofc-font.h>

#include <algorithm>

#include "platform/glib/LayoutCache.h"
#include "platform/kw/CharClassifier.h"

namespace Glib {

ShapedFont::ShapedFont(const FontDesc& desc, const String& family, PangoContext* context,
                       LayoutCache& layouts, GlyphCache& glyphs, int id)
    : iFont(desc),
      context_(static_cast<PangoContext*>(g_object_ref(context))),
      pangoDesc_(pango_font_description_new()),
      layouts_(layouts),
      id_(id) {
  pango_font_description_set_family(pangoDesc_, family.c_str());
  pango_font_description_set_absolute_size(pangoDesc_, desc.size * double(PANGO_SCALE));
  pango_font_description_set_weight(pangoDesc_,
                                    desc.bold() ? PANGO_WEIGHT_BOLD : PANGO_WEIGHT_NORMAL);
  pango_font_description_set_style(pangoDesc_,
                                   desc.italic() ? PANGO_STYLE_ITALIC : PANGO_STYLE_NORMAL);
  info_.context = context_;
  info_.desc = pangoDesc_;
  // The line box of an empty layout is the font's own line box.
  TextLayout empty(info_, WString());
  height_ = empty.height();
  ascent_ = empty.baseline();
  info_.lineHeight = height_;
  info_.baseline = ascent_;
  info_.primary = pango_context_load_font(context_, pangoDesc_);
  coverage_.assign(TextLayout::kCoverageLimit, 0);
  info_.coverage = &coverage_;
  info_.glyphs = &glyphs;
}

ShapedFont::~ShapedFont() {
  if (info_.primary) g_object_unref(info_.primary);
  pango_font_description_free(pangoDesc_);
  g_object_unref(context_);
}

String ShapedFont::fileName() const {
  if (!info_.primary || !PANGO_IS_FC_FONT(info_.primary)) return String();
  FcPattern* pattern = pango_fc_font_get_pattern(PANGO_FC_FONT(info_.primary));
  FcChar8* file = nullptr;
  if (!pattern || FcPatternGetString(pattern, FC_FILE, 0, &file) != FcResultMatch) return String();
  return reinterpret_cast<const char*>(file);
}

Kw::Ptr<TextLayout> ShapedFont::layout(const WString& text) const {
  return layouts_.get(id_, text, [&] { return Kw::Ptr<TextLayout>(new TextLayout(info_, text)); });
}

int ShapedFont::textWidth(const WString& text) const {
  if (text.empty()) return 0;
  return layout(text)->width();
}

iFont::CharacterLocation ShapedFont::charSeek(const WString& text, int fromIndex,
                                              eCharSeekMethod method, int toIndex) const {
  const int n = static_cast<int>(text.size());
  const int from = std::clamp(fromIndex, 0, n);
  int to = from;
  switch (method) {
    case PrevChar:
      to = std::max(0, from - 1);
      break;
    case NextChar:
      to = std::min(n, from + 1);
      break;
    case NextWord:
      to = CharClassifier::nextWordStart(text, from);
      break;
    case PrevWord:
      to = CharClassifier::previousWordStart(text, from);
      break;
    case Start:
      to = 0;
      break;
    case End:
      to = n;
      break;
    case ToIndex:
      to = std::clamp(toIndex, 0, n);
      break;
    default:
      break;  // an unknown method leaves the caret where it is
  }
  if (to == 0) return {0, 0};
  return {to, layout(text)->caretX(to)};
}

iFont::CharacterLocation ShapedFont::locate(const WString& text, int x) const {
  if (text.empty()) return {0, 0};
  const Kw::Ptr<TextLayout> l = layout(text);
  const int index = l->nearestIndex(x);
  return {index, l->caretX(index)};
}

}  // namespace Glib
