#include <gtest/gtest.h>

#include <cmath>
#include <functional>

#include "foundation/ValServerAdaptor.h"
#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "tests/values/ValuesTestSupport.h"
#include "values/ScrollBar.h"

namespace {

using Texts = std::vector<String>;

// A horizontal bar 232 long at (20, 20): its trough runs from x 16 to 216 of the bar, 200
// pixels, so a thumb of size s at position p covers 16 + 200 p to 16 + 200 (p + s).
struct ScrollBarTest : ::testing::Test {
  ScrollBar* make(Orientation o, double pos, double size, bool resizable = false) {
    return makeScrollBar(parent.canvas(), 20, 20, o == kHorizontal ? 232 : 0,
                         o == kHorizontal ? 0 : 232, o, pos, size, resizable);
  }
  // A root point `along` pixels from the bar's decreasing end (left, or top of a vertical bar).
  XY<int> on(const ScrollBar& b, int along) const {
    return b.getOrientation() == kHorizontal ? XY<int>(20 + along, 28)
                                             : XY<int>(28, 20 + b.height() - 1 - along);
  }

  Harness h;
  MessageProbe parent{h.place(0, 0, 400, 300)};
};

}  // namespace

TEST(ScrollBarGeometryTest, ThumbLengthRangeAndStart) {
  ScrollBarGeometry g{232, 16, 0.5, 0.2, 20};
  EXPECT_EQ(g.troughLength(), 200);
  EXPECT_EQ(g.thumbLength(), 40);
  EXPECT_DOUBLE_EQ(g.rangePixels(), 200.0);
  EXPECT_EQ(g.thumbStart(), 116);
  EXPECT_EQ(g.thumbEnd(), 156);
  // A small thumb is drawn at the minimum length; the range shrinks to match.
  g.thumbSize = 0.01;
  g.thumbPos = 0.99;
  EXPECT_EQ(g.thumbLength(), 20);
  EXPECT_NEAR(g.rangePixels(), 180.0 / 0.99, 1e-9);
  EXPECT_EQ(g.thumbEnd(), 216);
  // A bar too short for a trough has an empty one and nothing divides by zero.
  const ScrollBarGeometry tiny{20, 16, 0.3, 0.5, 20};
  EXPECT_EQ(tiny.troughLength(), 0);
  EXPECT_EQ(tiny.thumbLength(), 0);
  EXPECT_GE(tiny.rangePixels(), 1.0);
}

TEST_F(ScrollBarTest, ThumbSettersClampAndRefuse) {
  ScrollBar* b = make(kHorizontal, 0.0, 1.0);
  EXPECT_EQ(b->getThumbPos(), 0.0);
  EXPECT_EQ(b->getThumbSize(), 1.0);
  EXPECT_EQ(b->width(), 232);
  EXPECT_EQ(b->height(), ScrollBar::thickness());
  EXPECT_TRUE(b->setThumbSize(0.25));
  EXPECT_TRUE(b->setThumbPos(0.9));
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.75);
  EXPECT_FALSE(b->setThumbPos(0.7500000001));
  EXPECT_TRUE(b->setThumbSize(0.0));  // zero means the whole
  EXPECT_EQ(b->getThumbSize(), 1.0);
  EXPECT_EQ(b->getThumbPos(), 0.0);
  b->setThumbSize(0.5);
  EXPECT_TRUE(b->setThumbSize(1.5));
  EXPECT_EQ(b->getThumbSize(), 1.0);

  Diagnostics::Capture diag;
  EXPECT_FALSE(b->setThumbSize(-0.5));
  EXPECT_FALSE(b->setThumbSize(NAN));
  EXPECT_FALSE(b->setThumbPos(NAN));
  EXPECT_EQ(b->getThumbSize(), 1.0);
  EXPECT_EQ(diag.lines().size(), 3u);

  EXPECT_TRUE(ScrollBar::isScrollBarMsg(ScrollBar::thumbMovedMsg));
  EXPECT_FALSE(ScrollBar::isScrollBarMsg("slider 0.5"));
  EXPECT_EQ(ScrollBar::minSizePixels(), 52);
  b->resize(10, 90);
  EXPECT_EQ(b->width(), 52);
  EXPECT_EQ(b->height(), 16);
}

