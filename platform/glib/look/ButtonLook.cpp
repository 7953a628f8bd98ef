#include "platform/glib/look/ButtonLook.h"

#include <algorithm>
#include <cmath>

#include "platform/glib/Image.h"
#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"

namespace Glib {

Colour ButtonLook::face(const Colour& stateFace, bool active) const {
  return active ? stateFace : mix(stateFace, palette_.get(Palette::Base), kInactiveFaceSink);
}

Colour ButtonLook::label(const Colour& stateLabel, bool active) const {
  return active ? stateLabel : palette_.get(Palette::Disabled);
}

Colour ButtonLook::edge(bool focused) const {
  return palette_.get(focused ? Palette::Focus : Palette::Border);
}

Kw::Box<int> ButtonLook::pressed(const Kw::Box<int>& box, bool down, bool flat) {
  const int s = pressShift(down, flat);
  return box.translated(s, -s);
}

void ButtonLook::background(Painter& p, const Colour& face, bool down, bool flat) const {
  if (flat) {
    p.fillRect(p.bounds(), face);
  } else if (down) {
    p.verticalGradient(p.bounds(), scale(face, 0.92), scale(face, 0.80));
  } else {
    p.verticalGradient(p.bounds(), scale(face, 0.90), scale(face, 1.08));
  }
}

void ButtonLook::edge(Painter& p, const Colour& edge, const Colour& face, bool down, bool flat,
                      bool active, int bevelWidth) const {
  const Kw::Box<int> b = p.bounds();
  p.outlineRect(b, edge);
  if (flat || bevelWidth <= 1) return;
  const double contrast = active ? 1.0 : kInactiveBevelContrast;
  const Colour light = mix(face, palette_.get(Palette::Light), contrast);
  const Colour shadow = mix(face, palette_.get(Palette::Shadow), contrast);
  const Kw::Box<int> inner(b.x0 + 1, b.y0 + 1, b.x1 - 1, b.y1 - 1);
  p.depthBox(inner, down ? Bevel::Sunken : Bevel::Raised, bevelWidth - 1, light, shadow);
}

void ButtonLook::latchLamp(Painter& p, const Kw::Box<int>& content) const {
  p.fillRect(Kw::Box<int>(content.x0 + 1, content.y0, content.x1 - 1, content.y0 + 2),
             palette_.get(Palette::Highlight));
}

void ButtonLook::focusMark(Painter& p, const Kw::Box<int>& content) const {
  p.focusRect(content, palette_.get(Palette::Focus));
}

void ButtonLook::glyph(Painter& p, int code, const Kw::Box<int>& box, const Colour& c) {
  drawSymbol(p, code, box, c);
}

int ButtonLook::picture(Painter& p, const Image& img, const Kw::Box<int>& room,
                        const Kw::Box<int>& button, bool alone, int shift, bool active) {
  const int iw = img.width(), ih = img.height();
  if (iw <= 0 || ih <= 0 || room.empty()) return room.x0;
  const double fit = std::min(
      {1.0, static_cast<double>(room.width()) / iw, static_cast<double>(room.height()) / ih});
  const int dw = std::max(1, static_cast<int>(std::lround(iw * fit)));
  const int dh = std::max(1, static_cast<int>(std::lround(ih * fit)));
  const int x = (alone ? button.x0 + (button.width() - dw) / 2 : room.x0) + shift;
  const int y = button.y0 + (button.height() - dh) / 2 - shift;
  const double opacity = active ? 1.0 : kInactivePictureOpacity;
  if (fit >= 1.0) {
    p.image(img, XY<int>(x, y), opacity);
  } else {
    p.scaledImage(img, Kw::Box<int>(x, y, x + dw, y + dh), fit, opacity);
  }
  return x + dw;
}

}  // namespace Glib
