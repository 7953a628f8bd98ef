// The drop-down button driven through the screen: opening and closing, choosing, stepping with
// the wheel and the arrow keys, the add entry, kept group states, and bad input.
#include <gtest/gtest.h>

#include "dropdowns/DropDownChoices.h"
#include "dropdowns/MenuWithAddButton.h"
#include "menus/MenuItemList.h"
#include "platform/glib/FontCache.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/KeyCodes.h"
#include "platform/glob/RootGlob.h"
#include "tests/dropdowns/DropDownTestSupport.h"

namespace {

struct DropDownButtonTest : DropDownFixture {};

TEST_F(DropDownButtonTest, PressOpensTheListBelowAndAChoiceSelectsReportsAndCloses) {
  DropDownMenuButton* b = make({L"Red", L"Green", L"Blue"});
  EXPECT_EQ(b->getString(), L"Red");
  EXPECT_EQ(b->getSelectedItemServer().getValue(), 0);
  h.press(Harness::centreOf(*b));
  EXPECT_EQ(parent.texts(), Texts{DropDownMenuButton::dropDownMenuButtonClickedMsg});
  DropDownMenu* list = b->dropDown();
  ASSERT_NE(list, nullptr);
  EXPECT_TRUE(list->m_is_type("menu"));
  const Kw::Box<int> lr = list->canvas()->rootRect();
  const Kw::Box<int> br = b->canvas()->rootRect();
  EXPECT_EQ(lr.x0, br.x0);
  EXPECT_EQ(lr.y1, br.y0);  // right below
  EXPECT_GE(lr.width(), br.width());
  EXPECT_EQ(list->selectedIndex(), 0);

  h.release(Harness::centreOf(*b));  // the button stays down while its list is open
  EXPECT_EQ(b->get_state(), kButtonDown);
  EXPECT_TRUE(b->isDropDownValid());

  h.click(rowCentre(list, 2));
  EXPECT_EQ(b->getSelectedItem(), 2);
  EXPECT_EQ(b->getSelectedItemNameW(), L"Blue");
  EXPECT_EQ(b->getString(), L"Blue");
  EXPECT_EQ(b->getSelectedItemServer().getValue(), 2);
  EXPECT_EQ(parent.texts(), (Texts{DropDownMenuButton::dropDownMenuButtonClickedMsg,
                                   DropDownMenuButton::dropDownMenuButtonMsg}));
  EXPECT_EQ(parent.last()->sender, b);
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(countKind("menu"), 0);
  EXPECT_EQ(countKind("menu_dismisser"), 0);
  EXPECT_EQ(h.root().inputScope(), nullptr);
}

TEST_F(DropDownButtonTest, ClosingWithoutAChoiceChangesNothingAndTellsNoOne) {
  DropDownMenuButton* b = make({L"Red", L"Green"});
  b->setSelectedItem(1);
  h.click(Harness::centreOf(*b));
  ASSERT_TRUE(b->isDropDownValid());
  parent.clear();
  // A second press on the face lands on the pop-up's catcher: it closes and does not reopen.
  h.click(Harness::centreOf(*b));
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(b->getSelectedItem(), 1);
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 0);

  // Programmatic open and close.
  EXPECT_TRUE(b->displayDropDown());
  EXPECT_FALSE(b->displayDropDown());
  b->removeMenuFromScreen();
  EXPECT_EQ(countKind("menu"), 0);
}

TEST_F(DropDownButtonTest, AListDestroyedBehindTheButtonsBackIsForgotten) {
  DropDownMenuButton* b = make({L"Red", L"Green"});
  h.press(Harness::centreOf(*b));
  DropDownMenu* list = b->dropDown();
  ASSERT_NE(list, nullptr);
  delete list;  // not through the button: no "menu_poot"
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonDown);
  h.release(Harness::centreOf(*b));
  // The next press opens a fresh list instead of taking the stale state for a second click.
  h.press(Harness::centreOf(*b));
  EXPECT_TRUE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonDown);
  h.release(Harness::centreOf(*b));
  // An unrelated "menu_poot" releases the button and closes the list.
  send_message_event(nullptr, b, Menu::pootMsg_);
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonUp);
}

