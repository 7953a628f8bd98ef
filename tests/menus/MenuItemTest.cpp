// The menu item model: label syntax, options, ids, type names, and the list queries that the
// pop-up and the drop-down data share.
#include <gtest/gtest.h>

#include "menus/DropDownMenuData.h"
#include "menus/MenuItem.h"
#include "menus/MenuItemList.h"

namespace {

struct LabelCase {
  const wchar_t* label;
  const wchar_t* display;
  const wchar_t* right;
  std::vector<WString> options;
  uint64_t current;
};

TEST(MenuItemLabel, SplitsDisplayRightTextAndOptions) {
  const std::vector<LabelCase> cases = {
      {L"Open", L"Open", L"", {}, 0},
      {L"A||B", L"A", L"B", {}, 0},
      {L"A||[B]", L"A", L"[B]", {}, 0},
      {L"Zoom||[Fit] 100% [200%]", L"Zoom", L"", {L"Fit", L"100%", L"200%"}, 1},
      {L"Mode||[a] [b] c", L"Mode", L"", {L"a", L"b", L"c"}, 2},
      {L"All||[x] [y]", L"All", L"", {L"x", L"y"}, 0},        // none plain: the first
      {L"Two||p [q] r", L"Two", L"", {L"p", L"q", L"r"}, 2},  // the last plain one
      {L"Open||x [y", L"Open", L"x [y", {}, 0},               // unclosed: plain text
      {L"Gap||[] [ ] only", L"Gap", L"[] [ ] only", {}, 0},   // empty parts dropped
      {L"||right", L"", L"right", {}, 0},
      {L"A||B||C", L"A", L"B||C", {}, 0},
  };
  for (const LabelCase& c : cases) {
    SCOPED_TRACE(Kw::toUtf8(c.label));
    const MenuItem item(c.label, "m");
    EXPECT_EQ(item.getDisplayString(), c.display);
    EXPECT_EQ(item.getRightAlignedText(), c.right);
    EXPECT_EQ(item.options(), c.options);
    EXPECT_EQ(item.curOption(), c.current);
  }
}

TEST(MenuItemLabel, OnlyPlainAndGroupedItemsParseOptions) {
  EXPECT_EQ(MenuItem(L"Z||[a] b", "m", GroupedMenuItem).options().size(), 2u);
  EXPECT_TRUE(MenuItem(L"Z||[a] b", "m", ExpandedGroupItem).options().empty());
  const MenuItem icon(L"cut,cut_down", "m", IconicMenuItem);
  EXPECT_TRUE(icon.options().empty());
  EXPECT_EQ(icon.getDisplayString(), L"");
}

TEST(MenuItemOptions, IncrementWrapsAndPlainItemsStay) {
  MenuItem item(L"Zoom||[Fit] 100% [200%]", "zoom");
  EXPECT_EQ(item.getCurOptionStr(), L"100%");
  item.incCurOption();
  EXPECT_EQ(item.getCurOptionStr(), L"200%");
  item.incCurOption();
  EXPECT_EQ(item.curOption(), 0u);
  EXPECT_EQ(item.getCurOptionStr(), L"Fit");

  MenuItem plain(L"Open||Ctrl+O", "open");
  plain.incCurOption();
  EXPECT_EQ(plain.curOption(), 0u);
  EXPECT_EQ(plain.getCurOptionStr(), L"");
}

TEST(MenuItemOptions, ExplicitListClampsTheCurrentOption) {
  const MenuItem item(7u, "m", std::vector<WString>{L"a", L"b"}, 9);
  EXPECT_EQ(item.curOption(), 1u);
  EXPECT_EQ(item.getRightAlignedText(), L"");
}

TEST(MenuItemIds, AreUniqueFromOneAndCopiesByConstructionGetNewOnes) {
  const MenuItem a(L"a", "a");
  const MenuItem b(L"b", "b");
  EXPECT_GE(a.id(), 1u);
  EXPECT_NE(a.id(), b.id());
  EXPECT_TRUE(MenuItem::isValid(a.id()));
  EXPECT_FALSE(MenuItem::isValid(0));

  const MenuItem copy(a);
  EXPECT_NE(copy.id(), a.id());
  EXPECT_EQ(copy, a);  // equal in everything but the id

  MenuItem assigned;
  assigned = a;
  EXPECT_EQ(assigned.id(), a.id());

  // A list that grows keeps its items' ids.
  std::vector<MenuItem> list;
  list.emplace_back(L"first", "f");
  const uint32_t first = list[0].id();
  for (int i = 0; i < 50; ++i) list.emplace_back(L"more", "m");
  EXPECT_EQ(list[0].id(), first);
}

TEST(MenuItemDefaults, FlagsAndSetters) {
  MenuItem item(L"x", "x");
  EXPECT_TRUE(item.getActive());
  EXPECT_EQ(item.getFlags(), MenuItem::kActive);
  EXPECT_EQ(item.getTextDisplayMode(), 4);
  EXPECT_EQ(item.col(), MenuItem::getDefaultColour());
  item.setFlags(MenuItem::kActive | MenuItem::kStaysOpen);
  item.setActive(false);
  EXPECT_EQ(item.getFlags(), MenuItem::kStaysOpen);  // only bit 0 changes
}

TEST(MenuItemType, NamesRoundTripAndUnknownTextsLeaveTheValue) {
  EXPECT_EQ(menuItemTypeName(SimpleMenuItem), "SimpleMenuItem");
  EXPECT_EQ(menuItemTypeName(CompressedGroupItem), "CompressedGroupItem");
  EXPECT_EQ(menuItemTypeName(IconicMenuItem), "");
  EXPECT_EQ(menuItemTypeName(static_cast<MenuItemType>(-1)), "");
  for (int v = 0; v < 4; ++v) {
    MenuItemType t = IconicMenuItem;
    EXPECT_TRUE(menuItemTypeFromName(menuItemTypeName(static_cast<MenuItemType>(v)), t));
    EXPECT_EQ(t, v);
  }
  MenuItemType t = GroupedMenuItem;
  EXPECT_FALSE(menuItemTypeFromName("expandedgroupitem", t));
  EXPECT_FALSE(menuItemTypeFromName("", t));
  EXPECT_EQ(t, GroupedMenuItem);
}

std::vector<MenuItem> groupedList() {
  return {
      MenuItem(L"top", "t"),                     // 0
      MenuItem(L"G1", "", ExpandedGroupItem),    // 1
      MenuItem(L"a", "a", GroupedMenuItem),      // 2
      MenuItem(L"i,j", "i", IconicMenuItem),     // 3
      MenuItem(L"b", "b", GroupedMenuItem),      // 4
      MenuItem(L"G2", "", CompressedGroupItem),  // 5
      MenuItem(L"c", "c", GroupedMenuItem),      // 6
      MenuItem(L"d", "d", GroupedMenuItem),      // 7
      MenuItem(L"plain", "p"),                   // 8
  };
}

TEST(MenuItemList, HeadersGroupsAndHiddenRows) {
  const auto items = groupedList();
  EXPECT_TRUE(MenuItemList::isGroupHeader(items, 5));
  EXPECT_FALSE(MenuItemList::isGroupHeader(items, 9));
  EXPECT_FALSE(MenuItemList::isGroupHeader(items, -1));
  EXPECT_EQ(MenuItemList::lastGroupedItem(items, 1), 4);  // the iconic item is skipped
  EXPECT_EQ(MenuItemList::lastGroupedItem(items, 5), 7);
  EXPECT_EQ(MenuItemList::lastGroupedItem(items, 2), -1);
  EXPECT_EQ(MenuItemList::headerCount(items), 2);
  EXPECT_TRUE(MenuItemList::hasHeaders(items));

  const std::vector<bool> hidden = MenuItemList::hiddenFlags(items);
  const std::vector<bool> expected = {false, false, false, true, false, false, true, true, false};
  EXPECT_EQ(hidden, expected);
  for (int i = 0; i < static_cast<int>(items.size()); ++i) {
    EXPECT_EQ(MenuItemList::isHidden(items, i), expected[i]) << i;
  }
  // A grouped item with no header above it shows.
  EXPECT_FALSE(MenuItemList::isHidden({MenuItem(L"x", "x", GroupedMenuItem)}, 0));
  EXPECT_EQ(MenuItemList::findByDisplayString(items, L"plain"), 8);
  EXPECT_EQ(MenuItemList::findByDisplayString(items, L"Plain"), -1);
  EXPECT_EQ(MenuItemList::findById(items, items[6].id()), 6);
  EXPECT_EQ(MenuItemList::findById(items, 0), -1);
}

TEST(DropDownMenuData, LogicalIndexCountsRowsThatShow) {
  DropDownMenuData d(groupedList(), 4);
  EXPECT_EQ(d.getSelectedItemPhysical(), 4);
  EXPECT_EQ(d.getSelectedItem(), 4);  // top, G1, a, (icon counted in an open group), b
  // After a closed group nothing but headers counts until the next open one.
  d.selected = 8;
  EXPECT_EQ(d.getSelectedItem(), 5);
  EXPECT_EQ(d.getSelectedItemNameW(), L"plain");
  d.selected = 0;
  EXPECT_EQ(d.getSelectedItem(), 0);
  EXPECT_EQ(d.getSelectedItemNameW(), L"top");

  DropDownMenuData empty;
  EXPECT_EQ(empty.getSelectedItem(), -1);
  EXPECT_EQ(empty.getSelectedItemNameW(), L"");
  empty.selected = 3;
  EXPECT_EQ(empty.getSelectedItemNameW(), L"");
}

}  // namespace
