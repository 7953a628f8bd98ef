#include "dropdowns/ComboNumber.h"

#include <algorithm>
#include <climits>
#include <cmath>
#include <cstdio>

WString ComboNumber::characters(int minimum, bool allowDecimals) {
  WString s = L"0123456789";
  if (minimum < 0) s += L'-';
  if (allowDecimals) s += L'.';
  return s;
}

std::optional<double> ComboNumber::parse(const WString& text, bool allowDecimals) {
  size_t i = 0;
  const bool negative = !text.empty() && text[0] == L'-';
  if (negative) ++i;
  double whole = 0.0;
  size_t digits = 0;
  for (; i < text.size() && text[i] >= L'0' && text[i] <= L'9'; ++i, ++digits) {
    whole = whole * 10.0 + (text[i] - L'0');
  }
  double fraction = 0.0;
  if (i < text.size() && text[i] == L'.' && allowDecimals) {
    double scale = 0.1;
    for (++i; i < text.size() && text[i] >= L'0' && text[i] <= L'9'; ++i, ++digits) {
      fraction += (text[i] - L'0') * scale;
      scale /= 10.0;
    }
  }
  if (i != text.size() || digits == 0 || !std::isfinite(whole)) return std::nullopt;
  const double v = whole + fraction;
  return negative ? -v : v;
}

int ComboNumber::toInt(double value) {
  if (std::isnan(value)) return 0;
  const double t = std::trunc(value);
  if (t >= static_cast<double>(INT_MAX)) return INT_MAX;
  if (t <= static_cast<double>(INT_MIN)) return INT_MIN;
  return static_cast<int>(t);
}

double ComboNumber::clamp(double value, int minimum, int maximum) {
  if (minimum == maximum) return value;
  const double lo = std::min(minimum, maximum);
  const double hi = std::max(minimum, maximum);
  return value < lo ? lo : value > hi ? hi : value;
}

int ComboNumber::step(int current, int delta, int minimum, int maximum) {
  const long long next = static_cast<long long>(current) + (delta < 1 ? 1 : -1);
  if (minimum == maximum) {
    return next > INT_MAX ? INT_MAX : next < INT_MIN ? INT_MIN : static_cast<int>(next);
  }
  return toInt(clamp(static_cast<double>(next), minimum, maximum));
}

WString ComboNumber::format(double value) {
  if (value == std::trunc(value) && std::fabs(value) < 1e15) {
    return std::to_wstring(static_cast<long long>(value));
  }
  char buf[64];
  std::snprintf(buf, sizeof buf, "%.6f", value);
  std::string s(buf);
  while (!s.empty() && s.back() == '0') s.pop_back();
  if (!s.empty() && s.back() == '.') s.pop_back();
  return WString(s.begin(), s.end());
}
