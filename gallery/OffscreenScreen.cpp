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
  render();
  if (cairo_surface_write_to_png(surface_, pngPath.c_str()) != CAIRO_STATUS_SUCCESS) {
    diagError("screenshot: cannot write " + pngPath + "\n");
    return false;
  }
  return true;
}

bool OffscreenScreen::screenshot(const Glob&, const String& pngPath) {
  return screenshot(pngPath);
}
