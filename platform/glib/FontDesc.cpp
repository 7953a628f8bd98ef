#include "platform/glib/FontDesc.h"

namespace Glib {

FontDesc FontDesc::resolved() const {
  FontDesc d = *this;
  if (d.face.empty()) d.face = kDefaultFontFace;
  if (d.size < 1) d.size = kDefaultFontSize;
  // Sizes past this are clipped anyway and only cost memory in the glyph caches.
  if (d.size > 512) d.size = 512;
  if (d.style < Plain || d.style > BoldItalic) d.style = Plain;
  return d;
}

}  // namespace Glib
