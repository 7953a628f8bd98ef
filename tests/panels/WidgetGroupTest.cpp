#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "panels/ButtonGroup.h"
#include "panels/CheckableWidgetGroup.h"
#include "panels/CheckboxGroup.h"
#include "panels/MinimizableGroup.h"
#include "panels/WidgetGroup2.h"
#include "platform/glob/GlobHandle.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

struct GroupFixture : ::testing::Test {
  Harness h{400, 400};
  MessageProbe probe{h.place(0, 0, 400, 400)};

  // A point in the title strip of `g`, in root coordinates.
  static XY<int> titleOf(const Glob& g) {
    return XY<int>(static_cast<int>(g.get_x()) + g.width() - 20,
                   static_cast<int>(g.get_y()) + g.height() - 6);
  }
  Button* makeButton(Glob& on, const char* label) {
    return new Button(Kw::toWide(label), label, GlobCreationInfo(80, 20, on.canvas()));
  }
};

}  // namespace

TEST(WidgetGroupArithmetic, HeightForRowsAndDeltas) {
  EXPECT_EQ(WidgetGroupEx::calcHeightForRows(1, 20, 5), 52);
  EXPECT_EQ(WidgetGroupEx::calcHeightForRows(3, 20, 5), 102);
  EXPECT_EQ(MinimizableGroup::getHeightDelta("MinimizableGroupSizeChange -40"), -40);
  EXPECT_EQ(MinimizableGroup::getHeightDelta("MinimizableGroupSizeChange 17"), 17);
  EXPECT_EQ(MinimizableGroup::getHeightDelta("MinimizableGroupSizeChange "), 0);
  EXPECT_EQ(MinimizableGroup::getHeightDelta("MinimizableGroupSizeChange x"), 0);
  EXPECT_EQ(MinimizableGroup::getHeightDelta("SomethingElse 12"), 0);
  EXPECT_EQ(MinimizableGroup::getHeightDelta(""), 0);
}

TEST_F(GroupFixture, FlippingTwiceReportsOppositeChangesAndHidesWidgets) {
  auto* g = new MinimizableGroup(GlobCreationInfo(200, 120, probe.canvas(), 10, 200), L"Gain");
  Button* b = makeButton(*g, "inner");
  ASSERT_TRUE(g->addWidget(b, XY<int>(0, 0), OriginInnerTopLeft));
  const int top = static_cast<int>(g->get_y()) + g->height();

  h.click(titleOf(*g));
  EXPECT_TRUE(g->isMinimised());
  EXPECT_EQ(g->height(), WidgetGroup::kMinimisedHeight);
  EXPECT_EQ(static_cast<int>(g->get_y()) + g->height(), top);  // the top edge stays
  EXPECT_FALSE(b->isVisible());

  h.click(titleOf(*g));
  EXPECT_FALSE(g->isMinimised());
  EXPECT_EQ(g->height(), 120);
  EXPECT_TRUE(b->isVisible());
  ASSERT_EQ(probe.texts(), (std::vector<String>{"MinimizableGroupSizeChange -93",
                                                "MinimizableGroupSizeChange 93"}));
}

TEST_F(GroupFixture, PressesBelowTheToggleAreaDoNotFlip) {
  auto* g = new MinimizableGroup(GlobCreationInfo(200, 120, probe.canvas(), 10, 200), L"Gain");
  EXPECT_TRUE(g->isCoordinateInSizeToggleArea(XY<int>(5, 119)));
  EXPECT_FALSE(g->isCoordinateInSizeToggleArea(XY<int>(5, 120 - WidgetGroup::kMinimisedHeight)));
  h.click(XY<int>(60, 230));
  EXPECT_FALSE(g->isMinimised());
  EXPECT_TRUE(probe.texts().empty());
}

TEST_F(GroupFixture, ParentGroupFollowsAChildGroupsHeight) {
  auto* outer = new MinimizableGroup(GlobCreationInfo(300, 100, probe.canvas(), 10, 100), L"Outer");
  outer->setAutoSize(true);
  auto* inner = new MinimizableGroup(GlobCreationInfo(260, 100, outer->canvas()), L"Inner");
  outer->addWidget(inner, XY<int>(0, 0), OriginInnerTopLeft);
  Button* below = makeButton(*outer, "below");
  outer->addWidgetRelative(below, inner, 4, PlaceBelow, SurroundNone, AlignLeft);
  outer->setAutoSize(true);
  const int outerHeight = outer->height();
  const int belowTopFromOuterTop = outer->height() - below->canvas()->rect().y1;

  h.click(titleOf(*inner));
  const int delta = WidgetGroup::kMinimisedHeight - 100;
  EXPECT_EQ(outer->height(), outerHeight + delta);
  EXPECT_EQ(outer->height() - below->canvas()->rect().y1, belowTopFromOuterTop + delta);
  // The outer group passes its own change on.
  ASSERT_EQ(probe.count("MinimizableGroupSizeChange " + std::to_string(delta)), 1);
  EXPECT_EQ(probe.last()->sender, outer);
}

