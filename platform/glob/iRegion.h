#pragma once
// An area of a canvas: what a Glob covers (Glob::path, Glob::shape) and what a client is asked
// to paint directly (CanvasClient::drawUnbuffered). Counted, so it can be handed around freely.
#include "platform/kw/Box.h"
#include "platform/kw/Ptr.h"

class iRegion : public Kw::RefCounted {
 public:
  virtual bool contains(XY<int> p) const = 0;
  // The smallest box holding the area; empty for an empty area.
  virtual Kw::Box<int> bounds() const = 0;
  // The same area moved by (dx, dy).
  virtual Kw::Ptr<iRegion> translated(int dx, int dy) const = 0;
};
