#include "platform/glib/CairoPaintSession.h"

#include "platform/glob/Canvas.h"

namespace Glib {

CairoPaintSession::CairoPaintSession(cairo_surface_t* surface)
    : surface_(surface),
      cr_(cairo_create(surface)),
      rootHeight_(cairo_image_surface_get_height(surface)) {}

CairoPaintSession::~CairoPaintSession() {
  cairo_destroy(cr_);
}

void CairoPaintSession::beginFrame(const std::vector<Kw::Box<int>>& areas,
                                   const Colour& background) {
  presented_.clear();
  for (const auto& a : areas) {
    // Bottom-up root box to Cairo's top-down rectangle.
    presented_.push_back(Kw::Box<int>(a.x0, rootHeight_ - a.y1, a.x1, rootHeight_ - a.y0));
  }
  cairo_save(cr_);
  for (const auto& top : presented_)
    cairo_rectangle(cr_, top.x0, top.y0, top.width(), top.height());
  // Everything drawn this frame stays inside the damaged areas.
  cairo_clip(cr_);
  cairo_set_operator(cr_, CAIRO_OPERATOR_SOURCE);
  cairo_set_source_rgba(cr_, background.r, background.g, background.b, background.a);
  cairo_paint(cr_);
  cairo_set_operator(cr_, CAIRO_OPERATOR_OVER);
  inFrame_ = true;
}

void CairoPaintSession::endFrame(const std::vector<Kw::Box<int>>&) {
  if (inFrame_) cairo_restore(cr_);
  inFrame_ = false;
  cairo_surface_flush(surface_);
}

void CairoPaintSession::beginCanvas(Canvas& canvas, const Kw::Box<int>& clip) {
  current_ = &canvas;
  cairo_save(cr_);
  cairo_rectangle(cr_, clip.x0, rootHeight_ - clip.y1, clip.width(), clip.height());
  cairo_clip(cr_);
  const Kw::Box<int> r = canvas.rootRect();
  cairo_translate(cr_, r.x0, rootHeight_ - r.y1);
}

void CairoPaintSession::endCanvas(Canvas&) {
  cairo_restore(cr_);
  current_ = nullptr;
}

}  // namespace Glib
