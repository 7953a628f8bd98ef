#pragma once
// The creation record: where a Glob goes, how big it is, and the palette it starts with.
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
  GlobCreationInfo(unsigned short w, unsigned short h, Canvas* parent, int px = 0, int py = 0)
      : width(w), height(h), canvas(parent), x(px), y(py) {}

  // The record of the older explicit-geometry constructors: size, creation flags, parent.
  static GlobCreationInfo withFlags(unsigned short w, unsigned short h, int flag, Canvas* parent) {
    GlobCreationInfo info(w, h, parent);
    info.flags = flag;
    return info;
  }
};
