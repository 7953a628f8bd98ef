#pragma once
// Where the screen lives: an image in memory (headless) or a real window. Both hold one root
// Glob and a Cairo image of it; a step takes input, fires due ticks, delivers queued messages,
// repaints the damage and presents what changed.
#include <cairo.h>

#include "platform/glob/RootGlob.h"
#include "platform/kw/String.h"

class Backend {
 public:
  virtual ~Backend() = default;

  virtual RootGlob& root() = 0;
  // One turn of the loop; waits up to `waitMs` for input. False once the user asked to quit.
  virtual bool step(int waitMs) = 0;
  // The root's pixels (top-down, ARGB32), current after the last step or render.
  virtual cairo_surface_t* surface() = 0;
  // Repaints whatever is damaged now, without taking input.
  virtual void render() = 0;
  // Writes the whole root, or the visible part of one Glob, to a PNG file. False on failure
  // (reported through Diagnostics).
  virtual bool screenshot(const String& pngPath) = 0;
  virtual bool screenshot(const Glob& glob, const String& pngPath) = 0;
};
