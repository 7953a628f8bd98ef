#pragma once
// The logarithmic value-box parser for int, unsigned int, float and double. Its steps are taken
// in position units on a base-10 curve, p = log10((value − min) ÷ (max − min) × 9 + 1), so a
// step moves the value little near min and much near max: the feel of a gain or frequency
// control. Text is made by a wide string stream with the caller's format flags, width and
// precision, and read back with the stream's default (decimal) base.
//
// Every change goes through setValueInternal with the flags of VariBoxParserBasic (bit 0
// refresh the text, bit 1 publish); the callers are the same, and a step is
// setPositionWithinRange(position ± step), which publishes.
//
// Allowed characters: "-" only when min < 0, and then "+" only when also max > 0; "." for the
// floating types; the digits of the display base ("01234567", "0123456789ABCDEF" or
// "0123456789").
//
// Choices made here:
// - unsigned int and float round the computed value to the nearest; int truncates toward zero.
// - Text the stream cannot read puts back the current value's text and publishes nothing;
//   a NaN read, pushed or given is refused as in the linear family (NaN min or max stand for
//   the type's limits, a NaN value for min).
// - The scale applies when it is above 0.
// - The format flags are ORed into the stream's, except that a base among them (hex, oct)
//   replaces the stream's decimal default instead of mixing with it, which would leave the
//   display decimal.
// - Widths and precisions above kMaxField are taken as kMaxField.
#include <cstdint>

#include "values/VariBoxParserTyped.h"

template <typename T>
class VariBoxParserLog : public VariBoxParserTyped<T> {
 public:
  static constexpr int64_t kMaxField = 255;

  VariBoxParserLog(VariBox* owner, T min, T max, double minorStep, double majorStep, T value,
                   T scale, unsigned char maxNumChars, int formatFlags, int64_t width,
                   int64_t precision);
  VariBoxParserLog(const VariBoxParserLog& other);
  VariBoxParserLog& operator=(const VariBoxParserLog& other);
  ~VariBoxParserLog() override = default;

  // --- VariBoxParserBase ---
  void init() override;
  bool handleMajorInc() override { return incInternal(majorStep); }
  bool handleMinorInc() override { return incInternal(minorStep); }
  bool handleMajorDec() override { return decInternal(majorStep); }
  bool handleMinorDec() override { return decInternal(minorStep); }
  bool handleParseText() override;
  double getPositionWithinRange() override;

  // The characters that init offers the box, for this range, type and display base.
  String allowedCharacters() const;

 private:
  using VariBoxParserTyped<T>::min;
  using VariBoxParserTyped<T>::max;
  using VariBoxParserTyped<T>::value;
  using VariBoxParserTyped<T>::scale;
  using VariBoxParserTyped<T>::scaled;
  using VariBoxParserTyped<T>::text;
  using VariBoxParserTyped<T>::setValueInternal;
  using VariBoxParserTyped<T>::setAllowedCharacters;
  using VariBoxParserTyped<T>::setMaxNumChars;
  using VariBoxParserTyped<T>::notifyValidatedTextChange;
  using VariBoxParserTyped<T>::getDataChangeType;

  bool incInternal(double step);
  bool decInternal(double step);
  bool setPositionWithinRange(double p);
  WString valueToString(T v) const override;

  double minorStep;
  double majorStep;
  int formatFlags;
  int64_t width;
  int64_t precision;
  unsigned char maxNumChars;
};

extern template class VariBoxParserLog<int>;
extern template class VariBoxParserLog<unsigned int>;
extern template class VariBoxParserLog<float>;
extern template class VariBoxParserLog<double>;
