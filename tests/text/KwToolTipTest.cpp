// The tooltip on the manual clock: when it comes, where it goes, when it goes away, and what
// becomes of it when its control or its text misbehaves.
#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "buttons/SizeButton.h"
#include "platform/glib/FontCache.h"
#include "platform/misc/ResourceStrings.h"
#include "platform/testing/Harness.h"
#include "text/KwToolTip.h"
#include "text/ToolTipLayout.h"

namespace {

struct ToolTipFixture : ::testing::Test {
  void SetUp() override {
    KwToolTip::enable(true);
    KwToolTip::registerTypes(h.root());
    button->setContextString("Apply the changes");
  }
  void TearDown() override {
    KwToolTip::hide();
    KwToolTip::enable(true);
  }
  // Moves the pointer and lets one tick see it: the rest starts at that tick.
  void restAt(XY<int> p) {
    h.move(p);
    h.advance(h.root().tickPeriod());
  }
  XY<int> onButton() const { return Harness::centreOf(*button); }

  Harness h{400, 300};
  Button* button = new Button(L"Apply", String("apply"), h.place(100, 150, 80, 24));
};

}  // namespace

TEST_F(ToolTipFixture, ShowsAtTheFirstTickAfterTheRestBelowThePointer) {
  restAt(onButton());
  h.advance(KwToolTip::kRestMs);
  EXPECT_EQ(KwToolTip::current(), nullptr);
  h.advance(h.root().tickPeriod());
  KwToolTip* tip = KwToolTip::current();
  ASSERT_NE(tip, nullptr);
  EXPECT_EQ(tip->text(), L"Apply the changes");
  EXPECT_EQ(tip->root(), &h.root());
  // Its top 20 pixels below the pointer, its left edge at the pointer.
  const Kw::Box<int> r = tip->canvas()->rect();
  EXPECT_EQ(r.x0, onButton().x);
  EXPECT_EQ(r.y1, onButton().y - KwToolTip::kPointerGap);
  // One line: the text's size and the margins.
  const Glib::FontPtr font = Glib::fonts().standard();
  EXPECT_EQ(r.width(), font->textWidth(L"Apply the changes") + KwToolTip::kMarginX);
  EXPECT_EQ(r.height(), font->height() + KwToolTip::kMarginY);
  // It is drawn above the control.
  h.render();
  EXPECT_TRUE(h.drew(tip));
}

TEST_F(ToolTipFixture, GoesAfterFiveSecondsAndStaysAwayUntilThePointerMoves) {
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  ASSERT_NE(KwToolTip::current(), nullptr);
  h.advance(KwToolTip::kShowMs);
  EXPECT_NE(KwToolTip::current(), nullptr);
  h.advance(h.root().tickPeriod());
  EXPECT_EQ(KwToolTip::current(), nullptr);
  h.advance(20000);
  EXPECT_EQ(KwToolTip::current(), nullptr);

  restAt(onButton() + XY<int>(1, 0));
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  EXPECT_NE(KwToolTip::current(), nullptr);
}

TEST_F(ToolTipFixture, AnyMovementRemovesItAtTheNextTick) {
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  ASSERT_NE(KwToolTip::current(), nullptr);
  h.move(onButton() + XY<int>(0, 1));
  EXPECT_NE(KwToolTip::current(), nullptr);
  h.advance(h.root().tickPeriod());
  EXPECT_EQ(KwToolTip::current(), nullptr);
  // The rest starts again from the movement.
  h.advance(KwToolTip::kRestMs);
  EXPECT_EQ(KwToolTip::current(), nullptr);
  h.advance(h.root().tickPeriod());
  EXPECT_NE(KwToolTip::current(), nullptr);
}

TEST_F(ToolTipFixture, DisablingRemovesItAndShowsNothing) {
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  ASSERT_NE(KwToolTip::current(), nullptr);
  KwToolTip::enable(false);
  EXPECT_EQ(KwToolTip::current(), nullptr);
  restAt(onButton() + XY<int>(2, 0));
  h.advance(2000);
  EXPECT_EQ(KwToolTip::current(), nullptr);

  KwToolTip::enable(true);
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  EXPECT_NE(KwToolTip::current(), nullptr);
}

TEST_F(ToolTipFixture, HiddenTooltipsStayAwayUntilThePointerMoves) {
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  ASSERT_NE(KwToolTip::current(), nullptr);
  KwToolTip::hide();
  h.advance(1000);
  EXPECT_EQ(KwToolTip::current(), nullptr);
  restAt(onButton() + XY<int>(1, 1));
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  EXPECT_NE(KwToolTip::current(), nullptr);
}

