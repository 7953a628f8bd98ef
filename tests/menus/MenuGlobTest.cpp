// The menu-owning base: building the list, and group states kept in the preferences.
#include <gtest/gtest.h>

#include "panels/StandardPanel.h"
#include "platform/misc/ResourceStrings.h"
#include "tests/menus/MenuTestSupport.h"
#include "tests/platform/TempDir.h"

namespace {

class MenuBuilding : public MenuFixture {
 protected:
  std::vector<MenuItemType> types() const {
    std::vector<MenuItemType> t;
    for (const MenuItem& it : owner->menuItems()) t.push_back(it.type());
    return t;
  }
};

TEST_F(MenuBuilding, GroupsTypeTheirItemsAlsoReadyMadeOnes) {
  owner->addMenuItem(L"top", "t");
  owner->startMenuGroup(L"G", GroupCompressed);
  owner->addMenuItem(L"a", "a");
  owner->addMenuItem(MenuItem(L"b", "b"));  // type 0 joins the group
  owner->endMenuGroup();
  owner->addMenuItem(L"after", "x");
  owner->setDefaultGroupState(GroupCompressed);
  owner->startMenuGroup(L"H");  // the default state
  EXPECT_EQ(types(),
            (std::vector<MenuItemType>{SimpleMenuItem, CompressedGroupItem, GroupedMenuItem,
                                       GroupedMenuItem, SimpleMenuItem, CompressedGroupItem}));
  const MenuItem& header = owner->menuItems()[1];
  EXPECT_EQ(header.getTextDisplayMode(), 0);
  EXPECT_EQ(owner->menuItems()[2].col(), owner->getPalette().windowShade(3));
  EXPECT_EQ(owner->menuItems()[2].fCol(), owner->getPalette().get(Palette::WindowText));
  EXPECT_NE(header.fCol(), owner->menuItems()[2].fCol());  // the sub-heading colour

  // The item and text colours of new items cannot be changed, on purpose.
  owner->setMenuItemCol(Colour(1, 0, 0));
  owner->setMenuTextCol(Colour(0, 1, 0));
  EXPECT_EQ(owner->getMenuItemCol(), owner->getPalette().windowShade(3));
  owner->setMenuBaseCol(Colour(0, 0, 1));
  EXPECT_EQ(owner->getMenuBaseCol(), Colour(0, 0, 1));
}

TEST_F(MenuBuilding, IdsInactiveItemsAndIconicLabels) {
  const uint32_t a = owner->addMenuItem(L"a", "a", false);
  const uint32_t icon = owner->addIconicMenuItem(L"up", L"down", "icon");
  EXPECT_NE(a, icon);
  EXPECT_EQ(owner->findMenuItem(a), 0);
  EXPECT_FALSE(owner->menuItems()[0].getActive());
  EXPECT_EQ(owner->menuItems()[1].label(), L"up,down");
  EXPECT_EQ(owner->menuItems()[1].type(), IconicMenuItem);
  EXPECT_TRUE(owner->setMenuItemActive(a, true));
  EXPECT_FALSE(owner->setMenuItemActive(a, true));
  EXPECT_FALSE(owner->setMenuItemActive(9999999, false));
}

TEST_F(MenuBuilding, InsertAfterAnAnchor) {
  owner->addMenuItem(L"a", "a");
  owner->startMenuGroup(L"G");
  owner->addMenuItem(L"g1", "g1");
  owner->addMenuItem(L"g2", "g2");
  EXPECT_EQ(owner->insertMenuItemAfter(L"x", "x", L"nowhere"), 0u);
  EXPECT_NE(owner->insertMenuItemAfter(L"in", "in", L"g1"), 0u);    // inside the group
  EXPECT_NE(owner->insertMenuItemAfter(L"top", "top", L"a"), 0u);   // after a plain item
  EXPECT_NE(owner->insertMenuItemAfter(L"end", "end", L"g2"), 0u);  // after the last: appended
  std::vector<WString> labels;
  for (const MenuItem& it : owner->menuItems()) labels.push_back(it.label());
  EXPECT_EQ(labels, (std::vector<WString>{L"a", L"top", L"G", L"g1", L"in", L"g2", L"end"}));
  EXPECT_EQ(types(), (std::vector<MenuItemType>{SimpleMenuItem, SimpleMenuItem, ExpandedGroupItem,
                                                GroupedMenuItem, GroupedMenuItem, GroupedMenuItem,
                                                SimpleMenuItem}));
}

TEST_F(MenuBuilding, RemovingAHeaderFreesItsItems) {
  owner->startMenuGroup(L"G", GroupCompressed);
  owner->addMenuItem(L"a", "a");
  owner->addMenuItem(L"b", "b");
  owner->endMenuGroup();
  owner->startMenuGroup(L"H");
  owner->addMenuItem(L"c", "c");
  EXPECT_TRUE(owner->removeMenuItem(L"G"));
  EXPECT_FALSE(owner->removeMenuItem(L"G"));
  EXPECT_EQ(types(), (std::vector<MenuItemType>{SimpleMenuItem, SimpleMenuItem, ExpandedGroupItem,
                                                GroupedMenuItem}));
  // The freed items show as plain rows.
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->nonHiddenRowCount(), 4);
}

