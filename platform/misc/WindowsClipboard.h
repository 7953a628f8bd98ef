#pragma once
// The library's clipboard facade. Controls call the statics; the text goes to the installed
// ClipboardProvider, which the facade does not own. The default provider is an in-process one
// whose contents persist across setProvider calls.
#include "platform/misc/ClipboardProvider.h"

class WindowsClipboard {
 public:
  static void setText(const WString& text);
  static WString getText();
  static bool hasText();

  // Installs `provider` (not owned; it must outlive its installation). Null restores the
  // default in-process provider.
  static void setProvider(ClipboardProvider* provider);
  static ClipboardProvider& provider();
};
