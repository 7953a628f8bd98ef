#pragma once
// Where a window goes on a screen: the position the platform proposes for a window of a given
// size, and the correction that keeps a proposed window on the screen. Top-level panels that
// place themselves (input boxes, tooltips) ask here rather than doing the arithmetic each.
//
// Positions are bottom-left corners in root coordinates, y upward.
//
// Choices made here:
// - A new window is proposed centred on the pointer, so that it opens where the user is
//   looking; the proposal is already kept on the screen.
// - Keeping on the screen moves a window as little as possible. A window larger than the
//   screen keeps its top-left corner on the screen's top-left corner, so its title shows.
#include "platform/kw/XY.h"

class RootGlob;

class WindowPlacement {
 public:
  // A position for a new window of `size` on `screen`.
  static XY<int> propose(const RootGlob& screen, XY<int> size);
  // `proposed` moved the least distance that puts a window of `size` wholly on the screen.
  static XY<int> keepOnScreen(const RootGlob& screen, XY<int> size, XY<int> proposed);
  // The same arithmetic for a screen of `screenSize`.
  static XY<int> keepInside(XY<int> screenSize, XY<int> size, XY<int> proposed);
};
