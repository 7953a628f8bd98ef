#pragma once
// Everything a drop-down button (or a combo box) is made from: the button's record (place,
// label, message, button settings), the entries, the selection and the drop-down settings.
// Entries are given either as texts or as ready-made menu items; items win when both are set.
#include <vector>

#include "buttons/Button.h"
#include "dropdowns/DropDownSettings.h"
#include "menus/MenuItem.h"

struct DDBtnInitArgs : ButtonInitArgs {
  std::vector<WString> entries;
  std::vector<MenuItem> items;
  int selected = 0;  // physical index; refused (first choosable entry) when out of range
  DropDownSettings dropDown;

  DDBtnInitArgs() = default;
  DDBtnInitArgs(const WString& title, std::vector<WString> e, const GlobCreationInfo& where)
      : ButtonInitArgs(title, String(), where), entries(std::move(e)) {}
};
