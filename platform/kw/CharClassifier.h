#pragma once
// Character classes for text editing: what may be typed, what counts as a line break, and
// which characters form one word for word-wise caret moves and erasing.
//
// The classes are fixed tables, independent of the process locale, so that a text box behaves
// the same on every machine:
//   Word         letters, digits and '_', and every character from U+0080 up that no other
//                class claims (so accented and non-Latin letters join their words);
//   Space        space, no-break space and the other Unicode spaces, and TAB;
//   Punctuation  ASCII punctuation and symbols, Latin-1 punctuation and symbols, the general
//                punctuation, currency, arrow, mathematical and drawing blocks, CJK and
//                full-width punctuation;
//   Other        control characters, line breaks, surrogates and non-characters.
#include <string_view>

class CharClassifier {
 public:
  enum class CharClass { Word = 0, Space = 1, Punctuation = 2, Other = 3 };

  static CharClass classOf(wchar_t ch);

  // True when both characters belong to one class, so that a word move passes over both.
  static bool sameCharType(wchar_t a, wchar_t b) { return classOf(a) == classOf(b); }

  // True for a character that can be shown in a single line of text: not a control character
  // (C0, DEL, C1), not a line break, not a surrogate, not a non-character, not above U+10FFFF.
  // TAB is not printable.
  static bool isPrintable(wchar_t ch);

  // LF, VT, FF, CR, NEL, and the Unicode line and paragraph separators.
  static bool isLineBreak(wchar_t ch);

  // Word moves, shared by the text boxes and the font service's caret seeks. Forward: over the
  // rest of the run under `i` (unless it is spaces), then over spaces. Backward: over spaces,
  // then to the start of the run before them. `i` is clamped to the text.
  static int nextWordStart(std::wstring_view text, int i);
  static int previousWordStart(std::wstring_view text, int i);
};