TEST_F(ScrollBarTest, ThumbPixelExtentsInBothOrientations) {
  ScrollBar* hb = make(kHorizontal, 0.5, 0.2);
  EXPECT_EQ(hb->getThumbPixelExtents(), (NumRange<int, true>(116, 155)));
  ScrollBar* vb = make(kVertical, 0.5, 0.2);
  // Position 0.5 is halfway down: 116 pixels from the top of a 232-pixel bar.
  EXPECT_EQ(vb->getThumbPixelExtents(), (NumRange<int, true>(231 - 116, 232 - 156)));
}

TEST_F(ScrollBarTest, TroughPagingRepeatsAfter300ThenEvery100UntilTheThumbReachesThePointer) {
  ScrollBar* b = make(kHorizontal, 0.0, 0.1);
  h.press(on(*b, 206));
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.1);
  EXPECT_EQ(parent.texts(), Texts{ScrollBar::thumbMovedMsg});
  h.advance(300);  // not yet more than 300 ms
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.1);
  h.advance(10);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.2);
  h.advance(100);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.2);
  h.advance(10);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.3);
  h.advance(2000);
  // It stops once the thumb covers the pointer (its end passes along pixel 206).
  EXPECT_NEAR(b->getThumbPos(), 0.9, 1e-9);
  EXPECT_EQ(parent.count(ScrollBar::thumbMovedMsg), 9);
  h.release(on(*b, 206));
  EXPECT_FALSE(b->isPaging());
  EXPECT_EQ(parent.count(ScrollBar::thumbReleasedMsg), 0);
}

TEST_F(ScrollBarTest, TroughClickBeyondAndBeforeTheThumb) {
  ScrollBar* b = make(kHorizontal, 0.5, 0.2);
  h.press(on(*b, 200));
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.7);
  h.advance(310);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.8);
  h.advance(500);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.8);
  h.release(on(*b, 200));
  // Before the thumb pages backward. A right press beside the thumb does not page.
  h.press(on(*b, 20));
  h.release(on(*b, 20));
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.6);
  h.press(on(*b, 20), MouseButton::Right);
  h.release(on(*b, 20), MouseButton::Right);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.6);
}

TEST_F(ScrollBarTest, DraggingTheThumbMovesItByPixelsOverTheRange) {
  ScrollBar* b = make(kHorizontal, 0.0, 0.2);
  h.press(on(*b, 26));
  EXPECT_TRUE(b->isThumbBeingMoved());
  EXPECT_EQ(b->contextCursor(XY<int>(26, 8)), kCursorHorizontalMove);
  h.move(on(*b, 76));
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.25);
  h.move(on(*b, 500));  // clamped at the end
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.8);
  h.release(on(*b, 500));
  EXPECT_FALSE(b->isThumbBeingMoved());
  EXPECT_EQ(parent.texts(), (Texts{ScrollBar::thumbMovedMsg, ScrollBar::thumbMovedMsg,
                                   ScrollBar::thumbReleasedMsg}));

  // Vertical bars run downward: moving the pointer down increases the position.
  ScrollBar* v = make(kVertical, 0.0, 0.2);
  v->reshape_canvas(300, 20, 16, 232);
  h.press(XY<int>(308, 20 + 231 - 26));
  h.move(XY<int>(308, 20 + 231 - 76));
  EXPECT_DOUBLE_EQ(v->getThumbPos(), 0.25);
  h.release(XY<int>(308, 20 + 231 - 76));
}

TEST_F(ScrollBarTest, ResizableThumbGrowsAndShrinksAboutItsCentre) {
  ScrollBar* b = make(kHorizontal, 0.4, 0.2, true);  // thumb from 96 to 136
  EXPECT_EQ(b->contextCursor(XY<int>(132, 8)), kCursorResizeHorizontal);
  EXPECT_EQ(b->contextCursor(XY<int>(100, 8)), kCursorResizeHorizontal);
  EXPECT_EQ(b->contextCursor(XY<int>(116, 8)), kCursorHorizontalMove);
  h.press(on(*b, 132));
  EXPECT_TRUE(b->isThumbBeingResized());
  h.move(on(*b, 152));  // 20 pixels: f = 0.1, both ends move out
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.3);
  EXPECT_DOUBLE_EQ(b->getThumbSize(), 0.4);
  // Shrinking past the centre is refused.
  h.move(on(*b, 52));
  EXPECT_DOUBLE_EQ(b->getThumbSize(), 0.4);
  h.move(on(*b, 32));  // 20 back: shrinks to 0.2
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.4);
  EXPECT_DOUBLE_EQ(b->getThumbSize(), 0.2);
  h.release(on(*b, 32));
  EXPECT_EQ(parent.count(ScrollBar::thumbReleasedMsg), 1);

  // The decreasing end, dragged left at the start of the bar: only room on one side.
  b->setThumbPos(0.05);
  h.press(on(*b, 16 + 10 + 2));
  EXPECT_TRUE(b->isThumbBeingResized());
  h.move(on(*b, 16 + 10 + 2 - 20));
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.0);
  EXPECT_DOUBLE_EQ(b->getThumbSize(), 0.3);
  h.release(on(*b, 8));
}

