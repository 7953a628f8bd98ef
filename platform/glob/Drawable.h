#pragma once
// Something that paints itself when asked. update() only records what needs repainting;
// painting happens later, once per frame, and is held back while redraws are disabled.
// Its table is update, draw, canDraw; it is never deleted through this face.
#include "platform/kw/Box.h"

class Drawable {
 public:
  // Marks the whole face as needing a repaint.
  virtual void update() = 0;
  // Paints the face. Called by the framework during a repaint, clipped to what is damaged.
  virtual void draw() = 0;
  // Whether drawing would show anything now.
  virtual bool canDraw() = 0;

  // Batching: painting waits until every disableRedraws has been matched. Both nest. An
  // enableRedraws with no matching disable is ignored and reported.
  static void disableRedraws();
  static void enableRedraws();
  static bool redrawsEnabled();

 protected:
  ~Drawable() = default;
};

// The older spelling of the same batching, with a separate count; painting waits for both.
void refresh_off();
void refresh_on();
bool refresh_is_on();
