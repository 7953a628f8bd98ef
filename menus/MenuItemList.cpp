#include "menus/MenuItemList.h"

bool MenuItemList::isGroupHeader(const Items& items, int i) {
  return i >= 0 && static_cast<size_t>(i) < items.size() && items[i].isGroupHeader();
}

int MenuItemList::lastGroupedItem(const Items& items, int i) {
  if (!isGroupHeader(items, i)) return -1;
  int last = -1;
  for (size_t j = static_cast<size_t>(i) + 1; j < items.size(); ++j) {
    const MenuItemType t = items[j].type();
    if (t == IconicMenuItem) continue;
    if (t != GroupedMenuItem) break;
    last = static_cast<int>(j);
  }
  return last;
}

int MenuItemList::headerCount(const Items& items) {
  int n = 0;
  for (const MenuItem& it : items) n += it.isGroupHeader() ? 1 : 0;
  return n;
}

bool MenuItemList::hasHeaders(const Items& items) {
  for (const MenuItem& it : items) {
    if (it.isGroupHeader()) return true;
  }
  return false;
}

bool MenuItemList::isHidden(const Items& items, int i) {
  if (i < 0 || static_cast<size_t>(i) >= items.size()) return true;
  const MenuItemType t = items[i].type();
  if (t == IconicMenuItem) return true;
  if (t != GroupedMenuItem) return false;
  for (int j = i - 1; j >= 0; --j) {
    if (items[j].isGroupHeader()) return items[j].type() == CompressedGroupItem;
  }
  return false;
}

std::vector<bool> MenuItemList::hiddenFlags(const Items& items) {
  std::vector<bool> hidden(items.size(), false);
  bool closed = false;  // the nearest header above is compressed
  for (size_t i = 0; i < items.size(); ++i) {
    const MenuItemType t = items[i].type();
    if (items[i].isGroupHeader()) closed = t == CompressedGroupItem;
    hidden[i] = t == IconicMenuItem || (t == GroupedMenuItem && closed);
  }
  return hidden;
}

int MenuItemList::findByDisplayString(const Items& items, const WString& text) {
  for (size_t i = 0; i < items.size(); ++i) {
    if (items[i].getDisplayString() == text) return static_cast<int>(i);
  }
  return -1;
}

int MenuItemList::findById(const Items& items, uint32_t id) {
  for (size_t i = 0; i < items.size(); ++i) {
    if (items[i].id() == id) return static_cast<int>(i);
  }
  return -1;
}
