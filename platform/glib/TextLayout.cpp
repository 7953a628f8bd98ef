#include "platform/glib/TextLayout.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>

#include "platform/glib/GlyphCache.h"

namespace Glib {

namespace {

constexpr wchar_t kReplacement = 0xFFFD;

bool printable(wchar_t c) {
  const auto u = static_cast<uint32_t>(c);
  if (u < 0x20 || (u >= 0x7F && u < 0xA0)) return false;  // C0 and C1 controls
  if (u >= 0xD800 && u <= 0xDFFF) return false;           // lone surrogates
  if (u > 0x10FFFF) return false;
  // Line and paragraph separators would break the single line.
  return u != 0x2028 && u != 0x2029;
}

// UTF-8 of `text`, noting where each character starts.
std::string encode(const WString& text, std::vector<int>& byteOfChar) {
  std::string out;
  out.reserve(text.size());
  byteOfChar.resize(text.size());
  for (size_t i = 0; i < text.size(); ++i) {
    byteOfChar[i] = static_cast<int>(out.size());
    const auto u = static_cast<uint32_t>(text[i]);
    if (u < 0x80) {
      out += static_cast<char>(u);
    } else if (u < 0x800) {
      out += static_cast<char>(0xC0 | (u >> 6));
      out += static_cast<char>(0x80 | (u & 0x3F));
    } else if (u < 0x10000) {
      out += static_cast<char>(0xE0 | (u >> 12));
      out += static_cast<char>(0x80 | ((u >> 6) & 0x3F));
      out += static_cast<char>(0x80 | (u & 0x3F));
    } else {
      out += static_cast<char>(0xF0 | (u >> 18));
      out += static_cast<char>(0x80 | ((u >> 12) & 0x3F));
      out += static_cast<char>(0x80 | ((u >> 6) & 0x3F));
      out += static_cast<char>(0x80 | (u & 0x3F));
    }
  }
  return out;
}

int toPixels(int pangoUnits) {
  return PANGO_PIXELS(pangoUnits);
}

}  // namespace

WString TextLayout::displayText(const WString& text) {
  WString out = text.size() > static_cast<size_t>(kMaxChars) ? text.substr(0, kMaxChars) : text;
  for (wchar_t& c : out) {
    if (c == L'\t') {
      c = L' ';
    } else if (!printable(c)) {
      c = kReplacement;
    }
  }
  return out;
}

TextLayout::TextLayout(const FontInfo& font, const WString& text) : glyphCache_(font.glyphs) {
  const WString shown = displayText(text);
  std::vector<int> byteOfChar;
  const std::string utf8 = encode(shown, byteOfChar);
  if (!shapeSimple(font, shown, utf8, byteOfChar)) shapeWithLayout(font, utf8, byteOfChar);
}

bool TextLayout::shapeSimple(const FontInfo& font, const WString& shown, const std::string& utf8,
                             const std::vector<int>& byteOfChar) {
  if (!font.primary) return false;
  for (wchar_t c : shown) {
    const auto u = static_cast<uint32_t>(c);
    // Latin letters, punctuation and symbols: one script, left to right, no reordering.
    const bool simple = u < 0x250 || (u >= 0x2000 && u < 0x2070) || (u >= 0x20A0 && u < 0x20D0);
    if (!simple) return false;
    uint8_t covered = 0;
    if (font.coverage && u < kCoverageLimit) covered = (*font.coverage)[u];
    if (covered == 0) {
      covered = pango_font_has_char(font.primary, u) ? 1 : 2;
      if (font.coverage && u < kCoverageLimit) (*font.coverage)[u] = covered;
    }
    if (covered != 1) return false;
  }
  PangoAnalysis analysis{};
  analysis.font = font.primary;
  analysis.level = 0;
  analysis.gravity = PANGO_GRAVITY_SOUTH;
  analysis.script = PANGO_SCRIPT_LATIN;
  analysis.language = pango_context_get_language(font.context);
  PangoGlyphString* glyphs = pango_glyph_string_new();
  const int len = static_cast<int>(utf8.size());
  pango_shape_with_flags(utf8.data(), len, utf8.data(), len, &analysis, glyphs,
                         PANGO_SHAPE_ROUND_POSITIONS);
  PangoRectangle ink, logical;
  pango_glyph_string_extents(glyphs, font.primary, &ink, &logical);
  const int baseline = font.baseline * PANGO_SCALE;
  ink.y += baseline;
  pango_extents_to_pixels(&ink, nullptr);
  ink_ = Kw::Box<int>::fromSize(ink.x, ink.y, ink.width, ink.height);
  width_ = toPixels(logical.width);
  height_ = font.lineHeight;
  baseline_ = font.baseline;
  std::vector<Cluster> clusters;
  addRun(font.primary, glyphs, 0, baseline, 0, false, clusters);
  pango_glyph_string_free(glyphs);
  setCarets(clusters, byteOfChar, len);
  return true;
}

void TextLayout::shapeWithLayout(const FontInfo& font, const std::string& utf8,
                                 const std::vector<int>& byteOfChar) {
  PangoLayout* layout = pango_layout_new(font.context);
  pango_layout_set_font_description(layout, font.desc);
  pango_layout_set_single_paragraph_mode(layout, TRUE);
  pango_layout_set_text(layout, utf8.data(), static_cast<int>(utf8.size()));

  PangoRectangle ink, logical;
  pango_layout_get_extents(layout, &ink, &logical);
  pango_extents_to_pixels(&ink, nullptr);
  ink_ = Kw::Box<int>::fromSize(ink.x, ink.y, ink.width, ink.height);
  width_ = toPixels(logical.x + logical.width);
  height_ = toPixels(logical.height);
  baseline_ = toPixels(pango_layout_get_baseline(layout));

  std::vector<Cluster> clusters;
  PangoLayoutIter* it = pango_layout_get_iter(layout);
  const int baseline = pango_layout_iter_get_baseline(it);
  do {
    PangoLayoutRun* run = pango_layout_iter_get_run_readonly(it);
    if (!run) continue;
    PangoRectangle runLogical;
    pango_layout_iter_get_run_extents(it, nullptr, &runLogical);
    // Glyph clusters count from the start of the run's item.
    addRun(run->item->analysis.font, run->glyphs, runLogical.x, baseline, run->item->offset,
           (run->item->analysis.level % 2) != 0, clusters);
  } while (pango_layout_iter_next_run(it));
  pango_layout_iter_free(it);
  g_object_unref(layout);
  setCarets(clusters, byteOfChar, static_cast<int>(utf8.size()));
}

void TextLayout::addRun(PangoFont* font, const PangoGlyphString* gs, int x, int baseline,
                        int byteOffset, bool rtl, std::vector<Cluster>& clusters) {
  cairo_scaled_font_t* sf = pango_cairo_font_get_scaled_font(PANGO_CAIRO_FONT(font));
  Run out;
  if (sf) out.font = cairo_scaled_font_reference(sf);
  out.glyphs.reserve(static_cast<size_t>(gs->num_glyphs));
  for (int i = 0; i < gs->num_glyphs; ++i) {
    const PangoGlyphInfo& gi = gs->glyphs[i];
    if (gi.glyph == PANGO_GLYPH_EMPTY) {
      // Nothing to draw.
    } else if ((gi.glyph & PANGO_GLYPH_UNKNOWN_FLAG) || !sf) {
      missing_.push_back({x / double(PANGO_SCALE), gi.geometry.width / double(PANGO_SCALE)});
    } else {
      cairo_glyph_t g;
      g.index = gi.glyph;
      g.x = (x + gi.geometry.x_offset) / double(PANGO_SCALE);
      g.y = (baseline + gi.geometry.y_offset) / double(PANGO_SCALE);
      out.glyphs.push_back(g);
    }
    // A glyph that starts a new cluster opens it; the rest widen it.
    if (i == 0 || gs->log_clusters[i] != gs->log_clusters[i - 1]) {
      clusters.push_back({byteOffset + gs->log_clusters[i], x, x + gi.geometry.width, rtl});
    } else {
      Cluster& c = clusters.back();
      c.x0 = std::min(c.x0, x);
      c.x1 = std::max(c.x1, x + gi.geometry.width);
    }
    x += gi.geometry.width;
  }
  if (out.font) runs_.push_back(std::move(out));
}

TextLayout::~TextLayout() {
  if (mask_.image) pixman_image_unref(mask_.image);
  if (maskSurface_) cairo_surface_destroy(maskSurface_);
  for (Run& r : runs_) cairo_scaled_font_destroy(r.font);
}

bool TextLayout::hasMask() const {
  mask();
  return mask_.image != nullptr || (ink_.empty() && missing_.empty());
}

const TextLayout::Mask& TextLayout::mask() const {
  if (maskMade_) return mask_;
  maskMade_ = true;
  // Ink and the replacement boxes, with a pixel to spare for anti-aliasing.
  Kw::Box<int> area = ink_;
  if (!missing_.empty()) area = area.united(Kw::Box<int>(0, 0, width_, height_));
  if (area.empty()) return mask_;
  area = Kw::Box<int>(area.x0 - 1, area.y0 - 1, area.x1 + 1, area.y1 + 1);
  if (area.width() > kMaxMaskWidth || area.height() > kMaxMaskWidth) return mask_;
  maskSurface_ = cairo_image_surface_create(CAIRO_FORMAT_A8, area.width(), area.height());
  if (cairo_surface_status(maskSurface_) != CAIRO_STATUS_SUCCESS) {
    cairo_surface_destroy(maskSurface_);
    maskSurface_ = nullptr;
    return mask_;
  }
  if (glyphCache_ && missing_.empty()) {
    unsigned char* data = cairo_image_surface_get_data(maskSurface_);
    const int stride = cairo_image_surface_get_stride(maskSurface_);
    for (const Run& r : runs_) {
      for (const cairo_glyph_t& g : r.glyphs) {
        const GlyphCache::Bitmap& b = glyphCache_->get(r.font, g.index);
        const int gx = static_cast<int>(std::lround(g.x)) + b.x - area.x0;
        const int gy = static_cast<int>(std::lround(g.y)) + b.y - area.y0;
        for (int y = std::max(0, -gy); y < b.height && gy + y < area.height(); ++y) {
          unsigned char* row = data + (gy + y) * stride;
          const uint8_t* src = &b.coverage[static_cast<size_t>(y) * b.width];
          for (int x = std::max(0, -gx); x < b.width && gx + x < area.width(); ++x) {
            // Coverage over coverage, as overlapping glyphs combine.
            const unsigned s = src[x];
            const unsigned d = row[gx + x];
            if (s == 0) continue;
            row[gx + x] = d == 0 ? static_cast<unsigned char>(s)
                                 : static_cast<unsigned char>(s + d - (s * d + 127) / 255);
          }
        }
      }
    }
    cairo_surface_mark_dirty(maskSurface_);
  } else {
    cairo_t* cr = cairo_create(maskSurface_);
    cairo_set_source_rgba(cr, 0, 0, 0, 1);
    draw(cr, -area.x0, -area.y0);
    cairo_destroy(cr);
    cairo_surface_flush(maskSurface_);
  }
  mask_.image = pixman_image_create_bits(
      PIXMAN_a8, area.width(), area.height(),
      reinterpret_cast<uint32_t*>(cairo_image_surface_get_data(maskSurface_)),
      cairo_image_surface_get_stride(maskSurface_));
  mask_.x = area.x0;
  mask_.y = area.y0;
  mask_.width = area.width();
  mask_.height = area.height();
  return mask_;
}

void TextLayout::setCarets(std::vector<Cluster>& clusters, const std::vector<int>& byteOfChar,
                           int totalBytes) {
  const int n = static_cast<int>(byteOfChar.size());
  caretX_.assign(static_cast<size_t>(n) + 1, width_);
  caretX_[0] = 0;
  if (n == 0) return;
  std::sort(clusters.begin(), clusters.end(),
            [](const Cluster& a, const Cluster& b) { return a.startByte < b.startByte; });
  // Characters inside one cluster (ligatures, combining marks) share its width evenly.
  int ch = 0;
  for (size_t c = 0; c < clusters.size(); ++c) {
    const Cluster& cl = clusters[c];
    const int endByte = c + 1 < clusters.size() ? clusters[c + 1].startByte : totalBytes;
    while (ch < n && byteOfChar[static_cast<size_t>(ch)] < cl.startByte) ++ch;
    int last = ch;
    while (last < n && byteOfChar[static_cast<size_t>(last)] < endByte) ++last;
    const int count = std::max(1, last - ch);
    for (int k = ch; k < last; ++k) {
      const int offset = (cl.x1 - cl.x0) * (k - ch) / count;
      caretX_[static_cast<size_t>(k)] = toPixels(cl.rtl ? cl.x1 - offset : cl.x0 + offset);
    }
    if (last == n && last > ch) caretX_[static_cast<size_t>(n)] = toPixels(cl.rtl ? cl.x0 : cl.x1);
    ch = last;
  }
}

int TextLayout::caretX(int index) const {
  index = std::clamp(index, 0, length());
  return caretX_[static_cast<size_t>(index)];
}

int TextLayout::nearestIndex(int x) const {
  int best = 0;
  int bestDistance = std::abs(caretX_[0] - x);
  for (int i = 1; i <= length(); ++i) {
    const int d = std::abs(caretX_[static_cast<size_t>(i)] - x);
    if (d < bestDistance) {
      best = i;
      bestDistance = d;
    }
  }
  return best;
}

void TextLayout::draw(cairo_t* cr, double left, double top) const {
  cairo_translate(cr, left, top);
  for (const Run& r : runs_) {
    cairo_set_scaled_font(cr, r.font);
    cairo_show_glyphs(cr, r.glyphs.data(), static_cast<int>(r.glyphs.size()));
  }
  if (!missing_.empty()) {
    cairo_set_line_width(cr, 1.0);
    for (const MissingGlyph& m : missing_) {
      cairo_rectangle(cr, std::floor(m.x) + 1.5, 2.5, std::max(1.0, m.width - 3.0), height_ - 5.0);
    }
    cairo_stroke(cr);
  }
  cairo_translate(cr, -left, -top);
}

}  // namespace Glib
