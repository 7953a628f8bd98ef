// The pop-up menu driven through the screen: opening, highlighting, choosing, groups,
// scrolling, tooltips, titles, and what happens when owners and items go away.
#include <gtest/gtest.h>

#include "foundation/ListViewAdaptorBase.h"
#include "menus/MenuItemList.h"
#include "platform/glob/RootGlob.h"
#include "platform/misc/Config.h"
#include "platform/misc/ListServer.h"
#include "platform/misc/ValServer.h"
#include "tests/menus/MenuTestSupport.h"
#include "values/ScrollBar.h"

namespace {

int countKind(RootGlob& root, const char* kind) {
  int n = 0;
  for (Glob* g : root.children()) n += g->m_is_type(kind) ? 1 : 0;
  return n;
}

class MenuPopup : public MenuFixture {};

TEST_F(MenuPopup, OpensAtThePointerAndClosesAfterAChoice) {
  owner->addMenuItem(L"Open||Ctrl+O", "open");
  owner->addMenuItem(L"Save", "save");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  EXPECT_STREQ(m->idstring(), "menu");
  const Kw::Box<int> r = m->canvas()->rootRect();
  EXPECT_EQ(r.x0, 60);
  EXPECT_EQ(r.y1, 150);
  EXPECT_EQ(h.root().inputScope(), m);
  EXPECT_EQ(m->nonHiddenRowCount(), 2);
  EXPECT_EQ(m->height(), 1 + 2 * m->itemHeight());  // no title: a one-pixel top edge

  h.click(rowCentre(m, 1));
  EXPECT_EQ(owner->heard, (std::vector<String>{"save", Menu::pootMsg_}));
  EXPECT_EQ(owner->openMenu(), nullptr);
  EXPECT_EQ(countKind(h.root(), "menu"), 0);
  EXPECT_EQ(countKind(h.root(), "menu_dismisser"), 0);
  EXPECT_EQ(h.root().inputScope(), nullptr);
}

TEST_F(MenuPopup, KeepsInsideTheScreenAndOpensOnScrewdriver) {
  owner->reshape_canvas(0, 0, 400, 300);
  for (int i = 0; i < 4; ++i) owner->addMenuItem(L"Item " + std::to_wstring(i), "i");
  Menu* m = openAt(XY<int>(395, 5));
  ASSERT_NE(m, nullptr);
  const Kw::Box<int> r = m->canvas()->rootRect();
  EXPECT_LE(r.x1, 400);
  EXPECT_GE(r.y0, 0);
  owner->removeMenu();
  EXPECT_EQ(countKind(h.root(), "menu"), 0);

  h.move(XY<int>(100, 120));
  EXPECT_EQ(send_message_event(nullptr, owner, MenuGlob::kScrewdriverMsg), 1);
  ASSERT_NE(owner->openMenu(), nullptr);
  EXPECT_EQ(owner->openMenu()->canvas()->rootRect().x0, 100);
}

TEST_F(MenuPopup, NothingOpensForAnEmptyMenuAndThePressGoesOn) {
  EXPECT_EQ(openAt(XY<int>(60, 150)), nullptr);
  EXPECT_EQ(countKind(h.root(), "menu"), 0);
  EXPECT_EQ(send_message_event(nullptr, owner, MenuGlob::kScrewdriverMsg), 0);
  // A pop-up with nothing in it refuses to show.
  EXPECT_FALSE(Menu(std::vector<MenuItem>{}).popUp(h.root(), XY<int>(10, 10)));
}

TEST_F(MenuPopup, APressOutsideClosesItWithoutReachingWhatLiesBeneath) {
  owner->addMenuItem(L"One", "one");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  const size_t before = owner->heard.size();
  h.click(XY<int>(300, 30));
  EXPECT_EQ(owner->openMenu(), nullptr);
  ASSERT_EQ(owner->heard.size(), before + 1);
  EXPECT_EQ(owner->heard.back(), Menu::pootMsg_);
}

TEST_F(MenuPopup, KeysStopAtThePopUp) {
  owner->addMenuItem(L"One", "one");
  owner->set_kbd_focus();
  ASSERT_NE(openAt(XY<int>(60, 150)), nullptr);
  EXPECT_EQ(h.root().keyTarget(), owner->openMenu());
  h.key('a');
  EXPECT_NE(owner->openMenu(), nullptr);  // no key handling of its own
}

TEST_F(MenuPopup, HighlightFollowsThePointerAndRedrawsOnlyTheTwoRows) {
  owner->addMenuItem(L"One", "one");
  owner->addMenuItem(L"Off", "off", false);
  owner->addMenuItem(L"", "empty");
  owner->startMenuGroup(L"Group");
  owner->setMenuItemActive(owner->menuItems().back().id(), false);
  owner->addMenuItem(L"Two", "two");
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  h.render();

  h.move(rowCentre(m, 0));
  EXPECT_EQ(m->highlightedItem(), 0);
  h.render();
  // Within the same row nothing is redrawn.
  h.move(rowCentre(m, 0) + XY<int>(3, 2));
  EXPECT_FALSE(h.root().needsPaint());

  h.move(rowCentre(m, 4));
  EXPECT_EQ(m->highlightedItem(), 4);
  const Kw::Box<int> o(m->canvas()->rootOrigin().x, m->canvas()->rootOrigin().y, 0, 0);
  Kw::Box<int> expected = m->itemArea(0).translated(o.x0, o.y0);
  const Kw::Box<int> second = m->itemArea(4).translated(o.x0, o.y0);
  expected = Kw::Box<int>(std::min(expected.x0, second.x0), std::min(expected.y0, second.y0),
                          std::max(expected.x1, second.x1), std::max(expected.y1, second.y1));
  EXPECT_EQ(h.root().dirty().bounds(), expected);
  h.render();
  EXPECT_TRUE(h.drew(m));

  h.move(rowCentre(m, 1));  // inactive
  EXPECT_EQ(m->highlightedItem(), -1);
  h.move(rowCentre(m, 2));  // empty
  EXPECT_EQ(m->highlightedItem(), -1);
  h.move(rowCentre(m, 3));  // an inactive header still lights
  EXPECT_EQ(m->highlightedItem(), 3);
  h.move(XY<int>(350, 20));  // outside
  EXPECT_EQ(m->highlightedItem(), -1);
}

TEST_F(MenuPopup, InactiveAndEmptyRowsCannotBeChosen) {
  owner->addMenuItem(L"Off", "off", false);
  owner->addMenuItem(L"", "empty");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 0));
  h.click(rowCentre(m, 1));
  EXPECT_EQ(owner->openMenu(), m);
  EXPECT_EQ(owner->count("off") + owner->count("empty"), 0);
}

