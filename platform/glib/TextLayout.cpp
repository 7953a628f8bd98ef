#include "platform/glib/TextLayout.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>

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

TextLayout::TextLayout(PangoContext* context, const PangoFontDescription* font,
                       const WString& text) {
  const WString shown = displayText(text);
  std::vector<int> byteOfChar;
  const std::string utf8 = encode(shown, byteOfChar);

  PangoLayout* layout = pango_layout_new(context);
  pango_layout_set_font_description(layout, font);
  pango_layout_set_single_paragraph_mode(layout, TRUE);
  pango_layout_set_text(layout, utf8.data(), static_cast<int>(utf8.size()));

  PangoRectangle logical;
  pango_layout_get_extents(layout, nullptr, &logical);
  width_ = toPixels(logical.x + logical.width);
  height_ = toPixels(logical.height);
  baseline_ = toPixels(pango_layout_get_baseline(layout));

  extractRuns(layout);
  extractCarets(layout, byteOfChar, static_cast<int>(utf8.size()));
  g_object_unref(layout);
}

TextLayout::~TextLayout() {
  for (Run& r : runs_) cairo_scaled_font_destroy(r.font);
}

void TextLayout::extractRuns(PangoLayout* layout) {
  PangoLayoutIter* it = pango_layout_get_iter(layout);
  const int baseline = pango_layout_iter_get_baseline(it);
  do {
    PangoLayoutRun* run = pango_layout_iter_get_run_readonly(it);
    if (!run) continue;
    PangoRectangle logical;
    pango_layout_iter_get_run_extents(it, nullptr, &logical);
    cairo_scaled_font_t* sf =
        pango_cairo_font_get_scaled_font(PANGO_CAIRO_FONT(run->item->analysis.font));
    if (!sf) continue;
    Run out;
    out.font = cairo_scaled_font_reference(sf);
    int x = logical.x;
    const PangoGlyphString* gs = run->glyphs;
    out.glyphs.reserve(static_cast<size_t>(gs->num_glyphs));
    for (int i = 0; i < gs->num_glyphs; ++i) {
      const PangoGlyphInfo& gi = gs->glyphs[i];
      if (gi.glyph == PANGO_GLYPH_EMPTY) {
        // Nothing to draw.
      } else if (gi.glyph & PANGO_GLYPH_UNKNOWN_FLAG) {
        missing_.push_back({x / double(PANGO_SCALE), gi.geometry.width / double(PANGO_SCALE)});
      } else {
        cairo_glyph_t g;
        g.index = gi.glyph;
        g.x = (x + gi.geometry.x_offset) / double(PANGO_SCALE);
        g.y = (baseline + gi.geometry.y_offset) / double(PANGO_SCALE);
        out.glyphs.push_back(g);
      }
      x += gi.geometry.width;
    }
    runs_.push_back(std::move(out));
  } while (pango_layout_iter_next_run(it));
  pango_layout_iter_free(it);
}

void TextLayout::extractCarets(PangoLayout* layout, const std::vector<int>& byteOfChar,
                               int totalBytes) {
  const int n = static_cast<int>(byteOfChar.size());
  caretX_.assign(static_cast<size_t>(n) + 1, width_);
  if (n == 0) {
    caretX_[0] = 0;
    return;
  }
  struct Cluster {
    int startByte, x0, x1;
    bool rtl;
  };
  std::vector<Cluster> clusters;
  PangoLayoutIter* it = pango_layout_get_iter(layout);
  do {
    PangoLayoutRun* run = pango_layout_iter_get_run_readonly(it);
    if (!run) continue;
    PangoRectangle logical;
    pango_layout_iter_get_cluster_extents(it, nullptr, &logical);
    clusters.push_back({pango_layout_iter_get_index(it), logical.x, logical.x + logical.width,
                        (run->item->analysis.level % 2) != 0});
  } while (pango_layout_iter_next_cluster(it));
  pango_layout_iter_free(it);
  std::sort(clusters.begin(), clusters.end(),
            [](const Cluster& a, const Cluster& b) { return a.startByte < b.startByte; });

  // Characters inside one cluster (ligatures, combining marks) share its width evenly.
  int ch = 0;
  for (size_t c = 0; c < clusters.size(); ++c) {
    const Cluster& cl = clusters[c];
    const int endByte = c + 1 < clusters.size() ? clusters[c + 1].startByte : totalBytes;
    while (ch < n && byteOfChar[ch] < cl.startByte) ++ch;
    int last = ch;
    while (last < n && byteOfChar[last] < endByte) ++last;
    const int count = std::max(1, last - ch);
    for (int k = ch; k < last; ++k) {
      const int offset = (cl.x1 - cl.x0) * (k - ch) / count;
      caretX_[k] = toPixels(cl.rtl ? cl.x1 - offset : cl.x0 + offset);
    }
    if (last == n) caretX_[n] = toPixels(cl.rtl ? cl.x0 : cl.x1);
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
