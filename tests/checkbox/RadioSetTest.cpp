#include <gtest/gtest.h>

#include <memory>

#include "buttons/BoolRadioSet.h"
#include "buttons/CheckboxRadioSet.h"
#include "buttons/RadioSet.h"
#include "buttons/RadioSetBase.h"
#include "foundation/ValServerAdaptor.h"
#include "platform/glob/KeyCodes.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

// A member that records how it was switched.
class FakeMember : public Glob {
 public:
  using Glob::Glob;
  int get_state() const { return state; }
  void switch_state(int s, bool silent) {
    state = s;
    log.push_back((s ? "down" : "up") + String(silent ? " silent" : " loud"));
    if (onSwitch) onSwitch();
  }
  int state = 0;
  std::vector<String> log;
  std::function<void()> onSwitch;
};

// A parent that, when called, records the message and the selection it can see at that moment.
template <typename Set>
class SelectionSpy : public Glob {
 public:
  using Glob::Glob;
  int react(Event* e) override {
    if (!message_event(e)) return Glob::react(e);
    texts.push_back(e->text());
    if (set) selections.push_back(set->getSelectedItem());
    return 1;
  }
  Set* set = nullptr;
  std::vector<String> texts;
  std::vector<int> selections;
};

struct RadioFixture : ::testing::Test {
  Harness h;
  GlobCreationInfo at(Glob& parent, int x, int y, int w, int ht) {
    return GlobCreationInfo(w, ht, parent.canvas(), x, y);
  }
};

std::vector<WString> threeLabels() {
  return {L"Cut", L"Copy", L"Paste"};
}

}  // namespace

// --- The engine ---

TEST_F(RadioFixture, SetCurrentSwitchesOldUpAndNewDownAndIgnoresNoOps) {
  MessageProbe owner(h.place(0, 0, 100, 100));
  RadioSetBase<FakeMember> set;
  auto* a = new FakeMember(at(owner, 0, 0, 10, 10));
  auto* b = new FakeMember(at(owner, 0, 20, 10, 10));
  EXPECT_EQ(set.add_button(a), 0);
  EXPECT_EQ(set.add_button(b), 1);
  EXPECT_EQ(set.add_button(nullptr), -1);
  EXPECT_EQ(set.getCurrentButton(), -1);

  set.set_current(0, true);
  set.set_current(0, false);  // already current
  set.set_current(2, false);  // == count
  set.set_current(-1, false);
  EXPECT_EQ(a->log, std::vector<String>{"down silent"});
  EXPECT_TRUE(b->log.empty());

  set.set_current(1, false);
  EXPECT_EQ(a->log.back(), "up loud");
  EXPECT_EQ(b->log, std::vector<String>{"down loud"});

  FakeMember stranger(at(owner, 50, 50, 10, 10));
  set.setCurrent(&stranger, true);
  set.setCurrent(a, true);
  EXPECT_EQ(set.getCurrentButton(), 0);
}

TEST_F(RadioFixture, TheThousandAndTwentyFifthMemberIsRefusedWithTheDiagnostic) {
  MessageProbe owner(h.place(0, 0, 100, 100));
  RadioSetBase<FakeMember> set;
  for (int i = 0; i < 1024; ++i)
    ASSERT_EQ(set.add_button(new FakeMember(at(owner, 0, 0, 1, 1))), i);
  Diagnostics::Capture diag;
  auto* extra = new FakeMember(at(owner, 0, 0, 1, 1));
  EXPECT_EQ(set.add_button(extra), -1);
  EXPECT_EQ(set.buttonCount(), 1024);
  ASSERT_EQ(diag.lines().size(), 1u);
  EXPECT_EQ(diag.lines()[0], "RadioSetBase:: attempt to exceed max no of radio buttons");
  EXPECT_EQ(set.indexOf(extra), -1);
}

TEST_F(RadioFixture, DeletedMembersAndADeletedSetAreNeverTouched) {
  MessageProbe owner(h.place(0, 0, 100, 100));
  auto set = std::make_unique<RadioSetBase<FakeMember>>();
  auto* a = new FakeMember(at(owner, 0, 0, 10, 10));
  auto* b = new FakeMember(at(owner, 0, 20, 10, 10));
  set->add_button(a);
  set->add_button(b);
  set->set_current(0, true);
  delete a;
  set->set_current(1, true);  // the old one is gone: only the new one switches
  EXPECT_EQ(set->getCurrentButton(), 1);
  set->set_current(0, true);  // selecting a deleted member moves the index, touches nothing
  EXPECT_EQ(set->getCurrentButton(), 0);
  EXPECT_EQ(set->indexOf(a), -1);

  // A member whose switch leads to the set's deletion: the set stops there.
  auto* c = new FakeMember(at(owner, 0, 40, 10, 10));
  set->add_button(c);
  set->set_current(1, true);
  b->onSwitch = [&set] { set.reset(); };
  set->set_current(2, true);  // b goes up first, and the set is gone
  EXPECT_EQ(set, nullptr);
  EXPECT_TRUE(c->log.empty());
}

