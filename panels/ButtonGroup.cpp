#include "panels/ButtonGroup.h"

#include "platform/glib/FontCache.h"

ButtonGroup::ButtonGroup(const GlobCreationInfo& info, const WString& title)
    : WidgetGroupEx(info, title) {
  auto* btn = new DropDownButtonImposter(title, kButtonMsg,
                                         GlobCreationInfo(60, kTitleHeight - 2, canvas()));
  setWidget(btn, title, TextAlignment::Left, true);
  fitButton();
}

void ButtonGroup::fitButton() {
  DropDownButtonImposter* btn = getBtn();
  if (!btn) return;
  const int w =
      Glib::fonts().standard()->textWidth(title_) + DropDownButtonImposter::kArrowWidth + 16;
  const Kw::Box<int> r = btn->canvas()->rect();
  if (r.width() != w) btn->reshape_canvas(r.x0, r.y0, w, r.height());
  update();
}

void ButtonGroup::titleStored() {
  if (DropDownButtonImposter* btn = getBtn()) {
    btn->setString(title_);
    btn->set_name(Kw::toUtf8(title_));
    fitButton();
  }
}

int ButtonGroup::handleMessageEvent(const String& msg, Glob* sender) {
  if (sender && sender == getWidget()) {
    if (Glob* to = parent()) send_message_event(this, to, msg);
    return 1;
  }
  return WidgetGroupEx::handleMessageEvent(msg, sender);
}
