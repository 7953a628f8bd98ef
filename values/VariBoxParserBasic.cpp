#include "values/VariBoxParserBasic.h"

#include "values/ParserArithmetic.h"

template <typename T>
VariBoxParserBasic<T>::VariBoxParserBasic(VariBox* owner,
                                          VariBoxParserBasicDisplayerBase<T>* displayer, T min,
                                          T max, T minorStep, T majorStep, T value, T scale)
    : VariBoxParserTyped<T>(owner, min, max, value, scale),
      displayer(displayer),
      minorStep(ParserArithmetic<T>::orIfNaN(minorStep, T{})),
      majorStep(ParserArithmetic<T>::orIfNaN(majorStep, T{})) {}

template <typename T>
VariBoxParserBasic<T>::VariBoxParserBasic(const VariBoxParserBasic& other)
    : VariBoxParserTyped<T>(other),
      displayer(other.displayer),
      minorStep(other.minorStep),
      majorStep(other.majorStep) {}

template <typename T>
VariBoxParserBasic<T>& VariBoxParserBasic<T>::operator=(const VariBoxParserBasic& other) {
  if (this == &other) return *this;
  VariBoxParserTyped<T>::operator=(other);
  displayer = other.displayer;
  minorStep = other.minorStep;
  majorStep = other.majorStep;
  return *this;
}

template <typename T>
void VariBoxParserBasic<T>::init() {
  if (displayer) {
    setAllowedCharacters(displayer->getAllowedCharacters());
    if (const unsigned char n = displayer->getMaxNumChars()) setMaxNumChars(n);
  }
  if (setValueInternal(value, 1)) notifyValidatedTextChange(false);
}

template <typename T>
bool VariBoxParserBasic<T>::incInternal(T step) {
  if (value == max || value == ParserArithmetic<T>::largest()) return false;
  return setValueInternal(ParserArithmetic<T>::up(value, step), 2);
}

template <typename T>
bool VariBoxParserBasic<T>::decInternal(T step) {
  if (value == min || value == ParserArithmetic<T>::lowest()) return false;
  return setValueInternal(ParserArithmetic<T>::down(value, step), 2);
}

template <typename T>
bool VariBoxParserBasic<T>::handleParseText() {
  T parsed = displayer ? displayer->parse(text) : value;
  if (displayer && scaled) parsed = ParserArithmetic<T>::scaleDown(parsed, scale);
  return setValueInternal(parsed, 3);
}

template <typename T>
double VariBoxParserBasic<T>::getPositionWithinRange() {
  return ParserArithmetic<T>::linearPosition(value, min, max);
}

template <typename T>
WString VariBoxParserBasic<T>::valueToString(T v) const {
  return displayer ? displayer->format(v) : WString();
}

template class VariBoxParserBasic<int>;
template class VariBoxParserBasic<unsigned int>;
template class VariBoxParserBasic<float>;
template class VariBoxParserBasic<double>;
