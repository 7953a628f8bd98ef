#include <gtest/gtest.h>

#include "buttons/Checkbox.h"
#include "buttons/CheckboxRadioSetManager.h"
#include "buttons/RadioSetCheckbox.h"
#include "buttons/TriStateBox.h"
#include "foundation/ValServerAdaptor.h"
#include "platform/glib/FontCache.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

struct BoxFixture : ::testing::Test {
  Harness h;
  MessageProbe panel{h.place(0, 0, 400, 300)};

  template <typename Box = Checkbox>
  Box* makeBox(int x, int y, bool ticked = false) {
    return new Box(GlobCreationInfo(120, 20, panel.canvas(), x, y), ticked);
  }
};

// An adaptor over a plain bool that remembers why each change was asked for.
class RecordingAdaptor : public ValAdaptorBase<bool> {
 public:
  bool getDataValue() override { return value; }
  bool requestSetNewDataValue(const bool& v, DataChangeType why) override {
    reasons.push_back(why);
    value = v;
    setNewWidgetValue(v);
    return true;
  }
  bool value = false;
  std::vector<DataChangeType> reasons;
};

int calls = 0;
void countCall(Checkbox*, void* data) {
  ++calls;
  *static_cast<Checkbox**>(data) = nullptr;
}
void deleteTheBox(Checkbox* box, void*) {
  delete box;
}

// A parent that deletes whichever box reports to it.
class DeletingParent : public Glob {
 public:
  using Glob::Glob;
  int react(Event* e) override {
    if (message_event(e)) {
      delete event_to_sender_glob(e);
      return 1;
    }
    return Glob::react(e);
  }
};

}  // namespace

TEST_F(BoxFixture, ClickTogglesAndReportsThePrefixWithTheNewState) {
  Checkbox* box = makeBox(10, 10);
  h.clickOn(*box);
  EXPECT_TRUE(box->getState());
  h.clickOn(*box);
  EXPECT_FALSE(box->getState());
  EXPECT_EQ(panel.texts(), (std::vector<String>{"Checkbox TICKED", "Checkbox CLEAR"}));
  EXPECT_EQ(panel.last()->sender, box);

  box->setMsgPrefix("mute", false);
  h.clickOn(*box);
  h.clickOn(*box);
  EXPECT_EQ(panel.count("mute"), 2);
  EXPECT_EQ(box->getMsgPrefix(), "mute");
}

TEST_F(BoxFixture, ReleaseGenerationTogglesOnlyOnTheRelease) {
  Checkbox* box = makeBox(10, 10);
  box->setMessageGeneration(Checkbox::GenerateOnRelease);
  h.press(Harness::centreOf(*box));
  EXPECT_FALSE(box->getState());
  EXPECT_TRUE(panel.messages().empty());
  h.release(Harness::centreOf(*box));
  EXPECT_TRUE(box->getState());
  EXPECT_EQ(panel.texts(), std::vector<String>{"Checkbox TICKED"});
}

TEST_F(BoxFixture, InactiveOrClickDisabledBoxIgnoresClicksButTogglesFromTheKeyboard) {
  Checkbox* box = makeBox(10, 10);
  box->setActive(false, true);
  h.clickOn(*box);
  EXPECT_FALSE(box->getState());

  box->set_kbd_focus();
  h.key(kKeyReturn);
  EXPECT_TRUE(box->getState());
  h.key(kKeySpace);
  EXPECT_FALSE(box->getState());
  EXPECT_EQ(panel.texts(), (std::vector<String>{"Checkbox TICKED", "Checkbox CLEAR"}));

  box->setActive(true, true);
  box->setClicksEnabled(false);
  h.clickOn(*box);
  EXPECT_FALSE(box->getState());
  h.key('x');  // other keys are not toggles
  EXPECT_FALSE(box->getState());
}

TEST_F(BoxFixture, UserFunctionDecidesInsteadOfToggling) {
  Checkbox* box = makeBox(10, 10);
  Checkbox* seen = box;
  calls = 0;
  box->setUserFunction(&countCall, &seen);
  h.clickOn(*box);
  box->set_kbd_focus();
  h.key(kKeySpace);
  EXPECT_EQ(calls, 2);
  EXPECT_EQ(seen, nullptr);  // the function got its data
  EXPECT_FALSE(box->getState());
  EXPECT_TRUE(panel.messages().empty());
}

