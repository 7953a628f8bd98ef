#pragma once
// Where the clipboard's text really lives. WindowsClipboard forwards to the installed provider:
// an in-process one by default, the window back end's system clipboard when it installs one.
#include "platform/kw/String.h"

class ClipboardProvider {
 public:
  virtual ~ClipboardProvider() = default;
  virtual WString getText() = 0;
  virtual void setText(const WString& text) = 0;
  virtual bool hasText() = 0;
};
