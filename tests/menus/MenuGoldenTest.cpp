// How the pop-up looks, in both palettes: a title, iconic buttons, an open and a closed group,
// a multi-choice row, right-aligned shortcuts, an inactive row, the highlight and the scroll
// bar.
#include <gtest/gtest.h>

#include "platform/testing/GoldenImage.h"
#include "tests/menus/MenuTestSupport.h"

namespace {

struct MenuLookTest : ::testing::TestWithParam<bool> {
  MenuLookTest() {
    prefs().setPath("");
    if (GetParam()) h.root().setPalette(Palette::light());
    owner = new RecordingOwner(GlobCreationInfo(300, 260, h.canvas(), 0, 0));
  }
  String name(const char* base) const { return String(base) + (GetParam() ? "_light" : ""); }

  Harness h{300, 260};
  RecordingOwner* owner;
};

TEST_P(MenuLookTest, GroupsOptionsShortcutsIconsAndScrollBar) {
  owner->setMenuTitle(L"Tools");
  owner->addIconicMenuItem(L"cut", L"cut", "cut");
  owner->addIconicMenuItem(L"copy", L"copy", "copy");
  owner->startMenuGroup(L"View");
  owner->addMenuItem(L"Zoom||[Fit] 100% [200%]", "zoom");
  owner->addMenuItem(L"Grid||Ctrl+G", "grid");
  owner->addMenuItem(L"Rulers||Ctrl+R", "rulers", false);
  owner->startMenuGroup(L"Edit", GroupCompressed);
  owner->addMenuItem(L"Undo||Ctrl+Z", "undo");
  owner->endMenuGroup();
  for (int i = 1; i <= 6; ++i) owner->addMenuItem(L"Recent " + std::to_wstring(i), "recent");
  h.move(XY<int>(10, 250));
  Menu* m = owner->makeMenu(nullptr, true);
  ASSERT_NE(m, nullptr);
  m->setMaxVisibleRows(7);
  ASSERT_NE(m->scrollBar(), nullptr);
  h.move(XY<int>(40,
                 250 - Menu::kTitleStripHeight - Menu::kIconStripHeight - 3 * m->itemHeight() / 2));
  EXPECT_EQ(m->highlightedItem(), 3);  // Zoom
  const GoldenResult r = GoldenImage::check(h, *m, name("menu_popup"));
  EXPECT_TRUE(r.ok) << r.message;
}

INSTANTIATE_TEST_SUITE_P(Palettes, MenuLookTest, ::testing::Bool());

}  // namespace
