#include "dropdowns/DropDownMenu.h"

#include <cstring>

#include "platform/glib/look/DropDownLook.h"
#include "platform/glib/look/MenuLook.h"
#include "platform/glob/KeyCodes.h"

namespace {

MenuData listData(std::vector<MenuItem> items, Glob* owner) {
  MenuData d;
  d.items = std::move(items);
  d.owner = owner;
  d.flags = MenuData::kCloseOnOutsideClick;  // no title strip
  return d;
}

}  // namespace

DropDownMenu::DropDownMenu(const DropDownMenuData& data, Glob* owner, bool showSelection,
                           ValServer<int>* selection)
    : Menu(listData(data.items, owner)),
      selected_(data.getSelectedItemPhysical()),
      showSelection_(showSelection) {
  if (selection) {
    registerWith(selection);
    selected_ = selection->getValue();
  }
}

DropDownMenu::DropDownMenu(const std::vector<MenuItem>& items, Glob* owner)
    : Menu(listData(items, owner)), showSelection_(false) {}

bool DropDownMenu::m_is_type(const char* type) const {
  // Still a pop-up menu to everything that looks for one.
  return type && (std::strcmp(type, idstring()) == 0 || Menu::m_is_type(type) ||
                  std::strcmp(type, "menu") == 0);
}

int DropDownMenu::react(Event* e) {
  if (key_press_event(e) && e->keyCode() == kKeyEscape) {
    send_message_event(this, this, kPootMsg);  // closes: nothing of it is touched after
    return 1;
  }
  return Menu::react(e);
}

void DropDownMenu::valChangedNtfy() {
  const ValServer<int>* s = getValServer(0);
  if (!s || s->getValue() == selected_) return;
  const int old = selected_;
  selected_ = s->getValue();
  for (int i : {old, selected_}) {
    const Kw::Box<int> a = itemArea(i);
    if (!a.empty()) update(a);
  }
}

void DropDownMenu::drawMenuItem(Glib::Painter& p, const VisibleMenuItem& row) {
  Menu::drawMenuItem(p, row);
  if (!showSelection_ || row.index != selected_) return;
  const MenuItem& it = items()[row.index];
  const Glib::MenuLook look(getPalette());
  const Colour c = look.rowText(it.fCol(), row.index == highlightedItem(), it.getActive());
  Glib::DropDownLook(getPalette()).selectionMark(p, row.area, kGlyphColumn, c);
}

Glib::TextStyles::TextStyle DropDownMenu::getTextStyle(int index) const {
  if (showSelection_ && index == selected_) return Glib::TextStyles::Embossed;
  return Menu::getTextStyle(index);
}
