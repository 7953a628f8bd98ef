#pragma once
// Stand-ins for the panel tests: a focusable child that records its focus changes, and a
// panel that records every handler the message table and the event entry call.
#include <functional>
#include <vector>

#include "foundation/TabOrderable.h"
#include "panels/StandardPanel.h"

class FocusChild : public Glob, public TabOrderable {
 public:
  FocusChild(Canvas* parent, int w = 20, int h = 10) : Glob(GlobCreationInfo(w, h, parent)) {}

  bool isTabStopActive() override { return isActive(); }
  void handleTabStopFocusReceipt() override { ++receipts; }
  void handleTabStopFocusLoss() override { ++losses; }
  const char* idstring() const override { return "focus_child"; }

  int receipts = 0;
  int losses = 0;
};

// A plain child whose position is easy to read back.
class Child : public Glob {
 public:
  Child(Canvas* parent, int w, int h) : Glob(GlobCreationInfo(w, h, parent)) {}
  Kw::Box<int> box() const { return canvas()->rect(); }
};

class RecordingPanel : public StandardPanel {
 public:
  using StandardPanel::StandardPanel;
  using StandardPanel::standardWidget;

  bool handlePoot() override {
    calls.push_back("poot");
    // onPoot may delete this panel: nothing of it is touched afterwards.
    const bool answer = pootPassesOn;
    if (auto action = onPoot) action();
    return answer;
  }
  void handleFlipSize() override {
    calls.push_back("flip");
    StandardPanel::handleFlipSize();
  }
  int handleMessageEvent(const String& msg, Glob* sender) override {
    calls.push_back("msg:" + msg);
    senders.push_back(sender);
    return messageAnswer;
  }
  int handleKeyboardEvent(int keyCode) override {
    keys.push_back(keyCode);
    return 1;
  }
  int handleMouseEvent(Event* e) override {
    mouseTypes.push_back(e->type);
    return 1;
  }
  int handleTimerEvent() override {
    ++ticks;
    return 1;
  }
  void handleTitleChange() override { calls.push_back("title:" + getTitle()); }
  void handleWidgetAdded(const WidgetDetails& d) override { added.push_back(d.get()); }

  std::vector<String> calls;
  std::vector<Glob*> senders;
  std::vector<int> keys;
  std::vector<int> mouseTypes;
  std::vector<Glob*> added;
  std::function<void()> onPoot;
  int ticks = 0;
  bool pootPassesOn = false;
  int messageAnswer = 0;
};

// A Glob that swallows every event and counts the presses that reach it.
struct PressCounter : Glob {
  using Glob::Glob;
  int react(Event* e) override {
    if (mouse_down_event(e)) ++downs;
    return 1;
  }
  int downs = 0;
};
