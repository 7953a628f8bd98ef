#pragma once
// What a canvas asks of the object that lives on it.
#include "platform/glob/MouseCursorID.h"
#include "platform/kw/String.h"
#include "platform/kw/XY.h"

class Glob;

class CanvasClient {
 public:
  virtual ~CanvasClient() = default;

  // The Glob this client is, or null: the tree asks this instead of casting.
  virtual Glob* asGlob() { return nullptr; }

  // The client's type word ("button", "glob", ...).
  virtual const char* idstring() const = 0;
  // Help text for the point `pos` of the canvas; empty when there is none.
  virtual String contextString(const XY<int>& pos, CanvasClient* asker) = 0;
  // The cursor shape to show over `pos`.
  virtual MouseCursorID contextCursor(const XY<int>& pos) = 0;
  // The pointer entered (true) or left (false) the canvas.
  virtual void handleMouseContainment(bool inside) = 0;
  // Whether the point is painted opaquely by the client; hit tests skip transparent points.
  virtual bool isOpaqueAt(const XY<int>& pos) { return true; }
};
