#include "values/DecibelDisplayer.h"

#include <cmath>
#include <limits>

#include "values/NumberText.h"

template <typename T>
WString DecibelDisplayer<T>::format(T gain) {
  if (!(gain > 0)) return WString(kSilence) + kSuffix;
  return NumberText<double>::format(20.0 * std::log10(static_cast<double>(gain)), decimals_,
                                    kSuffix);
}

template <typename T>
T DecibelDisplayer<T>::parse(const WString& text) {
  WString t = text;
  while (!t.empty() && t.back() == L' ') t.pop_back();
  if (t.size() >= 2 && t.compare(t.size() - 2, 2, L"dB") == 0) t.resize(t.size() - 2);
  while (!t.empty() && t.back() == L' ') t.pop_back();
  while (!t.empty() && t.front() == L' ') t.erase(0, 1);
  if (t == kSilence) return T{0};
  const std::optional<double> db = NumberText<double>::parse(t, WString());
  if (!db) return std::numeric_limits<T>::quiet_NaN();
  return static_cast<T>(std::pow(10.0, *db / 20.0));
}

template class DecibelDisplayer<float>;
template class DecibelDisplayer<double>;
