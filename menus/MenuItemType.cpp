#include "menus/MenuItemType.h"

namespace {
const char* const kNames[] = {"SimpleMenuItem", "GroupedMenuItem", "ExpandedGroupItem",
                              "CompressedGroupItem"};
constexpr int kNamed = 4;
}  // namespace

String menuItemTypeName(MenuItemType type) {
  const int v = static_cast<int>(type);
  return v >= 0 && v < kNamed ? String(kNames[v]) : String();
}

bool menuItemTypeFromName(const String& name, MenuItemType& type) {
  for (int v = 0; v < kNamed; ++v) {
    if (name == kNames[v]) {
      type = static_cast<MenuItemType>(v);
      return true;
    }
  }
  return false;
}