// --- Radio set of buttons ---

TEST_F(RadioFixture, MouseSelectionCallsTheParentExactlyOnce) {
  SelectionSpy<RadioSet> spy(h.place(0, 0, 400, 100));
  auto* set = new RadioSet(threeLabels(), at(spy, 10, 10, 300, 24));
  spy.set = set;
  ASSERT_EQ(set->buttonCount(), 3);
  EXPECT_EQ(set->getSelectedItem(), 0);
  EXPECT_EQ(set->buttonAt(0)->get_state(), kButtonDown);

  h.clickOn(*set->buttonAt(2));
  EXPECT_EQ(spy.texts, std::vector<String>{"radio_set_message"});
  EXPECT_EQ(spy.selections, std::vector<int>{2});  // already selected during the call
  EXPECT_EQ(set->buttonAt(0)->get_state(), kButtonUp);
  EXPECT_EQ(set->buttonAt(2)->get_state(), kButtonDown);

  h.clickOn(*set->buttonAt(2));  // pressing the selected one changes nothing
  EXPECT_EQ(spy.texts.size(), 1u);
  EXPECT_EQ(set->buttonAt(2)->get_state(), kButtonDown);

  set->buttonAt(1)->set_kbd_focus();
  h.key(kKeySpace);
  EXPECT_EQ(spy.texts.size(), 2u);
  EXPECT_EQ(set->getSelectedItem(), 1);
}

TEST_F(RadioFixture, TheReportingFormOfSetCurrentLeavesOneMemberDownAndCallsOnce) {
  SelectionSpy<RadioSet> spy(h.place(0, 0, 400, 100));
  auto* set = new RadioSet(threeLabels(), at(spy, 10, 10, 300, 24));
  spy.set = set;
  set->set_current(2, false);
  EXPECT_EQ(set->buttonAt(0)->get_state(), kButtonUp);
  EXPECT_EQ(set->buttonAt(2)->get_state(), kButtonDown);
  EXPECT_EQ(spy.texts, std::vector<String>{"radio_set_message"});
  EXPECT_EQ(spy.selections, std::vector<int>{2});

  // A press of the selected member afterwards still only puts it back down.
  h.clickOn(*set->buttonAt(2));
  EXPECT_EQ(set->buttonAt(2)->get_state(), kButtonDown);
  EXPECT_EQ(spy.texts.size(), 1u);
}

TEST_F(RadioFixture, ProgramSelectionIsQuietAndRefusesBadIndices) {
  SelectionSpy<RadioSet> spy(h.place(0, 0, 400, 100));
  auto* set = new RadioSet(threeLabels(), at(spy, 10, 10, 300, 24));
  EXPECT_TRUE(set->setSelectedItem(1));
  EXPECT_TRUE(set->setSelectedItem(1));
  EXPECT_FALSE(set->setSelectedItem(3));
  EXPECT_FALSE(set->setSelectedItem(-1));
  EXPECT_EQ(set->getSelectedItem(), 1);
  EXPECT_EQ(set->buttonAt(1)->get_state(), kButtonDown);
  EXPECT_EQ(set->buttonAt(0)->get_state(), kButtonUp);
  EXPECT_TRUE(spy.texts.empty());

  RadioSet empty({}, at(spy, 10, 50, 100, 20));
  EXPECT_EQ(empty.getSelectedItem(), -1);
  EXPECT_FALSE(empty.setSelectedItem(0));
}

TEST_F(RadioFixture, SetActiveReachesEveryMemberAndInactiveMembersIgnoreClicks) {
  SelectionSpy<RadioSet> spy(h.place(0, 0, 400, 100));
  auto* set = new RadioSet(threeLabels(), at(spy, 10, 10, 300, 24));
  set->setActive(false, true);
  for (int i = 0; i < 3; ++i) EXPECT_FALSE(set->buttonAt(i)->isActive());
  h.clickOn(*set->buttonAt(1));
  EXPECT_TRUE(spy.texts.empty());
  EXPECT_EQ(set->getSelectedItem(), 0);
  set->setActive(true, true);
  h.clickOn(*set->buttonAt(1));
  EXPECT_EQ(spy.texts.size(), 1u);
}

