#include "panels/WidgetGroup.h"

#include "platform/glib/Painter.h"
#include "platform/glib/look/GroupLook.h"

WidgetGroup::WidgetGroup(const GlobCreationInfo& info, const WString& title)
    : StandardPanel(info), title_(title) {
  init();
}

WidgetGroup::WidgetGroup(unsigned short width, unsigned short height, const WString& title,
                         Canvas* parent)
    : StandardPanel(GlobCreationInfo(width, height, parent)), title_(title) {
  init();
}

void WidgetGroup::init() {
  // The panel's own border is only the geometry of the frame: the group draws its own.
  StandardPanel::setBorderStyle(UifBorderRaised);
  setInnerInsets(0, kTitleHeight);
  set_name(Kw::toUtf8(title_));
}

void WidgetGroup::setGroupTitle(const WString& title, bool redraw, bool notify) {
  if (title == title_) return;
  title_ = title;
  set_name(Kw::toUtf8(title_));
  titleStored();
  if (redraw) update();
  if (notify) handleTitleChange();
}

void WidgetGroup::setEdgeColour(const Colour& c) {
  edge_ = c;
  edgeSet_ = true;
  update();
}

Colour WidgetGroup::getEdgeColour() const {
  return edgeSet_ ? edge_ : Glib::GroupLook(getPalette()).defaultEdge();
}

void WidgetGroup::setWidgetsActive(bool active, bool redraw) {
  std::vector<Glob*> kids;
  getChildren(kids);
  for (Glob* g : kids) g->setActive(active, redraw);
}

void WidgetGroup::setActive(bool active, bool redraw) {
  StandardPanel::setActive(active, redraw);
  setWidgetsActive(active, redraw);
}

void WidgetGroup::setBorderStyle(UifTypeOfBorder border) {
  if (border == groupBorder_) return;
  groupBorder_ = border;
  update();
}

Colour WidgetGroup::titleColour() const {
  return Glib::GroupLook(getPalette()).defaultTitle();
}

Kw::Box<int> WidgetGroup::titleStripBox() const {
  return Kw::Box<int>(0, height() - kTitleHeight, width(), height());
}

Kw::Box<int> WidgetGroup::titleTextBox() const {
  const Kw::Box<int> strip = titleStripBox();
  const int x = kTitleIndent + titleLeadWidth();
  const int w = drawsTitleText() ? Glib::GroupLook::titleWidth(title_, titleBold()) : 0;
  return Kw::Box<int>(x, strip.y0, std::min(x + w, width() - kTitleIndent), strip.y1);
}

void WidgetGroup::drawBorder() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::GroupLook look(getPalette());
  const Kw::Box<int> text = titleTextBox();
  const bool hasTitle = text.x1 > kTitleIndent;
  const int gap0 = hasTitle ? kTitleIndent - Glib::GroupLook::kTitleGap : 0;
  const int gap1 = hasTitle ? text.x1 + Glib::GroupLook::kTitleGap : 0;
  look.frame(p, p.bounds(), static_cast<Glib::GroupLook::Frame>(groupBorder_), getEdgeColour(),
             kTitleHeight / 2, gap0, gap1);
  if (drawsTitleText()) look.title(p, title_, text, titleColour(), titleBold(), isActive());
}
