#include <gtest/gtest.h>

#include <memory>

#include "panels/ModalShade.h"
#include "panels/StandardPanel.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "tests/panels/PanelTestSupport.h"
#include "text/PanelTitleTextBox.h"

namespace {

// A child that sends messages to its panel, as a control would.
class Sender : public Glob {
 public:
  explicit Sender(Canvas* parent) : Glob(GlobCreationInfo(10, 10, parent)) {}
  int say(const char* msg) { return call_msg(parent(), msg); }
};

struct PanelBehaviour : ::testing::Test {
  PanelBehaviour() {
    panel = new RecordingPanel(GlobCreationInfo(200, 120, probe->canvas(), 10, 10));
    sender = new Sender(panel->canvas());
  }

  Harness h{640, 480};
  std::unique_ptr<MessageProbe> probe = std::make_unique<MessageProbe>(h.place(0, 0, 400, 300));
  RecordingPanel* panel = nullptr;  // owned by the probe
  Sender* sender = nullptr;
};

}  // namespace

TEST_F(PanelBehaviour, MessageTableCallsTheHandlers) {
  // "poot" is consumed when handlePoot returns false and passed on otherwise.
  EXPECT_EQ(sender->say("poot"), 1);
  panel->pootPassesOn = true;
  EXPECT_EQ(sender->say("poot"), 0);

  // Any message starting "minify" flips the size, and is consumed.
  panel->addStandardWidgets(StdSettingsButton);
  EXPECT_EQ(sender->say("minify"), 1);
  EXPECT_EQ(panel->getSizeState(), SizeMinimised);
  EXPECT_EQ(sender->say("minify now"), 1);
  EXPECT_EQ(panel->getSizeState(), SizeFull);

  // "screwdriver" goes to the base without reaching handleMessageEvent.
  EXPECT_EQ(sender->say("screwdriver"), 0);

  // Everything else reaches handleMessageEvent with its sender; its answer decides.
  EXPECT_EQ(sender->say("varibox_ValueChanged"), 0);
  panel->messageAnswer = 1;
  EXPECT_EQ(sender->say("slider"), 1);

  // Without a pin button or a title box, their messages are ordinary ones.
  EXPECT_EQ(sender->say("pin off"), 1);
  EXPECT_EQ(sender->say(StandardPanel::titleChangedMsg), 1);
  EXPECT_FALSE(panel->isDismissable());

  EXPECT_EQ(panel->calls,
            (std::vector<String>{"poot", "poot", "flip", "flip", "msg:varibox_ValueChanged",
                                 "msg:slider", "msg:pin off", "msg:StdPanelTitleChanged"}));
  EXPECT_EQ(panel->senders.front(), sender);
  // Nothing the panel handles or passes on leaks to its parent.
  EXPECT_TRUE(probe->messages().empty());
}

TEST_F(PanelBehaviour, HandlerMayDeleteThePanel) {
  GlobHandle<> watch(panel);
  panel->pootPassesOn = true;
  panel->onPoot = [this] { delete panel; };
  Sender outside(probe->canvas());
  EXPECT_EQ(outside.call_msg(panel, "poot"), 1);
  EXPECT_FALSE(watch.alive());
}

TEST_F(PanelBehaviour, InputGoesToTheTypedHandlers) {
  panel->set_interest(kInterestTicks);
  h.advance(25);
  EXPECT_GT(panel->ticks, 0);

  h.click(XY<int>(100, 100));
  EXPECT_EQ(panel->mouseTypes, (std::vector<int>{kEventMouseMove, kEventLeftDown, kEventLeftUp}));

  panel->set_kbd_focus();
  h.key('a');
  h.setModifiers(kKeyCtrl);
  h.key(StandardPanel::kTabKey);  // Ctrl+Tab is not a tab move
  EXPECT_EQ(panel->keys, (std::vector<int>{'a', static_cast<int>(kKeyCtrl | 9)}));
}

TEST_F(PanelBehaviour, TabAndShiftTabWalkTheChildrenAndWrap) {
  auto* a = new FocusChild(panel->canvas());
  auto* b = new FocusChild(panel->canvas());
  auto* c = new FocusChild(panel->canvas());
  panel->addWidget(a, XY<int>(0, 0));
  panel->addWidget(c, XY<int>(60, 0));
  panel->addWidget(b, XY<int>(30, 0), OriginBottomLeft, SurroundNone, a);  // between a and c
  auto* plain = new Child(panel->canvas(), 5, 5);
  panel->addWidget(plain, XY<int>(90, 0));  // not focusable: no stop
  ASSERT_EQ(panel->tabOrder().numTabStops(), 3u);

  panel->set_kbd_focus();
  auto current = [this] {
    return panel->tabOrder().getTabStopObject(panel->tabOrder().getCurrentTabStopIndex());
  };
  std::vector<TabOrderable*> walk;
  for (int i = 0; i < 4; ++i) {
    h.key(StandardPanel::kTabKey);
    walk.push_back(current());
  }
  EXPECT_EQ(walk, (std::vector<TabOrderable*>{a, b, c, a}));
  h.setModifiers(kKeyShift);
  h.key(StandardPanel::kTabKey);
  EXPECT_EQ(current(), c);
  h.key(StandardPanel::kTabKey);
  EXPECT_EQ(current(), b);
  EXPECT_EQ(a->receipts, 2);
  EXPECT_EQ(a->losses, 2);
  EXPECT_TRUE(panel->keys.empty());  // tab moves never reach the keyboard handler

  // A removed child leaves the tab order; losing the focused stop clears the focus, so the
  // next Tab starts again from the first stop.
  panel->removeWidget(b, true);
  EXPECT_EQ(panel->tabOrder().numTabStops(), 2u);
  h.setModifiers(0);
  h.key(StandardPanel::kTabKey);
  EXPECT_EQ(current(), a);
}

