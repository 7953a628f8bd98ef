#include "platform/backend/SdlCursorSet.h"

SdlCursorSet::~SdlCursorSet() {
  for (SDL_Cursor* c : cursors_) {
    if (c) SDL_FreeCursor(c);
  }
}

SDL_SystemCursor SdlCursorSet::systemCursorFor(MouseCursorID id, bool& hidden) {
  hidden = id == kCursorNone;
  switch (id) {
    case kCursorResizeHorizontal:
    case kCursorHorizontalMove:
      return SDL_SYSTEM_CURSOR_SIZEWE;
    case kCursorResizeVertical:
    case kCursorVerticalMove:
      return SDL_SYSTEM_CURSOR_SIZENS;
    case kCursorText:
      return SDL_SYSTEM_CURSOR_IBEAM;
    case kCursorWait:
      return SDL_SYSTEM_CURSOR_WAIT;
    case kCursorHand:
      return SDL_SYSTEM_CURSOR_HAND;
    case kCursorResizeCorner:
      return SDL_SYSTEM_CURSOR_SIZENWSE;
    // A value, or a whole object, follows the pointer in either direction.
    case kCursorValueDrag:
    case kCursorMove:
      return SDL_SYSTEM_CURSOR_SIZEALL;
    default:
      return SDL_SYSTEM_CURSOR_ARROW;
  }
}

void SdlCursorSet::show(MouseCursorID id) {
  if (shown_ && id == showing_) return;
  bool hidden = false;
  const SDL_SystemCursor which = systemCursorFor(id, hidden);
  showing_ = id;
  shown_ = true;
  if (hidden) {
    SDL_ShowCursor(SDL_DISABLE);
    return;
  }
  SDL_Cursor*& c = cursors_[which];
  if (!c) c = SDL_CreateSystemCursor(which);
  if (c) SDL_SetCursor(c);
  SDL_ShowCursor(SDL_ENABLE);
}
