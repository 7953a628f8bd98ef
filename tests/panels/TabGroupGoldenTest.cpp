// The looks of tab strips and of every kind of widget group, in both palettes: one image per
// family, the states side by side.
#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "panels/ButtonGroup.h"
#include "panels/CheckableWidgetGroup.h"
#include "panels/CheckboxGroup.h"
#include "panels/MinimizableGroup.h"
#include "panels/StandardTabPage.h"
#include "panels/TabStrip.h"
#include "panels/TabbedDialogue.h"
#include "panels/WidgetGroup2.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

constexpr int kWidth = 480;
constexpr int kHeight = 230;

struct TabGroupLook : ::testing::TestWithParam<bool> {
  TabGroupLook() {
    if (GetParam()) {
      h.root().setPalette(Palette::light());
      parent.setPalette(Palette::light());  // the controls made on it start with it
    }
  }
  void expectGolden(const char* base) {
    const String name = String(base) + (GetParam() ? "_light" : "");
    const GoldenResult r = GoldenImage::check(h, Kw::Box<int>(0, 0, kWidth, kHeight), name);
    EXPECT_TRUE(r.ok) << r.message;
  }
  // Creation records in the probe's bottom-up coordinates.
  GlobCreationInfo at(int x, int y, int w, int hgt) {
    return GlobCreationInfo(static_cast<unsigned short>(w), static_cast<unsigned short>(hgt),
                            parent.canvas(), x, y);
  }
  static Button* button(Glob& on, const char* label, int width = 80) {
    return new Button(Kw::toWide(label), label,
                      GlobCreationInfo(static_cast<unsigned short>(width), 20, on.canvas()));
  }
  static void fill(StandardPanel& g, const char* label, int width = 80) {
    g.addWidget(button(g, label, width), XY<int>(0, 0), OriginInnerTopLeft);
  }

  Harness h{kWidth, kHeight};
  MessageProbe parent{GlobCreationInfo(kWidth, kHeight, h.canvas(), 0, 0)};
};

}  // namespace

// Above: four tabs, the second current, the last with its check box ticked. Below: more tabs
// than fit, scrolled to a current tab in the middle, both arrows live.
TEST_P(TabGroupLook, TabStrips) {
  auto* dlg = new TabbedDialogue(at(8, 118, 464, 104));
  for (const wchar_t* id : {L"Mix", L"EQ", L"Dynamics"}) ASSERT_TRUE(dlg->createStandardPage(id));
  ASSERT_TRUE(dlg->createTaggableStandardPage(L"Sends"));
  dlg->setCheckboxState(L"Sends", true);
  dlg->selectPage(L"EQ", true, false);
  button(*dlg->getPageBaseGlob(L"EQ"), "On the page", 100)->reshape_canvas(10, 10, 100, 20);

  auto* many = new TabbedDialogue(at(8, 8, 300, 100));
  for (int i = 1; i <= 12; ++i)
    ASSERT_TRUE(many->createStandardPage(L"Take " + std::to_wstring(i)));
  many->selectPage(L"Take 7", true, false);
  ASSERT_TRUE(many->tabStrip().scrolls());
  ASSERT_GT(many->tabStrip().firstShown(), 0);
  expectGolden("tab_strips");
}

// Above: a plain group, then general groups with each border style (none, raised, framed,
// sunken) and a separator, line or etched. Below: a bold-titled group in its own title colour
// and a group that stacks its rows (it grows downwards from its top edge).
TEST_P(TabGroupLook, PlainAndGeneralGroups) {
  auto* plain = new WidgetGroup(at(8, 132, 108, 90), L"Plain");
  fill(*plain, "Inside");
  const UifTypeOfBorder borders[] = {UifBorderNone, UifBorderRaised, UifBorderFramed,
                                     UifBorderSunken};
  const wchar_t* titles[] = {L"None", L"Raised", L"Framed", L"Sunken"};
  for (int i = 0; i < 4; ++i) {
    auto* g = new WidgetGroupEx(at(124 + i * 88, 132, 80, 90), titles[i]);
    g->setBorderStyle(borders[i]);
    g->setSeparatorStyle(i % 2 ? WidgetGroupEx::SeparatorEtched : WidgetGroupEx::SeparatorLine);
    fill(*g, "In", 50);
  }

  auto* bold = new WidgetGroupEx(at(8, 8, 200, 110), L"Bold and coloured");
  bold->setBoldText(true);
  bold->setGroupTitleColour(Colour::fromHex(0x3D8FD1));
  bold->setSeparatorStyle(WidgetGroupEx::SeparatorEtched);
  fill(*bold, "Inside", 120);

  auto* rows = new WidgetGroup2(GlobCreationInfo(250, 40, parent.canvas(), 220, 78), L"Rows");
  for (const char* l : {"First row", "Second row", "Third row"})
    rows->addRow(button(*rows, l, 160));
  expectGolden("widget_groups");
}

// Above: a minimisable group open and one minimised, a checkable group ticked and one clear.
// Below: a group headed by a check box, and one headed by a drop-down button.
TEST_P(TabGroupLook, GroupVariants) {
  auto* open = new MinimizableGroup(at(8, 128, 110, 94), L"Open");
  fill(*open, "Inside");
  auto* shut = new MinimizableGroup(at(126, 128, 110, 94), L"Minimised");
  fill(*shut, "Hidden");
  shut->setSize(SizeMinimised);

  auto* ticked = new CheckableWidgetGroup(at(244, 128, 110, 94), L"Ticked", true);
  fill(*ticked, "Active");
  auto* clear = new CheckableWidgetGroup(at(362, 128, 110, 94), L"Clear", true);
  fill(*clear, "Inactive");
  clear->setState(false, true);

  auto* boxed = new CheckboxGroup(at(8, 8, 228, 110), L"Limiter");
  boxed->setBoldWhenTicked(true);
  fill(*boxed, "Ceiling", 120);

  auto* menu = new ButtonGroup(at(244, 8, 228, 110), L"Mode: Stereo");
  fill(*menu, "Width", 120);
  expectGolden("group_variants");
}

INSTANTIATE_TEST_SUITE_P(Palettes, TabGroupLook, ::testing::Values(false, true),
                         [](const ::testing::TestParamInfo<bool>& i) {
                           return i.param ? "Light" : "Dark";
                         });
