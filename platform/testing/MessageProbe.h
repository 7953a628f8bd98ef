#pragma once
// A Glob that records every message event it receives: make it the parent of the controls
// under test and look at what they reported.
#include <functional>
#include <vector>

#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"

struct ReceivedMessage {
  String text;
  Glob* sender = nullptr;  // may have been deleted since; compare, do not dereference
  String senderKind;       // the sender's idstring at delivery time
  uint32_t modifiers = 0;
};

class MessageProbe : public Glob {
 public:
  explicit MessageProbe(const GlobCreationInfo& info);

  int react(Event* e) override;
  const char* idstring() const override { return "probe"; }

  const std::vector<ReceivedMessage>& messages() const { return messages_; }
  std::vector<String> texts() const;
  // How many messages with exactly this text arrived.
  int count(const String& text) const;
  const ReceivedMessage* last() const { return messages_.empty() ? nullptr : &messages_.back(); }
  void clear() { messages_.clear(); }
  // The value react returns for messages (1 consumes them).
  void setAnswer(int answer) { answer_ = answer; }

  // Run after a message whose text is `trigger` has been recorded: the test's answer to it
  // (setting the sender's state, deleting it...). The action may delete this probe too.
  String trigger;
  std::function<void()> action;

 private:
  std::vector<ReceivedMessage> messages_;
  int answer_ = 1;
};
