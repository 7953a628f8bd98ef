#pragma once
// Every message that controls on the gallery's pages send to their owners, in arrival order.
// Listeners hear each new entry; with a file attached each entry is also written there as one
// line and flushed at once, so that a script watching the file sees it.
#include <cstdint>
#include <cstdio>
#include <functional>
#include <vector>

#include "platform/kw/String.h"

struct LogEntry {
  int64_t timeMs = 0;  // since the log started
  String owner;        // the page (or gallery part) that received the message
  String senderKind;   // the sender's idstring, "-" when there was none
  String senderName;
  String text;
  uint32_t modifiers = 0;
};

class Event;

class MessageLog {
 public:
  MessageLog();
  ~MessageLog();
  MessageLog(const MessageLog&) = delete;
  MessageLog& operator=(const MessageLog&) = delete;

  // Writes every later entry to `path` too (the file is replaced). False, with a diagnostic,
  // when the file cannot be opened.
  bool attachFile(const String& path);

  // Records a message event that `owner` received.
  void record(const String& owner, const Event& e);
  void add(LogEntry entry);

  const std::vector<LogEntry>& entries() const { return entries_; }
  // How many entries arrived in all (old ones are dropped past a bound).
  size_t total() const { return total_; }
  void setListener(std::function<void()> listener) { listener_ = std::move(listener); }

  // The entry as one line of text, without a line break.
  static String format(const LogEntry& e);

 private:
  std::vector<LogEntry> entries_;
  size_t total_ = 0;
  std::FILE* file_ = nullptr;
  std::function<void()> listener_;
};