TEST_F(GroupFixture, AReceiverMayDeleteTheFlippedGroup) {
  struct Deleter : Glob {
    using Glob::Glob;
    int react(Event* e) override {
      if (!message_event(e)) return Glob::react(e);
      delete event_to_sender_glob(e);
      return 1;
    }
  };
  auto* parent = new Deleter(GlobCreationInfo(300, 300, probe.canvas()));
  auto* g = new MinimizableGroup(GlobCreationInfo(200, 120, parent->canvas(), 10, 100), L"Gone");
  GlobHandle<> handle(g);
  h.click(titleOf(*g));
  EXPECT_FALSE(handle.alive());
  h.pump();
}

TEST_F(GroupFixture, CheckableGroupSwitchesItsWidgets) {
  auto* g = new CheckableWidgetGroup(GlobCreationInfo(220, 90, probe.canvas(), 10, 200), L"Reverb");
  Button* b = makeButton(*g, "depth");
  g->addWidget(b, XY<int>(0, 0), OriginInnerTopLeft);
  ASSERT_TRUE(g->getCheckbox());
  EXPECT_TRUE(b->isActive());

  h.clickOn(*g->getCheckbox());
  EXPECT_FALSE(g->getState());
  EXPECT_FALSE(b->isActive());
  EXPECT_EQ(probe.texts(), std::vector<String>{"WidgetGroupStateToggled"});

  g->setState(true, true);
  EXPECT_TRUE(b->isActive());
  EXPECT_TRUE(g->getCheckbox()->getState());
  EXPECT_EQ(probe.texts().size(), 1u);  // setState is silent
}

TEST_F(GroupFixture, CheckboxGroupOnlyAnswersItsOwnBox) {
  auto* g = new CheckboxGroup(GlobCreationInfo(220, 90, probe.canvas(), 10, 200), L"Limiter");
  auto* other = new Checkbox(GlobCreationInfo(100, 18, g->canvas()), false);
  other->setLabel(L"Other");
  g->addWidget(other, XY<int>(0, 0), OriginInnerTopLeft);
  Button* b = makeButton(*g, "ceiling");
  g->addWidget(b, XY<int>(0, 24), OriginInnerTopLeft);

  // A grouped box's message leaves the group as it was.
  h.clickOn(*other);
  EXPECT_TRUE(other->getState());
  EXPECT_TRUE(g->getState());
  EXPECT_TRUE(b->isActive());
  EXPECT_EQ(probe.count("CheckboxGroupClicked"), 0);

  h.clickOn(*g->getCheckbox());
  EXPECT_FALSE(g->getState());
  EXPECT_FALSE(b->isActive());
  EXPECT_FALSE(other->isActive());
  EXPECT_EQ(probe.count("CheckboxGroupClicked"), 1);
}

TEST_F(GroupFixture, TitleChangesAndTheButtonHeader) {
  auto* g = new WidgetGroupEx(GlobCreationInfo(200, 80, probe.canvas(), 10, 10), L"Old");
  g->setGroupTitle(L"Old", true);  // unchanged: nothing
  g->setGroupTitle(L"Silent", false);
  g->setGroupTitle(L"New", true);
  EXPECT_EQ(probe.texts(), std::vector<String>{"GroupRenamed New"});

  probe.clear();
  auto* bg = new ButtonGroup(GlobCreationInfo(200, 80, probe.canvas(), 10, 200), L"Mode");
  ASSERT_TRUE(bg->getBtn());
  h.clickOn(*bg->getBtn());
  ASSERT_EQ(probe.texts(), std::vector<String>{ButtonGroup::kButtonMsg});
  EXPECT_EQ(probe.last()->sender, bg);
}

TEST_F(GroupFixture, RowsStackAndTheGroupFitsThem) {
  auto* g = new WidgetGroup2(GlobCreationInfo(200, 40, probe.canvas(), 10, 300), L"Rows");
  g->setAutoSizeChildren(true);
  for (const char* l : {"one", "two", "three"}) EXPECT_TRUE(g->addRow(makeButton(*g, l)));
  EXPECT_EQ(g->height(), WidgetGroupEx::calcHeightForRows(3, 20, WidgetGroup2::kDefaultRowGap));
  const WidgetDetails* second = g->StandardPanel::getWidget(1u);
  ASSERT_TRUE(second && second->get());
  EXPECT_EQ(second->get()->width(), g->getUserArea().width());
  g->setRowGap(10);
  EXPECT_EQ(g->height(), WidgetGroupEx::calcHeightForRows(3, 20, 10));
  EXPECT_FALSE(g->addRow(nullptr));
}