TEST_F(PanelBehaviour, TabWithNoStopsBubblesToTheParentPanel) {
  auto* inner = new StandardPanel(GlobCreationInfo(50, 50, panel->canvas()));
  auto* stop = new FocusChild(panel->canvas());
  panel->addWidget(inner, XY<int>(0, 0));
  panel->addWidget(stop, XY<int>(60, 0));
  inner->set_kbd_focus();
  h.key(StandardPanel::kTabKey);
  EXPECT_EQ(stop->receipts, 1);
}

TEST_F(PanelBehaviour, ModalNestingAndTheShade) {
  EXPECT_EQ(panel->setModal(false), 0);  // nothing to leave: no effect
  EXPECT_EQ(panel->modalShade(), nullptr);

  EXPECT_EQ(panel->setModal(true), 1);
  Glob* shade = panel->modalShade();
  ASSERT_NE(shade, nullptr);
  EXPECT_EQ(shade->parent(), &h.root());
  EXPECT_EQ(shade->canvas()->rect(), Kw::Box<int>(0, 0, 640, 480));
  EXPECT_LT(static_cast<ModalShade*>(shade)->colour().a, 1.0);  // the screen shows through
  EXPECT_TRUE(panel->isPinned());
  EXPECT_TRUE(refresh_is_on());

  GlobHandle<> shadeWatch(shade);
  EXPECT_EQ(panel->setModal(true), 2);
  EXPECT_EQ(panel->modalShade(), shade);  // one shade for all levels
  EXPECT_EQ(panel->setModal(false), 1);
  EXPECT_TRUE(shadeWatch.alive());
  EXPECT_EQ(panel->setModal(false), 0);
  EXPECT_FALSE(shadeWatch.alive());
  EXPECT_EQ(panel->setModal(false), 0);
}

TEST_F(PanelBehaviour, ModalShadeStopsClicksReachingWhatLiesBeneath) {
  PressCounter under(h.place(450, 200, 100, 100));

  h.click(XY<int>(500, 250));
  EXPECT_EQ(under.downs, 1);
  panel->setModal(true);
  h.click(XY<int>(500, 250));
  EXPECT_EQ(under.downs, 1);
  // The panel itself, raised above the shade, still gets its clicks.
  panel->mouseTypes.clear();
  h.click(XY<int>(100, 100));
  EXPECT_EQ(panel->mouseTypes.size(), 3u);  // move, press, release
  panel->setModal(false);
  h.click(XY<int>(500, 250));
  EXPECT_EQ(under.downs, 2);
}

TEST_F(PanelBehaviour, DestructionLeavesModalAndReportsChildrenAlreadyGone) {
  Child* a = new Child(panel->canvas(), 10, 10);
  Child* b = new Child(panel->canvas(), 10, 10);
  Child* c = new Child(panel->canvas(), 10, 10);
  for (Child* x : {a, b, c}) panel->addWidget(x, XY<int>(0, 0));
  GlobHandle<> wa(a), wc(c);
  delete b;
  panel->setModal(true);
  panel->setModal(true);
  GlobHandle<> shade(panel->modalShade());

  Diagnostics::Capture capture;
  delete panel;
  EXPECT_EQ(capture.lines(), (std::vector<String>{"glob double deletion(2)\n"}));
  EXPECT_EQ(capture.numbers(), (std::vector<int>{StandardPanel::kDoubleDeletionLevel}));
  EXPECT_EQ(StandardPanel::kDoubleDeletionLevel, 8);
  EXPECT_FALSE(wa.alive());
  EXPECT_FALSE(wc.alive());
  EXPECT_FALSE(shade.alive());
  EXPECT_TRUE(refresh_is_on());
}

