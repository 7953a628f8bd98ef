#include "panels/TabRenameBox.h"

#include "platform/glob/KeyCodes.h"

TabRenameBox::TabRenameBox(const InitArgs& args, Glob& dialogue)
    : TextBox(args), dialogue_(&dialogue), original_(args.text) {}

int TabRenameBox::handleKeyboardEvent(int keyCode) {
  if (static_cast<unsigned>(keyCode) == kKeyEscape) {
    setText(original_);
    clearChanged();
    if (Glob* d = dialogue_.get()) send_msg(d, closedMsg);
    return 1;
  }
  return TextBox::handleKeyboardEvent(keyCode);
}

void TabRenameBox::handle_kbd_focus() {
  GlobHandle<> self(this);
  TextBox::handle_kbd_focus();
  if (!self || hasKbdFocus()) return;
  if (Glob* d = dialogue_.get()) send_msg(d, closedMsg);
}
