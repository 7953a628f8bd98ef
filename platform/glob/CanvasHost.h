#pragma once
// What a root canvas reports to the object that owns the screen: damaged areas and canvases
// that go away, so that pointer, focus and paint state never point at them.
#include "platform/kw/Box.h"

class Canvas;
class PaintSession;

class CanvasHost {
 public:
  virtual ~CanvasHost() = default;
  // `rootArea` (root coordinates) must be repainted.
  virtual void canvasDamaged(const Kw::Box<int>& rootArea) = 0;
  // `canvas` is being destroyed or taken out of the tree.
  virtual void canvasRemoved(Canvas* canvas) = 0;
  // The paint session in progress, or null outside painting.
  virtual PaintSession* activePaintSession() const = 0;
};