TEST_F(BoxFixture, BoxDeletedByItsUserFunctionOrByItsParentLeavesNothingBehind) {
  Checkbox* box = makeBox(10, 10);
  GlobHandle<Checkbox> handle(box);
  box->setUserFunction(&deleteTheBox, nullptr);
  h.clickOn(*box);
  EXPECT_FALSE(handle.alive());
  h.click(XY<int>(20, 20));  // where it was

  DeletingParent parent(h.place(0, 0, 300, 100));
  auto* other = new Checkbox(GlobCreationInfo(100, 20, parent.canvas(), 5, 5), false);
  GlobHandle<Checkbox> otherHandle(other);
  h.clickOn(*other);
  EXPECT_FALSE(otherHandle.alive());
  EXPECT_EQ(parent.child_count(), 0);
}

TEST_F(BoxFixture, BoxWithoutParentTogglesAndSendsNothing) {
  Checkbox loose(GlobCreationInfo(100, 20, nullptr), false);
  loose.requestToggleState();
  EXPECT_TRUE(loose.getState());
  EXPECT_FALSE(loose.sendToggleMessage(true));
  // Its background is window shade 3; one on a panel takes the panel's colour.
  EXPECT_EQ(loose.getcol(), loose.getPalette().windowShade(3));
  panel.setCol(Colour(0.2, 0.4, 0.6), false);
  EXPECT_EQ(makeBox(10, 10)->getcol(), Colour(0.2, 0.4, 0.6));
  EXPECT_EQ(loose.contextCursor(XY<int>(1, 1)), kCursorHand);
}

TEST_F(BoxFixture, BoundBoxesFollowOneModelValueAndAskWithTheToggleChangeType) {
  ValServer<bool> model(false);
  Kw::Ptr<ValServerAdaptor<bool>> adaptor(new ValServerAdaptor<bool>(&model));
  Checkbox* a = makeBox(10, 10);
  Checkbox* b = makeBox(10, 40);
  a->setDataAdaptor(adaptor);
  b->setDataAdaptor(adaptor);

  h.clickOn(*a);
  EXPECT_TRUE(model.getValue());
  EXPECT_TRUE(b->getState());
  EXPECT_EQ(panel.texts(), std::vector<String>{"Checkbox TICKED"});

  model.setValue(false);  // the model's pushes report nothing
  EXPECT_FALSE(a->getState());
  EXPECT_FALSE(b->getState());
  EXPECT_EQ(panel.messages().size(), 1u);

  Kw::Ptr<RecordingAdaptor> recorder(new RecordingAdaptor);
  Checkbox* c = makeBox(10, 70);
  c->setDataAdaptor(recorder);
  c->setState(true);
  ASSERT_EQ(recorder->reasons.size(), 1u);
  EXPECT_EQ(recorder->reasons[0], DataChangeType(4));
  recorder->value = false;
  c->setState(true);   // unchanged state: nothing asked
  c->setState(false);  // the model already holds it: nothing asked
  EXPECT_EQ(recorder->reasons.size(), 1u);
  c->setState(true, false);  // quiet: stored only
  EXPECT_TRUE(c->getState());
  EXPECT_EQ(recorder->reasons.size(), 1u);
}

TEST_F(BoxFixture, AToggleTheModelRefusesShowsTheModelsValueAndReportsNothing) {
  // A model that holds on to false whatever it is asked.
  class Stubborn : public ValAdaptorBase<bool> {
   public:
    bool getDataValue() override { return false; }
    bool requestSetNewDataValue(const bool&, DataChangeType) override { return false; }
  };
  Checkbox* box = makeBox(10, 10);
  box->setDataAdaptor(Kw::Ptr<ValAdaptorBase<bool>>(new Stubborn));
  h.clickOn(*box);
  box->set_kbd_focus();
  h.key(kKeySpace);
  EXPECT_FALSE(box->getState());
  EXPECT_TRUE(panel.messages().empty());

  // Null events and events after the model has gone change nothing and crash nothing.
  EXPECT_EQ(box->react(nullptr), 0);
  box->setDataAdaptor(Kw::Ptr<ValAdaptorBase<bool>>());
  h.clickOn(*box);
  EXPECT_TRUE(box->getState());
  EXPECT_EQ(panel.texts(), std::vector<String>{"Checkbox TICKED"});
}

