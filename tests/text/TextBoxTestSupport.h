#pragma once
// A screen with an owner Glob holding text boxes, for the text box tests.
#include <gtest/gtest.h>

#include <memory>

#include "platform/misc/InProcessClipboard.h"
#include "platform/misc/WindowsClipboard.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "text/TextBox.h"

// Records the messages, the key presses and the mouse presses that reach it (those the boxes
// did not consume).
class BoxOwner : public MessageProbe {
 public:
  using MessageProbe::MessageProbe;
  int react(Event* e) override {
    if (key_press_event(e)) {
      keysReceived.push_back(e->keyCode());
      return 1;
    }
    if (mouse_event(e) && mouse_down_event(e)) {
      ++pressesReceived;
      return 1;
    }
    return MessageProbe::react(e);
  }
  std::vector<unsigned> keysReceived;
  int pressesReceived = 0;
};

class TextBoxFixture : public ::testing::Test {
 protected:
  static constexpr unsigned kCtrlZ = TextBoxBase::kKeyUndo;
  static constexpr unsigned kCtrlY = TextBoxBase::kKeyRedo;
  static constexpr unsigned kCtrlC = TextBoxBase::kKeyCopy;
  static constexpr unsigned kCtrlX = TextBoxBase::kKeyCut;
  static constexpr unsigned kCtrlV = TextBoxBase::kKeyPaste;
  static constexpr unsigned kCtrlA = TextBoxBase::kKeySelectAll;
  static constexpr unsigned kEnter = kKeyReturn;
  static constexpr unsigned kEscape = kKeyEscape;
  static constexpr unsigned kTab = kKeyTab;
  static constexpr unsigned kBackspace = kKeyBackspace;
  static constexpr unsigned kHome = kKeyHome;
  static constexpr unsigned kLeft = kKeyLeft;
  static constexpr unsigned kRight = kKeyRight;
  static constexpr unsigned kEnd = kKeyEnd;

  void SetUp() override { WindowsClipboard::setProvider(&clipboard); }
  void TearDown() override { WindowsClipboard::setProvider(nullptr); }

  // A box of `width` x 24 on the owner at (10, 10), with every callback event registered under
  // the message "event N".
  TextBox* makeBox(TextBox::InitArgs args = {}, int width = 200) {
    args.info = GlobCreationInfo(static_cast<unsigned short>(width), 24, owner->canvas(), 10, 10);
    auto* box = new TextBox(args);
    for (int event = 0; event <= 4; ++event) {
      box->requestCallback("event " + std::to_string(event), nullptr,
                           static_cast<TextBoxBase::CallbackEvent>(event));
    }
    return box;
  }
  TextBox* focusedBox(const WString& text, TextBox::InitArgs args = {}, int width = 200) {
    args.text = text;
    TextBox* box = makeBox(args, width);
    box->set_kbd_focus();
    h.pump();
    owner->clear();
    return box;
  }
  // The root x of the caret position before character `index`.
  static int rootXOf(const TextBox& box, int index) {
    return static_cast<int>(box.get_x()) + box.textX() + static_cast<int>(box.ruler().xOf(index)) -
           box.scrollOffset();
  }
  // The root point in the middle of character `index`, half way up the box.
  static XY<int> pointOnCharacter(const TextBox& box, int index) {
    return XY<int>((rootXOf(box, index) + rootXOf(box, index + 1)) / 2,
                   static_cast<int>(box.get_y() + box.height() / 2));
  }
  // The messages the owner received since the last clear, after the queue has run.
  std::vector<String> events() {
    h.pump();
    return owner->texts();
  }

  Harness h{600, 200};
  BoxOwner* owner = new BoxOwner(h.place(0, 0, 600, 200));
  InProcessClipboard clipboard;
};