TEST_F(RadioFixture, MembersFillARowWhenWideAndAColumnWhenTall) {
  MessageProbe owner(h.place(0, 0, 400, 300));
  RadioSet row(threeLabels(), at(owner, 0, 0, 304, 24));
  // 304 - 2 gaps of 2 = 300: three buttons 100 wide.
  EXPECT_EQ(row.buttonAt(0)->canvas()->rect(), Kw::Box<int>(0, 0, 100, 24));
  EXPECT_EQ(row.buttonAt(2)->canvas()->rect(), Kw::Box<int>(204, 0, 304, 24));

  RadioSet column(threeLabels(), at(owner, 0, 50, 80, 100));
  column.setBorderStyle(UifBorderRaised);  // 5 px: 90 high inside, 86 less gaps, 29+29+28
  EXPECT_EQ(column.buttonAt(0)->canvas()->rect(), Kw::Box<int>(5, 66, 75, 95));
  EXPECT_EQ(column.buttonAt(2)->canvas()->rect(), Kw::Box<int>(5, 5, 75, 33));
  EXPECT_EQ(column.getBorderStyle(), UifBorderRaised);
}

TEST_F(RadioFixture, RadioSetSurvivesMembersDeletedBehindItsBack) {
  SelectionSpy<RadioSet> spy(h.place(0, 0, 400, 100));
  auto* set = new RadioSet(threeLabels(), at(spy, 10, 10, 300, 24));
  delete set->buttonAt(0);  // the selected one
  delete set->buttonAt(2);
  h.clickOn(*set->buttonAt(1));
  EXPECT_EQ(spy.texts.size(), 1u);
  EXPECT_EQ(set->getSelectedItem(), 1);
  set->set_current(2, false);
  set->setActive(false, true);
  set->reshape();
  EXPECT_FALSE(set->setSelectedItem(0));
  h.render();
  delete set;
}

// --- Radio set of check boxes ---

struct CheckboxSetFixture : RadioFixture {
  SelectionSpy<CheckboxRadioSet> spy{h.place(0, 0, 400, 300)};
  CheckboxRadioSet* set = nullptr;

  void SetUp() override {
    set = new CheckboxRadioSet(at(spy, 10, 10, 80, 90));
    set->addWidgets({UIString("Red"), UIString("Green"), UIString("Blue")});
    spy.set = set;
  }
  bool clicksEnabled(int i) const { return set->member(i)->getClicksEnabled(); }
};

TEST_F(CheckboxSetFixture, ClickSelectsClearsThePreviousAndCallsTheParent) {
  ASSERT_EQ(set->memberCount(), 3);
  EXPECT_EQ(set->getSelectedItem(), 0);
  EXPECT_FALSE(clicksEnabled(0));
  // A column, top first.
  EXPECT_EQ(set->member(0)->canvas()->rect(), Kw::Box<int>(0, 70, 80, 90));
  EXPECT_EQ(set->member(1)->canvas()->rect(), Kw::Box<int>(0, 48, 80, 68));

  h.clickOn(*set->member(2));
  EXPECT_EQ(spy.texts, std::vector<String>{"CRSChanged"});
  EXPECT_EQ(spy.selections, std::vector<int>{2});
  EXPECT_FALSE(set->member(0)->getState());
  EXPECT_TRUE(clicksEnabled(0));
  EXPECT_FALSE(clicksEnabled(2));

  h.clickOn(*set->member(2));  // the selected box cannot be clicked off
  EXPECT_TRUE(set->member(2)->getState());
  set->member(2)->set_kbd_focus();
  h.key(kKeySpace);  // nor turned off from the keyboard
  EXPECT_TRUE(set->member(2)->getState());
  EXPECT_EQ(spy.texts.size(), 1u);
}

TEST_F(CheckboxSetFixture, MemberWithAnotherPrefixIsNotHandled) {
  set->member(1)->setMsgPrefix("Other ", true);
  h.clickOn(*set->member(1));
  EXPECT_TRUE(spy.texts.empty());
  EXPECT_TRUE(set->member(0)->getState());  // left ticked: the set never heard
  EXPECT_TRUE(set->member(1)->getState());

  // Its click can be routed through the set's callback instead.
  set->member(1)->setState(false);
  set->member(1)->setUserFunction(&CheckboxRadioSet::checkboxClickCallback, set);
  h.clickOn(*set->member(1));
  EXPECT_EQ(spy.texts, std::vector<String>{"CRSChanged"});
  EXPECT_EQ(set->getSelectedItem(), 1);
  EXPECT_FALSE(set->member(0)->getState());
}

