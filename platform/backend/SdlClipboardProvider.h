#pragma once
// The system clipboard, through SDL. Installed by the window back end while its window lives;
// SDL's video subsystem must be running. Text travels as UTF-8: invalid bytes from other
// programs become replacement characters.
#include "platform/misc/ClipboardProvider.h"

class SdlClipboardProvider : public ClipboardProvider {
 public:
  WString getText() override;
  void setText(const WString& text) override;
  bool hasText() override;
};
