#include "dropdowns/DropDownMenu.h"

#include <algorithm>
#include <cstring>

#include "dropdowns/DropDownChoices.h"
#include "menus/MenuItemList.h"
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
  if (key_press_event(e) && handleKey(e->keyCode())) return 1;
  return Menu::react(e);
}

bool DropDownMenu::canHighlight(const std::vector<bool>& hidden, int index) const {
  return index >= 0 && static_cast<size_t>(index) < hidden.size() && !hidden[index] &&
         DropDownChoices::isChoosable(items(), index);
}

int DropDownMenu::entryRowsAway(int from, int count) const {
  const std::vector<bool> hidden = MenuItemList::hiddenFlags(items());
  std::vector<int> rows;   // the entries the keys may highlight, in list order
  std::vector<int> place;  // for each of them, its row among all the rows shown
  int row = 0;
  int fromPlace = -1;
  for (int i = 0; i < static_cast<int>(items().size()); ++i) {
    if (hidden[i]) continue;
    if (i == from) fromPlace = row;
    if (canHighlight(hidden, i)) {
      rows.push_back(i);
      place.push_back(row);
    }
    ++row;
  }
  if (rows.empty()) return -1;
  if (fromPlace < 0) return count > 0 ? rows.front() : rows.back();
  const int target = fromPlace + count;
  // The nearest entry at or beyond the target; short of it, the furthest one on the way;
  // none when nothing lies that way.
  int found = -1;
  for (size_t k = 0; k < rows.size(); ++k) {
    const int at = place[k];
    if (count > 0 && at > fromPlace) {
      found = rows[k];
      if (at >= target) break;
    } else if (count < 0 && at < fromPlace && (found < 0 || at <= target)) {
      found = rows[k];
    }
  }
  return found;
}

bool DropDownMenu::highlightEntry(int index) {
  if (!canHighlight(MenuItemList::hiddenFlags(items()), index)) return false;
  scrollToItem(index);  // scrolling highlights what is under the pointer: highlight after
  setHighlight(index);
  return true;
}

bool DropDownMenu::handleKey(unsigned key) {
  const int now = highlightedItem();
  const int page = std::max(1, static_cast<int>(visibleItems().size()) - 1);
  int to = -1;
  switch (key) {
    case kKeyEscape:
      send_message_event(this, this, kPootMsg);  // closes: nothing of it is touched after
      return true;
    case kKeyReturn:
      if (now >= 0 && canHighlight(MenuItemList::hiddenFlags(items()), now)) {
        chooseItem(now);  // tells the owner and closes: nothing of it is touched after
      } else {
        send_message_event(this, this, kPootMsg);
      }
      return true;
    case kKeyUp:
      to = entryRowsAway(now, -1);
      break;
    case kKeyDown:
      to = entryRowsAway(now, 1);
      break;
    case kKeyHome:
      to = entryRowsAway(-1, 1);
      break;
    case kKeyEnd:
      to = entryRowsAway(-1, -1);
      break;
    case kKeyPageUp:
      to = entryRowsAway(now, -page);
      break;
    case kKeyPageDown:
      to = entryRowsAway(now, page);
      break;
    default:
      return false;
  }
  if (to >= 0) highlightEntry(to);
  return true;
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

void DropDownMenu::drawRightAlignedText(Glib::Painter& p, const VisibleMenuItem& row) {
  // The right-hand part of an entry reads as the menu's; the selection's style carries over.
  Menu::drawRightAlignedText(p, row);
}

Colour DropDownMenu::getItemBackCol(int index) const {
  return items()[index].col();
}