TEST_F(MenuPopup, HeadersFoldTheirGroupsOnlyWhenThereAreSeveral) {
  owner->startMenuGroup(L"Only");
  owner->addMenuItem(L"a", "a");
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 0));
  EXPECT_EQ(m->items()[0].type(), ExpandedGroupItem);
  EXPECT_EQ(m->nonHiddenRowCount(), 2);
  owner->removeMenu();

  owner->startMenuGroup(L"Second");
  owner->addMenuItem(L"b", "b");
  owner->addMenuItem(L"c", "c");
  m = openAt(XY<int>(60, 215));
  ASSERT_NE(m, nullptr);
  const int fullHeight = m->height();
  const int top = m->canvas()->rootRect().y1;
  h.click(rowCentre(m, 2));
  EXPECT_EQ(m->items()[2].type(), CompressedGroupItem);
  EXPECT_EQ(m->nonHiddenRowCount(), 3);
  EXPECT_EQ(m->height(), fullHeight - 2 * m->itemHeight());
  EXPECT_EQ(m->canvas()->rootRect().y1, top);  // the top edge stays
  EXPECT_TRUE(m->itemArea(3).empty());         // hidden rows have no place
  EXPECT_EQ(owner->openMenu(), m);             // a header click does not close
  EXPECT_EQ(owner->count(Menu::pootMsg_), 0);  // the first one was removed, not closed

  // The tooltip of a compressed header lists its hidden items; the cursor says clickable.
  const XY<int> o = m->canvas()->rootOrigin();
  const XY<int> onHeader = rowCentre(m, 2) - o;
  EXPECT_EQ(m->contextString(onHeader, nullptr), "b\nc\n");
  EXPECT_EQ(m->contextCursor(onHeader), kCursorHand);

  // With Shift, every later header takes the clicked one's new state.
  h.click(rowCentre(m, 2));
  h.setModifiers(kKeyShift);
  h.click(rowCentre(m, 0));
  h.setModifiers(0);
  EXPECT_EQ(m->items()[0].type(), CompressedGroupItem);
  EXPECT_EQ(m->items()[2].type(), CompressedGroupItem);
  EXPECT_EQ(m->nonHiddenRowCount(), 2);
}

