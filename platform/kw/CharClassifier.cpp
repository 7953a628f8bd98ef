#include "platform/kw/CharClassifier.h"

#include <algorithm>

namespace {

using CharClass = CharClassifier::CharClass;

struct Span {
  unsigned first;
  unsigned last;
};

template <unsigned N>
bool inSpans(unsigned c, const Span (&spans)[N]) {
  for (const Span& s : spans) {
    if (c >= s.first && c <= s.last) return true;
  }
  return false;
}

constexpr Span kSpaces[] = {
    {0x09, 0x09},     {0x20, 0x20},     {0xA0, 0xA0},     {0x1680, 0x1680},
    {0x2000, 0x200A}, {0x202F, 0x202F}, {0x205F, 0x205F}, {0x3000, 0x3000},
};

constexpr Span kPunctuation[] = {
    {0x21, 0x2F},     {0x3A, 0x40},     {0x5B, 0x5E},     {0x60, 0x60},     {0x7B, 0x7E},
    {0xA1, 0xA9},     {0xAB, 0xB1},     {0xB4, 0xB4},     {0xB6, 0xB8},     {0xBB, 0xBB},
    {0xBF, 0xBF},     {0xD7, 0xD7},     {0xF7, 0xF7},     {0x2010, 0x2027}, {0x2030, 0x205E},
    {0x20A0, 0x20CF}, {0x2100, 0x2101}, {0x2190, 0x2BFF}, {0x3001, 0x3003}, {0x3008, 0x3011},
    {0x3014, 0x301F}, {0xFE10, 0xFE19}, {0xFE30, 0xFE4F}, {0xFF01, 0xFF0F}, {0xFF1A, 0xFF20},
    {0xFF3B, 0xFF40}, {0xFF5B, 0xFF65},
};

bool isNonCharacter(unsigned c) {
  return (c >= 0xFDD0 && c <= 0xFDEF) || (c & 0xFFFE) == 0xFFFE;
}

}  // namespace

bool CharClassifier::isLineBreak(wchar_t ch) {
  const auto c = static_cast<unsigned>(ch);
  return (c >= 0x0A && c <= 0x0D) || c == 0x85 || c == 0x2028 || c == 0x2029;
}

bool CharClassifier::isPrintable(wchar_t ch) {
  const auto c = static_cast<unsigned>(ch);
  if (c < 0x20 || (c >= 0x7F && c <= 0x9F)) return false;
  if (c >= 0xD800 && c <= 0xDFFF) return false;
  if (c > 0x10FFFF || isNonCharacter(c)) return false;
  return !isLineBreak(ch);
}

CharClassifier::CharClass CharClassifier::classOf(wchar_t ch) {
  const auto c = static_cast<unsigned>(ch);
  if (inSpans(c, kSpaces)) return CharClass::Space;
  if (!isPrintable(ch)) return CharClass::Other;
  if (inSpans(c, kPunctuation)) return CharClass::Punctuation;
  return CharClass::Word;
}

int CharClassifier::nextWordStart(std::wstring_view text, int i) {
  const int len = static_cast<int>(text.size());
  i = std::clamp(i, 0, len);
  auto at = [&](int k) { return text[static_cast<size_t>(k)]; };
  if (i < len && classOf(at(i)) != CharClass::Space) {
    const wchar_t first = at(i);
    while (i < len && sameCharType(first, at(i))) ++i;
  }
  while (i < len && classOf(at(i)) == CharClass::Space) ++i;
  return i;
}

int CharClassifier::previousWordStart(std::wstring_view text, int i) {
  i = std::clamp(i, 0, static_cast<int>(text.size()));
  auto at = [&](int k) { return text[static_cast<size_t>(k)]; };
  while (i > 0 && classOf(at(i - 1)) == CharClass::Space) --i;
  if (i > 0) {
    const wchar_t last = at(i - 1);
    while (i > 0 && sameCharType(last, at(i - 1))) --i;
  }
  return i;
}
