#include "platform/glib/look/ToolTipLook.h"

#include "platform/glib/Painter.h"
#include "platform/glib/iFont.h"

namespace Glib {

Colour ToolTipLook::face() const {
  return mix(palette_.get(Palette::Window), palette_.get(Palette::Light), kFaceLift);
}

void ToolTipLook::frame(Painter& p) const {
  p.fillRect(p.bounds(), face());
  p.outlineRect(p.bounds(), palette_.get(Palette::Border));
}

void ToolTipLook::lines(Painter& p, const std::vector<WString>& lines, const Kw::Box<int>& inner,
                        const iFont& font) const {
  const int h = font.height();
  p.pushClip(inner);
  int top = inner.y1;
  for (const WString& line : lines) {
    if (top <= inner.y0) break;
    if (!line.empty()) p.textAt(line, XY<int>(inner.x0, top - h), font, text());
    top -= h;
  }
  p.popClip();
}

}  // namespace Glib
