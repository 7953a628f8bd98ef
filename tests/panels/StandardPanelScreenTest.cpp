// A panel and its screen: panels made without a canvas, and what modal display holds back
// from the rest of the screen.
#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "panels/StandardPanel.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "tests/panels/PanelTestSupport.h"
#include "text/TextBox.h"

namespace {

using Box = Kw::Box<int>;

// A tab stop that takes the keyboard focus when the tab order reaches it, as controls do.
class KeyedChild : public FocusChild {
 public:
  using FocusChild::FocusChild;
  void handleTabStopFocusReceipt() override {
    FocusChild::handleTabStopFocusReceipt();
    set_kbd_focus();
  }
};

// The screen's content: records the keys that bubble up to it.
class Desk : public MessageProbe {
 public:
  using MessageProbe::MessageProbe;
  int react(Event* e) override {
    if (key_press_event(e)) {
      keys.push_back(e->keyCode());
      return 1;
    }
    return MessageProbe::react(e);
  }
  std::vector<unsigned> keys;
};

// A panel behind (a text box, a button and their tab order) and a dialogue in front with two
// tab stops of its own.
struct ModalInput : ::testing::Test {
  ModalInput() {
    behind = new RecordingPanel(GlobCreationInfo(300, 200, desk.canvas(), 320, 10));
    TextBox::InitArgs args;
    args.info = GlobCreationInfo(200, 24, behind->canvas());
    field = new TextBox(args);
    field->requestCallback("field enter", behind, TextBoxBase::EnterPressed);
    ok = new Button(L"OK", "ok pressed", 60, 22, 0, behind->canvas());
    behind->addWidget(field, 10, 10);
    behind->addWidget(ok, 10, 50);

    dialog = new StandardPanel(GlobCreationInfo(200, 150, desk.canvas(), 10, 10));
    first = new KeyedChild(dialog->canvas());
    second = new KeyedChild(dialog->canvas());
    dialog->addWidget(first, 10, 10);
    dialog->addWidget(second, 40, 10);
  }

  void typeIntoField(const WString& text) {
    h.clickOn(*field);
    h.key(kKeyEnd);
    h.type(text);
  }

  Harness h{640, 480};
  Desk desk{h.place(0, 0, 640, 480)};
  RecordingPanel* behind = nullptr;  // the desk owns both panels
  TextBox* field = nullptr;
  Button* ok = nullptr;
  StandardPanel* dialog = nullptr;
  KeyedChild* first = nullptr;
  KeyedChild* second = nullptr;
};

}  // namespace

TEST_F(ModalInput, KeysReturnAndTabNeverReachWhatLiesBehindTheShade) {
  typeIntoField(L"ab");
  ASSERT_EQ(field->getText(), L"ab");
  ASSERT_EQ(h.root().focus(), field);
  dialog->setModal(true);

  // The field keeps the focus but hears nothing; the keys come to the modal panel instead.
  h.type(L"x");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(field->getText(), L"ab");
  EXPECT_TRUE(behind->calls.empty());
  EXPECT_TRUE(behind->keys.empty());

  // Tab walks the modal panel's own stops, never the panel behind.
  const unsigned behindStop = behind->tabOrder().getCurrentTabStopIndex();
  h.key(kKeyTab);
  EXPECT_EQ(h.root().focus(), first);
  h.key(kKeyTab);
  EXPECT_EQ(h.root().focus(), second);
  h.key(kKeyTab);
  EXPECT_EQ(h.root().focus(), first);
  h.setModifiers(kKeyShift);
  h.key(kKeyTab);
  EXPECT_EQ(h.root().focus(), second);
  h.setModifiers(0);
  EXPECT_EQ(behind->tabOrder().getCurrentTabStopIndex(), behindStop);

  // A button behind given the focus in code is not pressed by Return either.
  ok->set_kbd_focus();
  h.key(kKeyReturn);
  h.key(kKeySpace);
  h.pump();
  EXPECT_TRUE(behind->calls.empty());

  // Keys the modal panel does not use stop there, rather than bubble to the screen.
  first->set_kbd_focus();
  h.key('q');
  EXPECT_TRUE(desk.keys.empty());

  // After modal display everything behind works again.
  dialog->setModal(false);
  typeIntoField(L"c");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(field->getText(), L"abc");
  EXPECT_EQ(behind->calls, (std::vector<String>{"msg:field enter"}));
}

TEST_F(ModalInput, NestedLevelsHoldInputUntilTheLastOneGoes) {
  typeIntoField(L"ab");
  dialog->setModal(true);
  dialog->setModal(true);
  dialog->setModal(false);
  h.type(L"x");
  EXPECT_EQ(field->getText(), L"ab");
  dialog->setModal(false);
  h.type(L"y");
  EXPECT_EQ(field->getText(), L"aby");

  // Deleting a modal panel lets the rest of the screen have its input back.
  dialog->setModal(true);
  delete dialog;
  h.type(L"z");
  EXPECT_EQ(field->getText(), L"abyz");
}

TEST_F(ModalInput, TheShadeFollowsTheScreenThroughAResize) {
  dialog->setModal(true);
  h.root().reshape_canvas(0, 0, 900, 700);
  Glob* shade = dialog->modalShade();
  ASSERT_NE(shade, nullptr);
  EXPECT_EQ(shade->canvas()->rect(), Box(0, 0, 900, 700));
  // A Glob beneath the shade, in the part of the screen the resize added.
  auto* late = new PressCounter(h.place(800, 600, 50, 50));
  late->push_to_bottom();
  h.click(XY<int>(820, 620));
  EXPECT_EQ(late->downs, 0);
  delete late;

  h.root().reshape_canvas(0, 0, 300, 200);
  EXPECT_EQ(shade->canvas()->rect(), Box(0, 0, 300, 200));
}

TEST(PanelScreen, APanelMadeWithoutACanvasWaitsOffScreenUntilItIsPlaced) {
  Harness h(400, 300);
  StandardPanel loose(120, 80);
  EXPECT_EQ(loose.root(), nullptr);
  EXPECT_EQ(loose.parent(), nullptr);
  EXPECT_EQ(loose.setModal(true), 1);  // counted, but nothing to shade
  EXPECT_EQ(loose.modalShade(), nullptr);
  loose.setModal(false);

  ASSERT_TRUE(h.root().adopt(&loose, XY<int>(30, 40)));
  EXPECT_EQ(loose.root(), &h.root());
  EXPECT_EQ(loose.canvas()->rect(), Box(30, 40, 150, 120));
  EXPECT_FALSE(h.root().adopt(&loose, XY<int>(0, 0)));  // it has a parent now
  EXPECT_EQ(h.root().globAt(XY<int>(50, 50)), &loose);

  // Added to a panel on the screen, a loose panel lands there.
  StandardPanel host(h.place(0, 0, 300, 200));
  auto* inner = new StandardPanel(XY<int>(50, 30));
  ASSERT_TRUE(host.addWidget(inner, 10, 10));
  EXPECT_EQ(inner->root(), &h.root());
  EXPECT_EQ(inner->parent(), &host);
}
