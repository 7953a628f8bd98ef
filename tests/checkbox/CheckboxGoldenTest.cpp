#include <gtest/gtest.h>

#include "buttons/CheckboxRadioSet.h"
#include "buttons/RadioSet.h"
#include "buttons/TriStateBox.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "tests/glib/PaintGlob.h"

namespace {

constexpr int kRow = 22;

// A sheet in the window colour with boxes stacked from the top, one per row.
struct Sheet {
  Harness h{400, 300};
  PaintGlob sheet;

  explicit Sheet(int width, int height)
      : sheet(h.place(0, 0, width, height),
              [](Glib::Painter& p) { p.fillRect(p.bounds(), Palette().get(Palette::Window)); }) {}

  template <typename Box = Checkbox>
  Box* row(int index, const WString& label, bool ticked, int width = 150) {
    auto* b = new Box(
        GlobCreationInfo(width, 20, sheet.canvas(), 4, sheet.height() - 4 - kRow * (index + 1)),
        ticked);
    b->setLabel(label);
    return b;
  }

  GoldenResult check(const char* name) {
    return GoldenImage::check(h, Kw::Box<int>(0, 0, sheet.width(), sheet.height()), name);
  }
};

}  // namespace

TEST(CheckboxLook, States) {
  Sheet s(160, 8 + 7 * kRow);
  s.row(0, L"Clear", false);
  s.row(1, L"Ticked", true);
  s.row<TriStateBox>(2, L"Mixed", false)->setTriState(true, true);
  Checkbox* hover = s.row(3, L"Hover", true);
  s.row(4, L"Focus", false)->set_kbd_focus();
  s.row(5, L"Inactive", false)->setActive(false, true);
  s.row(6, L"Inactive ticked", true)->setActive(false, true);
  s.h.move(Harness::centreOf(*hover));
  ASSERT_TRUE(hover->isMouseInside());
  auto r = s.check("checkbox_states");
  EXPECT_TRUE(r) << r.message;
}

TEST(CheckboxLook, AppearancesAndTickCharacter) {
  Sheet s(160, 8 + 8 * kRow);
  for (int i = 0; i < 2; ++i) s.row(i, L"Box right", i == 1)->setAppearance(Checkbox::BoxRight);
  for (int i = 0; i < 2; ++i) s.row(2 + i, L"Toggle", i == 1)->setAppearance(Checkbox::FlatToggle);
  auto* mixed = s.row<TriStateBox>(4, L"Toggle mixed", false);
  mixed->setAppearance(Checkbox::FlatToggle);
  mixed->setTriState(true, true);
  Checkbox* off = s.row(5, L"Toggle inactive", true);
  off->setAppearance(Checkbox::FlatToggle);
  off->setActive(false, true);
  s.row(6, L"Cross", true)->setTickCharacter('x');
  Checkbox* bold = s.row(7, L"Bold when ticked", true);
  bold->setBoldWhenTicked(true);
  bold->setTextColourWhenTicked(Colour::fromHex(0xF5C542));
  auto r = s.check("checkbox_appearances");
  EXPECT_TRUE(r) << r.message;
}

TEST(CheckboxLook, RadioSetRows) {
  Sheet s(260, 130);
  auto* buttons = new RadioSet({L"Cut", L"Copy", L"Paste"},
                               GlobCreationInfo(250, 24, s.sheet.canvas(), 5, 101));
  buttons->setSelectedItem(1);
  auto* framed = new RadioSet({L"In", L"Out"}, GlobCreationInfo(120, 60, s.sheet.canvas(), 5, 36));
  framed->setBorderStyle(UifBorderSunken);
  auto* boxes = new CheckboxRadioSet(GlobCreationInfo(120, 60, s.sheet.canvas(), 135, 36));
  boxes->addWidgets({UIString("Mono"), UIString("Stereo")});
  boxes->setSelectedItem(1);
  auto* row = new CheckboxRadioSet(GlobCreationInfo(250, 20, s.sheet.canvas(), 5, 8));
  row->addWidgets({UIString("Low"), UIString("Mid"), UIString("High")});
  row->setAppearance(Checkbox::FlatToggle);
  auto r = s.check("radio_sets");
  EXPECT_TRUE(r) << r.message;
}
