#include "platform/misc/WindowsClipboard.h"

#include "platform/misc/InProcessClipboard.h"

namespace {

InProcessClipboard& defaultProvider() {
  static InProcessClipboard clipboard;
  return clipboard;
}

ClipboardProvider*& installed() {
  static ClipboardProvider* provider = nullptr;
  return provider;
}

}  // namespace

void WindowsClipboard::setText(const WString& text) {
  provider().setText(text);
}

WString WindowsClipboard::getText() {
  return provider().getText();
}

bool WindowsClipboard::hasText() {
  return provider().hasText();
}

void WindowsClipboard::setProvider(ClipboardProvider* provider) {
  installed() = provider;
}

ClipboardProvider& WindowsClipboard::provider() {
  ClipboardProvider* p = installed();
  return p != nullptr ? *p : defaultProvider();
}
