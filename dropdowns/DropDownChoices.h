#pragma once
// The arithmetic of a drop-down's entries, apart from any canvas: which entries can be chosen,
// which the wheel and arrow keys land on, and the selection messages the open list sends.
//
// Decisions taken here:
// - An entry can be chosen when it is a row of the list (not a group header, not an iconic
//   item), is active and has a display string. The wheel and arrow keys also need it to have a
//   message (of any kind) and flag kNoStepFlag to be clear.
// - A selection message is "DDMSG" followed by decimal digits and nothing else; any other text
//   ("DDMSG", "DDMSG-1", "DDMSG12x", a number too large) names no entry.
#include <vector>

#include "menus/MenuItem.h"

class DropDownChoices {
 public:
  static constexpr const char* kSelectPrefix = "DDMSG";
  // The item flag that keeps an entry out of wheel and arrow-key stepping.
  static constexpr unsigned kNoStepFlag = 4;

  // "DDMSG" followed by n in decimal.
  static String selectMessage(int n);
  // The number a selection message carries, or -1 when it carries none.
  static int numberFromMessage(const String& msg);
  // That number when it indexes one of `count` entries; -1 otherwise.
  static int indexFromMessage(const String& msg, size_t count);

  static bool isChoosable(const std::vector<MenuItem>& items, int i);
  static bool isSteppable(const std::vector<MenuItem>& items, int i);
  // The entry the wheel lands on from `selected`: for delta > 0 the nearest steppable entry
  // before it, otherwise the nearest after it; -1 when there is none (no wrapping).
  static int step(const std::vector<MenuItem>& items, int selected, int delta);
  // Entries made from plain texts: entry i selects itself.
  static std::vector<MenuItem> itemsFromStrings(const std::vector<WString>& texts);
  // Items without a message get the selection message of their index; items with a message of
  // their own keep it (choosing them is an action the owner hears, not a selection).
  static void fillSelectMessages(std::vector<MenuItem>& items);
};