TEST_F(DropDownButtonTest, BadSelectionsAndMessagesAreRefused) {
  DropDownMenuButton* b = make({L"Red", L"Green", L"Blue"});
  b->setSelectedItem(1);
  EXPECT_FALSE(b->setSelectedItem(3));
  EXPECT_FALSE(b->setSelectedItem(-1));
  EXPECT_FALSE(b->setSelectedItem(L"Purple"));
  EXPECT_EQ(b->getSelectedItem(), 1);
  EXPECT_TRUE(b->setSelectedItem(L"Blue"));
  EXPECT_EQ(b->getSelectedItem(), 2);
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 0);  // no user action

  EXPECT_EQ(DropDownMenuButton::buildMsgForItem(12), "DDMSG12");
  EXPECT_EQ(b->getLogicalItemIndexFromMessage("DDMSG1"), 1);
  EXPECT_EQ(b->getLogicalItemIndexFromMessage("DDMSG3"), -1);
  EXPECT_EQ(b->getLogicalItemIndexFromMessage("DDMSG"), -1);

  // Messages from the open list without a number, or past the end, select nothing; the list
  // is done with all the same.
  for (const char* bad : {"DDMSG", "DDMSG3", "DDMSG1x"}) {
    ASSERT_TRUE(b->displayDropDown());
    send_message_event(b->dropDown(), b, bad);
    EXPECT_EQ(b->getSelectedItem(), 2) << bad;
    EXPECT_FALSE(b->isDropDownValid()) << bad;
    EXPECT_EQ(b->get_state(), kButtonUp) << bad;
  }
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 0);

  // A good one coming back from the list selects its entry.
  ASSERT_TRUE(b->displayDropDown());
  send_message_event(b->dropDown(), b, DropDownMenuButton::buildMsgForItem(0));
  EXPECT_EQ(b->getSelectedItem(), 0);
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 1);

  // An empty list opens nothing and the button comes back up.
  b->setStrings(std::vector<WString>{});
  EXPECT_EQ(b->getSelectedItem(), -1);
  EXPECT_EQ(b->getString(), L"Pick");
  h.click(Harness::centreOf(*b));
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonUp);
}

TEST_F(DropDownButtonTest, WheelAndArrowKeysStepWithoutWrapping) {
  std::vector<MenuItem> items;
  for (const wchar_t* t : {L"One", L"Two", L"Three", L"Four", L"Five"}) items.emplace_back(t, "");
  items[1].setActive(false);
  items[2].setFlags(MenuItem::kActive | DropDownChoices::kNoStepFlag);
  DropDownMenuButton* b = make({});
  b->setStrings(items);
  EXPECT_EQ(b->getSelectedItem(), 0);
  const XY<int> c = Harness::centreOf(*b);

  h.wheel(c, 1);  // up at the first entry: nothing
  EXPECT_EQ(b->getSelectedItem(), 0);
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 0);
  h.wheel(c, -1);  // down skips the disabled and the unstepped entries
  EXPECT_EQ(b->getSelectedItem(), 3);
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 1);
  h.wheel(c, -1);
  h.wheel(c, -1);  // at the last: nothing
  EXPECT_EQ(b->getSelectedItem(), 4);
  EXPECT_FALSE(b->isDropDownValid());

  b->root()->setFocus(b);
  h.key(kKeyUp);
  EXPECT_EQ(b->getSelectedItem(), 3);
  h.key(kKeyUp);
  EXPECT_EQ(b->getSelectedItem(), 0);
  h.key(kKeyDown);
  EXPECT_EQ(b->getSelectedItem(), 3);

  // The unstepped entry can still be chosen from the list.
  h.click(c);
  h.click(rowCentre(b->dropDown(), 2));
  EXPECT_EQ(b->getSelectedItem(), 2);

  b->setWheelEnabled(false);
  h.wheel(c, -1);
  EXPECT_EQ(b->getSelectedItem(), 2);
}

TEST_F(DropDownButtonTest, AReceiverMayDeleteTheButtonWhenItHearsTheChoice) {
  DropDownMenuButton* b = make({L"Red", L"Green"});
  GlobHandle<DropDownMenuButton> handle(b);
  parent.trigger = DropDownMenuButton::dropDownMenuButtonMsg;
  parent.action = [&] { delete handle.get(); };
  h.click(Harness::centreOf(*b));
  DropDownMenu* list = b->dropDown();
  ASSERT_NE(list, nullptr);
  h.click(rowCentre(list, 1));
  EXPECT_FALSE(handle.alive());
  EXPECT_EQ(countKind("menu"), 0);
  EXPECT_EQ(h.root().inputScope(), nullptr);

  // Deleted while its list is open: the list goes with it.
  parent.action = nullptr;
  DropDownMenuButton* b2 = make({L"A"});
  EXPECT_TRUE(b2->displayDropDown());
  delete b2;
  EXPECT_EQ(countKind("menu"), 0);
}

