#pragma once
// The arithmetic the value-box parsers share, as pure functions of the value type: the type's
// limits, clamping into a range, the display scale, and the saturating linear steps.
//
//   step   refused at              saturates to the limit when                 otherwise
//   up     value is the largest    value > 0 and largest - value <= step        value + step
//   down   value is the lowest     value <= 0 and value <= step + lowest        value - step
//          (unsigned: at 0)        (unsigned: value <= step, target 0)
//
// The saturation tests are deliberately one-sided: the increment saturates only from a strictly
// positive value, the decrement only from a value at or below zero. The parsers refuse a step
// at either end of their own range before asking for a target.
//
// Choices made here:
// - NaN is never a value: clamping leaves it for the caller to refuse (isNaN), and the parsers
//   keep their previous value.
// - Integer arithmetic that would leave the type (a negative step on an int, the int scale
//   product) never invokes undefined behaviour: sums are taken wider and saturated, the scale
//   product wraps in two's complement as the type's own multiplication does.
// - A range whose max is not above its min has position 0: the thermometer is empty.
#include <limits>
#include <type_traits>

template <typename T>
class ParserArithmetic {
 public:
  // The lowest finite value (not the smallest positive one) and the largest.
  static constexpr T lowest() { return std::numeric_limits<T>::lowest(); }
  static constexpr T largest() { return std::numeric_limits<T>::max(); }

  static bool isNaN(T v) {
    if constexpr (std::is_floating_point_v<T>) {
      return v != v;
    } else {
      return false;
    }
  }  // `v`, or `fallback` when v is NaN.
  static T orIfNaN(T v, T fallback) { return isNaN(v) ? fallback : v; }

  // v limited to max, then to min: when min exceeds max, min wins.
  static T clamp(T v, T min, T max) {
    if (max < v) v = max;
    if (v < min) v = min;
    return v;
  }

  // The target of a step up or down, saturating at the type's limits as tabled above.
  static T up(T value, T step);
  static T down(T value, T step);

  // value × scale in T's own arithmetic (integers wrap).
  static T scaleUp(T value, T scale);
  // typed ÷ scale; integers truncate toward zero. `scale` is positive.
  static T scaleDown(T typed, T scale);

  // (value − min) ÷ (max − min) in double, unclamped; 0 for an empty range or a span too wide
  // to measure.
  static double linearPosition(T value, T min, T max);
  // log10(fraction × 9 + 1) clamped to [0, 1]; 0 for an empty range.
  static double logPosition(T value, T min, T max);
  // The value at position p (clamped to [0, 1]) on the base-10 curve; int truncates toward
  // zero, the other types round to the nearest value. Always within [min, max] for a range
  // that is not empty.
  static T valueAtLogPosition(double p, T min, T max);
};

extern template class ParserArithmetic<int>;
extern template class ParserArithmetic<unsigned int>;
extern template class ParserArithmetic<float>;
extern template class ParserArithmetic<double>;
