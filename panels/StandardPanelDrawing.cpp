// The look of a standard panel: its background with the title and bottom strips, its border
// in each style, and the surrounds it draws round its children.
#include "panels/PanelStandardWidgets.h"
#include "panels/StandardPanel.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"

void StandardPanel::draw() {
  drawBackground();
  drawBorder();
  drawWidgets();
}

namespace {

// Fills the band between `outer` and the box `width` pixels inside it.
void fillRing(Glib::Painter& p, const Kw::Box<int>& outer, int width, const Colour& c) {
  const Kw::Box<int> inner(outer.x0 + width, outer.y0 + width, outer.x1 - width, outer.y1 - width);
  p.fillRect(Kw::Box<int>(outer.x0, inner.y1, outer.x1, outer.y1), c);
  p.fillRect(Kw::Box<int>(outer.x0, outer.y0, outer.x1, inner.y0), c);
  p.fillRect(Kw::Box<int>(outer.x0, inner.y0, inner.x0, inner.y1), c);
  p.fillRect(Kw::Box<int>(inner.x1, inner.y0, outer.x1, inner.y1), c);
}

Kw::Box<int> inset(const Kw::Box<int>& b, int d) {
  return Kw::Box<int>(b.x0 + d, b.y0 + d, b.x1 - d, b.y1 - d);
}

}  // namespace

void StandardPanel::drawBackground() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Palette& pal = getPalette();
  p.fillRect(p.bounds(), getcol());
  const PanelFrame f = frame();
  const Kw::Box<int> title = PanelGeometry::titleStrip(f);
  if (!title.empty()) {
    // A slightly lighter band, lit from above, with an etched line under it.
    p.verticalGradient(title, pal.windowShade(3), pal.windowShade(4));
    p.fillRect(Kw::Box<int>(title.x0, title.y0, title.x1, title.y0 + 1), pal.get(Palette::Shadow));
    p.fillRect(Kw::Box<int>(title.x0, title.y0 - 1, title.x1, title.y0), pal.windowShade(4));
    if (!std_->titleBoxGlob() && !title_.empty()) {
      const Kw::Box<int> textBox(title.x0 + kTitleMargin, title.y0 + 1, titleButtonsLeft(),
                                 title.y1);
      auto font =
          Glib::fonts().get(Glib::FontDesc(String(), Glib::kDefaultFontSize, Glib::FontDesc::Bold));
      p.text(title_, textBox, *font, pal.get(Palette::WindowText), TextAlignment::Left);
    }
  }
  const Kw::Box<int> bottom = PanelGeometry::bottomStrip(f);
  if (!bottom.empty()) {
    p.fillRect(bottom, pal.windowShade(2));
    p.fillRect(Kw::Box<int>(bottom.x0, bottom.y1 - 1, bottom.x1, bottom.y1),
               pal.get(Palette::Shadow));
  }
}

void StandardPanel::drawBorder() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Palette& pal = getPalette();
  const Colour& light = pal.get(Palette::Light);
  const Colour& shadow = pal.get(Palette::Shadow);
  const Colour& edge = pal.get(Palette::Border);
  const Kw::Box<int> all = p.bounds();
  switch (border_) {
    case UifBorderRaised:  // dark outline, 4-pixel raised bevel
      p.outlineRect(all, edge);
      p.depthBox(inset(all, 1), Glib::Bevel::Raised, 4, light, shadow);
      break;
    case UifBorderFramed:  // outline, raised bevel, flat band, sunken groove
      p.outlineRect(all, edge);
      p.depthBox(inset(all, 1), Glib::Bevel::Raised, 3, light, shadow);
      fillRing(p, inset(all, 4), 4, pal.windowShade(2));
      p.depthBox(inset(all, 8), Glib::Bevel::Sunken, 2, light, shadow);
      break;
    case UifBorderSunken:  // 5-pixel sunken well edged inside by a dark line
      p.depthBox(all, Glib::Bevel::Sunken, 5, light, shadow);
      p.outlineRect(inset(all, 5), edge);
      break;
    default:
      break;
  }
}

void StandardPanel::drawWidgets() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Palette& pal = getPalette();
  for (const WidgetDetails& d : widgets_) {
    if (d.surround == SurroundNone || !d.get() || !d.get()->isVisible()) continue;
    const Kw::Box<int> outer = outerBoxOf(d);
    const int w = PanelGeometry::kSurroundWidth;
    switch (d.surround) {
      case SurroundRaised:
        p.depthBox(outer, Glib::Bevel::Raised, w, pal.get(Palette::Light),
                   pal.get(Palette::Shadow));
        break;
      case SurroundSunken:
        p.depthBox(outer, Glib::Bevel::Sunken, w, pal.get(Palette::Light),
                   pal.get(Palette::Shadow));
        break;
      default:  // framed: a dark line round a light one
        p.outlineRect(outer, pal.get(Palette::Border));
        p.outlineRect(inset(outer, 1), pal.windowShade(5));
        break;
    }
  }
}
