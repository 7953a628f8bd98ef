#pragma once
// The gallery's screen when there is no window: the root painted into a Cairo image.
#include <memory>

#include "platform/backend/Backend.h"
#include "platform/glib/CairoPaintSession.h"

class OffscreenScreen : public Backend {
 public:
  OffscreenScreen(int width, int height);
  ~OffscreenScreen() override;

  RootGlob& root() override { return *root_; }
  bool step(int waitMs) override;
  cairo_surface_t* surface() override { return surface_; }
  void render() override;
  bool screenshot(const String& pngPath) override;
  bool screenshot(const Glob& glob, const String& pngPath) override;

 private:
  bool write(const Kw::Box<int>& rootArea, const String& pngPath);

  std::unique_ptr<RootGlob> root_;
  cairo_surface_t* surface_;
  std::unique_ptr<Glib::CairoPaintSession> session_;
};