TEST_F(PanelBehaviour, AChildDeletedBehindThePanelsBackLeavesEverythingSafe) {
  auto* a = new FocusChild(panel->canvas());
  auto* b = new FocusChild(panel->canvas());
  auto* c = new FocusChild(panel->canvas());
  panel->addWidget(a, XY<int>(0, 0));
  panel->addWidgetRelative(b, a, 4, PlaceRightOf);
  panel->addWidgetRelative(c, b, 4, PlaceRightOf);
  const Glob* gone = b;
  delete b;

  EXPECT_EQ(panel->numWidgets(), 3u);  // the entry stays, with no widget
  EXPECT_EQ(panel->getWidget(1u)->get(), nullptr);
  EXPECT_FALSE(panel->isChildWidget(gone));
  EXPECT_FALSE(panel->setWidgetPos(const_cast<Glob*>(gone), XY<int>(1, 1)));
  EXPECT_FALSE(panel->translateWidgetPos(const_cast<Glob*>(gone), 1, 1));
  const Kw::Box<int> cBefore = c->canvas()->rect();
  EXPECT_TRUE(panel->translateWidgetPos(a, 5, 5));
  EXPECT_EQ(c->canvas()->rect(), cBefore);  // its reference is gone: it stays put
  panel->reshape_canvas(10, 10, 260, 140);
  panel->setBorderStyle(UifBorderFramed);
  panel->set_kbd_focus();
  for (int i = 0; i < 3; ++i) h.key(StandardPanel::kTabKey);
  EXPECT_EQ(a->receipts + c->receipts, 3);
  h.paint();
  EXPECT_TRUE(h.drew(panel));

  // Removing the dead entry by its old address is allowed, and then nothing is reported.
  EXPECT_TRUE(panel->removeWidget(const_cast<Glob*>(gone), true));
  EXPECT_EQ(panel->numWidgets(), 2u);
  Diagnostics::Capture capture;
  delete panel;
  EXPECT_TRUE(capture.lines().empty());
}

TEST_F(PanelBehaviour, TheTitleBoxCarriesTheTitleBothWays) {
  panel->setTitle(L"Levels");
  panel->addStandardWidgets(StdEditableTitleBox);
  PanelTitleTextBox* box = panel->titleBox();
  ASSERT_NE(box, nullptr);
  EXPECT_EQ(box->getText(), L"Levels");
  EXPECT_EQ(box->canvas()->rect(), Kw::Box<int>(5, 97, 195, 117));
  EXPECT_EQ(panel->standardWidget(StdTitleBox), box);

  h.clickOn(*box);
  h.key(kKeyEnd);
  h.type(L" 2");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(panel->getTitleW(), L"Levels 2");
  EXPECT_EQ(panel->calls.back(), "title:Levels 2");
  const size_t calls = panel->calls.size();
  panel->setTitle(L"Scopes");  // shown, and not echoed back as an edit
  h.pump();
  EXPECT_EQ(box->getText(), L"Scopes");
  EXPECT_EQ(panel->calls.size(), calls);
}

// 0x20 alone asks for a read-only box, 0x40 (alone or with 0x20) for an editable one, neither
// for none, whatever the order in which the flags come and go.
TEST_F(PanelBehaviour, TitleFlagsInAnyOrderGiveTheBoxTheRemainingFlagAsksFor) {
  enum Want { None, ReadOnly, Editable };
  struct Step {
    bool add;
    int flags;
    Want want;
  };
  const std::vector<std::vector<Step>> sequences = {
      {{true, StdTitleBox, ReadOnly},
       {true, StdEditableTitleBox, Editable},
       {false, StdEditableTitleBox, ReadOnly},
       {false, StdTitleBox, None}},
      {{true, StdEditableTitleBox, Editable},
       {true, StdTitleBox, Editable},
       {false, StdEditableTitleBox, ReadOnly},
       {true, StdEditableTitleBox, Editable},
       {false, StdTitleBox, Editable},
       {false, StdEditableTitleBox, None}},
      {{true, StdTitleBox | StdEditableTitleBox, Editable},
       {false, StdTitleBox | StdEditableTitleBox, None}},
      {{true, StdEditableTitleBox, Editable}, {false, StdTitleBox, Editable}},
  };
  int n = 0;
  for (const auto& steps : sequences) {
    SCOPED_TRACE(n++);
    auto* p = new RecordingPanel(GlobCreationInfo(200, 120, probe->canvas(), 10, 10));
    p->setTitle(L"T");
    for (const Step& s : steps) {
      if (s.add) {
        p->addStandardWidgets(s.flags);
      } else {
        p->removeStandardWidgets(s.flags, true);
      }
      PanelTitleTextBox* box = p->titleBox();
      ASSERT_EQ(box != nullptr, s.want != None);
      if (!box) continue;
      // Typed into as a user would: only an editable box renames the panel.
      p->setTitle(L"T");
      h.advance(500);  // no click here is the second of a pair
      h.clickOn(*box);
      h.key(kKeyEnd);
      h.type(L"x");
      h.key(kKeyReturn);
      h.pump();
      EXPECT_EQ(p->getTitleW(), s.want == Editable ? L"Tx" : L"T");
      EXPECT_EQ(box->isEditable(), s.want == Editable);
    }
    delete p;
  }
}