TEST_F(BoxFixture, TextColourFollowsTickAndEnablement) {
  Checkbox* box = makeBox(10, 10);
  const Colour red(1, 0, 0);
  box->setTextColourWhenTicked(red);
  EXPECT_EQ(box->getTextColour(), box->getPalette().get(Palette::WindowText));
  box->setState(true);
  EXPECT_EQ(box->getTextColour(), red);
  box->setActive(false, false);
  EXPECT_EQ(box->getTextColour(), box->getPalette().get(Palette::Disabled));

  auto* member = makeBox<RadioSetCheckbox>(10, 40, true);
  member->setTextColourWhenTicked(red);
  EXPECT_FALSE(member->isActive());
  EXPECT_EQ(member->getTextColour(), red);
}

TEST_F(BoxFixture, FactoryAndWidthCalculation) {
  Checkbox* box =
      Checkbox::make(150, 20, L"Loop", true, Colour(0.1, 0.1, 0.1), panel.canvas(), 1, 1);
  EXPECT_EQ(box->getLabel(), L"Loop");
  EXPECT_TRUE(box->getState());
  EXPECT_EQ(box->getcol(), Colour(0.1, 0.1, 0.1));
  EXPECT_TRUE(box->getFont().bold());
  EXPECT_EQ(box->getAppearance(), Checkbox::FlatToggle);

  const unsigned short plain =
      Checkbox::calcWidth(L"Loop playback", UifBorderNone, Checkbox::BoxLeft, false);
  EXPECT_GT(plain, Checkbox::calcWidth(L"Loop", UifBorderNone, Checkbox::BoxLeft, false));
  EXPECT_GT(Checkbox::calcWidth(L"Loop playback", UifBorderNone, Checkbox::BoxLeft, true), plain);
  EXPECT_EQ(Checkbox::calcWidth(L"Loop playback", UifBorderFramed, Checkbox::BoxLeft, false),
            plain + 20);
  EXPECT_EQ(Checkbox::calcWidth(L"", UifBorderNone, Checkbox::FlatToggle, false),
            2 * Checkbox::kDefaultMargin + Checkbox::kToggleWidth);

  // A box of the calculated width fits its label: the label box is at least the text's width.
  Checkbox* fitted = new Checkbox(GlobCreationInfo(plain, 20, panel.canvas(), 10, 100), false);
  fitted->setLabel(L"Loop playback");
  const Kw::Box<int> label = fitted->labelBox();
  EXPECT_GE(label.width(), Glib::fonts().standard()->textWidth(L"Loop playback"));
  EXPECT_LE(label.x1, plain);
}

TEST_F(BoxFixture, TabMovesFocusBetweenBoxesAndLosingItReturnsFocusToTheParent) {
  StandardPanel host(GlobCreationInfo(300, 100, h.canvas(), 0, 200));
  auto* first = new Checkbox(GlobCreationInfo(100, 20, host.canvas()), false);
  auto* second = new Checkbox(GlobCreationInfo(100, 20, host.canvas()), false);
  host.addWidget(first, 5, 5);
  host.addWidget(second, 5, 40);
  ASSERT_TRUE(host.incrementTab());
  EXPECT_EQ(h.root().focus(), first);
  h.key(kKeyTab);
  EXPECT_EQ(h.root().focus(), second);
  h.key(kKeySpace);
  EXPECT_TRUE(second->getState());
  second->handleTabStopFocusLoss();
  EXPECT_EQ(h.root().focus(), &host);

  second->setActive(false, false);
  EXPECT_FALSE(second->isTabStopActive());
}

