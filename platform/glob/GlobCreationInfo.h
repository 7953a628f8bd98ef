#pragma once
// The creation record: where a Glob goes, how big it is, and the palette it starts with.
//
// Palettes are inherited: a record made for a parent canvas starts with the palette of the Glob
// that owns that canvas, so a whole tree takes the look its root was given (set `palette`
// to give a Glob a look of its own). A record without a parent starts with the default
// palette. Only the start is inherited: a later setPalette on the parent changes the parent.
#include "platform/glob/Palette.h"

class Canvas;

struct GlobCreationInfo {
  unsigned short width = 0;
  unsigned short height = 0;
  Canvas* canvas = nullptr;  // the parent canvas; null makes an unattached Glob
  int x = 0;                 // position in the parent, bottom-left corner, y upward
  int y = 0;
  Palette palette;
  int flags = 0;

  GlobCreationInfo() = default;
  GlobCreationInfo(unsigned short w, unsigned short h, Canvas* parent, int px = 0, int py = 0);

  // The record of the older explicit-geometry constructors: size, creation flags, parent.
  static GlobCreationInfo withFlags(unsigned short w, unsigned short h, int flag, Canvas* parent) {
    GlobCreationInfo info(w, h, parent);
    info.flags = flag;
    return info;
  }
};
