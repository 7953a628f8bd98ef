#pragma once
// The text box a table puts over a cell while it is edited. It tells its owner when the edit
// ends, once:
//
//   input                   sends to the owner
//   Return                  commitMsg
//   Escape                  cancelMsg
//   losing the focus        commitMsg (the user went on elsewhere)
//
// Everything else is the text box's. The owner removes the editor when it hears either
// message (it may delete it during the call); dismiss() before removing it otherwise, so
// that the focus leaving with it sends nothing.
#include "platform/glob/GlobHandle.h"
#include "text/TextBox.h"

class CellEditor : public TextBox {
 public:
  static const char* const commitMsg;  // "CellEditor::commit"
  static const char* const cancelMsg;  // "CellEditor::cancel"

  CellEditor(const TextBox::InitArgs& args, Glob* owner);

  void dismiss() { finished_ = true; }
  bool isFinished() const { return finished_; }

  int handleKeyboardEvent(int keyCode) override;
  void handle_kbd_focus() override;
  const char* idstring() const override { return "celleditor"; }

 private:
  void finish(const char* msg);

  GlobHandle<> owner_;
  bool finished_ = false;
};