TEST_F(CheckboxSetFixture, ProgramSelectionAndItsNoOps) {
  EXPECT_FALSE(set->setSelectedItem(0));  // already selected
  EXPECT_FALSE(clicksEnabled(0));
  EXPECT_FALSE(set->setSelectedItem(3));
  EXPECT_FALSE(set->setSelectedItem(-2));
  EXPECT_TRUE(set->setSelectedItem(1));
  EXPECT_TRUE(clicksEnabled(0));
  EXPECT_FALSE(clicksEnabled(1));
  EXPECT_EQ(set->getSelectedItem(), 1);
  EXPECT_TRUE(spy.texts.empty());

  set->setActive(false, true);
  for (int i = 0; i < 3; ++i) EXPECT_FALSE(set->member(i)->isActive());
  set->setBoldWhenTicked(true);
  set->setAppearance(Checkbox::FlatToggle);
  for (int i = 0; i < 3; ++i) {
    EXPECT_TRUE(set->member(i)->getBoldWhenTicked());
    EXPECT_EQ(set->member(i)->getAppearance(), Checkbox::FlatToggle);
  }
}

TEST_F(CheckboxSetFixture, SelectionIsBoundToAnIntModel) {
  ValServer<int> model(0);
  Kw::Ptr<ValServerAdaptor<int>> adaptor(new ValServerAdaptor<int>(&model));
  set->setDataAdaptor(adaptor);
  h.clickOn(*set->member(1));
  EXPECT_EQ(model.getValue(), 1);
  model.setValue(2);
  EXPECT_EQ(set->getSelectedItem(), 2);
  EXPECT_FALSE(set->member(1)->getState());
  EXPECT_EQ(spy.texts.size(), 1u);  // only the user's click was reported
}

TEST_F(CheckboxSetFixture, DeletedMemberIsSkipped) {
  Diagnostics::Capture diag;  // the panel reports the deletion when it goes
  delete set->member(0);
  h.clickOn(*set->member(1));
  EXPECT_EQ(set->getSelectedItem(), 1);
  EXPECT_FALSE(set->setSelectedItem(0));
  set->setActive(false, true);
  set->setBoldWhenTicked(true);
  h.render();
  delete set;
  EXPECT_TRUE(diag.contains("glob double deletion(2)"));
}

// --- Two boxes for one bool ---

TEST_F(RadioFixture, BoolSetKeepsOneBoxTickedAndWritesTheModel) {
  MessageProbe owner(h.place(0, 0, 300, 100));
  auto* yes = new Checkbox(at(owner, 0, 0, 80, 20), false);
  auto* no = new Checkbox(at(owner, 0, 30, 80, 20), false);
  ValServer<bool> model(true);
  Kw::Ptr<ValServerAdaptor<bool>> adaptor(new ValServerAdaptor<bool>(&model));
  auto pair = std::make_unique<BoolRadioSet>();
  pair->setWidgets(yes, no, false);
  EXPECT_TRUE(no->getState());
  EXPECT_FALSE(yes->getState());
  pair->setDataAdaptor(adaptor);
  bool fromModel = model.getValue();
  pair->setNewWidgetValue(fromModel);
  EXPECT_TRUE(yes->getState());

  h.clickOn(*no);
  EXPECT_FALSE(model.getValue());
  EXPECT_TRUE(no->getState());
  EXPECT_FALSE(yes->getState());
  EXPECT_EQ(owner.texts(), std::vector<String>{"Checkbox "});

  h.clickOn(*no);  // the ticked box stays ticked
  no->set_kbd_focus();
  h.key(kKeyReturn);
  EXPECT_TRUE(no->getState());
  EXPECT_EQ(owner.messages().size(), 1u);

  model.setValue(true);
  EXPECT_TRUE(pair->getWidgetState());
  EXPECT_TRUE(yes->getState());
  EXPECT_FALSE(no->getState());

  pair->setState(false);
  EXPECT_FALSE(model.getValue());

  pair.reset();  // the boxes go back to being ordinary check boxes
  EXPECT_EQ(yes->getUserFunction(), nullptr);
  h.clickOn(*yes);
  EXPECT_TRUE(yes->getState());
  EXPECT_TRUE(no->getState());
}
