#include "platform/glib/Symbols.h"

#include <algorithm>
#include <cmath>

#include "platform/glib/Painter.h"

namespace Glib {

namespace {

// The glyph's square in Cairo's downward space: left, top and side, whole pixels.
struct Square {
  double x, y, s;
  double px(double f) const { return x + f * s; }
  double py(double f) const { return y + f * s; }
};

// An isosceles triangle pointing in direction (dx, dy), its base 2k pixels and its height k,
// centred in the square; whole-pixel corners keep the 45-degree edges crisp.
void triangle(cairo_t* cr, const Square& q, int dx, int dy) {
  const int k = std::max(2, static_cast<int>(std::lround(q.s * 0.3)));
  const double cx = q.x + std::floor(q.s / 2);
  const double cy = q.y + std::floor(q.s / 2);
  // The apex sits k/2 beyond the centre, the base k/2 behind it.
  const double back = std::floor(k / 2.0);
  if (dy != 0) {
    const double base = cy - dy * back;
    cairo_move_to(cr, cx - k, base);
    cairo_line_to(cr, cx + k, base);
    cairo_line_to(cr, cx, base + dy * k);
  } else {
    const double base = cx - dx * back;
    cairo_move_to(cr, base, cy - k);
    cairo_line_to(cr, base, cy + k);
    cairo_line_to(cr, base + dx * k, cy);
  }
  cairo_close_path(cr);
  cairo_fill(cr);
}

double strokeWidth(const Square& q) {
  return std::max(1.5, std::round(q.s / 7.0));
}

void tick(cairo_t* cr, const Square& q) {
  cairo_set_line_width(cr, strokeWidth(q));
  cairo_set_line_cap(cr, CAIRO_LINE_CAP_ROUND);
  cairo_set_line_join(cr, CAIRO_LINE_JOIN_ROUND);
  cairo_move_to(cr, q.px(0.2), q.py(0.52));
  cairo_line_to(cr, q.px(0.42), q.py(0.74));
  cairo_line_to(cr, q.px(0.8), q.py(0.28));
  cairo_stroke(cr);
}

void cross(cairo_t* cr, const Square& q) {
  cairo_set_line_width(cr, strokeWidth(q));
  cairo_set_line_cap(cr, CAIRO_LINE_CAP_ROUND);
  cairo_move_to(cr, q.px(0.27), q.py(0.27));
  cairo_line_to(cr, q.px(0.73), q.py(0.73));
  cairo_move_to(cr, q.px(0.73), q.py(0.27));
  cairo_line_to(cr, q.px(0.27), q.py(0.73));
  cairo_stroke(cr);
}

void minimise(cairo_t* cr, const Square& q) {
  const double h = std::max(2.0, std::round(q.s / 7.0));
  const double left = std::round(q.px(0.25));
  const double right = std::round(q.px(0.75));
  cairo_rectangle(cr, left, std::round(q.py(0.7)) - h, right - left, h);
  cairo_fill(cr);
}

void pin(cairo_t* cr, const Square& q) {
  // A drawing pin seen from the side: head, collar and needle, upright.
  const double cx = q.x + std::floor(q.s / 2) + 0.5;
  const double headW = std::max(3.0, std::round(q.s * 0.3));
  const double headTop = std::round(q.py(0.12));
  const double headBottom = std::round(q.py(0.45));
  cairo_rectangle(cr, std::round(cx - headW / 2), headTop, headW, headBottom - headTop);
  const double collarW = std::max(5.0, std::round(q.s * 0.56));
  const double collarH = std::max(1.0, std::round(q.s / 10.0));
  cairo_rectangle(cr, std::round(cx - collarW / 2), headBottom, collarW, collarH);
  cairo_fill(cr);
  cairo_set_line_width(cr, 1.0);
  cairo_move_to(cr, cx, headBottom + collarH);
  cairo_line_to(cr, cx, std::round(q.py(0.9)));
  cairo_stroke(cr);
}

}  // namespace

bool Symbols::known(int code) {
  switch (code) {
    case kSymbolLeft:
    case kSymbolRight:
    case kSymbolDown:
    case kSymbolUp:
    case kSymbolTick:
    case kSymbolCross:
    case kSymbolMinimise:
    case kSymbolPin:
      return true;
    default:
      return false;
  }
}

bool Symbols::draw(Painter& painter, int code, const Kw::Box<int>& box, const Colour& colour) {
  if (!known(code)) return false;
  cairo_t* cr = painter.cairo();
  if (!cr || box.empty()) return true;
  const int side = std::min(box.width(), box.height());
  const Square q{static_cast<double>(box.x0 + (box.width() - side) / 2),
                 painter.cairoY(box.y1) + (box.height() - side) / 2, static_cast<double>(side)};
  cairo_save(cr);
  cairo_set_source_rgba(cr, colour.r, colour.g, colour.b, colour.a);
  switch (code) {
    case kSymbolLeft:
      triangle(cr, q, -1, 0);
      break;
    case kSymbolRight:
      triangle(cr, q, 1, 0);
      break;
    case kSymbolDown:
      triangle(cr, q, 0, 1);
      break;
    case kSymbolUp:
      triangle(cr, q, 0, -1);
      break;
    case kSymbolTick:
      tick(cr, q);
      break;
    case kSymbolCross:
      cross(cr, q);
      break;
    case kSymbolMinimise:
      minimise(cr, q);
      break;
    case kSymbolPin:
      pin(cr, q);
      break;
    default:
      break;
  }
  cairo_restore(cr);
  return true;
}

}  // namespace Glib
