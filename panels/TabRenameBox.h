#pragma once
// The text box a tabbed dialogue opens over a tab to rename it. It tells the dialogue when
// the edit is over without a new name: Escape (which puts the old name back) or the focus
// leaving it unchanged send "rename_closed" (queued). A changed name arrives through the
// box's callback for event 1 ("name_changed"), queued before that.
#include "text/TextBox.h"

class TabRenameBox : public TextBox {
 public:
  static constexpr const char* closedMsg = "rename_closed";

  TabRenameBox(const InitArgs& args, Glob& dialogue);

  int handleKeyboardEvent(int keyCode) override;
  void handle_kbd_focus() override;
  const char* idstring() const override { return "tabrename"; }

 private:
  GlobHandle<> dialogue_;
  WString original_;
};
