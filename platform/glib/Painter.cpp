#include "platform/glib/Painter.h"

#include <algorithm>

#include "platform/glib/CairoPaintSession.h"
#include "platform/glib/Image.h"
#include "platform/glib/ShapedFont.h"
#include "platform/glib/Symbols.h"
#include "platform/glob/Canvas.h"

namespace Glib {

namespace {

uint16_t channel16(double v) {
  if (!(v > 0)) return 0;
  if (v >= 1) return 65535;
  return static_cast<uint16_t>(v * 65535 + 0.5);
}

// Pixman takes premultiplied colours.
pixman_color_t premultiplied(const Colour& c) {
  const double a = std::clamp(double{c.a}, 0.0, 1.0);
  return {channel16(c.r * a), channel16(c.g * a), channel16(c.b * a), channel16(a)};
}

}  // namespace

Painter::Painter(Canvas& canvas) {
  pixman_region32_init(&narrowed_);
  auto* session = dynamic_cast<CairoPaintSession*>(canvas.paintSession());
  if (!session || session->currentCanvas() != &canvas) return;
  session_ = session;
  width_ = canvas.width();
  height_ = canvas.height();
}

Painter::~Painter() {
  if (session_) {
    while (!clips_.empty()) popClip();
    if (cr_) cairo_restore(cr_);
  }
  pixman_region32_fini(&narrowed_);
}

cairo_t* Painter::cairo() {
  if (!session_) return nullptr;
  if (!cr_) {
    cr_ = session_->context();
    if (!cr_) return nullptr;
    cairo_save(cr_);
    // Clips pushed before the context existed are part of its base state.
    for (ClipEntry& e : clips_) e.inCairo = false;
    if (!clips_.empty()) {
      rectPath(clips_.back().box);
      cairo_clip(cr_);
    }
  }
  return cr_;
}

void Painter::setSource(const Colour& c) {
  cairo_set_source_rgba(cairo(), c.r, c.g, c.b, c.a);
}

void Painter::rectPath(const Kw::Box<int>& box) {
  cairo_rectangle(cairo(), box.x0, height_ - box.y1, box.width(), box.height());
}

pixman_box32_t Painter::device(const Kw::Box<int>& box) const {
  const XY<int> o = session_->origin();
  return {o.x + box.x0, o.y + height_ - box.y1, o.x + box.x1, o.y + height_ - box.y0};
}

void Painter::fillBoxes(const pixman_box32_t* boxes, int n, const Colour& c) {
  if (n <= 0 || !(c.a > 0)) return;
  const pixman_color_t pc = premultiplied(c);
  if (c.a >= 1) {
    // Opaque fills are plain stores: no blending, no per-call setup.
    const uint32_t pixel = 0xFF000000u | uint32_t(pc.red >> 8) << 16 |
                           uint32_t(pc.green >> 8) << 8 | uint32_t(pc.blue >> 8);
    for (int i = 0; i < n; ++i) session_->fillOpaque(boxes[i], pixel);
    return;
  }
  pixman_image_fill_boxes(PIXMAN_OP_OVER, session_->target(), &pc, n, boxes);
}

void Painter::fillRect(const Kw::Box<int>& box, const Colour& c) {
  if (!session_) return;
  const Kw::Box<int> b = box.intersection(bounds());
  if (b.empty()) return;
  const pixman_box32_t d = device(b);
  fillBoxes(&d, 1, c);
}

void Painter::outlineRect(const Kw::Box<int>& box, const Colour& c, int thickness) {
  if (!session_ || box.empty() || thickness < 1) return;
  const int t = std::min({thickness, (box.width() + 1) / 2, (box.height() + 1) / 2});
  pixman_box32_t bands[4];
  int n = 0;
  // The top and bottom bands take the corners.
  bands[n++] = device(Kw::Box<int>(box.x0, box.y1 - t, box.x1, box.y1));
  bands[n++] = device(Kw::Box<int>(box.x0, box.y0, box.x1, box.y0 + t));
  if (box.height() > 2 * t) {
    bands[n++] = device(Kw::Box<int>(box.x0, box.y0 + t, box.x0 + t, box.y1 - t));
    bands[n++] = device(Kw::Box<int>(box.x1 - t, box.y0 + t, box.x1, box.y1 - t));
  }
  fillBoxes(bands, n, c);
}

void Painter::line(XY<int> from, XY<int> to, const Colour& c, int lineWidth) {
  if (!session_ || lineWidth < 1) return;
  if (from.x == to.x || from.y == to.y) {
    // Axis-aligned lines are rectangles: exact pixels, no anti-aliasing.
    const int lo = (lineWidth - 1) / 2;
    const int hi = lineWidth - lo;
    if (from.y == to.y) {
      fillRect(Kw::Box<int>(std::min(from.x, to.x), from.y - lo, std::max(from.x, to.x) + 1,
                            from.y + hi),
               c);
    } else {
      fillRect(Kw::Box<int>(from.x - lo, std::min(from.y, to.y), from.x + hi,
                            std::max(from.y, to.y) + 1),
               c);
    }
    return;
  }
  cairo_t* cr = cairo();
  setSource(c);
  cairo_set_line_width(cr, lineWidth);
  cairo_set_line_cap(cr, CAIRO_LINE_CAP_SQUARE);
  cairo_move_to(cr, from.x + 0.5, cairoY(from.y + 0.5));
  cairo_line_to(cr, to.x + 0.5, cairoY(to.y + 0.5));
  cairo_stroke(cr);
}

void Painter::verticalGradient(const Kw::Box<int>& box, const Colour& bottom, const Colour& top) {
  if (!session_ || box.empty()) return;
  if (top.a >= 1 && bottom.a >= 1) {
    // Opaque: each row is one colour, the gradient's at the row's middle, stored directly.
    const Kw::Box<int> shown = box.intersection(bounds());
    if (shown.empty()) return;
    const pixman_box32_t whole = device(box);
    const pixman_box32_t d = device(shown);
    const double span = whole.y2 - whole.y1;
    for (int y = d.y1; y < d.y2; ++y) {
      const double t = (y + 0.5 - whole.y1) / span;
      const Colour c(top.r + t * (bottom.r - top.r), top.g + t * (bottom.g - top.g),
                     top.b + t * (bottom.b - top.b));
      const pixman_box32_t row{d.x1, y, d.x2, y + 1};
      fillBoxes(&row, 1, c);
    }
    return;
  }
  cairo_t* cr = cairo();
  cairo_pattern_t* p = cairo_pattern_create_linear(0, cairoY(box.y1), 0, cairoY(box.y0));
  cairo_pattern_add_color_stop_rgba(p, 0, top.r, top.g, top.b, top.a);
  cairo_pattern_add_color_stop_rgba(p, 1, bottom.r, bottom.g, bottom.b, bottom.a);
  cairo_set_source(cr, p);
  rectPath(box);
  cairo_fill(cr);
  cairo_pattern_destroy(p);
}

void Painter::horizontalGradient(const Kw::Box<int>& box, const Colour& left, const Colour& right) {
  if (!session_ || box.empty()) return;
  cairo_t* cr = cairo();
  cairo_pattern_t* p = cairo_pattern_create_linear(box.x0, 0, box.x1, 0);
  cairo_pattern_add_color_stop_rgba(p, 0, left.r, left.g, left.b, left.a);
  cairo_pattern_add_color_stop_rgba(p, 1, right.r, right.g, right.b, right.a);
  cairo_set_source(cr, p);
  rectPath(box);
  cairo_fill(cr);
  cairo_pattern_destroy(p);
}

void Painter::depthBox(const Kw::Box<int>& box, Bevel kind, int bevelWidth, const Colour& light,
                       const Colour& shadow) {
  if (!session_ || box.empty() || bevelWidth < 1) return;
  bevelRings(box, kind, bevelWidth, light, shadow, nullptr);
}

void Painter::depthBox(const Kw::Box<int>& box, Bevel kind, int bevelWidth, const Colour& light,
                       const Colour& shadow, const Colour& face) {
  if (!session_ || box.empty()) return;
  const int w = std::max(0, std::min({bevelWidth, box.width() / 2, box.height() / 2}));
  fillRect(Kw::Box<int>(box.x0 + w, box.y0 + w, box.x1 - w, box.y1 - w), face);
  if (w > 0) bevelRings(box, kind, w, light, shadow, &face);
}

void Painter::bevelRings(const Kw::Box<int>& box, Bevel kind, int bevelWidth, const Colour& light,
                         const Colour& shadow, const Colour* face) {
  const int w = std::max(1, std::min({bevelWidth, box.width() / 2, box.height() / 2}));
  const Colour& topLeft = kind == Bevel::Raised ? light : shadow;
  const Colour& bottomRight = kind == Bevel::Raised ? shadow : light;
  for (int i = 0; i < w; ++i) {
    const Kw::Box<int> r(box.x0 + i, box.y0 + i, box.x1 - i, box.y1 - i);
    if (r.width() < 2 || r.height() < 2) break;
    // The outer ring has the full colours; inner ones fade towards the face.
    const double fade = 1.0 - static_cast<double>(i) / w;
    Colour a = topLeft;
    Colour b = bottomRight;
    if (face) {
      a = mix(*face, topLeft, fade);
      b = mix(*face, bottomRight, fade);
    } else {
      a.a *= fade;
      b.a *= fade;
    }
    // The top row and left column take the first colour; the corners where the colours meet
    // (top-right, bottom-left) go to the second, so each reads as a clean L.
    const pixman_box32_t first[2] = {device(Kw::Box<int>(r.x0, r.y1 - 1, r.x1 - 1, r.y1)),
                                     device(Kw::Box<int>(r.x0, r.y0 + 1, r.x0 + 1, r.y1 - 1))};
    const pixman_box32_t second[2] = {device(Kw::Box<int>(r.x0, r.y0, r.x1, r.y0 + 1)),
                                      device(Kw::Box<int>(r.x1 - 1, r.y0 + 1, r.x1, r.y1))};
    fillBoxes(first, 2, a);
    fillBoxes(second, 2, b);
  }
}

void Painter::focusRect(const Kw::Box<int>& box, const Colour& c) {
  if (!session_ || box.width() < 2 || box.height() < 2) return;
  cairo_t* cr = cairo();
  setSource(c);
  cairo_set_line_width(cr, 1.0);
  cairo_set_line_cap(cr, CAIRO_LINE_CAP_BUTT);
  const double dots[] = {1.0, 1.0};
  cairo_set_dash(cr, dots, 2, 0.0);
  const double top = cairoY(box.y1) + 0.5;
  const double bottom = cairoY(box.y0) - 0.5;
  // Each side is its own sub-path, so each starts on a dot at a pixel edge.
  cairo_move_to(cr, box.x0, top);
  cairo_line_to(cr, box.x1, top);
  cairo_move_to(cr, box.x0, bottom);
  cairo_line_to(cr, box.x1, bottom);
  cairo_move_to(cr, box.x0 + 0.5, cairoY(box.y1));
  cairo_line_to(cr, box.x0 + 0.5, cairoY(box.y0));
  cairo_move_to(cr, box.x1 - 0.5, cairoY(box.y1));
  cairo_line_to(cr, box.x1 - 0.5, cairoY(box.y0));
  cairo_stroke(cr);
  cairo_set_dash(cr, nullptr, 0, 0.0);
}

void Painter::image(const Image& img, XY<int> at, double opacity) {
  if (!session_ || !img.surface()) return;
  cairo_t* cr = cairo();
  const double top = cairoY(at.y + img.height());
  cairo_save(cr);
  cairo_rectangle(cr, at.x, top, img.width(), img.height());
  cairo_clip(cr);
  cairo_set_source_surface(cr, img.surface(), at.x, top);
  cairo_paint_with_alpha(cr, std::clamp(opacity, 0.0, 1.0));
  cairo_restore(cr);
}

void Painter::scaledImage(const Image& img, const Kw::Box<int>& box, double factor,
                          double opacity) {
  if (!session_ || !img.surface() || box.empty() || !(factor > 0)) return;
  cairo_t* cr = cairo();
  const double top = cairoY(box.y1);
  cairo_save(cr);
  cairo_rectangle(cr, box.x0, top, box.width(), box.height());
  cairo_clip(cr);
  cairo_translate(cr, box.x0, top);
  cairo_scale(cr, factor, factor);
  cairo_set_source_surface(cr, img.surface(), 0, 0);
  cairo_pattern_set_filter(cairo_get_source(cr), CAIRO_FILTER_GOOD);
  cairo_paint_with_alpha(cr, std::clamp(opacity, 0.0, 1.0));
  cairo_restore(cr);
}

void Painter::compositeText(const TextLayout& layout, int left, int top, const Colour& c) {
  if (!(c.a > 0)) return;
  if (!layout.hasMask()) {
    // Too large to keep as a picture: glyph by glyph, Cairo dropping what the clip hides.
    cairo_t* cr = cairo();
    setSource(c);
    layout.draw(cr, left, top);
    return;
  }
  const TextLayout::Mask& m = layout.mask();
  if (!m.image) return;
  const XY<int> o = session_->origin();
  pixman_image_composite32(PIXMAN_OP_OVER, session_->solid(premultiplied(c)), m.image,
                           session_->target(), 0, 0, 0, 0, o.x + left + m.x, o.y + top + m.y,
                           m.width, m.height);
}

void Painter::text(const WString& s, const Kw::Box<int>& box, const iFont& font, const Colour& c,
                   TextAlignment align, TextStyles::TextStyle style) {
  if (!session_ || s.empty() || box.empty()) return;
  const auto* shaped = dynamic_cast<const ShapedFont*>(&font);
  if (!shaped) return;
  const Kw::Ptr<TextLayout> layout = shaped->layout(s);
  const int w = layout->width();
  int left = box.x0;
  if (w <= box.width()) {
    if (align == TextAlignment::Right) left = box.x1 - w;
    if (align == TextAlignment::Centred) left = box.x0 + (box.width() - w) / 2;
  }
  // Vertically centred; the top in the canvas's downward pixels.
  const int top = height_ - box.y1 + (box.height() - layout->height()) / 2;
  const TextLayout::Mask& m = layout->mask();
  // Clip only when the ink would leave the box.
  const Kw::Box<int> inkTopDown = Kw::Box<int>::fromSize(left + m.x, top + m.y, m.width, m.height);
  const Kw::Box<int> boxTopDown(box.x0, height_ - box.y1, box.x1, height_ - box.y0);
  const bool fits = boxTopDown.contains(inkTopDown) && style == TextStyles::Normal;
  if (!fits) pushClip(box);
  if (style == TextStyles::Embossed) {
    compositeText(*layout, left, top + 1, Colour(1, 1, 1, 0.14 * c.a));
  } else if (style == TextStyles::Shadowed) {
    compositeText(*layout, left + 1, top + 1, Colour(0, 0, 0, 0.55 * c.a));
  }
  compositeText(*layout, left, top, c);
  if (!fits) popClip();
}

void Painter::textAt(const WString& s, XY<int> origin, const iFont& font, const Colour& c) {
  if (!session_ || s.empty()) return;
  const auto* shaped = dynamic_cast<const ShapedFont*>(&font);
  if (!shaped) return;
  const Kw::Ptr<TextLayout> layout = shaped->layout(s);
  compositeText(*layout, origin.x, height_ - origin.y - layout->height(), c);
}

bool Painter::symbol(int code, const Kw::Box<int>& box, const Colour& c) {
  return drawSymbol(*this, code, box, c);
}

void Painter::narrowTargetClip() {
  if (clips_.empty()) {
    session_->setTargetClip(nullptr);
    return;
  }
  const Kw::Box<int>& b = clips_.back().box;
  const pixman_box32_t d = device(b.empty() ? Kw::Box<int>() : b);
  pixman_region32_intersect_rect(&narrowed_, session_->clip(), d.x1, d.y1,
                                 static_cast<unsigned>(std::max(0, d.x2 - d.x1)),
                                 static_cast<unsigned>(std::max(0, d.y2 - d.y1)));
  session_->setTargetClip(&narrowed_);
}

void Painter::pushClip(const Kw::Box<int>& box) {
  if (!session_) return;
  const Kw::Box<int> outer = clips_.empty() ? bounds() : clips_.back().box;
  Kw::Box<int> effective = box.intersection(outer);
  if (effective.empty()) effective = Kw::Box<int>();
  clips_.push_back({effective, cr_ != nullptr});
  if (cr_) {
    cairo_save(cr_);
    rectPath(effective);
    cairo_clip(cr_);
  }
  narrowTargetClip();
}

void Painter::popClip() {
  if (!session_ || clips_.empty()) return;
  const ClipEntry e = clips_.back();
  clips_.pop_back();
  if (cr_) {
    cairo_restore(cr_);
    // A clip that was part of the context's base state: set the context up again when needed.
    if (!e.inCairo) cr_ = nullptr;
  }
  narrowTargetClip();
}

}  // namespace Glib
