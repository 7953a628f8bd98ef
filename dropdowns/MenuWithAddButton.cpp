#include "dropdowns/MenuWithAddButton.h"

#include "buttons/Button.h"
#include "platform/glib/Painter.h"

const char* const MenuWithAddButton::AddMsg_ = "MenuAdd";

MenuWithAddButton::MenuWithAddButton(const DropDownMenuData& data, Glob* owner, int width,
                                     const WString& addLabel, ValServer<int>* selection)
    : DropDownMenu(data, owner, true, selection) {
  auto* b = new Button(addLabel, AddMsg_,
                       GlobCreationInfo(static_cast<unsigned short>(std::max(1, width)),
                                        Glib::DropDownLook::kAddRowHeight, canvas()));
  b->set_style(kButtonStyleFlat);
  b->set_name("Add entry");
  addButton_ = GlobHandle<>(b);
  setMinWidth(width);
  // The base laid the pop-up out before the add row existed.
  setMaxVisibleRows(maxVisibleRows());
}

Button* MenuWithAddButton::addButton() const {
  return static_cast<Button*>(addButton_.get());
}

int MenuWithAddButton::calculateHeight() const {
  return DropDownMenu::calculateHeight() + Glib::DropDownLook::kAddRowHeight;
}

int MenuWithAddButton::react(Event* e) {
  if (message_event(e) && e->text() == AddMsg_) {
    GlobHandle<MenuWithAddButton> self(this);
    if (Glob* o = owner()) send_message_event(this, o, AddMsg_);
    if (self) send_message_event(this, this, kPootMsg);
    return 1;
  }
  return DropDownMenu::react(e);
}

void MenuWithAddButton::draw() {
  DropDownMenu::draw();
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::DropDownLook(getPalette()).addRowRule(p, Kw::Box<int>(1, 1, width() - 1, footHeight()));
}

void MenuWithAddButton::reshape() {
  DropDownMenu::reshape();
  if (Button* b = addButton()) {
    b->reshape_canvas(1, 1, std::max(1, width() - 2), footHeight() - 2);
  }
}