TEST_F(ScrollBarTest, ArrowButtonsReportAndRepeat) {
  ScrollBar* v = make(kVertical, 0.5, 0.2);
  Button* up = v->decrementButton();
  Button* down = v->incrementButton();
  EXPECT_GT(Harness::centreOf(*up).y, Harness::centreOf(*down).y);
  h.press(Harness::centreOf(*up));
  EXPECT_EQ(parent.texts(), Texts{ScrollBar::upButtonPressedMsg});
  h.advance(249);
  EXPECT_EQ(parent.count(ScrollBar::upButtonPressedMsg), 1);
  h.advance(20);  // past the 250 ms delay
  EXPECT_EQ(parent.count(ScrollBar::upButtonPressedMsg), 2);
  h.advance(50);  // then every 50 ms: not more than 50 yet
  EXPECT_EQ(parent.count(ScrollBar::upButtonPressedMsg), 2);
  h.advance(10);
  EXPECT_EQ(parent.count(ScrollBar::upButtonPressedMsg), 3);
  h.release(Harness::centreOf(*up));
  h.advance(1000);
  EXPECT_EQ(parent.count(ScrollBar::upButtonPressedMsg), 3);
  h.click(Harness::centreOf(*down));
  EXPECT_EQ(parent.last()->text, ScrollBar::downButtonPressedMsg);

  ScrollBar* hb = make(kHorizontal, 0.5, 0.2);
  h.press(Harness::centreOf(*hb->decrementButton()));
  h.advance(260);  // a 250 ms delay, then every 125 ms
  EXPECT_EQ(parent.count(ScrollBar::leftButtonPressedMsg), 2);
  h.advance(120);
  EXPECT_EQ(parent.count(ScrollBar::leftButtonPressedMsg), 2);
  h.advance(5);
  EXPECT_EQ(parent.count(ScrollBar::leftButtonPressedMsg), 3);
  h.release(Harness::centreOf(*hb->decrementButton()));
  h.click(Harness::centreOf(*hb->incrementButton()));
  EXPECT_EQ(parent.last()->text, ScrollBar::rightButtonPressedMsg);
}

TEST_F(ScrollBarTest, TheParentsAnswerDecidesWhatIsRedrawn) {
  ScrollBar* b = make(kVertical, 0.5, 0.2);
  h.render();
  parent.trigger = ScrollBar::downButtonPressedMsg;
  // Where the thumb lies on the screen.
  const Kw::Box<int> trough(20, 20 + 16, 36, 20 + 232 - 16);
  auto troughDamaged = [&] {
    for (const Kw::Box<int>& r : h.root().dirty().rects()) {
      if (r.intersects(trough)) return true;
    }
    return false;
  };
  // No answer: only the pressed button repaints, not the thumb.
  h.press(Harness::centreOf(*b->incrementButton()));
  EXPECT_FALSE(troughDamaged());
  h.paint();
  EXPECT_TRUE(h.drew(b->incrementButton()));
  h.release(Harness::centreOf(*b->incrementButton()));
  h.paint();
  // The parent scrolls during the call: the bar shows the new thumb at once.
  parent.action = [b] { b->setThumbPosDelta(0.1); };
  h.press(Harness::centreOf(*b->incrementButton()));
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.6);
  EXPECT_TRUE(troughDamaged());
  h.paint();
  EXPECT_TRUE(h.drew(b));
  h.release(Harness::centreOf(*b->incrementButton()));
}

