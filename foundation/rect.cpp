#include "foundation/rect.h"

rect::rect(const GlobCreationInfo& info) : MenuGlob(info), face_(info.palette.get(Palette::Window)) {}

rect::rect(unsigned short width, unsigned short height, int flag, Canvas* parent)
    : MenuGlob(width, height, flag, parent), face_(getPalette().get(Palette::Window)) {}

void rect::setcol(const Colour& colour, bool redraw) {
  if (colour == face_) return;
  face_ = colour;
  if (redraw) update();
}

Kw::Box<int> rect::facepath() const { return Kw::Box<int>(0, 0, width(), height()); }
