#pragma once
// The items of a drop-down control and which of them is selected. The selection is stored as a
// physical index into the list; the logical index counts rows as the pop-up shows them.
#include <cstdint>
#include <vector>

#include "menus/MenuItem.h"

class DropDownMenuData {
 public:
  DropDownMenuData() = default;
  DropDownMenuData(std::vector<MenuItem> items, int32_t selected)
      : items(std::move(items)), selected(selected) {}
  virtual ~DropDownMenuData() = default;
  DropDownMenuData(const DropDownMenuData&) = default;
  DropDownMenuData& operator=(const DropDownMenuData&) = default;

  int32_t getSelectedItemPhysical() const { return selected; }
  // The selection counted in rows: from the start up to the selection, every header counts and
  // every other item counts while its group is open (items above the first header always
  // count); -1 when the selection is outside the list.
  int32_t getSelectedItem() const;
  // The display string of the selected item; empty when there is none.
  WString getSelectedItemNameW() const;

  std::vector<MenuItem> items;
  int32_t selected = -1;
};
