#include "values/VariBoxParserLog.h"

#include <algorithm>
#include <ios>
#include <sstream>
#include <type_traits>

#include "values/ParserArithmetic.h"

namespace {

double stepOrZero(double step) {
  return step == step ? step : 0.0;
}

}  // namespace

template <typename T>
VariBoxParserLog<T>::VariBoxParserLog(VariBox* owner, T min, T max, double minorStep,
                                      double majorStep, T value, T scale, unsigned char maxNumChars,
                                      int formatFlags, int64_t width, int64_t precision)
    : VariBoxParserTyped<T>(owner, min, max, value, scale),
      minorStep(stepOrZero(minorStep)),
      majorStep(stepOrZero(majorStep)),
      formatFlags(formatFlags),
      width(width),
      precision(precision),
      maxNumChars(maxNumChars) {}

template <typename T>
VariBoxParserLog<T>::VariBoxParserLog(const VariBoxParserLog& other)
    : VariBoxParserTyped<T>(other),
      minorStep(other.minorStep),
      majorStep(other.majorStep),
      formatFlags(other.formatFlags),
      width(other.width),
      precision(other.precision),
      maxNumChars(other.maxNumChars) {}

template <typename T>
VariBoxParserLog<T>& VariBoxParserLog<T>::operator=(const VariBoxParserLog& other) {
  if (this == &other) return *this;
  VariBoxParserTyped<T>::operator=(other);
  minorStep = other.minorStep;
  majorStep = other.majorStep;
  formatFlags = other.formatFlags;
  width = other.width;
  precision = other.precision;
  maxNumChars = other.maxNumChars;
  return *this;
}

template <typename T>
String VariBoxParserLog<T>::allowedCharacters() const {
  String chars;
  if (min < 0) {
    chars += "-";
    if (max > 0) chars += "+";
  }
  if constexpr (std::is_floating_point_v<T>) chars += ".";
  const auto base = static_cast<std::ios_base::fmtflags>(formatFlags) & std::ios_base::basefield;
  if (base == std::ios_base::oct) {
    chars += "01234567";
  } else if (base == std::ios_base::hex) {
    chars += "0123456789ABCDEF";
  } else {
    chars += "0123456789";
  }
  return chars;
}

template <typename T>
void VariBoxParserLog<T>::init() {
  setAllowedCharacters(allowedCharacters());
  if (maxNumChars != 0) setMaxNumChars(maxNumChars);
  if (setValueInternal(value, 1)) notifyValidatedTextChange(false);
}

template <typename T>
double VariBoxParserLog<T>::getPositionWithinRange() {
  return ParserArithmetic<T>::logPosition(value, min, max);
}

template <typename T>
bool VariBoxParserLog<T>::setPositionWithinRange(double p) {
  return setValueInternal(ParserArithmetic<T>::valueAtLogPosition(p, min, max), 2);
}

template <typename T>
bool VariBoxParserLog<T>::incInternal(double step) {
  if (value == max || value == ParserArithmetic<T>::largest()) return false;
  return setPositionWithinRange(getPositionWithinRange() + step);
}

template <typename T>
bool VariBoxParserLog<T>::decInternal(double step) {
  if (value == min || value == ParserArithmetic<T>::lowest()) return false;
  return setPositionWithinRange(getPositionWithinRange() - step);
}

template <typename T>
bool VariBoxParserLog<T>::handleParseText() {
  std::wistringstream in(text);
  T parsed{};
  in >> parsed;
  if (in.fail()) return setValueInternal(value, 1);
  if (scaled) parsed = ParserArithmetic<T>::scaleDown(parsed, scale);
  return setValueInternal(parsed, 3);
}

template <typename T>
WString VariBoxParserLog<T>::valueToString(T v) const {
  std::wostringstream out;
  // Widths and precisions past what any box shows are held to kMaxField, so that a wild
  // setting cannot ask the stream for an enormous string.
  if (width != -1) out.width(static_cast<std::streamsize>(std::min<int64_t>(width, kMaxField)));
  if (precision != -1) {
    out.precision(static_cast<std::streamsize>(std::min<int64_t>(precision, kMaxField)));
  }
  const auto flags = static_cast<std::ios_base::fmtflags>(formatFlags);
  out.flags(out.flags() | flags);
  // A base asked for replaces the stream's decimal default rather than mixing with it.
  if (flags & std::ios_base::basefield) out.setf(flags, std::ios_base::basefield);
  out << v;
  return out.str();
}

template class VariBoxParserLog<int>;
template class VariBoxParserLog<unsigned int>;
template class VariBoxParserLog<float>;
template class VariBoxParserLog<double>;
