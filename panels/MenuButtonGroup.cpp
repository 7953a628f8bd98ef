#include "panels/MenuButtonGroup.h"

const char* const MenuButtonGroup::buttonClickedMsg = "MenuButtonGroupClick";

MenuButtonGroup::MenuButtonGroup(const GlobCreationInfo& info, const WString& title,
                                 const std::vector<WString>& entries)
    : WidgetGroupEx(info, title) {
  auto* btn =
      new DropDownMenuButton(title, entries, GlobCreationInfo(80, kTitleHeight - 2, canvas()));
  setWidget(btn, title, TextAlignment::Left, true);
  fitButton();
}

void MenuButtonGroup::fitButton() {
  DropDownMenuButton* btn = getBtn();
  if (!btn || !autoSizeButton_) return;
  const int w = DropDownMenuButton::calcWidth(btn->getString(), *btn->labelFont());
  const Kw::Box<int> r = btn->canvas()->rect();
  if (r.width() != w) btn->reshape_canvas(r.x0, r.y0, w, r.height());
  update();
}

void MenuButtonGroup::setStrings(const std::vector<WString>& entries) {
  if (DropDownMenuButton* btn = getBtn()) btn->setStrings(entries);
  fitButton();
}

void MenuButtonGroup::setStrings(const std::vector<MenuItem>& items) {
  if (DropDownMenuButton* btn = getBtn()) btn->setStrings(items);
  fitButton();
}

bool MenuButtonGroup::setSelectedItem(int index) {
  DropDownMenuButton* btn = getBtn();
  if (!btn || !btn->setSelectedItem(index)) return false;
  fitButton();
  return true;
}

bool MenuButtonGroup::setSelectedItem(const WString& name) {
  DropDownMenuButton* btn = getBtn();
  if (!btn || !btn->setSelectedItem(name)) return false;
  fitButton();
  return true;
}

int MenuButtonGroup::getSelectedItem() const {
  const DropDownMenuButton* btn = getBtn();
  return btn ? btn->getSelectedItem() : -1;
}

WString MenuButtonGroup::getSelectedItemNameW() const {
  const DropDownMenuButton* btn = getBtn();
  return btn ? btn->getSelectedItemNameW() : WString();
}

int MenuButtonGroup::getNumItems() const {
  const DropDownMenuButton* btn = getBtn();
  return btn ? btn->getNumItems() : 0;
}

void MenuButtonGroup::setMenuPrefsKey(const String& key) {
  if (DropDownMenuButton* btn = getBtn()) btn->setPrefsKey(key);
}

void MenuButtonGroup::setButtonCol(const Colour& colour) {
  if (DropDownMenuButton* btn = getBtn()) btn->setCol(colour, true);
}

void MenuButtonGroup::setAutoSizeButton(bool on) {
  if (on == autoSizeButton_) return;
  autoSizeButton_ = on;
  fitButton();
}

void MenuButtonGroup::setDrawButtonSeparator(bool on) {
  if (DropDownMenuButton* btn = getBtn()) btn->setDrawSeparator(on);
}

void MenuButtonGroup::setBoldText(bool bold) {
  WidgetGroupEx::setBoldText(bold);
  if (DropDownMenuButton* btn = getBtn()) btn->setBoldLabel(bold);
  fitButton();
}

void MenuButtonGroup::informOwner() {
  if (Glob* to = parent()) send_message_event(this, to, buttonClickedMsg);
}

int MenuButtonGroup::handleMessageEvent(const String& msg, Glob* sender) {
  if (sender && sender == getWidget()) {
    if (msg == DropDownMenuButton::dropDownMenuButtonMsg) {
      fitButton();
      informOwner();
      return 1;
    }
    if (Glob* to = parent()) send_message_event(this, to, msg);
    return 1;
  }
  return WidgetGroupEx::handleMessageEvent(msg, sender);
}
