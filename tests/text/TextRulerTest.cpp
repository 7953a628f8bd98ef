// The piecewise ruler: its positions match the font's, edits keep it equal to a ruler built
// from scratch, and an edit re-measures only the pieces it touches.
#include <gtest/gtest.h>

#include <cstdint>

#include "platform/glib/FontCache.h"
#include "text/TextRuler.h"

namespace {

Glib::FontPtr standardFont() {
  return Glib::FontPtr(Glib::fonts().standard());
}

WString prose(std::size_t length) {
  const WString words = L"the quick brown fox jumps over a lazy dog, then naps. ";
  WString s;
  while (s.size() < length) s += words;
  s.resize(length);
  return s;
}

TextRuler rulerFor(const WString& text) {
  TextRuler r;
  r.setFont(standardFont());
  r.setText(text);
  return r;
}

void expectSameAsFresh(const TextRuler& edited, const WString& text) {
  const TextRuler fresh = rulerFor(text);
  ASSERT_EQ(edited.length(), fresh.length());
  ASSERT_EQ(edited.pieceCount(), fresh.pieceCount());
  ASSERT_EQ(edited.width(), fresh.width());
  for (int i = 0; i <= fresh.length(); i += 7) ASSERT_EQ(edited.xOf(i), fresh.xOf(i)) << i;
}

}  // namespace

TEST(TextRuler, ShortTextMatchesTheFontAndIndexAtInvertsXOf) {
  const WString text = L"Timeline: 00:01:02";
  const TextRuler r = rulerFor(text);
  const Glib::FontPtr font = standardFont();
  ASSERT_EQ(r.pieceCount(), 1u);
  EXPECT_EQ(r.width(), font->textWidth(text));
  for (int i = 0; i <= r.length(); ++i) {
    EXPECT_EQ(r.xOf(i), font->charSeek(text, 0, Glib::iFont::ToIndex, i).x);
    EXPECT_EQ(r.indexAt(r.xOf(i)), i);
  }
  EXPECT_EQ(r.indexAt(-50), 0);
  EXPECT_EQ(r.indexAt(r.width() + 50), r.length());
  EXPECT_EQ(r.xOf(-3), 0);
  EXPECT_EQ(r.xOf(1000), r.width());
}

TEST(TextRuler, EditsAnywhereLeaveTheSameRulerAsBuildingAfresh) {
  WString text = prose(3000);
  TextRuler r = rulerFor(text);
  // A text with a long run without spaces, where pieces are cut by length.
  text.insert(1500, WString(400, L'x'));
  r.setText(text);
  expectSameAsFresh(r, text);
  uint32_t seed = 12345;
  auto next = [&seed](uint32_t n) {
    seed = seed * 1103515245u + 12345u;
    return (seed >> 8) % n;
  };
  for (int step = 0; step < 60; ++step) {
    const std::size_t at = next(static_cast<uint32_t>(text.size() + 1));
    switch (next(3)) {
      case 0:
        text.insert(at, prose(1 + next(40)));
        break;
      case 1:
        text.erase(at, next(50));
        break;
      default:
        text.insert(at, 1, next(2) ? L' ' : static_cast<wchar_t>(L'a' + next(26)));
        break;
    }
    r.setText(text);
    SCOPED_TRACE(step);
    expectSameAsFresh(r, text);
  }
  r.setText(L"");
  EXPECT_EQ(r.pieceCount(), 0u);
  EXPECT_EQ(r.width(), 0);
}

TEST(TextRuler, TypingInALongTextMeasuresOnlyNearbyPieces) {
  WString text = prose(10000);
  TextRuler r = rulerFor(text);
  const std::size_t pieces = r.pieceCount();
  EXPECT_GT(pieces, 10000u / TextRuler::kMaxPiece);
  EXPECT_GT(r.width(), 0);
  for (std::size_t at : {text.size(), std::size_t{5003}, std::size_t{0}}) {
    const auto before = r.measuredPieces();
    text.insert(at, L"q");
    r.setText(text);
    EXPECT_GT(r.width(), 0);
    EXPECT_LE(r.measuredPieces() - before, 2u) << at;
  }
}

// Nothing is shaped until a position is asked for; edits in between are measured once, and
// the answer is the one an eager ruler gives.
TEST(TextRuler, MeasuresOnlyWhenAPositionIsAsked) {
  WString text = prose(1000);
  TextRuler r = rulerFor(text);
  EXPECT_EQ(r.measuredPieces(), 0u);
  const std::size_t pieces = r.pieceCount();
  EXPECT_GT(r.xOf(500), 0);
  EXPECT_EQ(r.measuredPieces(), pieces);

  for (int k = 0; k < 5; ++k) {
    text.insert(600, L"word ");
    r.setText(text);
  }
  EXPECT_EQ(r.measuredPieces(), pieces);
  expectSameAsFresh(r, text);
  EXPECT_LT(r.measuredPieces() - pieces, r.pieceCount() / 2);

  r.setFont(Glib::FontPtr(Glib::fonts().get(Glib::FontDesc("DejaVu Sans Mono", 14))));
  const auto beforeFont = r.measuredPieces();
  EXPECT_EQ(r.measuredPieces(), beforeFont);
  EXPECT_GT(r.width(), 0);
  EXPECT_EQ(r.measuredPieces() - beforeFont, r.pieceCount());
}

TEST(TextRuler, MaskedTextIsUniformAndDrawsOnlyTheVisiblePieces) {
  TextRuler r;
  r.setFont(Glib::FontPtr(Glib::fonts().get(Glib::FontDesc("courier", 13))));
  r.setMasked(L'*', 1000);
  const int64_t one = r.xOf(1);
  ASSERT_GT(one, 0);
  // Every stretch of kMaxPiece asterisks is one shaped piece, repeated.
  for (int i = 0; i < 300; i += 13) {
    EXPECT_EQ(r.xOf(i + TextRuler::kMaxPiece) - r.xOf(i), r.xOf(TextRuler::kMaxPiece));
  }
  EXPECT_EQ(r.indexAt(r.xOf(321)), 321);
  int drawn = 0;
  r.forEachPiece(r.xOf(400), r.xOf(410), [&](const WString& s, int first, int64_t x) {
    EXPECT_EQ(s.find_first_not_of(L'*'), WString::npos);
    EXPECT_EQ(x, r.xOf(first));
    drawn += static_cast<int>(s.size());
  });
  EXPECT_GT(drawn, 0);
  EXPECT_LE(drawn, 2 * TextRuler::kMaxPiece);
  r.setText(L"plain again");
  EXPECT_FALSE(r.isMasked());
  EXPECT_EQ(r.length(), 11);
}
