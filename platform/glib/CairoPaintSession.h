#pragma once
// A repaint pass onto a Cairo image surface the size of the root (top-down, as Cairo counts).
// Each canvas is drawn with its top-left corner at the Cairo origin and clipped to the damage;
// the painter converts the library's upward y.
#include <cairo.h>

#include <vector>

#include "platform/glob/PaintSession.h"

namespace Glib {

class CairoPaintSession : public PaintSession {
 public:
  // `surface` must outlive the session; its height is the root's height.
  explicit CairoPaintSession(cairo_surface_t* surface);
  ~CairoPaintSession() override;
  CairoPaintSession(const CairoPaintSession&) = delete;
  CairoPaintSession& operator=(const CairoPaintSession&) = delete;

  void beginFrame(const std::vector<Kw::Box<int>>& areas, const Colour& background) override;
  void endFrame(const std::vector<Kw::Box<int>>& areas) override;
  void beginCanvas(Canvas& canvas, const Kw::Box<int>& clip) override;
  void endCanvas(Canvas& canvas) override;

  // The context set up for the canvas being drawn (origin at its top-left corner, clipped),
  // or null outside beginCanvas/endCanvas.
  cairo_t* context() const { return current_ ? cr_ : nullptr; }
  const Canvas* currentCanvas() const { return current_; }
  // Root areas painted by the last frame, top-down (for presenting).
  const std::vector<Kw::Box<int>>& presentedAreas() const { return presented_; }
  int rootHeight() const { return rootHeight_; }

 private:
  cairo_surface_t* surface_;
  cairo_t* cr_;
  int rootHeight_;
  Canvas* current_ = nullptr;
  bool inFrame_ = false;
  std::vector<Kw::Box<int>> presented_;
};

}  // namespace Glib
