#pragma once
// Queries on a flat list of menu items, shared by the menu's owner, the pop-up and the drop-down
// data. Indices are signed: -1 means none, and an index outside the list is never a header.
#include <vector>

#include "menus/MenuItem.h"

class MenuItemList {
 public:
  using Items = std::vector<MenuItem>;

  static bool isGroupHeader(const Items& items, int i);
  // The index of the last grouped item of the group that header `i` opens: the run of type-1
  // items after it (iconic items skipped); -1 when the run is empty or `i` is not a header.
  static int lastGroupedItem(const Items& items, int i);
  static int headerCount(const Items& items);
  static bool hasHeaders(const Items& items);
  // Whether item `i` takes no row: an iconic item, or a grouped item whose nearest header
  // above is compressed. A grouped item with no header above it shows.
  static bool isHidden(const Items& items, int i);
  // The same, for every item at once, in one pass.
  static std::vector<bool> hiddenFlags(const Items& items);
  // The first item whose display string is `text`; -1 when there is none. Case counts.
  static int findByDisplayString(const Items& items, const WString& text);
  // The first item with `id`; -1 when there is none.
  static int findById(const Items& items, uint32_t id);
};
