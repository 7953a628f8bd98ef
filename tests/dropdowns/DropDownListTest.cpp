// The open list of a drop-down: its own keys, the add row kept clear of the scroll bar, and
// the menu colours it takes from around the button.
#include <gtest/gtest.h>

#include "dropdowns/MenuWithAddButton.h"
#include "platform/glib/look/MenuLook.h"
#include "platform/glob/KeyCodes.h"
#include "platform/glob/RootGlob.h"
#include "tests/dropdowns/DropDownTestSupport.h"
#include "values/ScrollBar.h"

namespace {

struct DropDownListTest : DropDownFixture {
  // Opens `b`'s list from the keyboard.
  DropDownMenu* openByKey(DropDownMenuButton* b) {
    h.root().setFocus(b);
    h.key(kKeyReturn);
    return b->dropDown();
  }
};

TEST_F(DropDownListTest, ArrowsHomeAndEndMoveTheHighlightOverWhatCanBeChosen) {
  // Red, Green (inactive), [Cold], Blue, Cyan
  std::vector<MenuItem> items;
  items.emplace_back(L"Red", "");
  items.emplace_back(L"Green", "");
  items.emplace_back(L"Cold", "", ExpandedGroupItem);
  items.emplace_back(L"Blue", "", GroupedMenuItem);
  items.emplace_back(L"Cyan", "", GroupedMenuItem);
  items[1].setActive(false);
  DropDownMenuButton* b = make({});
  b->setStrings(items);
  ASSERT_TRUE(b->setSelectedItem(3));
  DropDownMenu* list = openByKey(b);
  ASSERT_NE(list, nullptr);
  EXPECT_EQ(list->highlightedItem(), 3);  // opens on the selection

  h.key(kKeyUp);  // over the header and the inactive entry
  EXPECT_EQ(list->highlightedItem(), 0);
  h.key(kKeyUp);  // at the first: stays
  EXPECT_EQ(list->highlightedItem(), 0);
  h.key(kKeyDown);
  EXPECT_EQ(list->highlightedItem(), 3);
  h.key(kKeyEnd);
  EXPECT_EQ(list->highlightedItem(), 4);
  h.key(kKeyDown);  // at the last: stays
  EXPECT_EQ(list->highlightedItem(), 4);
  h.key(kKeyHome);
  EXPECT_EQ(list->highlightedItem(), 0);
  EXPECT_EQ(b->getSelectedItem(), 3);  // moving the highlight chooses nothing
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 0);

  h.key(kKeyReturn);
  EXPECT_EQ(b->getSelectedItem(), 0);
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 1);
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(h.root().inputScope(), nullptr);
}

TEST_F(DropDownListTest, PagesMoveByTheRowsShownAndScrollTheHighlightIntoView) {
  std::vector<WString> entries;
  for (int i = 0; i < 40; ++i) entries.push_back(L"Entry " + std::to_wstring(i));
  DropDownMenuButton* b = make(entries);
  b->setMaxVisibleRows(5);
  DropDownMenu* list = openByKey(b);
  ASSERT_NE(list, nullptr);
  EXPECT_EQ(list->highlightedItem(), 0);
  h.key(kKeyPageDown);  // five rows shown: a page is four
  EXPECT_EQ(list->highlightedItem(), 4);
  h.key(kKeyPageDown);
  EXPECT_EQ(list->highlightedItem(), 8);
  EXPECT_FALSE(list->itemArea(8).empty());
  EXPECT_EQ(list->itemArea(8).height(), list->itemHeight());
  h.key(kKeyPageUp);
  EXPECT_EQ(list->highlightedItem(), 4);
  h.key(kKeyEnd);
  EXPECT_EQ(list->highlightedItem(), 39);
  EXPECT_EQ(list->itemArea(39).height(), list->itemHeight());
  h.key(kKeyPageDown);  // past the end: stays at the last
  EXPECT_EQ(list->highlightedItem(), 39);
  h.key(kKeyPageUp);
  h.key(kKeyPageUp);
  EXPECT_EQ(list->highlightedItem(), 31);
  h.key(kKeyReturn);
  EXPECT_EQ(b->getSelectedItem(), 31);
  EXPECT_FALSE(b->isDropDownValid());
}

