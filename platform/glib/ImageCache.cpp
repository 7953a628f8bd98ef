#include "platform/glib/ImageCache.h"

#include "platform/misc/Diagnostics.h"

namespace Glib {

namespace {

// The PNG at `path` as an ARGB32 surface, or null.
cairo_surface_t* readPng(const String& path) {
  if (path.empty()) return nullptr;
  cairo_surface_t* s = cairo_image_surface_create_from_png(path.c_str());
  if (cairo_surface_status(s) != CAIRO_STATUS_SUCCESS) {
    cairo_surface_destroy(s);
    return nullptr;
  }
  if (cairo_image_surface_get_format(s) == CAIRO_FORMAT_ARGB32) return s;
  // Opaque or grey files: convert so that every image has one pixel format.
  const int w = cairo_image_surface_get_width(s);
  const int h = cairo_image_surface_get_height(s);
  cairo_surface_t* argb = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, w, h);
  cairo_t* cr = cairo_create(argb);
  cairo_set_source_surface(cr, s, 0, 0);
  cairo_paint(cr);
  cairo_destroy(cr);
  cairo_surface_destroy(s);
  return argb;
}

}  // namespace

Kw::Ptr<Image> ImageCache::get(const String& path, int placeholderWidth, int placeholderHeight) {
  if (auto it = images_.find(path); it != images_.end()) return it->second;
  Kw::Ptr<Image> image;
  if (cairo_surface_t* s = readPng(path)) {
    image = Kw::Ptr<Image>(new Image(s));
  } else {
    if (reported_.insert(path).second) {
      diagWarning("image \"" + path + "\" could not be read; a placeholder is shown\n");
    }
    image = Image::placeholder(placeholderWidth, placeholderHeight);
  }
  images_.emplace(path, image);
  return image;
}

ImageCache& ImageCache::instance() {
  static ImageCache cache;
  return cache;
}

}  // namespace Glib
