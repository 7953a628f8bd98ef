#include "panels/WidgetGroupEx.h"

#include <algorithm>
#include <cstdio>
#include <cstring>

#include "platform/glib/Painter.h"
#include "platform/glib/look/GroupLook.h"

const char* const WidgetGroupEx::GroupRenamedMsg = "GroupRenamed ";
const char* const WidgetGroupEx::heightChangedPrefix = "MinimizableGroupSizeChange ";

WidgetGroupEx::WidgetGroupEx(const GlobCreationInfo& info, const WString& title)
    : WidgetGroup(info, title) {}

WidgetGroupEx::WidgetGroupEx(unsigned short width, unsigned short height, const WString& title,
                             Canvas* parent)
    : WidgetGroup(width, height, title, parent) {}

int WidgetGroupEx::calcHeightForRows(int rows, int rowHeight, int gap) {
  return rows * rowHeight + (rows - 1) * gap + kTitleAndFrame;
}

int WidgetGroupEx::parseHeightDelta(const String& msg) {
  if (msg.compare(0, std::strlen(heightChangedPrefix), heightChangedPrefix) != 0) return 0;
  char word[64];
  int delta = 0;
  if (std::sscanf(msg.c_str(), "%63s %d", word, &delta) != 2) return 0;
  return delta;
}

// --- Title ---

void WidgetGroupEx::setGroupTitle(const WString& title, bool notify) {
  setGroupTitle(title, true, notify);
  placeTitleWidget();
}

void WidgetGroupEx::handleTitleChange() {
  if (Glob* to = parent()) send_message_event(this, to, GroupRenamedMsg + Kw::toUtf8(title_));
}

void WidgetGroupEx::setWidget(Glob* widget, const WString& title, TextAlignment where,
                              bool fitToTitle) {
  if (Glob* old = titleWidget_.get(); old && old != widget) delete old;
  titleWidget_ = GlobHandle<>(widget);
  widgetPlace_ = where;
  fitToTitle_ = widget && fitToTitle;
  setGroupTitle(title, true, false);
  placeTitleWidget();
  update();
}

void WidgetGroupEx::placeTitleWidget() {
  Glob* w = titleWidget_.get();
  if (!w) return;
  const int wh = std::min<int>(w->height(), kTitleHeight);
  int ww = w->width();
  if (fitToTitle_) ww = std::max(ww, 0);
  const int y = height() - kTitleHeight + (kTitleHeight - wh) / 2;
  int x = kTitleIndent;
  if (widgetPlace_ == TextAlignment::Centred) x = (width() - ww) / 2;
  if (widgetPlace_ == TextAlignment::Right) x = width() - kTitleIndent - ww;
  w->reshape_canvas(x, y, ww, wh);
}

int WidgetGroupEx::titleLeadWidth() const {
  const Glob* w = titleWidget_.get();
  if (!w || widgetPlace_ != TextAlignment::Left) return 0;
  return w->width() + (fitToTitle_ ? 0 : kWidgetGap);
}

void WidgetGroupEx::setBoldText(bool bold) {
  if (bold == bold_) return;
  bold_ = bold;
  update();
}

void WidgetGroupEx::setGroupTitleColour(const Colour& c) {
  titleColour_ = c;
  titleColourSet_ = true;
  update();
}

Colour WidgetGroupEx::titleColour() const {
  return titleColourSet_ ? titleColour_ : WidgetGroup::titleColour();
}

void WidgetGroupEx::setSeparatorStyle(eSeparatorStyle s) {
  if (s == separator_) return;
  separator_ = s;
  update();
}

// --- Layout ---

void WidgetGroupEx::setAutoSize(bool on) {
  autoSize_ = on;
  if (on) fitHeight();
}

void WidgetGroupEx::setAutoSizeChildren(bool on) {
  autoSizeChildren_ = on;
  if (on) resizeChildren(0);
}

void WidgetGroupEx::setChildrenOffset(XY<int> offset) {
  childrenOffset_ = offset;
  setInnerInsets(offset.x, kTitleHeight + offset.y);
}

