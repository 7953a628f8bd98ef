#pragma once
// The message log panel along the bottom of the window: the newest entries, newest last,
// in columns (time, owner, sender, message).
#include "gallery/MessageLog.h"
#include "platform/glob/Glob.h"

class MessageLogView : public Glob {
 public:
  static constexpr int kTitleHeight = 30;
  static constexpr int kColumnsHeight = 24;
  static constexpr int kRowHeight = 19;

  MessageLogView(const GlobCreationInfo& info, const MessageLog& log);

  void draw() override;
  const char* idstring() const override { return "messagelog"; }
  String describeValue() const override;

 private:
  const MessageLog& log_;
};