TEST_F(ScrollBarTest, WheelSendsOneReportPerStep) {
  ScrollBar* b = make(kVertical, 0.5, 0.2);
  h.wheel(on(*b, 100), -3);
  EXPECT_EQ(parent.count(ScrollBar::downButtonPressedMsg), 3);
  h.wheel(on(*b, 100), 2);
  EXPECT_EQ(parent.count(ScrollBar::upButtonPressedMsg), 2);
  // The parent may answer each step.
  parent.trigger = ScrollBar::downButtonPressedMsg;
  parent.action = [b] { b->setThumbPosDelta(0.05); };
  h.wheel(on(*b, 100), -2);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.6);
}

TEST_F(ScrollBarTest, AParentDeletingTheBarDuringAReportIsSafe) {
  ScrollBar* b = make(kVertical, 0.5, 0.2);
  GlobHandle<ScrollBar> handle(b);
  parent.trigger = ScrollBar::downButtonPressedMsg;
  parent.action = [&handle] { delete handle.get(); };
  h.wheel(on(*b, 100), -3);
  EXPECT_FALSE(handle.alive());
  EXPECT_EQ(parent.count(ScrollBar::downButtonPressedMsg), 1);

  // From its own arrow button's report, and mid-drag, and from a paging repeat.
  ScrollBar* c = make(kVertical, 0.5, 0.2);
  handle = GlobHandle<ScrollBar>(c);
  h.click(Harness::centreOf(*c->incrementButton()));
  EXPECT_FALSE(handle.alive());

  ScrollBar* d = make(kHorizontal, 0.0, 0.2);
  handle = GlobHandle<ScrollBar>(d);
  parent.trigger = ScrollBar::thumbMovedMsg;
  // Positions are worked out while the bar still exists.
  const XY<int> grip = on(*d, 26), mid = on(*d, 60), end = on(*d, 80);
  h.press(grip);
  h.move(mid);
  EXPECT_FALSE(handle.alive());
  h.move(end);
  h.release(end);

  ScrollBar* e = make(kHorizontal, 0.0, 0.1);
  handle = GlobHandle<ScrollBar>(e);
  parent.action = {};
  const XY<int> trough = on(*e, 206);
  h.press(trough);
  parent.action = [&handle] { delete handle.get(); };
  h.advance(400);
  EXPECT_FALSE(handle.alive());
  h.release(trough);
}

TEST_F(ScrollBarTest, WholeThumbOrInactiveBarTakesNoPress) {
  ScrollBar* b = make(kHorizontal, 0.0, 1.0);
  Event press(kEventLeftDown);
  press.pos = XY<int>(100, 8);
  EXPECT_EQ(b->react(&press), 0);
  EXPECT_EQ(b->contextCursor(XY<int>(100, 8)), kCursorArrow);

  b->setThumbSize(0.2);
  b->setActive(false, true);
  EXPECT_FALSE(b->decrementButton()->isActive());
  EXPECT_EQ(b->react(&press), 0);
  EXPECT_EQ(b->contextCursor(XY<int>(20, 8)), kCursorArrow);
  h.click(Harness::centreOf(*b->incrementButton()));
  EXPECT_TRUE(parent.texts().empty());

  // Made inactive while paging: the repeat stops.
  b->setActive(true, true);
  h.press(on(*b, 200));
  b->setActive(false, true);
  h.advance(1000);
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.2);
}

TEST_F(ScrollBarTest, BoundToAModelThumb) {
  ValServer<ThumbSettings> view(ThumbSettings{0.3, 0.2});
  auto adaptor =
      Kw::Ptr<ValServerAdaptor<ThumbSettings>>(new ValServerAdaptor<ThumbSettings>(&view));
  ScrollBar* b = make(kHorizontal, 0.0, 1.0);
  b->setDataAdaptor(adaptor);
  adaptor->forceWidgetUpdate();
  EXPECT_DOUBLE_EQ(b->getThumbPos(), 0.3);
  EXPECT_DOUBLE_EQ(b->getThumbSize(), 0.2);
  // Paging and dragging reach the model; the model's pushes send nothing.
  h.press(on(*b, 200));
  h.release(on(*b, 200));
  EXPECT_DOUBLE_EQ(view.getValue().position, 0.5);
  parent.clear();
  view.setValue(ThumbSettings{0.1, 0.5});
  EXPECT_DOUBLE_EQ(b->getThumbSize(), 0.5);
  EXPECT_TRUE(parent.texts().empty());
  h.press(on(*b, 16 + 20 + 50));
  h.move(on(*b, 16 + 20 + 90));
  h.release(on(*b, 16 + 20 + 90));
  EXPECT_DOUBLE_EQ(view.getValue().position, 0.3);
}
