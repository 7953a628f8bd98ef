#include "platform/glib/Painter.h"

#include <algorithm>

#include "platform/glib/CairoPaintSession.h"
#include "platform/glib/Image.h"
#include "platform/glib/ShapedFont.h"
#include "platform/glib/Symbols.h"
#include "platform/glob/Canvas.h"

namespace Glib {

Painter::Painter(Canvas& canvas) {
  auto* session = dynamic_cast<CairoPaintSession*>(canvas.paintSession());
  if (!session || session->currentCanvas() != &canvas) return;
  cr_ = session->context();
  if (!cr_) return;
  width_ = canvas.width();
  height_ = canvas.height();
  cairo_save(cr_);
}

Painter::~Painter() {
  if (!cr_) return;
  while (clipDepth_ > 0) popClip();
  cairo_restore(cr_);
}

void Painter::setSource(const Colour& c) const {
  cairo_set_source_rgba(cr_, c.r, c.g, c.b, c.a);
}

void Painter::rectPath(const Kw::Box<int>& box) const {
  cairo_rectangle(cr_, box.x0, height_ - box.y1, box.width(), box.height());
}

void Painter::fillRect(const Kw::Box<int>& box, const Colour& c) {
  if (!cr_ || box.empty()) return;
  setSource(c);
  rectPath(box);
  cairo_fill(cr_);
}

void Painter::outlineRect(const Kw::Box<int>& box, const Colour& c, int thickness) {
  if (!cr_ || box.empty() || thickness < 1) return;
  const int t = std::min({thickness, (box.width() + 1) / 2, (box.height() + 1) / 2});
  setSource(c);
  // Four bands; the top and bottom ones take the corners.
  rectPath(Kw::Box<int>(box.x0, box.y1 - t, box.x1, box.y1));
  rectPath(Kw::Box<int>(box.x0, box.y0, box.x1, box.y0 + t));
  if (box.height() > 2 * t) {
    rectPath(Kw::Box<int>(box.x0, box.y0 + t, box.x0 + t, box.y1 - t));
    rectPath(Kw::Box<int>(box.x1 - t, box.y0 + t, box.x1, box.y1 - t));
  }
  cairo_fill(cr_);
}

void Painter::line(XY<int> from, XY<int> to, const Colour& c, int lineWidth) {
  if (!cr_ || lineWidth < 1) return;
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
  setSource(c);
  cairo_set_line_width(cr_, lineWidth);
  cairo_set_line_cap(cr_, CAIRO_LINE_CAP_SQUARE);
  cairo_move_to(cr_, from.x + 0.5, cairoY(from.y + 0.5));
  cairo_line_to(cr_, to.x + 0.5, cairoY(to.y + 0.5));
  cairo_stroke(cr_);
}

void Painter::verticalGradient(const Kw::Box<int>& box, const Colour& bottom, const Colour& top) {
  if (!cr_ || box.empty()) return;
  cairo_pattern_t* p = cairo_pattern_create_linear(0, cairoY(box.y1), 0, cairoY(box.y0));
  cairo_pattern_add_color_stop_rgba(p, 0, top.r, top.g, top.b, top.a);
  cairo_pattern_add_color_stop_rgba(p, 1, bottom.r, bottom.g, bottom.b, bottom.a);
  cairo_set_source(cr_, p);
  rectPath(box);
  cairo_fill(cr_);
  cairo_pattern_destroy(p);
}

void Painter::horizontalGradient(const Kw::Box<int>& box, const Colour& left, const Colour& right) {
  if (!cr_ || box.empty()) return;
  cairo_pattern_t* p = cairo_pattern_create_linear(box.x0, 0, box.x1, 0);
  cairo_pattern_add_color_stop_rgba(p, 0, left.r, left.g, left.b, left.a);
  cairo_pattern_add_color_stop_rgba(p, 1, right.r, right.g, right.b, right.a);
  cairo_set_source(cr_, p);
  rectPath(box);
  cairo_fill(cr_);
  cairo_pattern_destroy(p);
}

void Painter::depthBox(const Kw::Box<int>& box, Bevel kind, int bevelWidth, const Colour& light,
                       const Colour& shadow) {
  if (!cr_ || box.empty() || bevelWidth < 1) return;
  const int w = std::min({bevelWidth, box.width() / 2, box.height() / 2});
  const Colour& topLeft = kind == Bevel::Raised ? light : shadow;
  const Colour& bottomRight = kind == Bevel::Raised ? shadow : light;
  for (int i = 0; i < std::max(w, 1); ++i) {
    const Kw::Box<int> r(box.x0 + i, box.y0 + i, box.x1 - i, box.y1 - i);
    if (r.width() < 2 || r.height() < 2) break;
    const double fade = 1.0 - static_cast<double>(i) / std::max(w, 1);
    // Light ring: the top row and the left column; the corners where the two colours meet
    // (top-right, bottom-left) go to the shadow so the light reads as a clean L.
    Colour a = topLeft;
    a.a *= fade;
    setSource(a);
    rectPath(Kw::Box<int>(r.x0, r.y1 - 1, r.x1 - 1, r.y1));
    rectPath(Kw::Box<int>(r.x0, r.y0 + 1, r.x0 + 1, r.y1 - 1));
    cairo_fill(cr_);
    Colour b = bottomRight;
    b.a *= fade;
    setSource(b);
    rectPath(Kw::Box<int>(r.x0, r.y0, r.x1, r.y0 + 1));
    rectPath(Kw::Box<int>(r.x1 - 1, r.y0 + 1, r.x1, r.y1));
    cairo_fill(cr_);
  }
}

void Painter::focusRect(const Kw::Box<int>& box, const Colour& c) {
  if (!cr_ || box.width() < 2 || box.height() < 2) return;
  setSource(c);
  cairo_set_line_width(cr_, 1.0);
  cairo_set_line_cap(cr_, CAIRO_LINE_CAP_BUTT);
  const double dots[] = {1.0, 1.0};
  cairo_set_dash(cr_, dots, 2, 0.0);
  const double top = cairoY(box.y1) + 0.5;
  const double bottom = cairoY(box.y0) - 0.5;
  // Each side is its own sub-path, so each starts on a dot at a pixel edge.
  cairo_move_to(cr_, box.x0, top);
  cairo_line_to(cr_, box.x1, top);
  cairo_move_to(cr_, box.x0, bottom);
  cairo_line_to(cr_, box.x1, bottom);
  cairo_move_to(cr_, box.x0 + 0.5, cairoY(box.y1));
  cairo_line_to(cr_, box.x0 + 0.5, cairoY(box.y0));
  cairo_move_to(cr_, box.x1 - 0.5, cairoY(box.y1));
  cairo_line_to(cr_, box.x1 - 0.5, cairoY(box.y0));
  cairo_stroke(cr_);
  cairo_set_dash(cr_, nullptr, 0, 0.0);
}

void Painter::image(const Image& img, XY<int> at, double opacity) {
  if (!cr_ || !img.surface()) return;
  const double top = cairoY(at.y + img.height());
  cairo_set_source_surface(cr_, img.surface(), at.x, top);
  cairo_rectangle(cr_, at.x, top, img.width(), img.height());
  cairo_save(cr_);
  cairo_clip(cr_);
  cairo_paint_with_alpha(cr_, std::clamp(opacity, 0.0, 1.0));
  cairo_restore(cr_);
}

void Painter::text(const WString& s, const Kw::Box<int>& box, const iFont& font, const Colour& c,
                   TextAlignment align, TextStyles::TextStyle style) {
  if (!cr_ || s.empty() || box.empty()) return;
  const auto* shaped = dynamic_cast<const ShapedFont*>(&font);
  if (!shaped) return;
  const Kw::Ptr<TextLayout> layout = shaped->layout(s);
  const int w = layout->width();
  int left = box.x0;
  if (w <= box.width()) {
    if (align == TextAlignment::Right) left = box.x1 - w;
    if (align == TextAlignment::Centred) left = box.x0 + (box.width() - w) / 2;
  }
  // Vertically centred; the top in Cairo's downward y.
  const int top = static_cast<int>(cairoY(box.y1)) + (box.height() - layout->height()) / 2;
  const bool fits = w <= box.width() && layout->height() <= box.height();
  if (!fits) pushClip(box);
  if (style == TextStyles::Embossed) {
    setSource(Colour(1, 1, 1, 0.14 * c.a));
    layout->draw(cr_, left, top + 1);
  } else if (style == TextStyles::Shadowed) {
    setSource(Colour(0, 0, 0, 0.55 * c.a));
    layout->draw(cr_, left + 1, top + 1);
  }
  setSource(c);
  layout->draw(cr_, left, top);
  if (!fits) popClip();
}

void Painter::textAt(const WString& s, XY<int> origin, const iFont& font, const Colour& c) {
  if (!cr_ || s.empty()) return;
  const auto* shaped = dynamic_cast<const ShapedFont*>(&font);
  if (!shaped) return;
  const Kw::Ptr<TextLayout> layout = shaped->layout(s);
  setSource(c);
  layout->draw(cr_, origin.x, cairoY(origin.y + layout->height()));
}

bool Painter::symbol(int code, const Kw::Box<int>& box, const Colour& c) {
  return drawSymbol(*this, code, box, c);
}

void Painter::pushClip(const Kw::Box<int>& box) {
  if (!cr_) return;
  cairo_save(cr_);
  rectPath(box);
  cairo_clip(cr_);
  ++clipDepth_;
}

void Painter::popClip() {
  if (!cr_ || clipDepth_ == 0) return;
  cairo_restore(cr_);
  --clipDepth_;
}

}  // namespace Glib
