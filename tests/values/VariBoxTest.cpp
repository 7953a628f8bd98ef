// The value box driven through the harness: drags with exact pixel distances, both buttons,
// the wheel, Return, model pushes, the queued messages, and owners that delete the box.
#include <cmath>
#include <limits>
#include <memory>

#include "foundation/ValServerAdaptor.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "tests/values/ValuesTestSupport.h"
#include "values/DecimalDisplayer.h"
#include "values/IntegerDisplayer.h"
#include "values/TitledVariBox.h"
#include "values/VariBox.h"
#include "values/VariBoxParserBasic.h"
#include "values/VariBoxParserLog.h"
#include "values/VariFriendlyTextBox.h"

namespace {

const String kChanged = "varibox_ValueChanged";
const String kComplete = "varibox_ChangeComplete";

class VariBoxFixture : public ::testing::Test {
 protected:
  void SetUp() override {
    probe = new MessageProbe(h.place(0, 0, 400, 200));
    VariBoxInitArgs args(GlobCreationInfo(200, 0, probe->canvas(), 10, 10));
    box = new VariBox(args);
    parser = new VariBoxParserBasic<int>(box, &shown, 0, 100, 1, 10, 50, 0);
    parser->setDataAdaptor(model);
    box->setParser(parser, true);
    h.pump();
    probe->clear();
  }
  void TearDown() override { h.setModifiers(0); }

  // A point on the grip, where a left drag takes hold, in root coordinates.
  XY<int> grip() const { return XY<int>(10 + 200 - VariBox::kGripWidth / 2 - 1, 24); }
  XY<int> text() const { return Harness::centreOf(*box->getTextBox()); }
  std::vector<String> sent() {
    h.pump();
    return probe->texts();
  }

  Harness h{400, 200};
  MessageProbe* probe = nullptr;
  VariBox* box = nullptr;
  IntegerDisplayer<int> shown;
  VariBoxParserBasic<int>* parser = nullptr;
  Kw::Ptr<RecordingAdaptor<int>> model{new RecordingAdaptor<int>};
};

}  // namespace

TEST_F(VariBoxFixture, LeftDragStepsOncePerThreePixelsWhateverTheDistance) {
  const XY<int> at = grip();
  h.move(at);
  h.press(at);
  EXPECT_TRUE(box->isDragging());
  EXPECT_TRUE(sent().empty());  // the press publishes and sends nothing

  h.move(at + XY<int>(0, 2));  // 2 pixels up: nothing yet
  EXPECT_TRUE(sent().empty());
  EXPECT_EQ(parser->getValue(), 50);
  h.move(at + XY<int>(0, 3));  // the third pixel against the same anchor: one major step
  EXPECT_EQ(parser->getValue(), 60);
  EXPECT_EQ(box->getTextBox()->getText(), L"60");
  EXPECT_EQ(sent(), std::vector<String>{kChanged});

  h.move(at + XY<int>(0, 103));  // 100 pixels in one move: still a single step
  EXPECT_EQ(parser->getValue(), 70);
  h.move(at + XY<int>(3, 100));  // |dx| = |dy| = 3: dy decides, downward decrements
  EXPECT_EQ(parser->getValue(), 60);
  h.move(at + XY<int>(7, 99));  // dx wins: rightward increments
  EXPECT_EQ(parser->getValue(), 70);

  h.release(at + XY<int>(7, 99));
  EXPECT_FALSE(box->isDragging());
  EXPECT_EQ(sent(), (std::vector<String>{kChanged, kChanged, kChanged, kChanged, kComplete}));
  // The first step is published as the drag's start, the others as steps, then the release.
  EXPECT_EQ(model->changeTypes(),
            (std::vector<DataChangeType>{kChangeDragStart, kChangeDragStep, kChangeDragStep,
                                         kChangeDragStep, kChangeDragRelease}));
  EXPECT_EQ(model->requests.back().value, 70);
}

TEST_F(VariBoxFixture, ReleaseWithoutAStepStillCompletes) {
  h.drag(grip(), grip() + XY<int>(1, 1), 2);
  EXPECT_EQ(sent(), std::vector<String>{kComplete});
  ASSERT_EQ(model->requests.size(), 1u);
  EXPECT_EQ(model->requests[0].value, 50);
  EXPECT_EQ(model->requests[0].why, kChangeDragRelease);
}

