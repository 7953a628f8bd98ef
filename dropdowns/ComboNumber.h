#pragma once
// The numbers of a combo box with numeric entry, apart from any canvas: the characters typing
// may use, reading typed text, clamping to the bounds and the wheel's step.
//
// Decisions taken here:
// - Equal bounds mean no bounds: nothing is clamped.
// - Typed text is a number when it is an optional "-", digits, and (with decimals) one "."
//   followed by digits; anything else (empty text, "-", "1-2", "1.2.3", a number too large for
//   a double) is no number.
// - A number read as an integer drops its fraction (toward zero) and saturates to int.
#include <optional>

#include "platform/kw/String.h"

class ComboNumber {
 public:
  // "0123456789", then "-" when `minimum` is below 0, then "." when decimals are allowed.
  static WString characters(int minimum, bool allowDecimals);
  static std::optional<double> parse(const WString& text, bool allowDecimals);
  static int toInt(double value);
  static double clamp(double value, int minimum, int maximum);
  // The wheel: +1 for a delta below 1, otherwise -1, clamped when bounded.
  static int step(int current, int delta, int minimum, int maximum);
  // Decimal text: an integer without a point; a fraction without trailing zeros.
  static WString format(double value);
};
