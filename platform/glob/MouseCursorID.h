#pragma once
// Mouse cursor shapes by number. The numbers are the ones controls ask for.

enum MouseCursorID : int {
  kCursorNone = 0,
  kCursorResizeHorizontal = 1,  // left-right resize handle
  kCursorResizeVertical = 4,    // up-down resize handle
  kCursorText = 8,              // I-beam over editable text
  kCursorWait = 12,
  kCursorArrow = 16,      // the ordinary pointer
  kCursorHand = 20,       // something that reacts to a click
  kCursorValueDrag = 21,  // dragging changes a value
  kCursorHorizontalMove = 22,
  kCursorVerticalMove = 23,
  kCursorResizeCorner = 24,  // the corner handle that resizes both ways
  kCursorMove = 25,          // the whole object moves with the pointer
};