TEST_F(VariBoxFixture, RightDragOverTheTextAndTheOtherButtonForMinorSteps) {
  const XY<int> at = text();
  h.move(at);
  h.press(at, MouseButton::Right);
  EXPECT_TRUE(box->isDragging());
  h.move(at + XY<int>(-3, 0));  // leftward decrements, a major step
  EXPECT_EQ(parser->getValue(), 40);
  h.press(at + XY<int>(-3, 0), MouseButton::Left);  // both held: minor steps
  h.move(at + XY<int>(0, 0));
  EXPECT_EQ(parser->getValue(), 41);
  h.release(at, MouseButton::Left);  // the other button up: the drag goes on
  EXPECT_TRUE(box->isDragging());
  h.move(at + XY<int>(3, 0));
  EXPECT_EQ(parser->getValue(), 51);
  h.release(at + XY<int>(3, 0), MouseButton::Right);
  EXPECT_FALSE(box->isDragging());
  EXPECT_EQ(sent(), (std::vector<String>{kChanged, kChanged, kChanged, kComplete}));
  EXPECT_EQ(box->getTextBox()->getText(), L"51");
}

TEST_F(VariBoxFixture, FineAdjustModifierTakesMinorSteps) {
  h.setModifiers(kKeyCtrl);
  h.drag(grip(), grip() + XY<int>(0, 6), 2);
  EXPECT_EQ(parser->getValue(), 52);
  // A left press over the text with the modifier is the box's too.
  h.drag(text(), text() + XY<int>(0, 3), 1);
  EXPECT_EQ(parser->getValue(), 53);
  h.setModifiers(0);
  h.drag(text(), text() + XY<int>(0, 9), 3);  // without it, a left drag over the text edits
  EXPECT_EQ(parser->getValue(), 53);
}

TEST_F(VariBoxFixture, WheelStepsAndStopsAtTheEnds) {
  h.wheel(text(), 1);
  EXPECT_EQ(parser->getValue(), 60);
  h.setModifiers(kKeyCtrl);
  h.wheel(text(), -1);
  EXPECT_EQ(parser->getValue(), 59);
  h.setModifiers(0);
  EXPECT_EQ(sent(), (std::vector<String>{kChanged, kChanged}));
  EXPECT_EQ(model->changeTypes(), (std::vector<DataChangeType>{kChangeDirect, kChangeDirect}));

  for (int i = 0; i < 10; ++i) h.wheel(grip(), 3);
  h.pump();
  probe->clear();
  h.wheel(grip(), 1);  // at max: nothing changes, nothing is sent
  EXPECT_EQ(parser->getValue(), 100);
  EXPECT_TRUE(sent().empty());
}

TEST_F(VariBoxFixture, ReturnParsesTypedTextAndPutsBackWhatCannotBeRead) {
  h.clickOn(*box->getTextBox());
  ASSERT_TRUE(box->getTextBox()->hasKbdFocus());
  h.type(L"7x5");  // the parser's allowed characters only
  EXPECT_EQ(box->getTextBox()->getText(), L"75");
  h.key(kKeyReturn);
  EXPECT_EQ(sent(), std::vector<String>{kChanged});
  EXPECT_EQ(parser->getValue(), 75);
  EXPECT_EQ(model->changeTypes(), std::vector<DataChangeType>{kChangeDirect});

  probe->clear();
  h.clickOn(*box->getTextBox());
  h.key(kKeyReturn);  // unchanged text: no parse, no message
  EXPECT_TRUE(sent().empty());

  h.clickOn(*box->getTextBox());
  h.type(L"-");  // unreadable: the old text comes back, and the message is still sent
  h.key(kKeyReturn);
  EXPECT_EQ(sent(), std::vector<String>{kChanged});
  EXPECT_EQ(box->getTextBox()->getText(), L"75");
  EXPECT_EQ(parser->getValue(), 75);

  h.clickOn(*box->getTextBox());
  h.type(L"500");  // out of range: clamped
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(parser->getValue(), 100);
  EXPECT_EQ(box->getTextBox()->getText(), L"100");
}

TEST_F(VariBoxFixture, TextLeftUnconfirmedGivesWayToTheValue) {
  h.clickOn(*box->getTextBox());
  h.type(L"9");
  box->set_kbd_focus();  // the focus moves on without Return
  h.pump();
  EXPECT_EQ(box->getTextBox()->getText(), L"50");
  EXPECT_EQ(parser->getValue(), 50);
  EXPECT_TRUE(probe->texts().empty());
}

