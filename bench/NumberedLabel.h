#pragma once
// A word and a number, as the benchmark scenes label their controls and menu items, without
// the cost of formatted output (std::to_wstring goes through swprintf) and in one allocation.
#include <cwchar>
#include <string>

inline std::wstring numberedLabel(const wchar_t* word, int i) {
  wchar_t digits[12];
  int n = 0;
  do {
    digits[n++] = static_cast<wchar_t>(L'0' + i % 10);
    i /= 10;
  } while (i > 0);
  const std::size_t wordLength = std::wcslen(word);
  std::wstring s(wordLength + static_cast<std::size_t>(n), L' ');
  std::wmemcpy(s.data(), word, wordLength);
  for (std::size_t k = wordLength; n > 0; ++k) s[k] = digits[--n];
  return s;
}
