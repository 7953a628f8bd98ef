#include "gallery/ColourChip.h"

#include <cstdio>

#include "platform/glib/Painter.h"
#include "platform/glib/look/FaceLook.h"
#include "platform/glob/DragPayload.h"

ColourChip::ColourChip(const GlobCreationInfo& info, uint32_t rgb) : Glob(info), rgb_(rgb) {
  setDefaultCursor(kCursorHand);
  setContextString("Drag this colour onto the well");
}

String ColourChip::hexOf(uint32_t rgb) {
  char text[8];
  std::snprintf(text, sizeof text, "#%06X", rgb & 0xFFFFFFu);
  return text;
}

bool ColourChip::dragPayload(const XY<int>&, DragPayload& out) {
  out = DragPayload(DragPayload::kColour, hexOf(rgb_));
  return true;
}

void ColourChip::draw() {
  Glib::Painter p(*canvas());
  Glib::FaceLook(getPalette()).raised(p, p.bounds(), Colour::fromHex(rgb_));
}
