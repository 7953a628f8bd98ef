#include "panels/CheckableWidgetGroup.h"

#include <cstring>

#include "buttons/Checkbox.h"

const char* const CheckableWidgetGroup::groupStateToggledMsg = "WidgetGroupStateToggled";
const char* const CheckableWidgetGroup::checkboxPrefix = "WidgetGroupCheckbox ";

CheckableWidgetGroup::CheckableWidgetGroup(const GlobCreationInfo& info, const WString& title,
                                           bool ticked)
    : WidgetGroupEx(info, title), state_(ticked) {
  const unsigned short w = Checkbox::calcWidth(title, UifBorderNone, Checkbox::BoxLeft, false);
  auto* box = new Checkbox(GlobCreationInfo(w, kTitleHeight - 4, canvas()), ticked);
  box->setLabel(title);
  box->setMsgPrefix(checkboxPrefix);
  box->set_name(Kw::toUtf8(title));
  setWidget(box, title, TextAlignment::Left, true);
}

Checkbox* CheckableWidgetGroup::getCheckbox() const {
  return dynamic_cast<Checkbox*>(getWidget());
}

void CheckableWidgetGroup::setState(bool value, bool redraw) {
  state_ = value;
  if (Checkbox* box = getCheckbox(); box && box->getState() != value) box->setState(value);
  setWidgetsActive(value, redraw);
}

void CheckableWidgetGroup::handleWidgetAdded(const WidgetDetails& details) {
  WidgetGroupEx::handleWidgetAdded(details);
  if (Glob* g = details.get()) g->setActive(state_ && isActive(), true);
}

void CheckableWidgetGroup::titleStored() {
  if (Checkbox* box = getCheckbox()) {
    box->setLabel(title_);
    const unsigned short w = Checkbox::calcWidth(title_, UifBorderNone, Checkbox::BoxLeft, false);
    const Kw::Box<int> r = box->canvas()->rect();
    box->reshape_canvas(r.x0, r.y0, w, r.height());
  }
}

int CheckableWidgetGroup::handleMessageEvent(const String& msg, Glob* sender) {
  Checkbox* box = getCheckbox();
  if (box && sender == box && msg.compare(0, 19, "WidgetGroupCheckbox") == 0) {
    setState(box->getState(), true);
    if (Glob* to = parent()) send_message_event(this, to, groupStateToggledMsg);
    return 1;
  }
  return WidgetGroupEx::handleMessageEvent(msg, sender);
}