TEST_F(DropDownButtonTest, TheAddEntryReachesTheOwnerAndClosesTheList) {
  DropDownMenuButton* b = make({L"Red", L"Green"});
  b->setAddEntry(true, L"New colour...");
  h.click(Harness::centreOf(*b));
  auto* list = dynamic_cast<MenuWithAddButton*>(b->dropDown());
  ASSERT_NE(list, nullptr);
  ASSERT_NE(list->addButton(), nullptr);
  EXPECT_EQ(list->addButton()->getString(), L"New colour...");
  EXPECT_EQ(list->height(), list->calculateHeight());
  parent.clear();
  h.click(Harness::centreOf(*list->addButton()));
  EXPECT_EQ(parent.texts(), Texts{MenuWithAddButton::AddMsg_});
  EXPECT_EQ(parent.last()->sender, b);
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(b->getSelectedItem(), 0);
}

TEST_F(DropDownButtonTest, GroupStatesAreKeptUnderThePrefsKey) {
  std::vector<MenuItem> items;
  items.emplace_back(L"Warm", "", ExpandedGroupItem);
  items.emplace_back(L"Red", "", GroupedMenuItem);
  items.emplace_back(L"Cold", "", ExpandedGroupItem);
  items.emplace_back(L"Blue", "", GroupedMenuItem);
  DropDownMenuButton* b = make({});
  b->setPrefsKey("dd test");
  b->setStrings(items);
  EXPECT_EQ(b->getSelectedItem(), 1);  // the first entry that can be chosen
  h.click(Harness::centreOf(*b));
  DropDownMenu* list = b->dropDown();
  ASSERT_NE(list, nullptr);
  h.click(rowCentre(list, 0));  // closes the Warm group
  ASSERT_TRUE(b->isDropDownValid());
  h.click(XY<int>(390, 10));  // outside: the list goes
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(prefs().getPreference(Menu::groupPreferenceName("dd test", L"Warm")),
            "CompressedGroupItem");
  h.click(Harness::centreOf(*b));
  ASSERT_NE(b->dropDown(), nullptr);
  EXPECT_EQ(b->dropDown()->items()[0].type(), CompressedGroupItem);
}

TEST_F(DropDownButtonTest, AHundredThousandEntriesOpenAtTheSelectionAndStep) {
  std::vector<WString> entries;
  entries.reserve(100000);
  for (int i = 0; i < 100000; ++i) entries.push_back(L"Entry " + std::to_wstring(i));
  DropDownMenuButton* b = make(entries);
  ASSERT_TRUE(b->setSelectedItem(99998));
  h.click(Harness::centreOf(*b));
  DropDownMenu* list = b->dropDown();
  ASSERT_NE(list, nullptr);
  EXPECT_LE(list->canvas()->rootRect().height(), 300);  // scrolls inside the screen
  ASSERT_FALSE(list->itemArea(99998).empty());          // opened where the selection is
  h.click(rowCentre(list, 99997));
  EXPECT_EQ(b->getSelectedItem(), 99997);
  h.wheel(Harness::centreOf(*b), -1);
  h.wheel(Harness::centreOf(*b), -1);
  EXPECT_EQ(b->getSelectedItem(), 99999);
  h.wheel(Harness::centreOf(*b), -1);  // at the last entry: no wrap
  EXPECT_EQ(b->getSelectedItem(), 99999);
}

TEST_F(DropDownButtonTest, EscapeDeactivationAndTheModelCloseOrSet) {
  DropDownMenuButton* b = make({L"Red", L"Green"});
  h.click(Harness::centreOf(*b));
  ASSERT_TRUE(b->isDropDownValid());
  h.key(kKeyEscape);  // keys go to the open list
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(b->getSelectedItem(), 0);

  h.click(Harness::centreOf(*b));
  ASSERT_TRUE(b->isDropDownValid());
  b->setActive(false, true);
  EXPECT_FALSE(b->isDropDownValid());
  EXPECT_EQ(countKind("menu"), 0);
  EXPECT_EQ(b->get_state(), kButtonUp);
  b->setActive(true, true);

  // A name pushed from a model selects its entry; an unknown one is refused.
  WString green = L"Green", purple = L"Purple";
  b->setNewWidgetValue(green);
  EXPECT_EQ(b->getSelectedItem(), 1);
  b->setNewWidgetValue(purple);
  EXPECT_EQ(b->getSelectedItem(), 1);
  EXPECT_EQ(b->getWidgetValue(), L"Green");
}

TEST_F(DropDownButtonTest, AutoSizeFitsTheWidestEntry) {
  DropDownMenuButton* b = make({L"A", L"A much longer entry than the rest", L"B"});
  const Glib::FontPtr f = Glib::fonts().standard();
  const int x0 = b->canvas()->rect().x0;
  b->autoSize();
  EXPECT_EQ(b->width(), DropDownMenuButton::calcWidth(L"A much longer entry than the rest", *f));
  EXPECT_EQ(b->canvas()->rect().x0, x0);
  EXPECT_GT(DropDownMenuButton::calcWidth(L"AB", *f), DropDownMenuButton::calcWidth(L"A", *f));
}

}  // namespace