void WidgetGroupEx::changeHeightKeepingTop(int h) {
  h = std::max(h, static_cast<int>(kMinimisedHeight));
  const Kw::Box<int> r = canvas()->rect();
  if (h == r.height()) return;
  reshape_canvas(r.x0, r.y1 - h, r.width(), h);
}

void WidgetGroupEx::resize(double w, double h) {
  const Kw::Box<int> r = canvas()->rect();
  const int nh = std::max(0, static_cast<int>(h + 0.5));
  reshape_canvas(r.x0, r.y1 - nh, std::max(0, static_cast<int>(w + 0.5)), nh);
  if (autoSizeChildren_) resizeChildren(0);
}

void WidgetGroupEx::resizeChildren(int w) {
  if (w <= 0) w = getUserArea().width();
  std::vector<Glob*> kids;
  getChildren(kids);
  for (Glob* g : kids) {
    const Kw::Box<int> r = g->canvas()->rect();
    if (r.width() != w) g->reshape_canvas(r.x0, r.y0, w, r.height());
  }
  recalculateWidgetPositions();
}

void WidgetGroupEx::recolourChildren(WidgetGroupEx* group) {
  if (!group) return;
  std::vector<Glob*> kids;
  group->getChildren(kids);
  for (Glob* g : kids) g->setCol(group->getcol(), true);
}

int WidgetGroupEx::fitHeight() {
  if (!autoSize_) return 0;
  std::vector<Glob*> kids;
  getChildren(kids);
  const int innerTop = getOriginXY(OriginInnerTopLeft).y;
  int extent = 0;
  for (Glob* g : kids) {
    if (!g->isVisible()) continue;
    extent = std::max(extent, innerTop - g->canvas()->rect().y0);
  }
  const int before = height();
  const int wanted = height() - innerTop + extent + kFrameWidth;
  changeHeightKeepingTop(wanted);
  return height() - before;
}

void WidgetGroupEx::handleWidgetAdded(const WidgetDetails& details) {
  if (autoSizeChildren_) {
    if (Glob* g = details.get()) {
      const Kw::Box<int> r = g->canvas()->rect();
      g->reshape_canvas(r.x0, r.y0, getUserArea().width(), r.height());
      recalculateWidgetPositions();
    }
  }
  fitHeight();
}

void WidgetGroupEx::relayoutAfter(Glob* changed, int delta) {
  const Kw::Box<int> c = changed->canvas()->rect();
  std::vector<Glob*> kids;
  getChildren(kids);
  // The changed group kept its top edge; what stood below that edge moves with its bottom.
  // Widgets placed against another follow it when the positions are worked out again.
  for (Glob* g : kids) {
    if (g == changed || g->canvas()->rect().y1 > c.y1) continue;
    const WidgetDetails* d = getWidget(g);
    if (d && d->relative) continue;
    translateWidgetPos(g, 0, -delta);
  }
  recalculateWidgetPositions();
}

bool WidgetGroupEx::reportHeightChange(int delta) {
  Glob* to = parent();
  if (!to) return true;
  GlobHandle<> self(this);
  send_message_event(this, to, heightChangedPrefix + std::to_string(delta));
  return self.alive();
}

int WidgetGroupEx::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg.compare(0, std::strlen(heightChangedPrefix), heightChangedPrefix) != 0) return 0;
  if (!sender || !isChildWidget(sender)) return 0;
  const int delta = parseHeightDelta(msg);
  if (delta == 0) return 1;
  relayoutAfter(sender, delta);
  const int own = fitHeight();
  if (own != 0) reportHeightChange(own);
  return 1;
}

void WidgetGroupEx::reshape() {
  WidgetGroup::reshape();
  placeTitleWidget();
}

void WidgetGroupEx::drawBorder() {
  WidgetGroup::drawBorder();
  if (separator_ == SeparatorNone) return;
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::GroupLook(getPalette())
      .separator(p, kFrameWidth, width() - kFrameWidth, height() - kTitleHeight,
                 static_cast<Glib::GroupLook::Separator>(separator_), getEdgeColour());
}