TEST_F(MenuPopup, TooltipsAndCursorsOfRows) {
  MenuItem tipped(L"Tipped", "t");
  tipped.tooltip(L"Does a thing");
  owner->addMenuItem(tipped);
  owner->addMenuItem(L"Off", "off", false);
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  const XY<int> o = m->canvas()->rootOrigin();
  EXPECT_EQ(m->contextString(rowCentre(m, 0) - o, nullptr), "Does a thing");
  EXPECT_EQ(m->contextCursor(rowCentre(m, 0) - o), kCursorHand);
  EXPECT_EQ(m->contextCursor(rowCentre(m, 1) - o), kCursorArrow);
  h.move(rowCentre(m, 0));
  EXPECT_EQ(h.root().contextStringAtPointer(), "Does a thing");
}

TEST_F(MenuPopup, MultiChoiceRowsCycleAndTheOwnerKeepsTheChoice) {
  owner->addMenuItem(L"Zoom||[Fit] 100% [200%]", "zoom");
  owner->addMenuItem(L"Other", "other");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(owner->getMenuItemChoice(L"Zoom"), L"100%");
  EXPECT_TRUE(owner->setMenuItemChoice(L"Zoom", 2));
  EXPECT_FALSE(owner->setMenuItemChoice(L"Zoom", 2));
  EXPECT_FALSE(owner->setMenuItemChoice(L"Zoom", 3));
  EXPECT_EQ(owner->getMenuItemChoice(L"Zoom"), L"200%");

  h.click(rowLabel(m, 0));  // wraps to the first option, reports and closes
  EXPECT_EQ(owner->heard, (std::vector<String>{"zoom", Menu::pootMsg_}));
  EXPECT_EQ(owner->menuItems()[0].curOption(), 0u);
  EXPECT_EQ(owner->getMenuItemChoice(L"Zoom"), L"");  // no pop-up open
}

TEST_F(MenuPopup, ItemsThatStayOpenAndPinnedPopUps) {
  MenuItem stays(L"Mode||a [b]", "mode");
  stays.setFlags(MenuItem::kActive | MenuItem::kStaysOpen);
  owner->addMenuItem(stays);
  owner->addMenuItem(L"Plain", "plain");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  h.click(rowLabel(m, 0));
  EXPECT_EQ(owner->openMenu(), m);
  EXPECT_EQ(m->getCurrentChoice(L"Mode"), L"b");
  EXPECT_EQ(owner->heard, (std::vector<String>{"mode", Menu::itemSelectedMsg_}));

  m->setPinned(true);
  h.click(rowCentre(m, 1));
  EXPECT_EQ(owner->openMenu(), m);
  EXPECT_EQ(owner->count("plain"), 1);
  EXPECT_EQ(owner->count(Menu::itemSelectedMsg_), 2);
}

TEST_F(MenuPopup, AnOwnerThatRemovesThePopUpWhileHandlingAChoice) {
  class Remover : public RecordingOwner {
   public:
    using RecordingOwner::RecordingOwner;
    int react(Event* e) override {
      if (message_event(e) && e->text() == "go") removeMenu();
      return RecordingOwner::react(e);
    }
  };
  auto* remover = new Remover(h.place(250, 20, 100, 100));
  remover->addMenuItem(L"Go", "go");
  h.click(XY<int>(300, 60), MouseButton::Right);
  Menu* m = remover->openMenu();
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 0));
  EXPECT_EQ(countKind(h.root(), "menu"), 0);
  EXPECT_EQ(remover->count(Menu::pootMsg_), 0);  // removed, not closed
}

