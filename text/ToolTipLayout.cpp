#include "text/ToolTipLayout.h"

#include <algorithm>

#include "platform/glib/iFont.h"

namespace {

bool blank(const WString& s) {
  return std::all_of(s.begin(), s.end(), [](wchar_t c) { return c == L' ' || c == L'\t'; });
}

}  // namespace

bool ToolTipLayout::hasSomethingToShow(const WString& text) {
  return std::any_of(text.begin(), text.end(),
                     [](wchar_t c) { return c != L' ' && c != L'\t' && c != L'\n' && c != L'\r'; });
}

std::vector<WString> ToolTipLayout::lines(const WString& text, const Glib::iFont& font,
                                          int maxWidth) {
  std::vector<WString> out;
  if (!hasSomethingToShow(text)) return out;
  maxWidth = std::max(maxWidth, 1);
  bool cut = text.size() > kMaxCharacters;
  const WString kept = cut ? text.substr(0, kMaxCharacters) : text;

  std::vector<WString> paragraphs(1);
  for (wchar_t c : kept) {
    if (c == L'\n') {
      if (!paragraphs.back().empty() && paragraphs.back().back() == L'\r')
        paragraphs.back().pop_back();
      paragraphs.emplace_back();
    } else {
      paragraphs.back() += c;
    }
  }
  while (!paragraphs.empty() && blank(paragraphs.back())) paragraphs.pop_back();
  auto first = std::find_if(paragraphs.begin(), paragraphs.end(),
                            [](const WString& p) { return !blank(p); });
  paragraphs.erase(paragraphs.begin(), first);

  for (const WString& p : paragraphs) {
    if (out.size() > kMaxLines) break;
    wrap(p, font, maxWidth, out);
  }
  if (out.size() > kMaxLines) {
    out.resize(kMaxLines);
    cut = true;
  }
  if (cut && !out.empty()) {
    // The ellipsis takes the place of the last characters when the line has no room for it.
    WString& last = out.back();
    while (!last.empty() && font.textWidth(last + kEllipsis) > maxWidth) last.pop_back();
    last += kEllipsis;
  }
  return out;
}

int ToolTipLayout::widest(const std::vector<WString>& lines, const Glib::iFont& font) {
  int w = 0;
  for (const WString& l : lines) w = std::max(w, font.textWidth(l));
  return w;
}

void ToolTipLayout::wrap(const WString& paragraph, const Glib::iFont& font, int maxWidth,
                         std::vector<WString>& out) {
  if (font.textWidth(paragraph) <= maxWidth) {
    out.push_back(paragraph);
    return;
  }
  WString line;
  std::size_t i = 0;
  while (i < paragraph.size() && out.size() <= kMaxLines) {
    // The next word, with the spaces before it.
    std::size_t j = i;
    while (j < paragraph.size() && paragraph[j] == L' ') ++j;
    while (j < paragraph.size() && paragraph[j] != L' ') ++j;
    const WString piece = paragraph.substr(i, j - i);
    if (font.textWidth(line + piece) <= maxWidth) {
      line += piece;
      i = j;
      continue;
    }
    if (!line.empty()) {
      out.push_back(line);
      line.clear();
      // A wrapped line starts at its word, not at the spaces before it.
      while (i < paragraph.size() && paragraph[i] == L' ') ++i;
      continue;
    }
    // Spaces alone, wider than a line: nothing to show of them.
    const std::size_t start = piece.find_first_not_of(L' ');
    if (start == WString::npos) {
      i = j;
      continue;
    }
    // A word wider than a whole line: as much of it as fits.
    const WString word = piece.substr(start);
    const std::size_t n = fittingPrefix(word, font, maxWidth);
    out.push_back(word.substr(0, n));
    i = j - (word.size() - n);
  }
  if (!line.empty()) out.push_back(line);
}

std::size_t ToolTipLayout::fittingPrefix(const WString& word, const Glib::iFont& font,
                                         int maxWidth) {
  std::size_t lo = 1, hi = word.size();
  while (lo < hi) {
    const std::size_t mid = (lo + hi + 1) / 2;
    if (font.textWidth(word.substr(0, mid)) <= maxWidth) {
      lo = mid;
    } else {
      hi = mid - 1;
    }
  }
  return lo;
}
