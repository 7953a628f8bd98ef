// How drop-downs look, in both palettes: closed (a drop-down with a separator, a disabled one,
// a combo box with a suffix), and open with the selected entry marked and one highlighted.
#include <gtest/gtest.h>

#include "dropdowns/ComboBox.h"
#include "dropdowns/DropDownMenuButton.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"

namespace {

struct DropDownLookTest : ::testing::TestWithParam<bool> {
  DropDownLookTest() {
    if (GetParam()) h.root().setPalette(Palette::light());
  }
  String name(const char* base) const { return String(base) + (GetParam() ? "_light" : ""); }
  DropDownMenuButton* make(int y) {
    return new DropDownMenuButton(L"Pick", {L"Red", L"Green", L"Blue", L"Cyan"},
                                  GlobCreationInfo(140, 24, h.canvas(), 10, y));
  }

  Harness h{240, 200};
};

TEST_P(DropDownLookTest, Closed) {
  DropDownMenuButton* a = make(166);
  a->setSelectedItem(1);
  DropDownMenuButton* b = make(134);
  b->setDrawSeparator(true);
  DropDownMenuButton* c = make(102);
  c->setActive(false, true);
  auto* combo = new ComboBox(L"", {}, GlobCreationInfo(140, 24, h.canvas(), 10, 70));
  combo->setNumericEntry(true, 0, 100);
  combo->setSuffix(L"%");
  combo->setString(L"42");
  const GoldenResult r =
      GoldenImage::check(h, Kw::Box<int>(0, 60, 160, 200), name("dropdown_closed"));
  EXPECT_TRUE(r.ok) << r.message;
}

TEST_P(DropDownLookTest, OpenWithTheSelectionMarked) {
  DropDownMenuButton* a = make(166);
  a->setSelectedItem(2);
  h.click(Harness::centreOf(*a));
  DropDownMenu* list = a->dropDown();
  ASSERT_NE(list, nullptr);
  const Kw::Box<int> row = list->itemArea(0);
  const XY<int> o = list->canvas()->rootOrigin();
  h.move(XY<int>(o.x + 30, o.y + (row.y0 + row.y1) / 2));
  EXPECT_EQ(list->highlightedItem(), 0);
  const GoldenResult r =
      GoldenImage::check(h, Kw::Box<int>(0, 60, 160, 200), name("dropdown_open"));
  EXPECT_TRUE(r.ok) << r.message;
}

INSTANTIATE_TEST_SUITE_P(Palettes, DropDownLookTest, ::testing::Bool());

}  // namespace
