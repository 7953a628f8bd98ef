#include "platform/glib/look/TabLook.h"

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"

#include <tuple>

namespace Glib {

namespace {

Colour scaled(const Colour& c, double f) {
  auto ch = [f](double v) { return v * f > 1.0 ? 1.0 : v * f; };
  return Colour(ch(c.r), ch(c.g), ch(c.b), c.a);
}

}  // namespace

void TabLook::strip(Painter& p, const Kw::Box<int>& box) const {
  p.fillRect(box, palette_.windowShade(2));
  p.fillRect(Kw::Box<int>(box.x0, box.y0, box.x1, box.y0 + 1), palette_.get(Palette::Light));
}

Colour TabLook::defaultFace() const {
  return palette_.windowShade(3);
}

Colour TabLook::defaultText() const {
  return palette_.get(Palette::WindowText);
}

void TabLook::tab(Painter& p, const Kw::Box<int>& box, const Colour& face, const Colour& text,
                  const WString& name, bool current, bool hover, bool active) const {
  Colour fill = current ? scaled(face, kCurrentLift) : face;
  if (hover && !current) fill = scaled(fill, 1.08);
  if (!active) fill = scaled(fill, kInactiveDim);
  // The top corners are cut by one pixel; the current tab stands a little taller.
  const int top = current ? box.y1 : box.y1 - 2;
  const Kw::Box<int> body(box.x0, box.y0, box.x1, top);
  p.fillRect(Kw::Box<int>(body.x0 + 1, body.y0, body.x1 - 1, body.y1 - 1), fill);
  p.fillRect(Kw::Box<int>(body.x0 + 2, body.y1 - 1, body.x1 - 2, body.y1), fill);
  const Colour& light = palette_.get(Palette::Light);
  const Colour& shadow = palette_.get(Palette::Shadow);
  p.fillRect(Kw::Box<int>(body.x0, body.y0, body.x0 + 1, body.y1 - 1), light);
  p.fillRect(Kw::Box<int>(body.x0 + 1, body.y1 - 1, body.x0 + 2, body.y1), light);
  p.fillRect(Kw::Box<int>(body.x0 + 2, body.y1 - 1, body.x1 - 2, body.y1), light);
  p.fillRect(Kw::Box<int>(body.x1 - 1, body.y0, body.x1, body.y1 - 1), shadow);
  // Other tabs sit on the base line; the current one covers it to join its page.
  if (!current) {
    p.fillRect(Kw::Box<int>(box.x0, box.y0, box.x1, box.y0 + 1), light);
  }
  const Colour ink = active ? text : palette_.get(Palette::Disabled);
  const auto font =
      fonts().get(FontDesc(String(), kDefaultFontSize, current ? FontDesc::Bold : FontDesc::Plain));
  p.text(name,
         Kw::Box<int>(body.x0 + kTextPadding / 2, body.y0 + 1, body.x1 - kTextPadding / 2,
                      body.y1 - 1),
         *font, ink, TextAlignment::Centred);
}

void TabLook::scrollArrows(Painter& p, const Kw::Box<int>& box, bool canLeft, bool canRight) const {
  const int mid = (box.x0 + box.x1) / 2;
  const Kw::Box<int> left(box.x0, box.y0 + 2, mid, box.y1 - 2);
  const Kw::Box<int> right(mid, box.y0 + 2, box.x1, box.y1 - 2);
  const Colour& light = palette_.get(Palette::Light);
  const Colour& shadow = palette_.get(Palette::Shadow);
  const Colour& face = palette_.get(Palette::Button);
  for (const auto& [b, enabled, sym] : {std::tuple(left, canLeft, int(kSymbolLeft)),
                                        std::tuple(right, canRight, int(kSymbolRight))}) {
    p.depthBox(b, Bevel::Raised, 1, light, shadow, face);
    const Colour ink =
        enabled ? palette_.get(Palette::ButtonText) : palette_.get(Palette::Disabled);
    drawSymbol(p, sym, Kw::Box<int>(b.x0 + 3, b.y0 + 3, b.x1 - 3, b.y1 - 3), ink);
  }
}

}  // namespace Glib
