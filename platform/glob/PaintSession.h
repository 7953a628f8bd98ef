#pragma once
// One repaint pass. The root walks the damaged canvases in stacking order and brackets each
// client's draw() with beginCanvas/endCanvas; the drawing module's painter reaches the
// session through the canvas it is asked to draw on.
#include <vector>

#include "platform/glob/Colour.h"
#include "platform/kw/Box.h"

class Canvas;

class PaintSession {
 public:
  virtual ~PaintSession() = default;
  // A pass over `areas` (root coordinates) starts; nothing drawn in it leaves them.
  virtual void beginFrame(const std::vector<Kw::Box<int>>& areas) = 0;
  // The pass is over: the areas may be presented.
  virtual void endFrame(const std::vector<Kw::Box<int>>& areas) = 0;
  // `clip` (root coordinates) bounds the part of the canvas to repaint: its visible part that
  // meets the frame's areas. `covered` lists parts of it (root coordinates) that opaque
  // children will paint over, which this canvas need not paint.
  virtual void beginCanvas(Canvas& canvas, const Kw::Box<int>& clip,
                           const std::vector<Kw::Box<int>>& covered) = 0;
  virtual void endCanvas(Canvas& canvas) = 0;
  // Fills what the current canvas may paint with `colour` (the screen's background).
  virtual void fillCanvas(const Colour& colour) = 0;
};
