#include "panels/CheckboxGroup.h"

CheckboxGroup::CheckboxGroup(const GlobCreationInfo& info, const WString& title, bool ticked)
    : WidgetGroupEx(info, title) {
  auto* box = new Checkbox(GlobCreationInfo(20, kTitleHeight - 4, canvas()), ticked);
  box->setLabel(title);
  box->set_name(Kw::toUtf8(title));
  setWidget(box, title, TextAlignment::Left, true);
  fitBox();
}

void CheckboxGroup::fitBox() {
  Checkbox* box = getCheckbox();
  if (!box) return;
  const bool bold = box->getFont().bold() || (box->getBoldWhenTicked() && box->getState());
  const unsigned short w =
      Checkbox::calcWidth(box->getLabel(), UifBorderNone, box->getAppearance(), bold);
  const Kw::Box<int> r = box->canvas()->rect();
  if (r.width() != w) box->reshape_canvas(r.x0, r.y0, w, r.height());
  update();
}

void CheckboxGroup::titleStored() {
  if (Checkbox* box = getCheckbox()) {
    box->setLabel(title_);
    fitBox();
  }
}

void CheckboxGroup::setCheckboxAppearance(Checkbox::Appearance a) {
  if (Checkbox* box = getCheckbox()) box->setAppearance(a);
  fitBox();
}

void CheckboxGroup::setClicksEnabled(bool enabled) {
  if (Checkbox* box = getCheckbox()) box->setClicksEnabled(enabled);
}

void CheckboxGroup::setBoldWhenTicked(bool bold) {
  if (Checkbox* box = getCheckbox()) box->setBoldWhenTicked(bold);
  fitBox();
}

void CheckboxGroup::useBoldText(bool bold) {
  Checkbox* box = getCheckbox();
  if (!box) return;
  Glib::FontDesc f = box->getFont();
  f.style = bold ? Glib::FontDesc::Bold : Glib::FontDesc::Plain;
  box->setFont(f);
  fitBox();
}

bool CheckboxGroup::getState() const {
  const Checkbox* box = getCheckbox();
  return box && box->getState();
}

void CheckboxGroup::setState(bool value, bool redraw) {
  if (Checkbox* box = getCheckbox(); box && box->getState() != value) box->setState(value);
  handleStateChange(redraw);
  if (redraw) update();
}

void CheckboxGroup::handleStateChange(bool redraw) {
  const bool on = getState() && isActive();
  refresh_off();
  std::vector<Glob*> kids;
  getChildren(kids);
  for (Glob* g : kids) {
    if (g != getWidget()) g->setActive(on, redraw);
  }
  refresh_on();
  fitBox();
}

void CheckboxGroup::handleWidgetAdded(const WidgetDetails& details) {
  WidgetGroupEx::handleWidgetAdded(details);
  if (Glob* g = details.get()) g->setActive(getState() && isActive(), true);
}

int CheckboxGroup::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg.compare(0, 9, "Checkbox ") == 0 && sender && sender == getWidget()) {
    handleStateChange(true);
    if (Glob* to = parent()) send_message_event(this, to, CheckboxClickedMsg());
    return 1;
  }
  return WidgetGroupEx::handleMessageEvent(msg, sender);
}
