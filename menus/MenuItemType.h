#pragma once
// What a menu item is: a plain item, an item of a group, an open or closed group header, or an
// iconic item that shows as a button rather than a row. The values and the text names of the
// first four are fixed: the names are what group states are stored as in the preferences.
#include <cstdint>

#include "platform/kw/String.h"

enum MenuItemType : int32_t {
  SimpleMenuItem = 0,
  GroupedMenuItem = 1,
  ExpandedGroupItem = 2,
  CompressedGroupItem = 3,
  IconicMenuItem = 4,
};

// The text name of `type`; empty for any value outside 0..3.
String menuItemTypeName(MenuItemType type);
// Sets `type` from its text name and returns true; any other text leaves `type` as it was and
// returns false.
bool menuItemTypeFromName(const String& name, MenuItemType& type);
