#include "platform/backend/SdlClipboardProvider.h"

#include <SDL.h>

#include "platform/misc/Diagnostics.h"

WString SdlClipboardProvider::getText() {
  char* text = SDL_GetClipboardText();  // an empty string when there is none; never null in SDL2
  if (!text) return WString();
  WString wide = Kw::toWide(text);
  SDL_free(text);
  return wide;
}

void SdlClipboardProvider::setText(const WString& text) {
  if (SDL_SetClipboardText(Kw::toUtf8(text).c_str()) != 0) {
    diagWarning(String("clipboard: the system clipboard refused the text: ") + SDL_GetError() +
                "\n");
  }
}

bool SdlClipboardProvider::hasText() {
  return SDL_HasClipboardText() == SDL_TRUE;
}