TEST_F(BoxFixture, ManagedRowKeepsOneTickedAndReportsTheBarePrefixOnce) {
  CheckboxRadioSetManager row;
  EXPECT_EQ(row.getSelected(), 0);
  RadioSetCheckbox* boxes[3];
  for (int i = 0; i < 3; ++i) {
    boxes[i] = makeBox<RadioSetCheckbox>(10, 10 + 30 * i);
    boxes[i]->setMsgPrefix("row" + std::to_string(i) + " ", true);
    row.add(boxes[i]);
  }
  EXPECT_EQ(row.getSelected(), 0);  // all clear

  h.clickOn(*boxes[2]);
  EXPECT_EQ(row.getSelected(), 2);
  EXPECT_EQ(panel.texts(), std::vector<String>{"row2 "});
  EXPECT_FALSE(boxes[2]->isActive());

  h.clickOn(*boxes[2]);  // the ticked member is inactive
  EXPECT_EQ(panel.messages().size(), 1u);

  h.clickOn(*boxes[1]);
  EXPECT_TRUE(boxes[1]->getState());
  EXPECT_FALSE(boxes[0]->getState());
  EXPECT_FALSE(boxes[2]->getState());
  EXPECT_TRUE(boxes[2]->isActive());
  EXPECT_EQ(panel.texts(), (std::vector<String>{"row2 ", "row1 "}));

  // A deleted member is skipped; the rest still work.
  delete boxes[0];
  h.clickOn(*boxes[2]);
  EXPECT_EQ(row.getSelected(), 2);
}

TEST_F(BoxFixture, ManagerGoneBeforeItsMembersLeavesThemOrdinaryBoxes) {
  RadioSetCheckbox* box = makeBox<RadioSetCheckbox>(10, 10);
  {
    CheckboxRadioSetManager row;
    row.add(box);
  }
  EXPECT_EQ(box->getUserFunction(), nullptr);
  h.clickOn(*box);
  EXPECT_EQ(panel.texts(), std::vector<String>{"Checkbox TICKED"});
}

TEST_F(BoxFixture, TriStateIsDisplayOnly) {
  auto* box = makeBox<TriStateBox>(10, 10);
  box->setTriState(true, true);
  EXPECT_TRUE(box->getTriState());
  EXPECT_FALSE(box->getState());
  h.clickOn(*box);
  EXPECT_TRUE(box->getState());
  EXPECT_TRUE(box->getTriState());  // the owner clears it
}

TEST_F(BoxFixture, InitArgsAndCopiesCarryTheSettingsButNotTheUserFunction) {
  CheckboxInitArgs args(L"Solo", true, GlobCreationInfo(120, 20, panel.canvas(), 10, 10));
  args.settings.msgPrefix = "solo ";
  args.settings.msgGeneration = Checkbox::GenerateOnRelease;
  args.settings.appearance = Checkbox::BoxRight;
  args.settings.borderStyle = UifBorderRaised;
  args.settings.font.style = Glib::FontDesc::Bold;
  auto* box = new Checkbox(args);
  EXPECT_TRUE(box->getState());
  EXPECT_EQ(box->getLabel(), L"Solo");
  EXPECT_EQ(box->getMessageGeneration(), Checkbox::GenerateOnRelease);
  EXPECT_EQ(box->getAppearance(), Checkbox::BoxRight);
  EXPECT_EQ(box->getBorderStyle(), UifBorderRaised);
  EXPECT_TRUE(box->getFont().bold());
  // The raised border insets the tick box from the right edge.
  EXPECT_EQ(box->indicatorBox().x1, 120 - 5 - Checkbox::kDefaultMargin);

  box->setUserFunction(&deleteTheBox, nullptr);
  auto* copy = new Checkbox(*box);
  EXPECT_EQ(copy->canvas()->rect(), box->canvas()->rect());
  EXPECT_EQ(copy->parent(), &panel);
  EXPECT_EQ(copy->getMsgPrefix(), "solo ");
  EXPECT_EQ(copy->getUserFunction(), nullptr);
  copy->requestToggleState();
  EXPECT_EQ(panel.texts(), std::vector<String>{"solo CLEAR"});

  // The copy's settings are its own once changed; the original keeps its own.
  copy->setMsgPrefix("copy ");
  copy->setLabel(L"Copy");
  EXPECT_EQ(box->getMsgPrefix(), "solo ");
  EXPECT_EQ(box->getLabel(), L"Solo");
  // Out-of-range numbers in the record fall back to the defaults.
  CheckboxInitArgs odd(L"Odd", false, GlobCreationInfo(120, 20, panel.canvas(), 10, 40));
  odd.settings.appearance = static_cast<Checkbox::Appearance>(7);
  odd.settings.msgGeneration = static_cast<Checkbox::eMsgGeneration>(-3);
  auto* oddBox = new Checkbox(odd);
  EXPECT_EQ(oddBox->getAppearance(), Checkbox::BoxLeft);
  EXPECT_EQ(oddBox->getMessageGeneration(), Checkbox::GenerateOnPress);
}
