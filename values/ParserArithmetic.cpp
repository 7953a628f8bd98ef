#include "values/ParserArithmetic.h"

#include <cmath>
#include <cstdint>

namespace {

// An int sum or difference taken in 64 bits and saturated back into int.
int saturateInt(int64_t v) {
  if (v > std::numeric_limits<int>::max()) return std::numeric_limits<int>::max();
  if (v < std::numeric_limits<int>::min()) return std::numeric_limits<int>::min();
  return static_cast<int>(v);
}

}  // namespace

template <typename T>
T ParserArithmetic<T>::up(T value, T step) {
  if constexpr (std::is_same_v<T, int>) {
    if (value > 0 && int64_t{largest()} - value <= step) return largest();
    return saturateInt(int64_t{value} + step);
  } else if constexpr (std::is_unsigned_v<T>) {
    if (value != 0 && largest() - value <= step) return largest();
    return value + step;  // cannot pass the largest: that case saturated above
  } else {
    if (value > 0 && step >= largest() - value) return largest();
    return value + step;
  }
}

template <typename T>
T ParserArithmetic<T>::down(T value, T step) {
  if constexpr (std::is_same_v<T, int>) {
    if (value <= 0 && value <= int64_t{step} + lowest()) return lowest();
    return saturateInt(int64_t{value} - step);
  } else if constexpr (std::is_unsigned_v<T>) {
    if (value <= step) return 0;
    return value - step;
  } else {
    if (value <= 0 && (step - largest()) >= value) return lowest();
    return value - step;
  }
}

template <typename T>
T ParserArithmetic<T>::scaleUp(T value, T scale) {
  if constexpr (std::is_same_v<T, int>) {
    return static_cast<int>(static_cast<uint32_t>(value) * static_cast<uint32_t>(scale));
  } else {
    return value * scale;
  }
}

template <typename T>
T ParserArithmetic<T>::scaleDown(T typed, T scale) {
  return typed / scale;
}

template <typename T>
double ParserArithmetic<T>::linearPosition(T value, T min, T max) {
  if (!(min < max)) return 0.0;
  const double span = static_cast<double>(max) - static_cast<double>(min);
  const double p = (static_cast<double>(value) - static_cast<double>(min)) / span;
  return std::isfinite(p) ? p : 0.0;
}

template <typename T>
double ParserArithmetic<T>::logPosition(T value, T min, T max) {
  const double f = linearPosition(value, min, max);
  const double p = std::log10(f * 9.0 + 1.0);
  if (!(p > 0.0)) return 0.0;  // also NaN, from a fraction below -1/9
  return p > 1.0 ? 1.0 : p;
}

template <typename T>
T ParserArithmetic<T>::valueAtLogPosition(double p, T min, T max) {
  if (!(p > 0.0)) p = 0.0;
  if (p > 1.0) p = 1.0;
  if (!(min < max)) return min;
  const double f = (std::pow(10.0, p) - 1.0) / 9.0;
  const double lo = static_cast<double>(min);
  const double hi = static_cast<double>(max);
  double v = (hi - lo) * f + lo;
  // A span wider than double reaches (two huge doubles) cannot be scaled: interpolate instead.
  if (!std::isfinite(v)) v = lo * (1.0 - f) + hi * f;
  if (!(v >= lo)) v = lo;
  if (v > hi) v = hi;
  if constexpr (std::is_same_v<T, int>) {
    return static_cast<int>(std::trunc(v));
  } else if constexpr (std::is_unsigned_v<T>) {
    return static_cast<T>(std::llround(v));
  } else {
    return clamp(static_cast<T>(v), min, max);
  }
}

template class ParserArithmetic<int>;
template class ParserArithmetic<unsigned int>;
template class ParserArithmetic<float>;
template class ParserArithmetic<double>;