TEST_F(VariBoxFixture, ModelPushesShowWithoutEchoOrMessages) {
  ValServer<int> level(0);
  Kw::Ptr<ValServerAdaptor<int>> adaptor(new ValServerAdaptor<int>(&level));
  parser->setDataAdaptor(adaptor);
  level.setValue(25);
  EXPECT_EQ(box->getTextBox()->getText(), L"25");
  EXPECT_EQ(box->thermometerWidth(), 50);  // trunc(0.25 × 200)
  level.setValue(-40);                     // out of range: shown clamped
  EXPECT_EQ(box->getTextBox()->getText(), L"0");
  EXPECT_EQ(box->thermometerWidth(), 0);
  EXPECT_TRUE(sent().empty());

  h.wheel(grip(), 1);  // a user step writes the model, which pushes back
  EXPECT_EQ(level.getValue(), 10);
  EXPECT_EQ(sent(), std::vector<String>{kChanged});
}

TEST_F(VariBoxFixture, ThermometerFollowsThePositionInWholePixels) {
  h.render();
  EXPECT_EQ(box->thermometerWidth(), 100);
  const uint32_t bar = h.pixelAt(10 + 50, 24);
  const uint32_t empty = h.pixelAt(10 + 150, 12);
  EXPECT_NE(bar, empty);

  VariBoxParserBasic<int> fine(nullptr, &shown, 0, 1000, 1, 1, 500, 0);
  box->setParser(&fine, false);
  EXPECT_EQ(box->thermometerWidth(), 100);
  h.render();
  EXPECT_TRUE(fine.setValue(502));  // 0.502 × 200 = 100.4: the same pixel width
  h.wheel(grip(), 1);               // 503
  EXPECT_EQ(box->thermometerWidth(), 100);
  h.wheel(grip(), 1);
  h.wheel(grip(), 1);
  h.wheel(grip(), 1);  // 506: 101.2 pixels
  EXPECT_EQ(box->thermometerWidth(), 101);
  box->setParser(nullptr, false);
  EXPECT_EQ(fine.getOwner(), nullptr);  // a borrowed parser is handed back
}

TEST_F(VariBoxFixture, BadRangesGiveDefinedThermometers) {
  for (auto [min, max] : {std::pair{7, 7}, std::pair{9, 2}}) {
    auto* p = new VariBoxParserBasic<int>(box, &shown, min, max, 1, 1, 5, 0);
    box->setParser(p, true);
    EXPECT_EQ(box->thermometerWidth(), 0);
    EXPECT_EQ(p->getValue(), min);
    h.wheel(grip(), 1);
    EXPECT_EQ(p->getValue(), min);
  }
  DecimalDisplayer<double> dec(1);
  auto* d = new VariBoxParserBasic<double>(box, &dec, 0.0, 1.0, 0.1, 0.1, 0.5, 0);
  box->setParser(d, true);
  double nan = std::numeric_limits<double>::quiet_NaN();
  d->setNewWidgetValue(nan);
  EXPECT_EQ(box->getTextBox()->getText(), L"0.5");
  h.render();  // nothing to crash on
}

TEST_F(VariBoxFixture, InactiveBoxesIgnoreTheMouseAndEndADragQuietly) {
  h.move(grip());
  h.press(grip());
  h.move(grip() + XY<int>(0, 3));
  box->setActive(false, true);  // mid-drag
  EXPECT_FALSE(box->isDragging());
  h.release(grip() + XY<int>(0, 3));
  h.wheel(grip(), 1);
  EXPECT_EQ(sent(), std::vector<String>{kChanged});  // the one step before; no completion
  EXPECT_EQ(parser->getValue(), 60);
  EXPECT_EQ(box->contextCursor(XY<int>(1, 1)), kCursorArrow);
  box->setActive(true, true);
  EXPECT_EQ(box->contextCursor(XY<int>(1, 1)), kCursorValueDrag);

  parser->setEnabledState(false);  // the binding's enablement reaches the box
  EXPECT_FALSE(box->isActive());
  EXPECT_FALSE(box->getTextBox()->isActive());
}

TEST_F(VariBoxFixture, OwnersMayDeleteTheBoxWhileItReports) {
  // The model deletes the box as it takes the first step.
  GlobHandle<VariBox> handle(box);
  model->onRequest = [this] {
    delete box;
    model->onRequest = nullptr;
  };
  h.move(grip());
  h.press(grip());
  h.move(grip() + XY<int>(0, 3));
  EXPECT_FALSE(handle.alive());
  h.move(grip() + XY<int>(0, 9));
  h.release(grip() + XY<int>(0, 9));
  h.pump();
  EXPECT_EQ(model->requests.size(), 1u);
}