TEST_F(ToolTipFixture, NothingForAPointerOverNothingToSayOrWithAButtonHeld) {
  restAt(XY<int>(10, 10));
  h.advance(1000);
  EXPECT_EQ(KwToolTip::current(), nullptr);
  // A press held down is not a rest.
  h.press(onButton());
  h.advance(h.root().tickPeriod());
  h.advance(1000);
  EXPECT_EQ(KwToolTip::current(), nullptr);
  h.release(onButton());
  h.advance(KwToolTip::kRestMs + 2 * h.root().tickPeriod());
  EXPECT_NE(KwToolTip::current(), nullptr);
}

TEST_F(ToolTipFixture, ItsControlDeletedWhileItShowsTakesItAway) {
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  ASSERT_NE(KwToolTip::current(), nullptr);
  delete button;
  button = nullptr;
  h.advance(h.root().tickPeriod());
  EXPECT_EQ(KwToolTip::current(), nullptr);
  h.advance(2000);
  EXPECT_EQ(KwToolTip::current(), nullptr);
  h.render();
}

TEST_F(ToolTipFixture, TheTextComesFromTheControlOrItsNearestParent) {
  auto* holder = new Glob(h.place(220, 20, 150, 100));
  holder->setContextString("Holder help");
  auto* inner = new Glob(GlobCreationInfo(40, 40, holder->canvas(), 10, 10));
  EXPECT_EQ(KwToolTip::getTooltipText(h.root(), XY<int>(240, 40)), L"Holder help");
  inner->setContextString("Inner help");
  EXPECT_EQ(KwToolTip::getTooltipText(h.root(), XY<int>(240, 40)), L"Inner help");
  EXPECT_EQ(KwToolTip::getTooltipText(h.root(), XY<int>(5, 5)), L"");

  // A control that works out its own text (the size button's flips with its state).
  resourceStrings().set(SizeButton::kContextStringSizeSet, L"Larger");
  resourceStrings().set(SizeButton::kContextStringSizeClear, L"Smaller");
  auto* size = new SizeButton(true, 20, 0, h.canvas());
  size->reshape_canvas(20, 250, size->width(), size->height());
  const WString said = KwToolTip::getTooltipText(h.root(), Harness::centreOf(*size));
  EXPECT_TRUE(said == L"Larger" || said == L"Smaller");
}

TEST_F(ToolTipFixture, KeptOnTheScreenAndOffThePointerNearTheEdges) {
  button->setContextString("A help text long enough to reach past the right edge");
  auto* corner = new Glob(h.place(330, 0, 70, 30));
  corner->setContextString("Bottom corner help");
  restAt(XY<int>(395, 10));
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  KwToolTip* tip = KwToolTip::current();
  ASSERT_NE(tip, nullptr);
  const Kw::Box<int> r = tip->canvas()->rect();
  EXPECT_EQ(r.x1, 400);
  EXPECT_GE(r.y0, 0);
  EXPECT_FALSE(r.contains(XY<int>(395, 10)));
  EXPECT_EQ(r.y0, 10 + KwToolTip::kPointerGap);
}

TEST_F(ToolTipFixture, LineBreaksMakeLinesAndEmptyTextsShowNothing) {
  button->setContextString("First line\nSecond, the longer line\n");
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  KwToolTip* tip = KwToolTip::current();
  ASSERT_NE(tip, nullptr);
  ASSERT_EQ(tip->lines().size(), 2u);
  const Glib::FontPtr font = Glib::fonts().standard();
  EXPECT_EQ(tip->height(), 2 * font->height() + KwToolTip::kMarginY);
  EXPECT_EQ(tip->width(), font->textWidth(L"Second, the longer line") + KwToolTip::kMarginX);

  KwToolTip::hide();
  button->setContextString("\n\n\r\n");
  restAt(onButton() + XY<int>(1, 0));
  h.advance(2000);
  EXPECT_EQ(KwToolTip::current(), nullptr);
}

TEST_F(ToolTipFixture, AnEnormousTextStaysWithinTheScreen) {
  String huge;
  for (int i = 0; i < 600; ++i) huge += "word" + std::to_string(i) + " ";
  huge += String(3000, 'x');
  button->setContextString(huge);
  restAt(onButton());
  h.advance(KwToolTip::kRestMs + h.root().tickPeriod());
  KwToolTip* tip = KwToolTip::current();
  ASSERT_NE(tip, nullptr);
  EXPECT_LE(tip->lines().size(), ToolTipLayout::kMaxLines);
  const Kw::Box<int> r = tip->canvas()->rect();
  EXPECT_LE(r.width(), 400);
  EXPECT_GE(r.x0, 0);
  EXPECT_LE(r.x1, 400);
  // Taller than the screen: its top edge stays on it.
  EXPECT_EQ(r.y1, 300);
  h.render();
}
