#include "platform/glib/look/PanelLook.h"

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"

namespace Glib {

namespace {

Kw::Box<int> inset(const Kw::Box<int>& b, int d) {
  return Kw::Box<int>(b.x0 + d, b.y0 + d, b.x1 - d, b.y1 - d);
}

// Fills the band between `outer` and the box `width` pixels inside it.
void fillRing(Painter& p, const Kw::Box<int>& outer, int width, const Colour& c) {
  const Kw::Box<int> inner = inset(outer, width);
  p.fillRect(Kw::Box<int>(outer.x0, inner.y1, outer.x1, outer.y1), c);
  p.fillRect(Kw::Box<int>(outer.x0, outer.y0, outer.x1, inner.y0), c);
  p.fillRect(Kw::Box<int>(outer.x0, inner.y0, inner.x0, inner.y1), c);
  p.fillRect(Kw::Box<int>(inner.x1, inner.y0, outer.x1, inner.y1), c);
}

}  // namespace

void PanelLook::background(Painter& p, const Colour& colour, const Kw::Box<int>& title,
                           const WString& titleText, const Kw::Box<int>& titleTextBox,
                           const Kw::Box<int>& bottom) const {
  face(p, colour);
  if (!title.empty()) {
    titleStrip(p, title);
    this->titleText(p, titleText, titleTextBox);
  }
  if (!bottom.empty()) bottomStrip(p, bottom);
}

void PanelLook::face(Painter& p, const Colour& colour) {
  p.fillRect(p.bounds(), colour);
}

void PanelLook::titleStrip(Painter& p, const Kw::Box<int>& strip) const {
  p.verticalGradient(strip, palette_.windowShade(3), palette_.windowShade(4));
  p.fillRect(Kw::Box<int>(strip.x0, strip.y0, strip.x1, strip.y0 + 1),
             palette_.get(Palette::Shadow));
  p.fillRect(Kw::Box<int>(strip.x0, strip.y0 - 1, strip.x1, strip.y0), palette_.windowShade(4));
}

void PanelLook::titleText(Painter& p, const WString& text, const Kw::Box<int>& box) const {
  if (text.empty()) return;
  auto font = fonts().get(FontDesc(String(), kDefaultFontSize, FontDesc::Bold));
  p.text(text, box, *font, palette_.get(Palette::WindowText), TextAlignment::Left);
}

void PanelLook::bottomStrip(Painter& p, const Kw::Box<int>& strip) const {
  p.fillRect(strip, palette_.windowShade(2));
  p.fillRect(Kw::Box<int>(strip.x0, strip.y1 - 1, strip.x1, strip.y1),
             palette_.get(Palette::Shadow));
}

void PanelLook::border(Painter& p, Frame frame) const {
  switch (frame) {
    case Frame::Raised:
      raisedBorder(p);
      break;
    case Frame::Framed:
      framedBorder(p);
      break;
    case Frame::Sunken:
      sunkenBorder(p);
      break;
    default:
      break;
  }
}

void PanelLook::raisedBorder(Painter& p) const {
  const Kw::Box<int> all = p.bounds();
  p.outlineRect(all, palette_.get(Palette::Border));
  p.depthBox(inset(all, 1), Bevel::Raised, 4, palette_.get(Palette::Light),
             palette_.get(Palette::Shadow));
}

void PanelLook::framedBorder(Painter& p) const {
  const Kw::Box<int> all = p.bounds();
  const Colour& light = palette_.get(Palette::Light);
  const Colour& shadow = palette_.get(Palette::Shadow);
  p.outlineRect(all, palette_.get(Palette::Border));
  p.depthBox(inset(all, 1), Bevel::Raised, 3, light, shadow);
  fillRing(p, inset(all, 4), 4, palette_.windowShade(2));
  p.depthBox(inset(all, 8), Bevel::Sunken, 2, light, shadow);
}

void PanelLook::sunkenBorder(Painter& p) const {
  const Kw::Box<int> all = p.bounds();
  p.depthBox(all, Bevel::Sunken, 5, palette_.get(Palette::Light), palette_.get(Palette::Shadow));
  p.outlineRect(inset(all, 5), palette_.get(Palette::Border));
}

void PanelLook::surround(Painter& p, const Kw::Box<int>& outer, Surround kind, int width) const {
  const Colour& light = palette_.get(Palette::Light);
  const Colour& shadow = palette_.get(Palette::Shadow);
  switch (kind) {
    case Surround::Raised:
      p.depthBox(outer, Bevel::Raised, width, light, shadow);
      break;
    case Surround::Sunken:
      p.depthBox(outer, Bevel::Sunken, width, light, shadow);
      break;
    case Surround::None:
      break;
    default:  // framed: a dark line round a light one
      p.outlineRect(outer, palette_.get(Palette::Border));
      p.outlineRect(inset(outer, 1), palette_.windowShade(5));
      break;
  }
}

void PanelLook::groupFace(Painter& p) const {
  p.fillRect(p.bounds(), palette_.get(Palette::Window));
}

void PanelLook::groupFrame(Painter& p, Frame frame, int width) const {
  if (width == 0) return;
  const Kw::Box<int> all = p.bounds();
  const Colour& light = palette_.get(Palette::Light);
  const Colour& shadow = palette_.get(Palette::Shadow);
  switch (frame) {
    case Frame::Raised:
      p.depthBox(all, Bevel::Raised, width, light, shadow);
      break;
    case Frame::Sunken:
      p.depthBox(all, Bevel::Sunken, width, light, shadow);
      break;
    default:  // an outline, a raised bevel and a sunken groove at the frame's inner edge
      p.outlineRect(all, palette_.get(Palette::Border));
      p.depthBox(inset(all, 1), Bevel::Raised, 2, light, shadow);
      p.depthBox(inset(all, width - 2), Bevel::Sunken, 2, light, shadow);
      break;
  }
}

Colour PanelLook::modalShadeColour() const {
  Colour shade = palette_.windowShade(0);
  shade.a = kModalShadeAlpha8 / 255.0;
  return shade;
}

void PanelLook::modalShade(Painter& p, const Colour& colour) {
  p.fillRect(p.bounds(), colour);
}

}  // namespace Glib