TEST_F(DropDownListTest, ReturnWithNothingHighlightedClosesWithoutAChoice) {
  DropDownMenuButton* b = make({L"Red", L"Green"});
  b->setSelectedItem(1);
  h.click(Harness::centreOf(*b));
  DropDownMenu* list = b->dropDown();
  ASSERT_NE(list, nullptr);
  h.move(rowCentre(list, 0));
  h.move(XY<int>(390, 10));  // the pointer leaves: no highlight
  ASSERT_EQ(list->highlightedItem(), -1);
  parent.clear();
  h.key(kKeyReturn);
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->getSelectedItem(), 1);
  EXPECT_TRUE(parent.texts().empty());
}

TEST_F(DropDownListTest, TheAddRowStaysClearOfTheScrollBarAndTheRows) {
  std::vector<WString> entries;
  for (int i = 0; i < 12; ++i) entries.push_back(L"Entry " + std::to_wstring(i));
  DropDownMenuButton* b = make(entries);
  b->setAddEntry(true);
  b->setMaxVisibleRows(4);
  b->setSelectedItem(11);
  h.click(Harness::centreOf(*b));
  auto* list = dynamic_cast<MenuWithAddButton*>(b->dropDown());
  ASSERT_NE(list, nullptr);
  ScrollBar* bar = list->scrollBar();
  ASSERT_NE(bar, nullptr);
  const Kw::Box<int> add = list->addButton()->canvas()->rect();
  const Kw::Box<int> barBox = bar->canvas()->rect();
  EXPECT_GE(barBox.y0, add.y1);  // the bar stops above the add row
  EXPECT_EQ(barBox.y1, list->height() - 1);
  EXPECT_EQ(add.width(), list->width() - 2);
  for (const Menu::VisibleMenuItem& row : list->visibleItems()) {
    EXPECT_GE(list->itemArea(row.index).y0, add.y1) << row.index;
  }
  EXPECT_EQ(static_cast<int>(list->visibleItems().size()), 4);
  // The last entry shows whole above the add row, and the add row still answers.
  EXPECT_EQ(list->itemArea(11).height(), list->itemHeight());
  parent.clear();
  h.click(Harness::centreOf(*list->addButton()));
  EXPECT_EQ(parent.texts(), Texts{MenuWithAddButton::AddMsg_});
}

TEST_F(DropDownListTest, TheListTakesTheMenuColoursOfThePaletteAroundTheButton) {
  DropDownMenuButton* b = make({L"Red", L"Green"});
  h.click(Harness::centreOf(*b));
  DropDownMenu* list = b->dropDown();
  ASSERT_NE(list, nullptr);
  const Palette& around = parent.getPalette();
  // While its list is open the button is down, on its pressed palette.
  ASSERT_FALSE(b->getPalette() == around);
  EXPECT_TRUE(list->getPalette() == around);
  // Its rows take that palette's menu row colour.
  EXPECT_EQ(list->items()[0].col(), Glib::MenuLook(around).itemFace());
}

TEST_F(DropDownListTest, AZeroWheelStepAndAnActionEntryStepLikeAnyOther) {
  std::vector<MenuItem> items;
  items.emplace_back(L"Red", "");
  items.emplace_back(L"Mix...", "mix colours");  // an action entry
  items.emplace_back(L"Blue", "");
  DropDownMenuButton* b = make({});
  b->setStrings(items);
  const XY<int> c = Harness::centreOf(*b);
  h.wheel(c, 0);  // a delta of 0 counts as down
  EXPECT_EQ(b->getSelectedItem(), 1);
  h.wheel(c, -1);
  EXPECT_EQ(b->getSelectedItem(), 2);
  h.wheel(c, 1);
  EXPECT_EQ(b->getSelectedItem(), 1);
}

}  // namespace