TEST_F(MenuPopup, TheOwnerDeletedWhileOpenTakesThePopUpAlong) {
  owner->addMenuItem(L"One", "one");
  ASSERT_NE(openAt(XY<int>(60, 150)), nullptr);
  delete owner;
  EXPECT_EQ(countKind(h.root(), "menu"), 0);
  EXPECT_EQ(countKind(h.root(), "menu_dismisser"), 0);
  h.click(XY<int>(70, 140));
  h.render();
}

TEST_F(MenuPopup, APopUpWhoseOwnerIsGoneStillClosesCleanly) {
  auto* probe = new RecordingOwner(h.place(0, 0, 10, 10));
  MenuData data;
  data.items = {MenuItem(L"A", "a"), MenuItem(L"B", "b")};
  data.owner = probe;
  auto* m = new Menu(data);
  ASSERT_TRUE(m->popUp(h.root(), XY<int>(100, 150)));
  delete probe;
  EXPECT_EQ(m->owner(), nullptr);
  h.click(rowCentre(m, 0));
  EXPECT_EQ(countKind(h.root(), "menu"), 0);
}

TEST_F(MenuPopup, RemovingAndChangingItemsWhileOpenShowsAtOnce) {
  owner->addMenuItem(L"One", "one");
  owner->addMenuItem(L"Two", "two");
  owner->addMenuItem(L"Three", "three");
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  h.move(rowCentre(m, 2));
  EXPECT_EQ(m->highlightedItem(), 2);
  EXPECT_TRUE(owner->removeMenuItem(L"Three"));
  EXPECT_EQ(m->nonHiddenRowCount(), 2);
  EXPECT_LT(m->highlightedItem(), 2);
  EXPECT_TRUE(owner->changeMenuItem(L"One", L"First"));
  EXPECT_EQ(m->items()[0].label(), L"First");
  EXPECT_TRUE(owner->changeMenuItemMessage(L"Two", "second"));
  h.render();
  h.click(rowCentre(m, 1));
  EXPECT_EQ(owner->count("second"), 1);
}

TEST_F(MenuPopup, ScrollingIsClampedAndArrowsStepOneRow) {
  MenuData data;
  for (int i = 0; i < 10; ++i) data.items.emplace_back(L"Row " + std::to_wstring(i), "r");
  data.owner = owner;
  data.maxVisibleRows = 3;
  auto* m = new Menu(data);
  ASSERT_TRUE(m->popUp(h.root(), XY<int>(100, 250)));
  const int ih = m->itemHeight();
  EXPECT_EQ(m->height(), 1 + 3 * ih);
  ScrollBar* bar = m->scrollBar();
  ASSERT_NE(bar, nullptr);
  EXPECT_NEAR(bar->getThumbSize(), 0.3, 1e-6);

  h.clickOn(*bar->decrementButton());
  EXPECT_EQ(m->scrollOffset(), 0);
  for (int i = 0; i < 12; ++i) h.clickOn(*bar->incrementButton());
  EXPECT_EQ(m->scrollOffset(), 7 * ih);
  EXPECT_NEAR(bar->getThumbPos(), 0.7, 1e-6);
  EXPECT_EQ(m->visibleItems().front().index, 7);
  h.clickOn(*bar->decrementButton());
  EXPECT_EQ(m->scrollOffset(), 6 * ih);

  // The wheel over the rows steps too.
  h.wheel(rowCentre(m, 7), 2);
  EXPECT_EQ(m->scrollOffset(), 4 * ih);
  // A thumb position is turned into pixels of the whole list.
  bar->setThumbPos(0.5);
  EXPECT_EQ(m->call_msg(m, ScrollBar::thumbMovedMsg.c_str()), 1);
  EXPECT_EQ(m->scrollOffset(), static_cast<int>(0.5 * 10 * ih + 0.5));
}

