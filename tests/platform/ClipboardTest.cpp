#include <gtest/gtest.h>

#include "platform/misc/WindowsClipboard.h"

namespace {

class RecordingClipboard : public ClipboardProvider {
 public:
  WString getText() override { return L"system text"; }
  void setText(const WString& text) override { written.push_back(text); }
  bool hasText() override { return true; }
  std::vector<WString> written;
};

}  // namespace

TEST(WindowsClipboard, DefaultProviderTreatsEmptyTextAsNothing) {
  WindowsClipboard::setText(L"x");
  EXPECT_TRUE(WindowsClipboard::hasText());
  WindowsClipboard::setText(L"");
  EXPECT_FALSE(WindowsClipboard::hasText());
}

TEST(WindowsClipboard, InstalledProviderReceivesEverythingUntilRemoved) {
  WindowsClipboard::setText(L"in process");
  RecordingClipboard system;
  WindowsClipboard::setProvider(&system);
  WindowsClipboard::setText(L"copied");
  EXPECT_EQ(system.written, std::vector<WString>{L"copied"});
  EXPECT_EQ(WindowsClipboard::getText(), L"system text");
  EXPECT_EQ(&WindowsClipboard::provider(), &system);

  WindowsClipboard::setProvider(nullptr);
  EXPECT_EQ(WindowsClipboard::getText(), L"in process");
  WindowsClipboard::setText(L"");
}
