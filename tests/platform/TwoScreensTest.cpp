// Two screens alive in one process: every control asks its own screen whether it holds the
// keyboard focus, so the older screen works exactly like the newer one.
#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "text/TextBox.h"

namespace {

struct Screen {
  Harness h{300, 100};
  MessageProbe* owner = new MessageProbe(h.place(0, 0, 300, 100));

  TextBox* box() {
    TextBox::InitArgs args;
    args.text = L"hello";
    args.info = GlobCreationInfo(200, 24, owner->canvas(), 10, 10);
    auto* b = new TextBox(args);
    b->requestCallback("focus gained", nullptr, TextBoxBase::FocusGained);
    return b;
  }
};

}  // namespace

TEST(TwoScreens, TextBoxOnEitherScreenShowsItsCaretSelectsAndReportsTheFocus) {
  Screen first;
  Screen second;  // the newer screen
  TextBox* a = first.box();
  TextBox* b = second.box();

  for (auto [screen, box] : {std::pair{&first, a}, std::pair{&second, b}}) {
    box->set_kbd_focus();
    screen->h.pump();
    EXPECT_TRUE(box->hasKeyboardFocus());
    EXPECT_EQ(screen->h.root().focus(), box);
    ASSERT_NE(box->caret(), nullptr);
    EXPECT_EQ(box->getSelectedText(), L"hello");
    EXPECT_EQ(screen->owner->count("focus gained"), 1);
    screen->h.key(kKeyEnd);
    screen->h.type(L"!");
    EXPECT_EQ(box->getText(), L"hello!");
  }
  // Each screen keeps its own focus.
  EXPECT_EQ(first.h.root().focus(), a);
  EXPECT_EQ(second.h.root().focus(), b);
  EXPECT_EQ(get_kbd_focus(a), a);
  EXPECT_EQ(get_kbd_focus(b), b);
}

TEST(TwoScreens, ButtonsAndBoxesTakeAndHandBackTheFocusOfTheirOwnScreen) {
  Screen first;
  Screen second;
  auto* button = new Button(L"Go", "go", GlobCreationInfo(60, 24, first.owner->canvas(), 10, 40));
  auto* tick = new Checkbox(GlobCreationInfo(80, 20, first.owner->canvas(), 100, 40), false);
  second.owner->set_kbd_focus();

  button->handleTabStopFocusReceipt();
  EXPECT_TRUE(button->hasKbdFocus());
  first.h.key(kKeyReturn);
  EXPECT_EQ(first.owner->count("go"), 1);
  button->handleTabStopFocusLoss();
  EXPECT_EQ(first.h.root().focus(), first.owner);

  tick->handleTabStopFocusReceipt();
  first.h.key(kKeySpace);
  EXPECT_TRUE(tick->getState());
  tick->handleTabStopFocusLoss();
  EXPECT_EQ(first.h.root().focus(), first.owner);
  EXPECT_EQ(second.h.root().focus(), second.owner);
}
