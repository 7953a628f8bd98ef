#include "platform/glib/look/MarkLook.h"

#include <algorithm>
#include <cmath>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"

namespace Glib {

namespace {

Kw::Box<int> inset(const Kw::Box<int>& b, int d) {
  return Kw::Box<int>(b.x0 + d, b.y0 + d, b.x1 - d, b.y1 - d);
}

double luminance(const Colour& c) {
  return 0.2126 * c.r + 0.7152 * c.g + 0.0722 * c.b;
}

}  // namespace

Colour MarkLook::knob() const {
  const double well = luminance(palette_.get(Palette::Base));
  const Colour& light = palette_.get(Palette::Light);
  const Colour& shadow = palette_.get(Palette::Shadow);
  return std::abs(luminance(light) - well) >= std::abs(luminance(shadow) - well) ? light : shadow;
}

Colour MarkLook::label(const Colour& text, bool active) const {
  return active ? text : palette_.get(Palette::Disabled);
}

Colour MarkLook::mark(bool active) const {
  return palette_.get(active ? Palette::Highlight : Palette::Disabled);
}

void MarkLook::well(Painter& p, const Kw::Box<int>& box, const Colour& back, bool hover,
                    bool active, bool isSwitch) const {
  Colour well = palette_.get(Palette::Base);
  if (hover) well = scale(mix(well, palette_.get(Palette::Light), 0.25), 1.1);
  if (!active) well = mix(well, back, 0.5);
  const Colour& border = palette_.get(Palette::Border);
  const Colour edge = active ? border : mix(border, back, 0.5);
  p.fillRect(box, well);
  p.outlineRect(box, edge);
  if (isSwitch) return;
  p.depthBox(inset(box, 1), Bevel::Sunken, 1, mix(well, palette_.get(Palette::Light), 0.5),
             mix(well, palette_.get(Palette::Shadow), 0.8));
}

void MarkLook::tick(Painter& p, const Kw::Box<int>& box, char tickCharacter, bool active) const {
  const Kw::Box<int> glyphBox = inset(box, 1);
  if (tickCharacter == 0) {
    p.symbol(kSymbolTick, glyphBox, mark(active));
  } else {
    const WString ch(1, static_cast<wchar_t>(static_cast<unsigned char>(tickCharacter)));
    p.text(ch, glyphBox, *fonts().standard(), mark(active), TextAlignment::Centred,
           TextStyles::Plain);
  }
}

void MarkLook::mixedBar(Painter& p, const Kw::Box<int>& box, bool active) const {
  const int barHeight = std::max(2, box.height() / 5);
  const int y0 = box.y0 + (box.height() - barHeight) / 2;
  p.fillRect(Kw::Box<int>(box.x0 + 3, y0, box.x1 - 3, y0 + barHeight), mark(active));
}

void MarkLook::switchOff(Painter& p, const Kw::Box<int>& track, bool active) const {
  const Kw::Box<int> in = inset(track, kKnobInset);
  p.fillRect(Kw::Box<int>(in.x0, in.y0, in.x0 + in.height(), in.y1),
             active ? knob() : palette_.get(Palette::Disabled));
}

void MarkLook::switchOn(Painter& p, const Kw::Box<int>& track, bool active) const {
  const Kw::Box<int> in = inset(track, kKnobInset);
  const int k = in.height();
  p.fillRect(in, mark(active));
  p.fillRect(Kw::Box<int>(in.x1 - k, in.y0, in.x1, in.y1), palette_.get(Palette::HighlightedText));
}

void MarkLook::switchMixed(Painter& p, const Kw::Box<int>& track, const Colour& back,
                           bool active) const {
  const Kw::Box<int> in = inset(track, kKnobInset);
  const int k = in.height();
  const int x0 = in.x0 + (in.width() - k) / 2;
  p.fillRect(Kw::Box<int>(in.x0, in.y0, x0, in.y1), mix(mark(active), back, 0.5));
  p.fillRect(Kw::Box<int>(x0, in.y0, x0 + k, in.y1), knob());
}

void MarkLook::focusMark(Painter& p, const Kw::Box<int>& box) const {
  p.focusRect(box, palette_.get(Palette::Focus));
}

}  // namespace Glib
