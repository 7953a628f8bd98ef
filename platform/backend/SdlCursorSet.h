#pragma once
// The pointer shapes a window shows, made from SDL's system cursors on first use and kept
// until the set is destroyed. Needs SDL's video subsystem while it lives.
#include <SDL.h>

#include <array>

#include "platform/glob/MouseCursorID.h"

class SdlCursorSet {
 public:
  SdlCursorSet() = default;
  ~SdlCursorSet();
  SdlCursorSet(const SdlCursorSet&) = delete;
  SdlCursorSet& operator=(const SdlCursorSet&) = delete;

  // The system cursor that shows `id`. kCursorNone hides the pointer (`hidden` is set); numbers
  // the library does not name show the arrow.
  static SDL_SystemCursor systemCursorFor(MouseCursorID id, bool& hidden);

  // Shows `id`; does nothing when it is already showing.
  void show(MouseCursorID id);

 private:
  std::array<SDL_Cursor*, SDL_NUM_SYSTEM_CURSORS> cursors_{};
  MouseCursorID showing_ = kCursorArrow;
  bool shown_ = false;
};
