#include "gallery/OffscreenScreen.h"

#include "platform/misc/Diagnostics.h"

OffscreenScreen::OffscreenScreen(int width, int height)
    : root_(std::make_unique<RootGlob>(width, height)),
      surface_(cairo_image_surface_create(CAIRO_FORMAT_ARGB32, width, height)),
      session_(std::make_unique<Glib::CairoPaintSession>(surface_)) {}

OffscreenScreen::~OffscreenScreen() {
  root_.reset();
  session_.reset();
  cairo_surface_destroy(surface_);
}

bool OffscreenScreen::step(int) {
  root_->processTimers();
  root_->pumpQueue();
  render();
  return true;
}

void OffscreenScreen::render() {
  root_->paint(*session_);
}

bool OffscreenScreen::screenshot(const String& pngPath) {
  return write(Kw::Box<int>(0, 0, root_->width(), root_->height()), pngPath);
}

bool OffscreenScreen::screenshot(const Glob& glob, const String& pngPath) {
  if (!is_good_glob_ptr(&glob) || glob.root() != root_.get()) {
    diagWarning("screenshot: the Glob is not on this screen: " + pngPath + " not written\n");
    return false;
  }
  return write(glob.canvas()->visibleRootRect(), pngPath);
}

bool OffscreenScreen::write(const Kw::Box<int>& rootArea, const String& pngPath) {
  render();
  const int h = root_->height();
  const Kw::Box<int> a = rootArea.intersection(Kw::Box<int>(0, 0, root_->width(), h));
  if (a.empty()) {
    diagWarning("screenshot: nothing visible to write to " + pngPath + "\n");
    return false;
  }
  // The image counts rows from the top.
  cairo_surface_t* part =
      cairo_surface_create_for_rectangle(surface_, a.x0, h - a.y1, a.width(), a.height());
  cairo_surface_t* out = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, a.width(), a.height());
  cairo_t* cr = cairo_create(out);
  cairo_set_source_surface(cr, part, 0, 0);
  cairo_set_operator(cr, CAIRO_OPERATOR_SOURCE);
  cairo_paint(cr);
  cairo_destroy(cr);
  cairo_surface_destroy(part);
  const cairo_status_t status = cairo_surface_write_to_png(out, pngPath.c_str());
  cairo_surface_destroy(out);
  if (status != CAIRO_STATUS_SUCCESS) {
    diagError("screenshot: cannot write " + pngPath + ": " + cairo_status_to_string(status) + "\n");
    return false;
  }
  return true;
}
