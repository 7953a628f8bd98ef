#include "lists/CellEditor.h"

#include "platform/glob/KeyCodes.h"

const char* const CellEditor::commitMsg = "CellEditor::commit";
const char* const CellEditor::cancelMsg = "CellEditor::cancel";

CellEditor::CellEditor(const TextBox::InitArgs& args, Glob* owner) : TextBox(args), owner_(owner) {}

int CellEditor::handleKeyboardEvent(int keyCode) {
  const auto key = static_cast<unsigned>(keyCode);
  if (key == kKeyReturn || key == kKeyEscape) {
    finish(key == kKeyReturn ? commitMsg : cancelMsg);
    return 1;  // we may be gone now
  }
  return TextBox::handleKeyboardEvent(keyCode);
}

void CellEditor::handle_kbd_focus() {
  GlobHandle<> self(this);
  TextBox::handle_kbd_focus();
  if (self && !hasKbdFocus()) finish(commitMsg);
}

void CellEditor::finish(const char* msg) {
  if (finished_) return;
  finished_ = true;
  if (Glob* owner = owner_.get()) send_message_event(this, owner, msg);
}
