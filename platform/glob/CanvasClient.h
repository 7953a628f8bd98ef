#pragma once
// What a canvas asks of the object that lives on it. Its table, after the event-handler face
// it starts with: width, height, resize, handleBaseWindowMove, idstring, contextString,
// contextCursor, handleMouseContainment, drawUnbuffered, isOpaqueAt; asGlob comes last.
#include "platform/glob/EventHandler.h"
#include "platform/glob/MouseCursorID.h"
#include "platform/glob/iRegion.h"
#include "platform/kw/String.h"
#include "platform/kw/XY.h"

class Glob;

class CanvasClient : public EventHandler {
 public:
  // The client's size, as its canvas has it; a client that is not a Glob has none of its own.
  // (A Glob's own width() and height() are the 16-bit ones of its table.)
  virtual double width();
  virtual double height();
  // Asks for a new size; the bottom-left corner stays where it is. The base does nothing.
  virtual void resize(double width, double height) {}
  // The window the screen lives in moved on the desktop.
  virtual void handleBaseWindowMove() {}
  // The client's type word ("button", "glob", ...).
  virtual const char* idstring() const = 0;
  // Help text for the point `pos` of the canvas; empty when there is none.
  virtual String contextString(const XY<int>& pos, CanvasClient* asker) = 0;
  // The cursor shape to show over `pos`.
  virtual MouseCursorID contextCursor(const XY<int>& pos) = 0;
  // The pointer entered (true) or left (false) the canvas.
  virtual void handleMouseContainment(bool inside) = 0;
  // Paints `area` (the client's own coordinates) at once rather than with the next frame.
  virtual void drawUnbuffered(Kw::Ptr<iRegion> area) {}
  // Whether the point is painted opaquely by the client.
  virtual bool isOpaqueAt(const XY<int>& pos) { return true; }

  // The Glob this client is, or null: the tree asks this instead of casting.
  virtual Glob* asGlob() { return nullptr; }
};
