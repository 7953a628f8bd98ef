#include "values/NumberText.h"

#include <algorithm>
#include <cerrno>
#include <cmath>
#include <cstdlib>
#include <cwchar>
#include <limits>
#include <type_traits>

namespace {

bool isSpace(wchar_t c) {
  return c == L' ' || c == L'\t';
}

WString trimmed(const WString& s) {
  std::size_t b = 0;
  std::size_t e = s.size();
  while (b < e && isSpace(s[b])) ++b;
  while (e > b && isSpace(s[e - 1])) --e;
  return s.substr(b, e - b);
}

// The text without a trailing copy of the suffix (compared without its spaces).
WString withoutSuffix(const WString& text, const WString& suffix) {
  const WString unit = trimmed(suffix);
  if (unit.empty() || text.size() < unit.size()) return text;
  if (text.compare(text.size() - unit.size(), unit.size(), unit) != 0) return text;
  return trimmed(text.substr(0, text.size() - unit.size()));
}

}  // namespace

template <typename T>
WString NumberText<T>::format(T value, int decimals, const WString& suffix) {
  WString number;
  if constexpr (std::is_integral_v<T>) {
    number = std::to_wstring(value);
  } else if (std::isnan(value)) {
    number = L"nan";
  } else if (std::isinf(value)) {
    number = value < 0 ? L"-inf" : L"inf";
  } else {
    decimals = std::clamp(decimals, 0, kMaxDecimals);
    // Large enough for the largest double in fixed notation with every decimal.
    wchar_t buf[400];
    std::swprintf(buf, sizeof buf / sizeof buf[0], L"%.*f", decimals, static_cast<double>(value));
    number = buf;
    if (number.find_first_not_of(L"-0.") == WString::npos && number[0] == L'-') {
      number.erase(0, 1);  // no "-0.0" for a value that rounds to zero
    }
  }
  return number + suffix;
}

template <typename T>
std::optional<T> NumberText<T>::parse(const WString& text, const WString& suffix) {
  const WString number = withoutSuffix(trimmed(text), suffix);
  if (number.empty()) return std::nullopt;
  const wchar_t* begin = number.c_str();
  wchar_t* end = nullptr;
  errno = 0;
  if constexpr (std::is_integral_v<T>) {
    // Only an optional sign and digits: no spaces, bases or exponents.
    std::size_t i = (number[0] == L'-' || number[0] == L'+') ? 1 : 0;
    if (i == number.size()) return std::nullopt;
    for (; i < number.size(); ++i) {
      if (number[i] < L'0' || number[i] > L'9') return std::nullopt;
    }
    const long long v = std::wcstoll(begin, &end, 10);
    const bool overflow = errno == ERANGE;
    if (std::is_unsigned_v<T> && (v < 0 || (overflow && number[0] == L'-'))) return T{0};
    if (overflow) return v < 0 ? std::numeric_limits<T>::lowest() : std::numeric_limits<T>::max();
    if (v < static_cast<long long>(std::numeric_limits<T>::lowest())) {
      return std::numeric_limits<T>::lowest();
    }
    if (v > static_cast<long long>(std::numeric_limits<T>::max())) {
      return std::numeric_limits<T>::max();
    }
    return static_cast<T>(v);
  } else {
    // Digits with one optional point and a sign: no exponents, hex, "inf" or "nan".
    std::size_t i = (number[0] == L'-' || number[0] == L'+') ? 1 : 0;
    bool digit = false;
    bool point = false;
    for (; i < number.size(); ++i) {
      if (number[i] >= L'0' && number[i] <= L'9') {
        digit = true;
      } else if (number[i] == L'.' && !point) {
        point = true;
      } else {
        return std::nullopt;
      }
    }
    if (!digit) return std::nullopt;
    const double v = std::wcstod(begin, &end);
    return static_cast<T>(v);  // too large for float: an infinity, clamped by the range
  }
}

template <typename T>
String NumberText<T>::allowedCharacters(const WString& suffix) {
  String chars = "0123456789";
  if constexpr (std::is_signed_v<T>) chars += "-+";
  if constexpr (std::is_floating_point_v<T>) chars += ".";
  WString all = Kw::toWide(chars);
  for (wchar_t c : suffix) {
    if (all.find(c) == WString::npos) all += c;
  }
  return Kw::toUtf8(all);
}

template class NumberText<int>;
template class NumberText<unsigned int>;
template class NumberText<float>;
template class NumberText<double>;
