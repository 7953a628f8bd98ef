#include "platform/glob/GlobCreationInfo.h"

#include "platform/glob/Glob.h"

namespace {

// The palette of the live Glob owning `c`, or null.
const Palette* ownerPalette(const Canvas* c) {
  if (!c) return nullptr;
  const auto* owner = dynamic_cast<const Glob*>(c->client());
  return owner && is_good_glob_ptr(owner) ? &owner->getPalette() : nullptr;
}

}  // namespace

GlobCreationInfo::GlobCreationInfo(unsigned short w, unsigned short h, Canvas* parent, int px,
                                   int py)
    : width(w), height(h), canvas(parent), x(px), y(py) {
  if (const Palette* inherited = ownerPalette(parent)) palette = *inherited;
}
