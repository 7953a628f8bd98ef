#pragma once
// A field of the foundation page that takes the keyboard focus when clicked and shows the key
// code of every key it receives, with its name, and any composed text. It tells its owner
// about each one ("key 0x22000043 Ctrl+C", "composed ..."), so the log shows what the window
// delivered.
#include "platform/glob/Glob.h"

class KeyProbe : public Glob {
 public:
  explicit KeyProbe(const GlobCreationInfo& info);

  // A readable name for a key code: "Ctrl+Shift+Left", "A", "Return", "U+00E9".
  static String keyName(unsigned code);

  int react(Event* e) override;
  void draw() override;
  void handle_kbd_focus() override { update(); }
  MouseCursorID contextCursor(const XY<int>& pos) override { return kCursorText; }
  const char* idstring() const override { return "keyprobe"; }
  String describeValue() const override { return shown_; }

 private:
  void show(const String& line, const String& message);

  String shown_;
};
