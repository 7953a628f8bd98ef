#include "platform/glib/look/GroupLook.h"

#include <cmath>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"

namespace Glib {

namespace {

// The four edges of `b` one pixel wide, the top one broken between gx0 and gx1.
void edges(Painter& p, const Kw::Box<int>& b, int gx0, int gx1, const Colour& topLeft,
           const Colour& bottomRight) {
  if (gx1 > gx0) {
    p.fillRect(Kw::Box<int>(b.x0, b.y1 - 1, gx0, b.y1), topLeft);
    p.fillRect(Kw::Box<int>(gx1, b.y1 - 1, b.x1, b.y1), topLeft);
  } else {
    p.fillRect(Kw::Box<int>(b.x0, b.y1 - 1, b.x1, b.y1), topLeft);
  }
  p.fillRect(Kw::Box<int>(b.x0, b.y0, b.x0 + 1, b.y1), topLeft);
  p.fillRect(Kw::Box<int>(b.x0, b.y0, b.x1, b.y0 + 1), bottomRight);
  p.fillRect(Kw::Box<int>(b.x1 - 1, b.y0, b.x1, b.y1), bottomRight);
}

double luminance(const Colour& c) {
  return 0.2126 * c.r + 0.7152 * c.g + 0.0722 * c.b;
}

}  // namespace

Colour GroupLook::lightSide(const Colour& edge) const {
  const Colour& light = palette_.get(Palette::Light);
  const Colour& face = palette_.get(Palette::Window);
  if (std::abs(luminance(light) - luminance(face)) >= kMinLightContrast) return light;
  // Halfway from the edge to the face: the frame stays closed, its bevel still reads.
  return Colour((edge.r + face.r) / 2, (edge.g + face.g) / 2, (edge.b + face.b) / 2, edge.a);
}

Colour GroupLook::defaultEdge() const {
  return palette_.get(Palette::Shadow);
}

Colour GroupLook::defaultTitle() const {
  return palette_.get(Palette::WindowText);
}

void GroupLook::face(Painter& p, const Kw::Box<int>& box, const Colour& colour) const {
  p.fillRect(box, colour);
}

void GroupLook::frame(Painter& p, const Kw::Box<int>& box, Frame kind, const Colour& edge,
                      int topInset, int gapX0, int gapX1) const {
  const Kw::Box<int> b(box.x0, box.y0, box.x1, box.y1 - topInset);
  const Colour& light = palette_.get(Palette::Light);
  switch (kind) {
    case Frame::None:
      break;
    case Frame::Raised:
      edges(p, b, gapX0, gapX1, lightSide(edge), edge);
      break;
    case Frame::Sunken:
      edges(p, b, gapX0, gapX1, edge, lightSide(edge));
      break;
    default:  // etched: the edge colour with a light line inside it
      edges(p, Kw::Box<int>(b.x0, b.y0 + 1, b.x1 - 1, b.y1), gapX0, gapX1, edge, edge);
      edges(p, Kw::Box<int>(b.x0 + 1, b.y0, b.x1, b.y1 - 1), gapX0, gapX1, light, light);
      break;
  }
}

void GroupLook::title(Painter& p, const WString& text, const Kw::Box<int>& box,
                      const Colour& colour, bool bold, bool active) const {
  if (text.empty()) return;
  const auto font =
      fonts().get(FontDesc(String(), kDefaultFontSize, bold ? FontDesc::Bold : FontDesc::Plain));
  p.text(text, box, *font, active ? colour : palette_.get(Palette::Disabled), TextAlignment::Left);
}

int GroupLook::titleWidth(const WString& text, bool bold) {
  if (text.empty()) return 0;
  const auto font =
      fonts().get(FontDesc(String(), kDefaultFontSize, bold ? FontDesc::Bold : FontDesc::Plain));
  return font->textWidth(text);
}

void GroupLook::separator(Painter& p, int x0, int x1, int y, Separator kind,
                          const Colour& edge) const {
  switch (kind) {
    case Separator::None:
      break;
    case Separator::Line:
      p.fillRect(Kw::Box<int>(x0, y, x1, y + 1), edge);
      break;
    default:
      p.fillRect(Kw::Box<int>(x0, y, x1, y + 1), edge);
      p.fillRect(Kw::Box<int>(x0, y - 1, x1, y), palette_.get(Palette::Light));
      break;
  }
}

void GroupLook::sizeToggle(Painter& p, const Kw::Box<int>& box, bool minimised, bool active) const {
  const Colour ink = active ? palette_.get(Palette::WindowText) : palette_.get(Palette::Disabled);
  drawSymbol(p, minimised ? kSymbolRight : kSymbolDown, box, ink);
}

}  // namespace Glib
