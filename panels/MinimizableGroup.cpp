#include "panels/MinimizableGroup.h"

#include "platform/glib/Painter.h"
#include "platform/glib/look/GroupLook.h"

const char* const MinimizableGroup::sizeChangedMsg = WidgetGroupEx::heightChangedPrefix;

MinimizableGroup::MinimizableGroup(const GlobCreationInfo& info, const WString& title)
    : WidgetGroupEx(info, title) {}

MinimizableGroup::MinimizableGroup(unsigned short width, unsigned short height,
                                   const WString& title, Canvas* parent)
    : WidgetGroupEx(width, height, title, parent) {}

bool MinimizableGroup::isCoordinateInSizeToggleArea(XY<int> pos) const {
  return pos.x >= 0 && pos.x < width() && pos.y < height() && pos.y > height() - kMinimisedHeight;
}

bool MinimizableGroup::widgetVisibilityCanChange(Glob* widget) const {
  return widget && widget != getWidget();
}

void MinimizableGroup::mapWidgets(bool show) {
  if (show) {
    for (const GlobHandle<>& h : hidden_) {
      if (Glob* g = h.get()) g->map_canvas();
    }
    hidden_.clear();
    return;
  }
  std::vector<Glob*> kids;
  getChildren(kids);
  for (Glob* g : kids) {
    if (!g->isVisible() || !widgetVisibilityCanChange(g)) continue;
    g->unmap_canvas();
    hidden_.emplace_back(g);
  }
}

void MinimizableGroup::setSize(size_state state) {
  if (state != SizeMinimised) state = SizeFull;
  if (state == size_state_) return;
  const int before = height();
  setSizeState(state);
  if (state == SizeMinimised) {
    fullHeight_ = before;
    mapWidgets(false);
    changeHeightKeepingTop(kMinimisedHeight);
  } else {
    changeHeightKeepingTop(fullHeight_ > 0 ? fullHeight_ : before);
    mapWidgets(true);
    // Grouped groups may have changed height meanwhile.
    fitHeight();
  }
  update();
}

void MinimizableGroup::handleFlipSize() {
  const int before = height();
  setSize(size_state_ != SizeMinimised ? SizeMinimised : SizeFull);
  reportHeightChange(height() - before);
}

int MinimizableGroup::handleMouseEvent(Event* e) {
  if (!mouse_event(e) || mouse_move_event(e)) return 0;
  if (!isCoordinateInSizeToggleArea(e->pos)) return 0;
  if (mouse_left_event(e) && mouse_down_event(e) && isActive()) handleFlipSize();
  return 1;
}

int MinimizableGroup::handleMessageEvent(const String& msg, Glob* sender) {
  // A grouped group that changed height while this one is minimised changes only the full
  // height to come back to.
  if (isMinimised() && sender && isChildWidget(sender)) {
    const int delta = getHeightDelta(msg);
    if (delta != 0) {
      relayoutAfter(sender, delta);
      return 1;
    }
  }
  return WidgetGroupEx::handleMessageEvent(msg, sender);
}

void MinimizableGroup::drawBorder() {
  WidgetGroupEx::drawBorder();
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const int top = height();
  const Kw::Box<int> box(kTitleIndent, top - kTitleHeight + 5, kTitleIndent + kToggleWidth - 2,
                         top - 5);
  Glib::GroupLook(getPalette()).sizeToggle(p, box, isMinimised(), isActive());
}
