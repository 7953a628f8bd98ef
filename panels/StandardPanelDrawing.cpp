// The look of a standard panel: its background with the title and bottom strips, its border
// in each style, and the surrounds it draws round its children, all through the panel look.
#include "panels/PanelStandardWidgets.h"
#include "panels/StandardPanel.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/PanelLook.h"

void StandardPanel::draw() {
  drawBackground();
  drawBorder();
  drawWidgets();
}

void StandardPanel::drawBackground() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::PanelLook look(getPalette());
  const PanelFrame f = frame();
  const Kw::Box<int> title = PanelGeometry::titleStrip(f);
  // A title box shows the title itself; otherwise the strip carries it.
  const bool stripTitle = !title.empty() && !(std_ && std_->titleBoxGlob()) && !title_.empty();
  const Kw::Box<int> titleText =
      stripTitle ? Kw::Box<int>(title.x0 + kTitleMargin, title.y0 + 1, titleButtonsLeft(), title.y1)
                 : Kw::Box<int>();
  look.background(p, getcol(), title, stripTitle ? title_ : WString(), titleText,
                  PanelGeometry::bottomStrip(f));
}

void StandardPanel::drawBorder() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::PanelLook(getPalette()).border(p, static_cast<Glib::PanelLook::Frame>(border_));
}

void StandardPanel::drawWidgets() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::PanelLook look(getPalette());
  for (const WidgetDetails& d : widgets_) {
    if (d.surround == SurroundNone || !d.get() || !d.get()->isVisible()) continue;
    look.surround(p, outerBoxOf(d), static_cast<Glib::PanelLook::Surround>(d.surround),
                  PanelGeometry::kSurroundWidth);
  }
}
