#pragma once
// A repaint pass onto a Cairo image surface the size of the root (top-down, as Cairo counts).
// Each canvas is drawn clipped to the frame's damaged areas, to its own damaged box and to
// what its opaque children leave visible. The painter fills rectangles and composites text
// straight into the pixels through the session's clip region, and asks for the Cairo context
// (set up lazily, origin at the canvas's top-left corner) only for curves, gradients and
// images.
#include <cairo.h>
#include <pixman.h>

#include <vector>

#include "platform/glob/PaintSession.h"
#include "platform/kw/XY.h"

namespace Glib {

class CairoPaintSession : public PaintSession {
 public:
  // `surface` (an ARGB32 image surface) must outlive the session; its height is the root's.
  explicit CairoPaintSession(cairo_surface_t* surface);
  ~CairoPaintSession() override;
  CairoPaintSession(const CairoPaintSession&) = delete;
  CairoPaintSession& operator=(const CairoPaintSession&) = delete;

  void beginFrame(const std::vector<Kw::Box<int>>& areas) override;
  void endFrame(const std::vector<Kw::Box<int>>& areas) override;
  void beginCanvas(Canvas& canvas, const Kw::Box<int>& clip,
                   const std::vector<Kw::Box<int>>& covered) override;
  void endCanvas(Canvas& canvas) override;
  void fillCanvas(const Colour& colour) override;

  // The context for the canvas being drawn (origin at its top-left corner, clipped like the
  // pixels), or null outside beginCanvas/endCanvas.
  cairo_t* context();
  const Canvas* currentCanvas() const { return current_; }
  // The pixels as a pixman image and the current canvas's clip in image pixels.
  pixman_image_t* target() const { return target_; }
  const pixman_region32_t* clip() const { return &clip_; }
  // Restricts pixel operations to `region` (within the canvas's clip), or back to the
  // canvas's clip when null.
  void setTargetClip(const pixman_region32_t* region);
  // Fills `box` (image pixels) within the active clip with an opaque pixel value.
  void fillOpaque(const pixman_box32_t& box, uint32_t pixel);
  // A solid source of a premultiplied colour, kept for reuse while the session lives.
  pixman_image_t* solid(const pixman_color_t& colour);
  // The current canvas's top-left corner in image pixels.
  XY<int> origin() const { return origin_; }

  // Root areas painted by the last frame, top-down (for presenting).
  const std::vector<Kw::Box<int>>& presentedAreas() const { return presented_; }
  int rootHeight() const { return rootHeight_; }

 private:
  // Root box (bottom-up) to the image's top-down rectangle.
  Kw::Box<int> topDown(const Kw::Box<int>& b) const;

  cairo_surface_t* surface_;
  cairo_t* cr_;
  pixman_image_t* target_;
  int rootHeight_;
  Canvas* current_ = nullptr;
  bool contextReady_ = false;
  XY<int> origin_;
  pixman_region32_t frame_;
  pixman_region32_t clip_;
  const pixman_region32_t* activeClip_ = &clip_;
  struct Solid {
    pixman_color_t colour;
    pixman_image_t* image;
  };
  std::vector<Solid> solids_;  // most recently used last
  std::vector<Kw::Box<int>> presented_;
  std::vector<pixman_box32_t> scratch_;
};

}  // namespace Glib
