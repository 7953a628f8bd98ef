// The caret's flashing rules and its shape.
#include <gtest/gtest.h>

#include "platform/glib/FontCache.h"
#include "platform/testing/Harness.h"
#include "text/TextCursor.h"

TEST(TextCursor, TicksEvery500MsToggleOnEverySecondTickOnly) {
  Harness h(100, 100);
  h.root().setTickPeriod(500);
  auto* caret = new TextCursor(Glib::FontDesc(), h.canvas());
  caret->activateFlash();
  std::vector<bool> shown;
  for (int tick = 0; tick < 6; ++tick) {
    h.advance(500);
    shown.push_back(caret->isVisible());
  }
  EXPECT_EQ(shown, (std::vector<bool>{true, false, false, true, true, false}));
  caret->deactivateFlash();
  EXPECT_TRUE(caret->isVisible());
  EXPECT_FALSE(caret->isFlashing());
  h.advance(3000);
  EXPECT_TRUE(caret->isVisible());
}

TEST(TextCursor, RestartShowsAtOnceAndHoldsForAWholePeriod) {
  Harness h(100, 100);
  auto* caret = new TextCursor(Glib::FontDesc(), h.canvas());
  caret->activateFlash();
  h.advance(540);
  ASSERT_FALSE(caret->isVisible());
  caret->restartFlash();
  EXPECT_TRUE(caret->isVisible());
  EXPECT_TRUE(caret->isRestartPending());
  h.advance(540);  // the due toggle only clears the restart
  EXPECT_TRUE(caret->isVisible());
  EXPECT_FALSE(caret->isRestartPending());
  h.advance(540);
  EXPECT_FALSE(caret->isVisible());
}

TEST(TextCursor, ThinCaretIsCentredAndTheBlockTakesTheWidthOfItsCharacter) {
  Harness h(100, 100);
  const Glib::FontDesc desc;
  auto* caret = new TextCursor(desc, h.canvas());
  const Glib::FontPtr font = caret->font();
  caret->placeAt(XY<int>(20, 5));
  EXPECT_EQ(caret->canvas()->rect(),
            Kw::Box<int>::fromSize(20 - TextCursor::kThinWidth / 2, 5, TextCursor::kThinWidth,
                                   font->height()));
  caret->setCurrentChar(L'W');  // ignored in the thin style
  EXPECT_EQ(caret->currentChar(), 0);
  caret->setCursorStyle(TextCursor::StyleBlock);
  caret->setCurrentChar(L'W');
  EXPECT_EQ(caret->canvas()->rect(),
            Kw::Box<int>::fromSize(20, 5, font->textWidth(L"W"), font->height()));
  caret->setCurrentChar(L'i');
  EXPECT_EQ(caret->width(), std::max(TextCursor::kThinWidth, font->textWidth(L"i")));
  // A bigger font makes a taller caret.
  caret->setFont(Glib::FontDesc("", 24));
  EXPECT_GT(caret->height(), font->height());
}
