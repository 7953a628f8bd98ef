#include "platform/testing/MessageProbe.h"

MessageProbe::MessageProbe(const GlobCreationInfo& info) : Glob(info) {}

int MessageProbe::react(Event* e) {
  if (!message_event(e)) return Glob::react(e);
  ReceivedMessage m;
  m.text = e->text();
  m.sender = event_to_sender_glob(e);
  m.senderKind = m.sender ? m.sender->idstring() : "";
  m.modifiers = e->word2;
  const int answer = answer_;
  const bool act = action && m.text == trigger;
  messages_.push_back(std::move(m));
  if (act) {
    const std::function<void()> run = action;  // the action may delete this probe
    run();
  }
  return answer;
}

std::vector<String> MessageProbe::texts() const {
  std::vector<String> out;
  for (const auto& m : messages_) out.push_back(m.text);
  return out;
}

int MessageProbe::count(const String& text) const {
  int n = 0;
  for (const auto& m : messages_) n += m.text == text ? 1 : 0;
  return n;
}
