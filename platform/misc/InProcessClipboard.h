#pragma once
// A clipboard that lives in this process only: used headless, in tests, and until a window
// back end installs the system clipboard. Text is kept exactly as given, and an empty text
// counts as no text.
#include "platform/misc/ClipboardProvider.h"

class InProcessClipboard : public ClipboardProvider {
 public:
  WString getText() override { return text_; }
  void setText(const WString& text) override { text_ = text; }
  bool hasText() override { return !text_.empty(); }

 private:
  WString text_;
};
