#include "platform/glib/Image.h"

#include <algorithm>

#include "platform/glib/ImageCache.h"

namespace Glib {

Image::Image(cairo_surface_t* surface, bool placeholder)
    : surface_(surface), placeholder_(placeholder) {}

Image::~Image() {
  if (surface_) cairo_surface_destroy(surface_);
}

int Image::width() const {
  return cairo_image_surface_get_width(surface_);
}
int Image::height() const {
  return cairo_image_surface_get_height(surface_);
}

Kw::Ptr<Image> Image::load(const String& path, int width, int height) {
  return ImageCache::instance().get(path, width, height);
}

Kw::Ptr<Image> Image::placeholder(int width, int height) {
  // Bounded so that a wild size cannot exhaust memory; a placeholder only needs to be seen.
  width = std::clamp(width > 0 ? width : kPlaceholderSize, 1, 4096);
  height = std::clamp(height > 0 ? height : kPlaceholderSize, 1, 4096);
  cairo_surface_t* s = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, width, height);
  cairo_t* cr = cairo_create(s);
  cairo_set_source_rgba(cr, 0.1, 0.1, 0.1, 0.6);
  cairo_paint(cr);
  cairo_set_source_rgb(cr, 1.0, 0.0, 1.0);
  cairo_set_line_width(cr, 1.0);
  cairo_rectangle(cr, 0.5, 0.5, width - 1.0, height - 1.0);
  cairo_move_to(cr, 0.5, 0.5);
  cairo_line_to(cr, width - 0.5, height - 0.5);
  cairo_move_to(cr, width - 0.5, 0.5);
  cairo_line_to(cr, 0.5, height - 0.5);
  cairo_stroke(cr);
  cairo_destroy(cr);
  cairo_surface_flush(s);
  return Kw::Ptr<Image>(new Image(s, true));
}

}  // namespace Glib
