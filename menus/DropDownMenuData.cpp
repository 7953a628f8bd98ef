#include "menus/DropDownMenuData.h"

int32_t DropDownMenuData::getSelectedItem() const {
  if (selected < 0 || static_cast<size_t>(selected) >= items.size()) return -1;
  int32_t count = 0;
  bool open = true;  // items above the first header always count
  for (int32_t i = 0; i <= selected; ++i) {
    if (items[i].isGroupHeader()) {
      ++count;
      open = items[i].type() == ExpandedGroupItem;
    } else if (open) {
      ++count;
    }
  }
  return count - 1;
}

WString DropDownMenuData::getSelectedItemNameW() const {
  if (selected < 0 || static_cast<size_t>(selected) >= items.size()) return WString();
  return items[selected].getDisplayString();
}
