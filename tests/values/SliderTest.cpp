#include <gtest/gtest.h>

#include <cmath>
#include <functional>

#include "foundation/ValServerAdaptor.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/KeyCodes.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "values/Slider.h"
#include "values/SliderMapping.h"

namespace {

using Texts = std::vector<String>;

// Records every value a control asks for, with its change type, and accepts it.
class RecordingAdaptor : public ValAdaptorBase<double> {
 public:
  double getDataValue() override { return value; }
  bool requestSetNewDataValue(const double& v, DataChangeType why) override {
    value = v;
    requests.push_back({v, why});
    setNewWidgetValue(v);
    return true;
  }
  double value = 0.0;
  std::vector<std::pair<double, DataChangeType>> requests;
};

// A 112-pixel horizontal slider at (10, 10): startPixel 7 and endPixel 105, so a thumb at
// value v sits at root x = 17 + 98 v.
struct SliderTest : ::testing::Test {
  SliderTest() {
    slider = new Slider(SliderInitArgs(GlobCreationInfo(112, 20, parent.canvas(), 10, 10)));
    slider->setSynchronousMessages(true);
    slider->setDataAdaptor(adaptor);
  }
  XY<int> at(int alongPixel, int y = 15) const { return XY<int>(10 + alongPixel, y); }

  Harness h;
  MessageProbe parent{h.place(0, 0, 300, 200)};
  Slider* slider = nullptr;
  Kw::Ptr<RecordingAdaptor> adaptor = Kw::Ptr<RecordingAdaptor>(new RecordingAdaptor);
};

}  // namespace

TEST(SliderMappingTest, LinearBetweenTheTrackEnds) {
  const SliderMapping m{0.0, 1.0, 7.0, 105.0};
  EXPECT_DOUBLE_EQ(m.x2v(56.0), 0.5);
  EXPECT_DOUBLE_EQ(m.x2v(7.0), 0.0);
  EXPECT_DOUBLE_EQ(m.x2v(105.0), 1.0);
  EXPECT_DOUBLE_EQ(m.v2x(0.25), 31.5);
  const SliderMapping db{-60.0, 12.0, 7.0, 79.0};
  EXPECT_DOUBLE_EQ(db.x2v(db.v2x(-3.0)), -3.0);
  // A track too short for two ends gives the ends and never divides by zero.
  const SliderMapping flat{0.0, 1.0, 7.0, 7.0};
  EXPECT_EQ(flat.x2v(7.0), 0.0);
  EXPECT_EQ(flat.x2v(8.0), 1.0);
  EXPECT_EQ(flat.v2x(0.5), 7.0);
}

TEST_F(SliderTest, DefaultsAndTrackEnds) {
  EXPECT_STREQ(slider->idstring(), "slider");
  EXPECT_EQ(slider->getStartPixel(), 7.0);
  EXPECT_EQ(slider->getEndPixel(), 105.0);
  EXPECT_EQ(slider->getMinValue(), 0.0);
  EXPECT_EQ(slider->getMaxValue(), 1.0);
  EXPECT_EQ(slider->getThumbColour(), Colour(1, 0, 0));
  EXPECT_TRUE(slider->getThumbVisibility());
  EXPECT_EQ(slider->getOrientation(), kHorizontal);
  EXPECT_STREQ(Slider::thumbPickedMsg, "slider_thumb_picked");
}

TEST_F(SliderTest, DragByExactPixelsReportsEveryStepTwiceAndPublishesStartStepsRelease) {
  h.press(at(7));
  EXPECT_TRUE(slider->isThumbPicked());
  EXPECT_TRUE(parent.texts().empty());
  h.move(at(56));
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.5);
  EXPECT_EQ(parent.texts(), (Texts{"slider 0.500000", "slider_released 0.500000"}));
  h.move(at(200));  // far past the end: clamped to the last pixel
  EXPECT_DOUBLE_EQ(slider->getPosition(), 1.0);
  h.release(at(200));
  EXPECT_EQ(parent.texts(), (Texts{"slider 0.500000", "slider_released 0.500000", "slider 1.000000",
                                   "slider_released 1.000000", "slider_released 1.000000"}));
  ASSERT_EQ(adaptor->requests.size(), 3u);
  EXPECT_EQ(adaptor->requests[0], std::make_pair(0.5, kChangeDragStart));
  EXPECT_EQ(adaptor->requests[1], std::make_pair(1.0, kChangeDragStep));
  EXPECT_EQ(adaptor->requests[2], std::make_pair(1.0, kChangeDragRelease));
}

