#include "platform/backend/SdlClipboardProvider.h"

#include <SDL.h>
#include <gtest/gtest.h>

#include "platform/misc/WindowsClipboard.h"

// SDL's display-less video driver keeps the clipboard in the process, which is enough to check
// what the provider makes of the text on the way through.
class SdlClipboardProviderTest : public ::testing::Test {
 protected:
  void SetUp() override {
    SDL_SetHint(SDL_HINT_VIDEODRIVER, "dummy");
    if (SDL_InitSubSystem(SDL_INIT_VIDEO) != 0) GTEST_SKIP() << SDL_GetError();
    started_ = true;
  }
  void TearDown() override {
    WindowsClipboard::setProvider(nullptr);
    if (started_) {
      SDL_QuitSubSystem(SDL_INIT_VIDEO);
      SDL_Quit();
    }
  }
  bool started_ = false;
};

TEST_F(SdlClipboardProviderTest, WideTextRoundTripsThroughTheFacade) {
  SdlClipboardProvider provider;
  WindowsClipboard::setProvider(&provider);
  const WString text = L"caf\u00E9 \u4F60\u597D \U0001F600";
  WindowsClipboard::setText(text);
  EXPECT_TRUE(WindowsClipboard::hasText());
  EXPECT_EQ(WindowsClipboard::getText(), text);
}

TEST_F(SdlClipboardProviderTest, ForeignBytesBecomeReplacementCharacters) {
  SdlClipboardProvider provider;
  ASSERT_EQ(SDL_SetClipboardText("ok\xFF"), 0);
  EXPECT_EQ(provider.getText(), L"ok\uFFFD");
  // A lone surrogate cannot travel as UTF-8: it is replaced, the rest kept.
  provider.setText(WString(L"a") + wchar_t(0xD800) + L"b");
  EXPECT_EQ(provider.getText(), L"a\uFFFDb");
}
