// Breaking tooltip texts into lines, and keeping windows on the screen.
#include <gtest/gtest.h>

#include "platform/glib/FontCache.h"
#include "platform/glob/WindowPlacement.h"
#include "text/ToolTipLayout.h"

using Lines = std::vector<WString>;

TEST(ToolTipLayout, BreaksTrimsAndFindsNothingInBlankTexts) {
  const Glib::iFont& font = *Glib::fonts().standard();
  EXPECT_EQ(ToolTipLayout::lines(L"One line", font), Lines{L"One line"});
  EXPECT_EQ(ToolTipLayout::lines(L"One\r\nTwo\n\nFour", font),
            (Lines{L"One", L"Two", L"", L"Four"}));
  EXPECT_EQ(ToolTipLayout::lines(L"\n\nMiddle\n  \n", font), Lines{L"Middle"});
  EXPECT_TRUE(ToolTipLayout::lines(L"\n\r\n  \n", font).empty());
  EXPECT_TRUE(ToolTipLayout::lines(L"", font).empty());
  EXPECT_FALSE(ToolTipLayout::hasSomethingToShow(L" \n\t\r\n"));
  EXPECT_TRUE(ToolTipLayout::hasSomethingToShow(L"\n.\n"));
}

TEST(ToolTipLayout, WrapsWideLinesAtSpacesAndBreaksWideWords) {
  const Glib::iFont& font = *Glib::fonts().standard();
  const int max = font.textWidth(L"alpha beta");
  const Lines wrapped = ToolTipLayout::lines(L"alpha beta gamma delta", font, max);
  EXPECT_EQ(wrapped, (Lines{L"alpha beta", L"gamma", L"delta"}));

  const WString word(40, L'm');
  const Lines broken = ToolTipLayout::lines(word, font, 100);
  ASSERT_GT(broken.size(), 1u);
  WString joined;
  for (const WString& l : broken) {
    EXPECT_LE(font.textWidth(l), 100);
    joined += l;
  }
  EXPECT_EQ(joined, word);

  // Spaces alone wider than a line vanish rather than make empty lines.
  const Lines spaced = ToolTipLayout::lines(L"a\n" + WString(400, L' ') + L"\nb", font, 50);
  EXPECT_EQ(spaced, (Lines{L"a", L"b"}));
}

TEST(ToolTipLayout, OverlongTextsAreCutShortWithAnEllipsis) {
  const Glib::iFont& font = *Glib::fonts().standard();
  WString many;
  for (int i = 0; i < 100; ++i) many += L"line\n";
  const Lines lines = ToolTipLayout::lines(many + L"last", font);
  ASSERT_EQ(lines.size(), ToolTipLayout::kMaxLines);
  EXPECT_EQ(lines.back(), WString(L"line") + ToolTipLayout::kEllipsis);
  // The ellipsis never makes a line wider than allowed.
  const int max = font.textWidth(L"mmmm");
  for (const WString& l : ToolTipLayout::lines(WString(500, L'm'), font, max))
    EXPECT_LE(font.textWidth(l), max);

  const Lines longOne = ToolTipLayout::lines(WString(5000, L'i'), font, 100000);
  ASSERT_EQ(longOne.size(), 1u);
  EXPECT_EQ(longOne[0].size(), ToolTipLayout::kMaxCharacters + 1);
  EXPECT_EQ(longOne[0].back(), ToolTipLayout::kEllipsis);
}

TEST(WindowPlacement, KeepsWindowsOnTheScreen) {
  struct Case {
    XY<int> size, proposed, expected;
  };
  const XY<int> screen(400, 300);
  const Case cases[] = {
      {{100, 50}, {10, 20}, {10, 20}},     // already on it
      {{100, 50}, {350, 20}, {300, 20}},   // past the right edge
      {{100, 50}, {-30, -5}, {0, 0}},      // past the left and bottom edges
      {{100, 50}, {10, 280}, {10, 250}},   // past the top
      {{500, 50}, {-30, 10}, {0, 10}},     // wider than the screen: left edge
      {{100, 400}, {10, 10}, {10, -100}},  // taller: top edge on the screen's top
      {{100, 400}, {10, -500}, {10, -100}},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(WindowPlacement::keepInside(screen, c.size, c.proposed), c.expected)
        << c.proposed.x << "," << c.proposed.y;
  }
}