TEST_F(SliderTest, PickUpKeepsTheOffsetWithinTheMargin) {
  slider->setPosition(0.5);  // thumb at pixel 56
  // Eight pixels right of the centre still picks the thumb up (6 half size + 2 margin).
  h.press(at(64));
  ASSERT_TRUE(slider->isThumbPicked());
  h.move(at(65));  // one pixel right: pixel 56 + 1
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.5 + 1.0 / 98.0);
  h.release(at(65));
  // Nine pixels away is beside the thumb, and with no point of interest nothing happens.
  parent.clear();
  adaptor->requests.clear();
  slider->setPosition(0.5);
  // (Press and release only: after a release, moves over the slider go on dragging.)
  h.press(at(65 + 9 + 1));
  h.release(at(65 + 9 + 1));
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.5);
}

TEST_F(SliderTest, ReleaseWithoutAStepPublishesNothingAndTinyMovesSendNothing) {
  h.press(at(7));
  h.release(at(7));
  EXPECT_EQ(parent.texts(), Texts{"slider_released 0.000000"});
  EXPECT_TRUE(adaptor->requests.empty());

  parent.clear();
  h.press(at(7));
  h.move(at(7, 16));  // along the track nothing moved
  EXPECT_TRUE(parent.texts().empty());
  h.release(at(7, 16));
  EXPECT_TRUE(adaptor->requests.empty());
}

TEST_F(SliderTest, AfterReleaseLaterMovesGoOnDraggingWithTheSameOffset) {
  h.press(at(9));  // two pixels right of the thumb's centre: offset -2
  h.move(at(31));
  h.release(at(31));
  EXPECT_DOUBLE_EQ(slider->getPosition(), 22.0 / 98.0);
  parent.clear();
  // No button held: the thumb still follows, keeping the offset.
  h.move(at(58));
  EXPECT_DOUBLE_EQ(slider->getPosition(), 49.0 / 98.0);
  EXPECT_EQ(parent.texts(), (Texts{"slider 0.500000", "slider_released 0.500000"}));
}

TEST_F(SliderTest, PointOfInterestJumpEndsThePickUp) {
  EXPECT_DOUBLE_EQ(slider->setPointOfInterest(0.75), 80.5);
  h.press(at(7));
  h.release(at(7));
  ASSERT_TRUE(slider->isThumbPicked());
  parent.clear();
  adaptor->requests.clear();

  // Press and release without moving there first: a move would drag the thumb along.
  h.press(at(100));
  h.release(at(100));
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.75);
  EXPECT_FALSE(slider->isThumbPicked());
  EXPECT_EQ(parent.texts(), (Texts{"slider 0.750000", "slider_released 0.750000"}));
  ASSERT_EQ(adaptor->requests.size(), 1u);
  EXPECT_EQ(adaptor->requests[0], std::make_pair(0.75, kChangeDirect));

  // Already there: nothing more. Moves no longer drag.
  parent.clear();
  h.press(at(20));
  h.release(at(20));
  h.move(at(30));
  EXPECT_TRUE(parent.texts().empty());
  // Removed: a click beside the thumb does nothing.
  slider->removePointOfInterest();
  slider->setPosition(0.0);
  h.press(at(100));
  h.release(at(100));
  EXPECT_EQ(slider->getPosition(), 0.0);
}

TEST_F(SliderTest, ChordSetsThePositionDirectly) {
  h.press(at(56), MouseButton::Chord);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.5);
  EXPECT_EQ(parent.texts(), (Texts{"slider 0.500000", "slider_released 0.500000"}));
  ASSERT_EQ(adaptor->requests.size(), 1u);
  EXPECT_EQ(adaptor->requests[0].second, kChangeDirect);
}

TEST_F(SliderTest, QueuedReportsArriveWhenTheLoopRuns) {
  slider->setSynchronousMessages(false);
  h.press(at(7));
  h.move(at(56));
  EXPECT_TRUE(parent.texts().empty());
  h.pump();
  EXPECT_EQ(parent.texts(), (Texts{"slider 0.500000", "slider_released 0.500000"}));
  EXPECT_EQ(parent.last()->sender, slider);
}

TEST_F(SliderTest, ParentDeletingTheSliderDuringAReportIsSafe) {
  GlobHandle<Slider> handle(slider);
  parent.trigger = "slider 0.500000";
  parent.action = [this] { delete slider; };
  h.press(at(7));
  h.move(at(56));
  EXPECT_FALSE(handle.alive());
  EXPECT_EQ(parent.texts(), Texts{"slider 0.500000"});
  EXPECT_TRUE(adaptor->requests.empty());
  h.move(at(80));
  h.release(at(80));
}

TEST_F(SliderTest, ModelValuesAreClampedAndSendNothing) {
  ValServer<double> level(0.25);
  auto bound = Kw::Ptr<ValServerAdaptor<double>>(new ValServerAdaptor<double>(&level));
  slider->setDataAdaptor(bound);
  bound->forceWidgetUpdate();
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.25);
  level.setValue(7.0);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 1.0);
  level.setValue(-3.0);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.0);
  EXPECT_TRUE(parent.texts().empty());
  // A user drag reaches the model.
  h.press(at(7));
  h.move(at(56));
  h.release(at(56));
  EXPECT_DOUBLE_EQ(level.getValue(), 0.5);
}

