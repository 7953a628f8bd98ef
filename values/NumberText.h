#pragma once
// Numbers as the ready-made displayers show and read them: plain decimal integers, and
// floating values with a fixed number of decimals, with an optional unit suffix.
//
// Reading is strict: spaces around the text are ignored, and the suffix may be typed or left
// out (also without its spaces), but anything else that is not part of the number makes the
// text unreadable. Integers out of the type's range saturate at its limits ("-3" read as an
// unsigned gives 0); floating values too large for the type become infinities, which the
// parser's range then clamps.
#include <optional>

#include "platform/kw/String.h"

template <typename T>
class NumberText {
 public:
  // `decimals` applies to the floating types only (0 to kMaxDecimals).
  static WString format(T value, int decimals, const WString& suffix);
  static std::optional<T> parse(const WString& text, const WString& suffix);
  // The characters typing may enter: digits, the sign where the type has one, the decimal
  // point for the floating types, and the suffix's own characters.
  static String allowedCharacters(const WString& suffix);

  static constexpr int kMaxDecimals = 17;
};

extern template class NumberText<int>;
extern template class NumberText<unsigned int>;
extern template class NumberText<float>;
extern template class NumberText<double>;
