#include "values/VariBoxParserBasic.h"

#include "values/ParserArithmetic.h"

namespace {

template <typename T>
T orIfNaN(T v, T fallback) {
  return ParserArithmetic<T>::isNaN(v) ? fallback : v;
}

}  // namespace

template <typename T>
VariBoxParserBasic<T>::VariBoxParserBasic(VariBox* owner,
                                          VariBoxParserBasicDisplayerBase<T>* displayer, T min,
                                          T max, T minorStep, T majorStep, T value, T scale)
    : VariBoxParserBase(owner),
      displayer(displayer),
      min(orIfNaN(min, ParserArithmetic<T>::lowest())),
      max(orIfNaN(max, ParserArithmetic<T>::largest())),
      minorStep(orIfNaN(minorStep, T{})),
      majorStep(orIfNaN(majorStep, T{})),
      value(orIfNaN(value, this->min)),
      scale(scale),
      scaled(scale > 0) {}

template <typename T>
VariBoxParserBasic<T>::VariBoxParserBasic(const VariBoxParserBasic& other)
    : ValWidget<T>(), VariBoxParserBase(other) {
  *this = other;
}

template <typename T>
VariBoxParserBasic<T>& VariBoxParserBasic<T>::operator=(const VariBoxParserBasic& other) {
  if (this == &other) return *this;
  VariBoxParserBase::operator=(other);
  this->setAdaptor(other.getAdaptor());
  displayer = other.displayer;
  min = other.min;
  max = other.max;
  minorStep = other.minorStep;
  majorStep = other.majorStep;
  value = other.value;
  scale = other.scale;
  scaled = other.scaled;
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
bool VariBoxParserBasic<T>::setValueInternal(T v, int flags) {
  using A = ParserArithmetic<T>;
  if (!A::isNaN(v)) v = A::clamp(v, min, max);
  if (!A::isNaN(v) && !(v == value)) {
    value = v;
    text = valueToString(scaled ? A::scaleUp(v, scale) : v);
    // The model may delete the box, and this parser with it: nothing is touched afterwards.
    if (flags & 2) this->requestSetNewDataValue(v, getDataChangeType());
    return true;
  }
  if (flags & 1) {
    WString refreshed = valueToString(scaled ? A::scaleUp(value, scale) : value);
    if (refreshed != text) {
      text = std::move(refreshed);
      return true;
    }
  }
  return false;
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
bool VariBoxParserBasic<T>::handleNoChange() {
  return this->requestSetNewDataValue(value, getDataChangeType());
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
void VariBoxParserBasic<T>::setNewWidgetValue(T& v) {
  if (setValueInternal(v, 0)) notifyValidatedTextChange(false);
}

template <typename T>
bool VariBoxParserBasic<T>::setValue(T v) {
  const PublishGuard guard(this);
  const bool changed = setValueInternal(v, 2);
  if (changed && guard.parserAlive()) notifyValidatedTextChange(false);
  return changed;
}

template <typename T>
WString VariBoxParserBasic<T>::valueToString(T v) {
  return displayer ? displayer->format(v) : WString();
}

template class VariBoxParserBasic<int>;
template class VariBoxParserBasic<unsigned int>;
template class VariBoxParserBasic<float>;
template class VariBoxParserBasic<double>;
