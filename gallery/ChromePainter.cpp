#include "gallery/ChromePainter.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <cmath>

#include "platform/glib/CairoPaintSession.h"
#include "platform/glob/Canvas.h"

namespace {

PangoLayout* makeLayout(cairo_t* cr, const String& utf8, const ChromeFont& font) {
  PangoLayout* layout = pango_cairo_create_layout(cr);
  // Fixed rendering options, so that screenshots are the same from run to run.
  cairo_font_options_t* options = cairo_font_options_create();
  cairo_font_options_set_antialias(options, CAIRO_ANTIALIAS_GRAY);
  cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_SLIGHT);
  cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_ON);
  pango_cairo_context_set_font_options(pango_layout_get_context(layout), options);
  cairo_font_options_destroy(options);
  pango_layout_context_changed(layout);

  PangoFontDescription* desc = pango_font_description_new();
  pango_font_description_set_family(desc, font.mono ? "DejaVu Sans Mono" : "DejaVu Sans");
  pango_font_description_set_absolute_size(desc, font.size * PANGO_SCALE);
  pango_font_description_set_weight(desc, font.bold ? PANGO_WEIGHT_BOLD : PANGO_WEIGHT_NORMAL);
  pango_layout_set_font_description(layout, desc);
  pango_font_description_free(desc);
  // Pango refuses invalid UTF-8; the gallery shows replacement marks instead.
  const String valid = Kw::toUtf8(Kw::toWide(utf8));
  pango_layout_set_text(layout, valid.c_str(), static_cast<int>(valid.size()));
  return layout;
}

}  // namespace

ChromePainter::ChromePainter(Canvas& canvas) {
  auto* session = dynamic_cast<Glib::CairoPaintSession*>(canvas.paintSession());
  if (!session || session->currentCanvas() != &canvas) return;
  cr_ = session->context();
  width_ = canvas.width();
  height_ = canvas.height();
}

void ChromePainter::setSource(const Colour& c) {
  cairo_set_source_rgba(cr_, c.r, c.g, c.b, c.a);
}

void ChromePainter::fillRect(const Kw::Box<int>& box, const Colour& c) {
  if (!cr_ || box.empty()) return;
  setSource(c);
  cairo_rectangle(cr_, box.x0, height_ - box.y1, box.width(), box.height());
  cairo_fill(cr_);
}

void ChromePainter::roundedPath(const Kw::Box<int>& b, double r) {
  const double x0 = b.x0, x1 = b.x1, y0 = height_ - b.y1, y1 = height_ - b.y0;
  r = std::min({r, (x1 - x0) / 2, (y1 - y0) / 2});
  cairo_new_sub_path(cr_);
  cairo_arc(cr_, x1 - r, y0 + r, r, -M_PI / 2, 0);
  cairo_arc(cr_, x1 - r, y1 - r, r, 0, M_PI / 2);
  cairo_arc(cr_, x0 + r, y1 - r, r, M_PI / 2, M_PI);
  cairo_arc(cr_, x0 + r, y0 + r, r, M_PI, 3 * M_PI / 2);
  cairo_close_path(cr_);
}

void ChromePainter::roundedRect(const Kw::Box<int>& box, double radius, const Colour& fill) {
  if (!cr_ || box.empty()) return;
  roundedPath(box, radius);
  setSource(fill);
  cairo_fill(cr_);
}

void ChromePainter::roundedOutline(const Kw::Box<int>& box, double radius, const Colour& c) {
  if (!cr_ || box.empty()) return;
  cairo_save(cr_);
  cairo_translate(cr_, 0.5, -0.5);
  roundedPath(Kw::Box<int>(box.x0, box.y0, box.x1 - 1, box.y1 - 1), radius);
  cairo_restore(cr_);
  setSource(c);
  cairo_set_line_width(cr_, 1.0);
  cairo_stroke(cr_);
}

void ChromePainter::outlineRect(const Kw::Box<int>& box, const Colour& c) {
  if (!cr_ || box.empty()) return;
  hline(box.x0, box.x1, box.y0, c);
  hline(box.x0, box.x1, box.y1 - 1, c);
  vline(box.x0, box.y0, box.y1, c);
  vline(box.x1 - 1, box.y0, box.y1, c);
}

void ChromePainter::hline(int x0, int x1, int y, const Colour& c) {
  fillRect(Kw::Box<int>(x0, y, x1, y + 1), c);
}

void ChromePainter::vline(int x, int y0, int y1, const Colour& c) {
  fillRect(Kw::Box<int>(x, y0, x + 1, y1), c);
}

void ChromePainter::verticalGradient(const Kw::Box<int>& box, const Colour& bottom,
                                     const Colour& top) {
  if (!cr_ || box.empty()) return;
  cairo_pattern_t* p = cairo_pattern_create_linear(0, height_ - box.y1, 0, height_ - box.y0);
  cairo_pattern_add_color_stop_rgba(p, 0, top.r, top.g, top.b, top.a);
  cairo_pattern_add_color_stop_rgba(p, 1, bottom.r, bottom.g, bottom.b, bottom.a);
  cairo_set_source(cr_, p);
  cairo_rectangle(cr_, box.x0, height_ - box.y1, box.width(), box.height());
  cairo_fill(cr_);
  cairo_pattern_destroy(p);
}

void ChromePainter::dot(XY<int> centre, double radius, const Colour& c) {
  if (!cr_) return;
  setSource(c);
  cairo_arc(cr_, centre.x + 0.5, height_ - centre.y - 0.5, radius, 0, 2 * M_PI);
  cairo_fill(cr_);
}

void ChromePainter::text(const String& utf8, const Kw::Box<int>& box, const ChromeFont& font,
                         const Colour& c, ChromeAlign align) {
  if (!cr_ || box.empty() || utf8.empty()) return;
  PangoLayout* layout = makeLayout(cr_, utf8, font);
  pango_layout_set_width(layout, box.width() * PANGO_SCALE);
  pango_layout_set_ellipsize(layout, PANGO_ELLIPSIZE_END);
  pango_layout_set_alignment(layout, align == ChromeAlign::Left    ? PANGO_ALIGN_LEFT
                                     : align == ChromeAlign::Right ? PANGO_ALIGN_RIGHT
                                                                   : PANGO_ALIGN_CENTER);
  int w = 0, h = 0;
  pango_layout_get_pixel_size(layout, &w, &h);
  cairo_save(cr_);
  cairo_rectangle(cr_, box.x0, height_ - box.y1, box.width(), box.height());
  cairo_clip(cr_);
  setSource(c);
  cairo_move_to(cr_, box.x0, height_ - box.y1 + std::floor((box.height() - h) / 2.0));
  pango_cairo_show_layout(cr_, layout);
  cairo_restore(cr_);
  g_object_unref(layout);
}

int ChromePainter::textWidth(const String& utf8, const ChromeFont& font) {
  if (!cr_ || utf8.empty()) return 0;
  PangoLayout* layout = makeLayout(cr_, utf8, font);
  int w = 0, h = 0;
  pango_layout_get_pixel_size(layout, &w, &h);
  g_object_unref(layout);
  return w;
}
