// The drop-downs page: its controls move their model values, and the lines of text and the
// other views of a value follow.
#include <gtest/gtest.h>

#include "dropdowns/ComboBox.h"
#include "dropdowns/MenuWithAddButton.h"
#include "dropdowns/TitleMenuButton.h"
#include "gallery/GalleryApp.h"
#include "gallery/MessageLog.h"
#include "panels/MenuButtonGroup.h"
#include "platform/testing/Harness.h"
#include "tests/gallery/GalleryTestSupport.h"
#include "text/TextLabel.h"

namespace {

struct DropDownsPageFixture : ::testing::Test {
  void SetUp() override {
    app->selectPage(pageTitled(*app, "Drop-downs"));
    page = app->page(app->currentPage());
    ASSERT_TRUE(page);
  }
  template <typename T>
  T* named(const char* name) {
    return dynamic_cast<T*>(findNamed(*page, name));
  }
  WString line(const char* name) {
    TextLabel* l = named<TextLabel>(name);
    return l ? l->getText() : WString();
  }
  static XY<int> rowCentre(const Menu* m, int index) {
    const Kw::Box<int> a = m->itemArea(index);
    const XY<int> o = m->canvas()->rootOrigin();
    return XY<int>(o.x + (a.x0 + a.x1) / 2, o.y + (a.y0 + a.y1) / 2);
  }
  // Opens `b`'s list and chooses row `index`.
  void choose(DropDownMenuButton* b, int index) {
    h.clickOn(*b);
    ASSERT_TRUE(b->isDropDownValid());
    h.click(rowCentre(b->dropDown(), index));
  }

  Harness h{1300, 860};
  MessageLog log;
  GalleryApp* app = new GalleryApp(h.root(), log);
  GalleryPage* page = nullptr;
};

}  // namespace

TEST_F(DropDownsPageFixture, TheBoundColourMovesTheModelAndItsOtherView) {
  auto* colour = named<TitleMenuButton>("Colour");
  auto* twin = named<DropDownMenuButton>("Colour (not bound)");
  ASSERT_TRUE(colour && twin);
  choose(colour->getBtn(), 2);
  EXPECT_EQ(twin->getSelectedItemNameW(), L"Blue");
  EXPECT_NE(line("Drop-down values").find(L"colour 2"), WString::npos) << line("Drop-down values");
  // The log shows the choice as the titled drop-down's.
  ASSERT_FALSE(log.entries().empty());
  EXPECT_EQ(log.entries().back().text, DropDownMenuButton::dropDownMenuButtonMsg);
  EXPECT_EQ(log.entries().back().senderName, "Colour");
}

TEST_F(DropDownsPageFixture, TheAddEntryAddsAPresetAndTheComboMovesTheGain) {
  auto* preset = named<DropDownMenuButton>("Preset");
  ASSERT_TRUE(preset);
  h.clickOn(*preset);
  auto* list = dynamic_cast<MenuWithAddButton*>(preset->dropDown());
  ASSERT_TRUE(list && list->addButton());
  h.clickOn(*list->addButton());
  EXPECT_EQ(preset->getNumItems(), 4);
  EXPECT_EQ(preset->getSelectedItemNameW(), L"Preset 4");
  EXPECT_NE(line("Drop-down values").find(L"Preset 4"), WString::npos);

  auto* gain = named<ComboBox>("Gain");
  auto* group = named<MenuButtonGroup>("View group");
  ASSERT_TRUE(gain && group);
  h.wheel(Harness::centreOf(*gain), -1);
  EXPECT_EQ(gain->getString(), L"43");
  EXPECT_NE(line("Combo values").find(L"gain 43 %"), WString::npos) << line("Combo values");
  choose(group->getBtn(), 1);
  EXPECT_EQ(line("Group value"), L"Model: view Spectrum");
}