TEST_F(SliderTest, ResizeClampsToTheOrientationsLimits) {
  slider->resize(2000, 10);
  EXPECT_EQ(slider->width(), 1000);
  EXPECT_EQ(slider->height(), 10);
  EXPECT_EQ(slider->getEndPixel(), 993.0);
  slider->resize(5, 3);
  EXPECT_EQ(slider->width(), 14);
  EXPECT_EQ(slider->height(), 6);
  // At the smallest size both ends are one pixel; the thumb still picks up and nothing breaks.
  h.press(at(7, 12));
  h.move(at(9, 12));
  EXPECT_TRUE(std::isfinite(slider->getPosition()));

  slider->setOrientation(kVertical);
  slider->resize(100, 2000);
  EXPECT_EQ(slider->width(), 50);
  EXPECT_EQ(slider->height(), 800);
  slider->resize(3, 5);
  EXPECT_EQ(slider->width(), 6);
  EXPECT_EQ(slider->height(), 14);
}

TEST_F(SliderTest, VerticalRunsBottomToTop) {
  auto* v = new Slider(24, 112, true, parent.canvas());
  v->reshape_canvas(200, 10, 24, 112);
  v->setSynchronousMessages(true);
  EXPECT_EQ(v->getOrientation(), kVertical);
  h.press(XY<int>(205, 10 + 7));
  h.move(XY<int>(205, 10 + 56));
  EXPECT_DOUBLE_EQ(v->getPosition(), 0.5);
  EXPECT_EQ(v->contextCursor(XY<int>(5, 56)), kCursorVerticalMove);
  EXPECT_EQ(slider->contextCursor(XY<int>(7, 5)), kCursorHorizontalMove);
  EXPECT_EQ(slider->contextCursor(XY<int>(60, 5)), kCursorArrow);
}

TEST_F(SliderTest, KeysStepPageAndJumpToTheEnds) {
  slider->setValueRange(0.0, 10.0);
  slider->set_kbd_focus();
  h.key(kKeyRight);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.1);
  h.key(kKeyPageUp);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 1.1);
  h.key(kKeyEnd);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 10.0);
  h.key(kKeyUp);  // clamped: no change, no report
  h.key(kKeyPageDown);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 9.0);
  h.key(kKeyHome);
  EXPECT_DOUBLE_EQ(slider->getPosition(), 0.0);
  EXPECT_EQ(parent.count("slider_released 10.000000"), 1);
  EXPECT_EQ(parent.count("slider 9.000000"), 1);
  EXPECT_EQ(adaptor->requests.back(), std::make_pair(0.0, kChangeDirect));
  // A press on the slider takes the focus.
  h.root().setFocus(nullptr);
  h.click(at(7));
  EXPECT_TRUE(slider->hasKbdFocus());
}

TEST_F(SliderTest, BadInputIsRefusedAndKeepsTheState) {
  Diagnostics::Capture diag;
  EXPECT_FALSE(slider->setValueRange(1.0, 1.0));
  EXPECT_FALSE(slider->setValueRange(2.0, 1.0));
  EXPECT_FALSE(slider->setValueRange(0.0, NAN));
  EXPECT_EQ(slider->getMaxValue(), 1.0);
  EXPECT_FALSE(slider->setPosition(NAN));
  EXPECT_FALSE(slider->setPosition(INFINITY));
  double nan = NAN;
  slider->setNewWidgetValue(nan);
  EXPECT_EQ(slider->getPosition(), 0.0);
  slider->setPointOfInterest(NAN);
  EXPECT_FALSE(slider->hasPointOfInterestSet());
  slider->resize(NAN, 10);
  EXPECT_EQ(slider->width(), 112);
  EXPECT_GE(diag.lines().size(), 6u);
  // An out-of-range position is kept unclamped when set directly, and the thumb area stays sane.
  EXPECT_TRUE(slider->setPosition(1e300));
  h.click(at(50));
  h.render();
}

TEST_F(SliderTest, InactiveOrHiddenThumbIgnoresThePointer) {
  slider->setEnabledState(false);
  h.press(at(7));
  h.move(at(56));
  h.release(at(56));
  EXPECT_EQ(slider->getPosition(), 0.0);
  slider->setEnabledState(true);
  slider->setThumbVisibility(false);
  h.press(at(7));
  h.move(at(56));
  EXPECT_EQ(slider->getPosition(), 0.0);
  EXPECT_TRUE(parent.texts().empty());
}

TEST_F(SliderTest, OnlyAChangeRepaints) {
  h.render();
  h.press(at(7));
  h.paint();
  h.move(at(7, 17));  // nothing changes along the track
  EXPECT_TRUE(h.paint().empty());
  h.move(at(56));
  h.paint();
  EXPECT_TRUE(h.drew(slider));
}
