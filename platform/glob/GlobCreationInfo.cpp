#include "platform/glob/GlobCreationInfo.h"

#include "platform/glob/Glob.h"

namespace {

// The palette of the live Glob owning `c`, or null.
const Palette* ownerPalette(const Canvas* c) {
  const Glob* owner = c && c->client() ? c->client()->asGlob() : nullptr;
  return owner && glob_serial_is_alive(owner, owner->serial()) ? &owner->getPalette() : nullptr;
}

}  // namespace

GlobCreationInfo::GlobCreationInfo(unsigned short w, unsigned short h, Canvas* parent, int px,
                                   int py)
    : width(w), height(h), canvas(parent), x(px), y(py) {
  if (const Palette* inherited = ownerPalette(parent)) palette = *inherited;
}