TEST_F(VariBoxFixture, ParentDeletingTheBoxOnValueChangedStopsTheDrag) {
  class Deleter : public MessageProbe {
   public:
    using MessageProbe::MessageProbe;
    int react(Event* e) override {
      if (message_event(e) && e->text() == "varibox_ValueChanged") {
        for (Glob* c : children()) delete c;
      }
      return MessageProbe::react(e);
    }
  };
  auto* owner = new Deleter(h.place(0, 100, 300, 60));
  auto* doomed = new VariBox(L"", Colour(0.2, 0.6, 0.3), 150, owner->canvas());
  doomed->setParser(new VariBoxParserBasic<int>(doomed, &shown, 0, 9, 1, 1, 0, 0), true);
  GlobHandle<VariBox> handle(doomed);
  const XY<int> at(150 - 5, 114);
  h.move(at);
  h.press(at);
  h.move(at + XY<int>(0, 3));
  h.pump();
  EXPECT_FALSE(handle.alive());
  h.move(at + XY<int>(0, 6));
  h.release(at + XY<int>(0, 6));
  h.pump();
  EXPECT_EQ(owner->count("varibox_ValueChanged"), 1);
}

TEST(VariBox, NamesHeightsAndTabStops) {
  EXPECT_EQ(VariBox::message(VariBox::ValueChanged), "varibox_ValueChanged");
  EXPECT_EQ(VariBox::message(VariBox::ChangeComplete), "varibox_ChangeComplete");
  EXPECT_EQ(VariBox::message(static_cast<VariBox::eMessageType>(7)), "varibox_<INVALID>");
  EXPECT_EQ(VariBox::getDefaultHeight(VariBox::Standard), 28);
  EXPECT_EQ(VariBox::getDefaultHeight(VariBox::Compact), 22);
  EXPECT_EQ(VariBox::getDefaultHeight(VariBox::Flat), 20);

  Harness h(300, 100);
  auto* probe = new MessageProbe(h.place(0, 0, 300, 100));
  VariBox box(L"", Colour(0.3, 0.5, 0.8), 120, probe->canvas());
  EXPECT_EQ(box.height(), 28);
  box.setAppearance(VariBox::Flat);
  EXPECT_EQ(box.height(), 20);
  box.setAppearance(static_cast<VariBox::eAppearance>(9));  // refused
  EXPECT_EQ(box.getAppearance(), VariBox::Flat);
  std::vector<TabOrderable*> stops;
  box.getTabOrderables(stops);
  ASSERT_EQ(stops.size(), 1u);
  EXPECT_EQ(stops[0], static_cast<TabOrderable*>(box.getTextBox()));

  h.drag(Harness::centreOf(box), Harness::centreOf(box) + XY<int>(0, 30), 3,
         MouseButton::Right);  // no parser: ignored
  EXPECT_FALSE(box.isDragging());

  // A titled box passes the inner box's messages on to its own parent.
  IntegerDisplayer<int> shown;
  auto* titled =
      new TitledVariBox(L"Gain", L"", Colour(0.3, 0.5, 0.8), 60, 120, 1, probe->canvas());
  titled->setParser(new VariBoxParserBasic<int>(titled->getVariBox(), &shown, 0, 9, 1, 1, 3, 0),
                    true);
  EXPECT_EQ(titled->height(), 22);
  h.pump();
  probe->clear();
  h.wheel(Harness::centreOf(*titled->getVariBox()), 1);
  h.pump();
  EXPECT_EQ(probe->texts(), std::vector<String>{"varibox_ValueChanged"});
  EXPECT_EQ(probe->last()->sender, titled);
}

TEST(VariBox, LogarithmicBoxStepsAlongTheCurve) {
  Harness h(300, 100);
  auto* probe = new MessageProbe(h.place(0, 0, 300, 100));
  auto* box = new VariBox(L"", Colour(0.3, 0.5, 0.8), 200, probe->canvas());
  auto* p = new VariBoxParserLog<int>(box, 0, 1000, 0.01, 0.5, 0, 0, 5, 0, -1, -1);
  box->setParser(p, true);
  EXPECT_EQ(box->getTextBox()->getSizeLimit(), 5u);
  h.wheel(Harness::centreOf(*box), 1);
  EXPECT_EQ(p->getValue(), 240);
  EXPECT_EQ(box->getTextBox()->getText(), L"240");
  // 240 lies at position 0.4997 (the value was truncated): 99.9 pixels, drawn as 99.
  EXPECT_EQ(box->thermometerWidth(), 99);
}