TEST_F(MenuBuilding, ChangingLabelsMessagesAndClearing) {
  owner->addMenuItem(L"Open||Ctrl+O", "open");
  EXPECT_FALSE(owner->changeMenuItem(L"Missing", L"x"));
  EXPECT_FALSE(owner->changeMenuItem(L"Open", L"Open"));
  EXPECT_TRUE(owner->changeMenuItem(L"Open", L"Open file||Ctrl+O"));
  EXPECT_EQ(owner->menuItems()[0].getDisplayString(), L"Open file");
  EXPECT_TRUE(owner->changeMenuItemMessage(L"Open file", "openFile"));
  EXPECT_FALSE(owner->changeMenuItemMessage(L"Open", "x"));
  EXPECT_EQ(owner->menuItems()[0].msg(), "openFile");
  owner->startMenuGroup(L"G");
  owner->clearMenu();
  EXPECT_TRUE(owner->menuItems().empty());
  owner->addMenuItem(L"after", "a");
  EXPECT_EQ(owner->menuItems()[0].type(), SimpleMenuItem);  // no group any more
}

TEST_F(MenuBuilding, ToggleMenuEntrySwapsTheTwoForms) {
  resourceStrings().set(91001, L"Show grid\nHide grid");
  resourceStrings().set(91002, L"Snap");
  bool grid = false;
  owner->addMenuItem(MenuGlob::toggleLabel(91001, grid), "grid");
  EXPECT_TRUE(owner->toggleMenuEntry(grid, 91001));
  EXPECT_TRUE(grid);
  EXPECT_EQ(owner->menuItems()[0].label(), L"Hide grid");

  PrefVal<bool> snap("test.snap", false);
  owner->addMenuItem(MenuGlob::toggleLabel(91002, false), "snap");
  EXPECT_TRUE(owner->toggleMenuEntry(snap, 91002));
  EXPECT_TRUE(snap.get());
  EXPECT_EQ(owner->menuItems()[1].label(), L"\u2713 Snap");
  EXPECT_TRUE(owner->toggleMenuEntry(snap, 91002));
  EXPECT_EQ(owner->menuItems()[1].label(), L"Snap");
  resourceStrings().clear();
}

class GroupStates : public MenuFixture {
 protected:
  void build() {
    owner->setMenuPrefsKey("Tools");
    owner->startMenuGroup(L"View");
    owner->addMenuItem(L"a", "a");
    owner->startMenuGroup(L"Edit");
    owner->addMenuItem(L"b", "b");
  }
  static String name(const char* header) {
    return Menu::groupPreferenceName("Tools", Kw::toWide(header));
  }
};

TEST_F(GroupStates, AreSavedWhenThePopUpClosesAndRestoredWhenItOpens) {
  build();
  EXPECT_EQ(name("View"), "Menu (Tools) : View");
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 0));   // fold View
  h.click(XY<int>(350, 20));  // close
  EXPECT_EQ(prefs().getPreference(name("View")), "CompressedGroupItem");
  EXPECT_EQ(prefs().getPreference(name("Edit")), "ExpandedGroupItem");
  EXPECT_EQ(owner->menuItems()[0].type(), CompressedGroupItem);

  // A new owner with the same key starts from the stored states.
  delete owner;
  owner = new RecordingOwner(h.place(20, 20, 200, 200));
  build();
  m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->items()[0].type(), CompressedGroupItem);
  EXPECT_EQ(m->nonHiddenRowCount(), 3);
}

TEST_F(GroupStates, BadValuesAreIgnoredAndOneGroupStaysOpen) {
  prefs().setPreference(name("View"), "SimpleMenuItem");  // a type, but not a header's
  prefs().setPreference(name("Edit"), "sideways");
  build();
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->items()[0].type(), ExpandedGroupItem);
  EXPECT_EQ(m->items()[2].type(), ExpandedGroupItem);
  owner->removeMenu();

  prefs().setPreference(name("View"), "CompressedGroupItem");
  prefs().setPreference(name("Edit"), "CompressedGroupItem");
  m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(m->items()[0].type(), CompressedGroupItem);
  EXPECT_EQ(m->items()[2].type(), ExpandedGroupItem);  // the last one is opened
}

TEST_F(GroupStates, NoKeyStoresNothing) {
  build();
  owner->setMenuPrefsKey("");
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 0));
  h.click(XY<int>(350, 20));
  EXPECT_TRUE(prefs().allPreferences().empty());
}

TEST_F(GroupStates, SurviveARestartThroughThePreferencesFile) {
  TempDir dir;
  prefs().setPath(dir.file("prefs"));
  build();
  Menu* m = openAt(XY<int>(60, 200));
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 2));  // fold Edit
  h.click(XY<int>(350, 20));
  prefs().setPath("");
  prefs().setPath(dir.file("prefs"));  // read back from the file
  EXPECT_EQ(prefs().getPreference(name("Edit")), "CompressedGroupItem");
}

// A panel that takes every message for itself still hears its pop-up close.
TEST_F(GroupStates, APanelThatHandlesAllMessagesStillSavesThem) {
  class GreedyPanel : public StandardPanel {
   public:
    using StandardPanel::StandardPanel;
    int handleMessageEvent(const String& msg, Glob*) override {
      heard.push_back(msg);
      return 1;
    }
    std::vector<String> heard;
  };
  auto* panel = new GreedyPanel(h.place(230, 20, 160, 200));
  panel->setMenuPrefsKey("Tools");
  panel->startMenuGroup(L"View");
  panel->addMenuItem(L"a", "a");
  panel->startMenuGroup(L"Edit");
  panel->addMenuItem(L"b", "b");
  h.click(XY<int>(300, 200), MouseButton::Right);
  Menu* m = panel->openMenu();
  ASSERT_NE(m, nullptr);
  const Kw::Box<int> a = m->itemArea(0);
  const XY<int> o = m->canvas()->rootOrigin();
  h.click(XY<int>(o.x + a.x0 + 30, o.y + (a.y0 + a.y1) / 2));  // fold View
  h.click(XY<int>(10, 290));                                   // close
  EXPECT_EQ(panel->openMenu(), nullptr);
  EXPECT_EQ(prefs().getPreference(name("View")), "CompressedGroupItem");
}

}  // namespace
