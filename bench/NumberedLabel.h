#pragma once
// A word and a number, as the benchmark scenes label their controls and menu items, without
// the cost of formatted output (std::to_wstring goes through swprintf).
#include <string>

inline std::wstring numberedLabel(const wchar_t* word, int i) {
  wchar_t digits[12];
  int n = 0;
  do {
    digits[n++] = static_cast<wchar_t>(L'0' + i % 10);
    i /= 10;
  } while (i > 0);
  std::wstring s(word);
  while (n > 0) s += digits[--n];
  return s;
}
