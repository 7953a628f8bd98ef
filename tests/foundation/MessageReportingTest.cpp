#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "foundation/ButtonWidget.h"
#include "foundation/MessageReporter.h"
#include "foundation/MessageSuffixes.h"
#include "platform/glob/GlobHandle.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

// A press-and-release button that reports the way every control does.
class StandInButton : public Glob, public ButtonWidget<WString> {
 public:
  using Glob::Glob;

  WString getWidgetValue() override { return caption; }
  void setNewWidgetValue(WString& v) override { caption = v; }

  int react(Event* e) override {
    if (message_event(e)) {
      if (messageReceived(e->msg()) == kEventConsumed) return 1;
      ++messagesFallingThrough;
      return Glob::react(e);
    }
    if (mouse_left_event(e) && mouse_down_event(e)) {
      reporter.captureModifiers();
      widgetLeftClicked();
      reporter.report(*this, reporter.message() + pressureBtnDownSuffix_);
      return 1;
    }
    return Glob::react(e);
  }

  MessageReporter reporter;
  WString caption;
  int messagesFallingThrough = 0;
};

class CountingAdaptor : public ButtonAdaptor<WString> {
 public:
  void widgetLeftClicked() override { ++clicks; }
  EventHandlerRc messageReceived(String msg) override {
    seen.push_back(msg);
    return answer;
  }
  int clicks = 0;
  EventHandlerRc answer = kEventConsumed;
  std::vector<String> seen;
};

}  // namespace

TEST(Reporting, PressReachesTheParentWithModifierBits) {
  Harness h;
  MessageProbe panel(h.place(0, 0, 200, 200));
  StandInButton button(GlobCreationInfo(40, 20, panel.canvas(), 10, 10));
  button.reporter.set_message("go");

  struct Mods {
    unsigned held;
    uint32_t word;
  };
  for (Mods m : {Mods{0, 0}, Mods{kKeyShift, 1u << 24}, Mods{kKeyCtrl, 1u << 25},
                 Mods{kKeyShift | kKeyCtrl | kKeyAlt, 3u << 24}, Mods{kKeyAlt, 0}}) {
    h.setModifiers(m.held);
    h.clickOn(button);
    ASSERT_NE(panel.last(), nullptr);
    EXPECT_EQ(panel.last()->text, "go pressed");
    EXPECT_EQ(panel.last()->modifiers, m.word) << std::hex << m.held;
    EXPECT_EQ(panel.last()->sender, &button);
  }
  EXPECT_EQ(panel.messages().size(), 5u);
}

TEST(Reporting, EmptyMessageMeansTheControlsOwn) {
  Harness h;
  MessageProbe panel(h.place(0, 0, 100, 100));
  StandInButton button(GlobCreationInfo(20, 20, panel.canvas(), 10, 10));
  // Never set: the report is an empty message, still delivered.
  EXPECT_TRUE(button.reporter.report(button, ""));
  EXPECT_EQ(panel.last()->text, "");
  button.reporter.set_message("mine");
  EXPECT_TRUE(button.reporter.report(button, ""));
  EXPECT_EQ(panel.last()->text, "mine");
  EXPECT_TRUE(button.reporter.report(button, "explicit"));
  EXPECT_EQ(panel.texts(), (std::vector<String>{"", "mine", "explicit"}));
}

TEST(Reporting, NoScreenNoTarget) {
  // A second screen being alive changes nothing: an unattached control has no screen to ask.
  Harness h;
  MessageProbe everywhere(h.place(0, 0, 800, 600));
  StandInButton alone(GlobCreationInfo(20, 20, nullptr, 0, 0));
  EXPECT_EQ(MessageReporter::target(alone), nullptr);
  EXPECT_FALSE(alone.reporter.report(alone, "x"));
  EXPECT_TRUE(everywhere.messages().empty());
}

TEST(Reporting, ReceiverMayDeleteTheSender) {
  Harness h;
  struct Deleter : MessageProbe {
    using MessageProbe::MessageProbe;
    int react(Event* e) override {
      const int r = MessageProbe::react(e);
      if (Glob* s = event_to_sender_glob(e)) delete s;
      return r;
    }
  };
  Deleter panel(h.place(0, 0, 100, 100));
  auto* button = new StandInButton(GlobCreationInfo(20, 20, panel.canvas(), 10, 10));
  GlobHandle<StandInButton> handle(button);
  h.clickOn(*button);
  EXPECT_FALSE(handle.alive());
  EXPECT_EQ(panel.messages().size(), 1u);
}

TEST(Reporting, AdaptorSeesClicksAndMessagesFirst) {
  Harness h;
  MessageProbe panel(h.place(0, 0, 100, 100));
  StandInButton button(GlobCreationInfo(20, 20, panel.canvas(), 10, 10));

  // No adaptor: messages fall through to the Glob handling.
  panel.call_msg(&button, "hello");
  EXPECT_EQ(button.messagesFallingThrough, 1);

  Kw::Ptr<CountingAdaptor> adaptor(new CountingAdaptor);
  button.setDataAdaptor(adaptor);
  h.clickOn(button);
  EXPECT_EQ(adaptor->clicks, 1);

  // Consumed by the adaptor: never reaches the Glob handling.
  EXPECT_EQ(panel.call_msg(&button, "select"), 1);
  Event e(kEventMessage);
  e.message("queued");
  e.dest = &button;
  event_send(&e, true);
  h.pump();
  EXPECT_EQ(adaptor->seen, (std::vector<String>{"select", "queued"}));
  EXPECT_EQ(button.messagesFallingThrough, 1);

  // Not consumed: handling goes on.
  adaptor->answer = kEventNotConsumed;
  panel.call_msg(&button, "other");
  EXPECT_EQ(button.messagesFallingThrough, 2);
}

TEST(Reporting, TheMessageEventNamesTheControlsCanvasAndGoesToTheParent) {
  Harness h;
  struct Receiver : Glob {
    using Glob::Glob;
    int react(Event* e) override {
      if (!message_event(e)) return Glob::react(e);
      type = e->type;
      dest = e->dest;
      eventCanvas = e->canvas;
      text = e->text();
      return 1;
    }
    int type = 0;
    Glob* dest = nullptr;
    Canvas* eventCanvas = nullptr;
    String text;
  };
  Receiver panel(h.place(0, 0, 200, 200));
  auto* button = new Button(L"Go", "go", GlobCreationInfo(60, 20, panel.canvas(), 10, 10));
  h.clickOn(*button);
  EXPECT_EQ(panel.type, kEventMessage);
  EXPECT_EQ(panel.text, "go");
  EXPECT_EQ(panel.dest, &panel);
  EXPECT_EQ(panel.eventCanvas, button->canvas());
}
