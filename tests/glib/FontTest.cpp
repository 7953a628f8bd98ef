// The font service: one font per description, measuring, caret seeking and the layout cache.
#include <gtest/gtest.h>

#include "platform/glib/FontCache.h"
#include "platform/glib/LayoutCache.h"
#include "platform/kw/CharClassifier.h"

namespace {

using Seek = Glib::iFont::eCharSeekMethod;

TEST(GlibFonts, SameDescriptionSameFont) {
  auto& fonts = Glib::fonts();
  auto standard = fonts.standard();
  EXPECT_EQ(standard.get(), fonts.get(Glib::FontDesc("DejaVu Sans", 13)).get());
  EXPECT_EQ(standard.get(), fonts.get(Glib::FontDesc("", 0)).get()) << "defaults fill in";
  EXPECT_NE(standard.get(), fonts.get(Glib::FontDesc("", 13, Glib::FontDesc::Bold)).get());
  EXPECT_NE(standard.get(), fonts.get(Glib::FontDesc("", 20)).get());
  EXPECT_EQ(standard->desc().face, "DejaVu Sans");
  EXPECT_EQ(standard->desc().size, 13);
}

TEST(GlibFonts, MetricsAndWidths) {
  auto font = Glib::fonts().standard();
  EXPECT_GE(font->height(), 13);
  EXPECT_LE(font->height(), 20);
  EXPECT_GT(font->ascent(), font->descent());
  EXPECT_GT(font->descent(), 0);
  EXPECT_EQ(font->textWidth(L""), 0);
  const int one = font->textWidth(L"m");
  EXPECT_GT(one, 0);
  EXPECT_GT(font->textWidth(L"mm"), one);
  auto bold = Glib::fonts().get(Glib::FontDesc("", 13, Glib::FontDesc::Bold));
  EXPECT_GT(bold->textWidth(L"Settings"), font->textWidth(L"Settings"));
  auto big = Glib::fonts().get(Glib::FontDesc("", 26));
  EXPECT_GT(big->height(), font->height() * 3 / 2);
}

TEST(GlibFonts, LatinShapingAgreesWithFullLayout) {
  // Text with a Hebrew letter goes through the full layout; its Latin start must sit exactly
  // where the same letters sit when shaped on their own.
  auto font = Glib::fonts().standard();
  const WString latin = L"Wave Tempo 1.25";
  const WString mixed = latin + L" \u05D0";
  EXPECT_EQ(font->charSeek(mixed, 0, Seek::ToIndex, 15).x, font->textWidth(latin));
  EXPECT_EQ(font->charSeek(mixed, 0, Seek::ToIndex, 4).x,
            font->charSeek(latin, 0, Seek::ToIndex, 4).x);
}

TEST(GlibFonts, CharSeekMethods) {
  auto font = Glib::fonts().standard();
  const WString t = L"alpha beta,  gamma";
  auto idx = [&](int from, Seek m, int to = 0) { return font->charSeek(t, from, m, to).index; };
  EXPECT_EQ(idx(3, Seek::PrevChar), 2);
  EXPECT_EQ(idx(0, Seek::PrevChar), 0);
  EXPECT_EQ(idx(3, Seek::NextChar), 4);
  EXPECT_EQ(idx(18, Seek::NextChar), 18);
  EXPECT_EQ(idx(0, Seek::NextWord), 6);    // over "alpha" and the space
  EXPECT_EQ(idx(6, Seek::NextWord), 10);   // "beta" stops before the comma
  EXPECT_EQ(idx(10, Seek::NextWord), 13);  // the comma, then two spaces
  EXPECT_EQ(idx(16, Seek::NextWord), 18);
  EXPECT_EQ(idx(13, Seek::PrevWord), 10);
  EXPECT_EQ(idx(8, Seek::PrevWord), 6);  // inside a word: to its start
  EXPECT_EQ(idx(6, Seek::PrevWord), 0);
  EXPECT_EQ(idx(9, Seek::Start), 0);
  EXPECT_EQ(idx(2, Seek::End), 18);
  EXPECT_EQ(idx(2, Seek::ToIndex, 11), 11);
  EXPECT_EQ(idx(2, Seek::ToIndex, 99), 18);
  EXPECT_EQ(idx(2, Seek::ToIndex, -4), 0);
  EXPECT_EQ(idx(-7, Seek::NextChar), 1) << "a start outside the text is clamped first";
  EXPECT_EQ(idx(3, static_cast<Seek>(42)), 3) << "unknown methods leave the caret";

  // The pixel x is the width of what lies before the caret.
  EXPECT_EQ(font->charSeek(t, 0, Seek::ToIndex, 5).x, font->textWidth(L"alpha"));
  EXPECT_EQ(font->charSeek(t, 0, Seek::End).x, font->textWidth(t));
  EXPECT_EQ(font->charSeek(t, 4, Seek::Start).x, 0);

  // Word moves follow the library's one word rule, which the text boxes use too: accented
  // letters join their word and a run of symbols is a word of its own, whatever the locale.
  const WString mixed = L"caf\u00E9-bar  \u00BFqu\u00E9? x_1 ->\u2192 end";
  for (int i = 0; i <= static_cast<int>(mixed.size()); ++i) {
    EXPECT_EQ(font->charSeek(mixed, i, Seek::NextWord).index,
              CharClassifier::nextWordStart(mixed, i));
    EXPECT_EQ(font->charSeek(mixed, i, Seek::PrevWord).index,
              CharClassifier::previousWordStart(mixed, i));
  }
  EXPECT_EQ(font->charSeek(mixed, 0, Seek::NextWord).index, 4);  // "café", not "caf"
}

TEST(GlibFonts, LocateFindsNearestCaret) {
  auto font = Glib::fonts().standard();
  const WString t = L"mmmm";
  const int w = font->textWidth(L"m");
  EXPECT_EQ(font->locate(t, -50).index, 0);
  EXPECT_EQ(font->locate(t, 10000).index, 4);
  EXPECT_EQ(font->locate(t, 2 * w).index, 2);
  EXPECT_EQ(font->locate(t, 2 * w + w / 2 - 1).index, 2);
  EXPECT_EQ(font->locate(t, 2 * w + w / 2 + 1).index, 3);
  const auto loc = font->locate(t, 3 * w + 1);
  EXPECT_EQ(loc.x, font->charSeek(t, 0, Seek::ToIndex, loc.index).x);
  EXPECT_EQ(font->locate(L"", 40), (Glib::iFont::CharacterLocation{0, 0}));
}

TEST(GlibFonts, InvalidCharactersBecomeReplacementMarks) {
  auto font = Glib::fonts().standard();
  WString bad = L"a";
  bad += wchar_t(0);
  bad += wchar_t(0xD800);
  bad += wchar_t(0x110000);
  bad += L'\n';
  bad += L"b";
  const WString marks = L"a\uFFFD\uFFFD\uFFFD\uFFFDb";
  EXPECT_EQ(font->textWidth(bad), font->textWidth(marks));
  EXPECT_GT(font->textWidth(bad), font->textWidth(L"ab"));
  // One caret stop per character of the original text.
  EXPECT_EQ(font->charSeek(bad, 0, Seek::End).index, 6);
  EXPECT_EQ(font->charSeek(bad, 0, Seek::ToIndex, 3).x,
            font->charSeek(marks, 0, Seek::ToIndex, 3).x);
}

TEST(GlibFonts, HugeTextIsMeasuredWithoutFailing) {
  auto font = Glib::fonts().standard();
  const WString huge(200000, L'x');
  const int w = font->textWidth(huge);
  EXPECT_GT(w, font->textWidth(WString(1000, L'x')));
  const auto end = font->charSeek(huge, 0, Seek::End);
  EXPECT_EQ(end.index, 200000);
  EXPECT_EQ(end.x, w);
  EXPECT_LE(font->locate(huge, 1 << 30).index, 200000);
}

TEST(GlibLayoutCache, KeepsRecentLayoutsWithinItsCapacity) {
  Glib::LayoutCache cache(2);
  auto font = Glib::fonts().standard();
  int made = 0;
  auto get = [&](const WString& text, int fontId = 1) {
    return cache.get(fontId, text, [&] {
      ++made;
      return font->layout(text);
    });
  };
  auto a = get(L"Gain");
  EXPECT_EQ(get(L"Gain").get(), a.get()) << "a hit returns the kept layout";
  get(L"Pan");
  get(L"Gain");  // now the most recent
  get(L"Mute");  // evicts "Pan", the least recent
  EXPECT_EQ(cache.size(), 2u);
  EXPECT_EQ(made, 3);
  get(L"Gain");
  EXPECT_EQ(made, 3);
  get(L"Pan");
  EXPECT_EQ(made, 4);
  get(L"Pan", 2);
  EXPECT_EQ(made, 5) << "the same text in another font is another layout";
  get(WString(Glib::LayoutCache::kMaxCachedChars + 1, L'z'));
  EXPECT_EQ(cache.size(), 2u) << "long text is shaped but not kept";
  EXPECT_EQ(a->width(), font->textWidth(L"Gain")) << "an evicted layout stays usable";
}

}  // namespace
