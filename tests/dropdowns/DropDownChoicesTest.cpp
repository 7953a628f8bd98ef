// The arithmetic of drop-down entries: selection messages and where stepping lands.
#include <gtest/gtest.h>

#include "dropdowns/DropDownChoices.h"

TEST(DropDownChoices, SelectionMessagesCarryOnlyDigits) {
  EXPECT_EQ(DropDownChoices::selectMessage(12), "DDMSG12");
  struct Case {
    const char* msg;
    int number;
    int index;  // among 20 entries
  };
  const Case cases[] = {
      {"DDMSG12", 12, 12}, {"DDMSG0", 0, 0},    {"DDMSG19", 19, 19},          {"DDMSG20", 20, -1},
      {"DDMSG", -1, -1},   {"DDMSG-1", -1, -1}, {"DDMSG12x", -1, -1},         {"DDMSG 3", -1, -1},
      {"ddmsg3", -1, -1},  {"XDDMSG3", -1, -1}, {"DDMSG99999999999", -1, -1}, {"", -1, -1},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(DropDownChoices::numberFromMessage(c.msg), c.number) << c.msg;
    EXPECT_EQ(DropDownChoices::indexFromMessage(c.msg, 20), c.index) << c.msg;
  }
}

TEST(DropDownChoices, SteppingSkipsWhatCannotBeSteppedAndDoesNotWrap) {
  std::vector<MenuItem> items =
      DropDownChoices::itemsFromStrings({L"A", L"B", L"C", L"D", L"E", L""});
  items[1].setActive(false);                                            // disabled
  items[2].setFlags(MenuItem::kActive | DropDownChoices::kNoStepFlag);  // not stepped
  items.insert(items.begin() + 4, MenuItem(L"Group", "", ExpandedGroupItem));
  DropDownChoices::fillSelectMessages(items);
  // A, B(off), C(no step), D, Group, E, ""
  EXPECT_EQ(DropDownChoices::step(items, 0, -1), 3);   // down from A skips B and C
  EXPECT_EQ(DropDownChoices::step(items, 3, -1), 5);   // and the header
  EXPECT_EQ(DropDownChoices::step(items, 5, -1), -1);  // the empty entry is no choice: no wrap
  EXPECT_EQ(DropDownChoices::step(items, 3, 1), 0);
  EXPECT_EQ(DropDownChoices::step(items, 0, 1), -1);    // at the first: stays
  EXPECT_EQ(DropDownChoices::step(items, -1, -1), 0);   // nothing selected: the first
  EXPECT_EQ(DropDownChoices::step(items, 100, 1), 5);   // a stale index steps from the end
  EXPECT_TRUE(DropDownChoices::isChoosable(items, 2));  // still offered in the list
  EXPECT_FALSE(DropDownChoices::isChoosable(items, 1));
  EXPECT_FALSE(DropDownChoices::isChoosable(items, 4));
  // A header keeps no message; an item with a message of its own keeps it and is stepped onto
  // like any entry with a message; an entry left without one is not.
  EXPECT_EQ(items[4].msg(), "");
  items[3].msg("custom");
  EXPECT_EQ(DropDownChoices::step(items, 0, -1), 3);
  items[3].msg("");
  EXPECT_EQ(DropDownChoices::step(items, 0, -1), 5);
}
