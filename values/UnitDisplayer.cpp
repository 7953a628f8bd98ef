#include "values/UnitDisplayer.h"

#include <limits>
#include <type_traits>

template <typename T>
UnitDisplayer<T>::UnitDisplayer(const WString& suffix, int decimals, unsigned char maxNumChars)
    : suffix_(suffix), decimals_(decimals), maxNumChars_(maxNumChars) {}

template <typename T>
WString UnitDisplayer<T>::format(T value) {
  lastShown_ = value;
  return NumberText<T>::format(value, decimals_, suffix_);
}

template <typename T>
T UnitDisplayer<T>::parse(const WString& text) {
  if (const std::optional<T> v = NumberText<T>::parse(text, suffix_)) return *v;
  if constexpr (std::is_floating_point_v<T>) {
    return std::numeric_limits<T>::quiet_NaN();
  } else {
    return lastShown_;
  }
}

template <typename T>
String UnitDisplayer<T>::getAllowedCharacters() {
  return NumberText<T>::allowedCharacters(suffix_);
}

template class UnitDisplayer<int>;
template class UnitDisplayer<unsigned int>;
template class UnitDisplayer<float>;
template class UnitDisplayer<double>;