TEST_F(MenuPopup, AMenuTallerThanTheScreenShowsWhatFitsAndScrolls) {
  for (int i = 0; i < 100; ++i) owner->addMenuItem(L"Item " + std::to_wstring(i), "i");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  EXPECT_LE(m->height(), 300);
  EXPECT_GE(m->canvas()->rootRect().y0, 0);
  EXPECT_LE(m->canvas()->rootRect().y1, 300);
  EXPECT_NE(m->scrollBar(), nullptr);
  EXPECT_LT(static_cast<int>(m->visibleItems().size()), 20);
}

TEST_F(MenuPopup, IconicItemsAreButtonsThatChoose) {
  owner->addIconicMenuItem(L"cut", L"cut_down", "cut");
  owner->addMenuItem(L"Row", "row");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->nonHiddenRowCount(), 1);
  Glob* b = m->widgetForItem(0);
  ASSERT_NE(b, nullptr);
  EXPECT_EQ(m->findItemFromWidget(b), 0);
  EXPECT_EQ(m->height(), 1 + Menu::kIconStripHeight + m->itemHeight());
  h.clickOn(*b);
  EXPECT_EQ(owner->heard, (std::vector<String>{"cut", Menu::pootMsg_}));
  EXPECT_EQ(countKind(h.root(), "menu"), 0);
}

TEST_F(MenuPopup, TitleFromTheOwnerAndItsFailure) {
  owner->setMenuTitle(L"Things");
  owner->addMenuItem(L"One", "one");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->title(), L"Things");
  EXPECT_EQ(m->titleMode(), Menu::kTitleMode);
  EXPECT_EQ(m->height(), Menu::kTitleStripHeight + m->itemHeight());
  owner->removeMenu();

  owner->throwOnTitle = true;
  testing::internal::CaptureStdout();
  m = openAt(XY<int>(60, 150));
  EXPECT_EQ(testing::internal::GetCapturedStdout(),
            "Invalid cookie container in Menu::getTitle()\n");
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->title(), L"");
  EXPECT_EQ(m->height(), 1 + m->itemHeight());
  // A title set on the pop-up wins over the owner's.
  m->setTitle(L"Set", Colour(1, 1, 1));
  EXPECT_EQ(m->title(), L"Set");
}

TEST_F(MenuPopup, ItemsComeFromADataAdaptor) {
  ListServer list;
  ValServer<unsigned> current(0);
  list.addItem(L"alpha");
  auto adaptor = Kw::Ptr<ListViewAdaptorBase>(new ListViewAdaptorBase(&list, &current));
  MenuData data;
  data.owner = owner;
  data.items = {MenuItem(L"fixed", "fixed")};
  auto* m = new Menu(data);
  m->setDataAdaptor(adaptor);
  EXPECT_EQ(m->items().size(), 1u);  // the first entry is already present
  list.addItem(L"beta");
  ASSERT_EQ(m->items().size(), 2u);
  EXPECT_EQ(m->items()[1].label(), L"beta");
  EXPECT_EQ(m->items()[1].msg(), "Selected:beta");
  ASSERT_TRUE(m->popUp(h.root(), XY<int>(100, 150)));
  h.click(rowCentre(m, 1));
  EXPECT_EQ(owner->count("Selected:beta"), 1);
}

TEST_F(MenuPopup, FreezeFlipResetsTheSecondRowAndClickSeparationIsConfigurable) {
  owner->addMenuItem(L"One", "one");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->secondRowIndex(), -1);
  EXPECT_EQ(send_message_event(nullptr, m, "freeze_flip now"), 1);
  EXPECT_EQ(m->secondRowIndex(), -1);
  EXPECT_EQ(m->maxClickSeparation(), Menu::kDefaultMaxClickSeparation);

  configb record;
  record.set("max_click_separation", "350");
  EXPECT_EQ(Menu(record).maxClickSeparation(), 350);
  record.set("max_click_separation", "wide");
  EXPECT_EQ(Menu(record).maxClickSeparation(), 200);
}

}  // namespace
