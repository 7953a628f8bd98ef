#pragma once
// Keeps the root's pixels: an ARGB32 image the size of the root, repainted where damaged. Both
// back ends use it (one repaint session per screen); the window back end then presents the
// areas of the last repaint.
#include <cairo.h>

#include <cstdint>
#include <memory>
#include <vector>

#include "platform/glib/CairoPaintSession.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/RootGlob.h"

class RootRenderer {
 public:
  explicit RootRenderer(RootGlob& root);
  ~RootRenderer();
  RootRenderer(const RootRenderer&) = delete;
  RootRenderer& operator=(const RootRenderer&) = delete;

  // Repaints whatever the root has damaged. False when nothing was painted. When the root has
  // changed size, the image follows and everything is repainted.
  bool render();

  cairo_surface_t* surface() const { return surface_; }
  int width() const { return cairo_image_surface_get_width(surface_); }
  int height() const { return cairo_image_surface_get_height(surface_); }

  // Areas repainted by the last render that painted, top-down, in pixels of the image (what
  // a window needs to present).
  // Areas painted at once (drawUnbuffered) since the render before are added.
  const std::vector<Kw::Box<int>>& presentedAreas() const { return presented_; }
  // Every frame painted since the last call to takeChanged(), merged; top-down.
  Kw::Box<int> takeChanged();

  // The pixel at a root position (bottom-up), 0xAARRGGBB (premultiplied); 0 outside.
  uint32_t pixelAt(XY<int> rootPos) const;
  // A copy of a root area (bottom-up box) clipped to the image; null when nothing is left.
  cairo_surface_t* copyArea(const Kw::Box<int>& rootArea) const;
  // Writes a root area (bottom-up box), clipped to the image, to a PNG file. False on failure,
  // reported through Diagnostics.
  bool writePng(const String& path, const Kw::Box<int>& rootArea) const;
  // Writes the visible part of `glob` to a PNG file. False, through Diagnostics, when the Glob
  // is not shown on this root or the file cannot be written.
  bool writePng(const String& path, const Glob& glob) const;

 private:
  void makeSurface(int width, int height);
  // Paints a root area at once, outside the frames; false when the image cannot be used now.
  bool renderNow(const Kw::Box<int>& rootArea);

  RootGlob& root_;
  // The screen may go first (a window takes its Globs down before its image): the painter it
  // holds is withdrawn only from a screen that is still there.
  GlobHandle<RootGlob> rootAlive_;
  cairo_surface_t* surface_ = nullptr;
  std::unique_ptr<Glib::CairoPaintSession> session_;
  Kw::Box<int> changed_;
  std::vector<Kw::Box<int>> presented_;
  std::vector<Kw::Box<int>> unbufferedSinceRender_;
};
