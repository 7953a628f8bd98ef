#include "values/VariBoxParserTyped.h"

#include "values/ParserArithmetic.h"

template <typename T>
VariBoxParserTyped<T>::VariBoxParserTyped(VariBox* owner, T min, T max, T value, T scale)
    : VariBoxParserBase(owner),
      min(ParserArithmetic<T>::orIfNaN(min, ParserArithmetic<T>::lowest())),
      max(ParserArithmetic<T>::orIfNaN(max, ParserArithmetic<T>::largest())),
      value(ParserArithmetic<T>::orIfNaN(value, this->min)),
      scale(scale),
      scaled(scale > 0) {}

template <typename T>
VariBoxParserTyped<T>::VariBoxParserTyped(const VariBoxParserTyped& other)
    : ValWidget<T>(), VariBoxParserBase(other) {
  *this = other;
}

template <typename T>
VariBoxParserTyped<T>& VariBoxParserTyped<T>::operator=(const VariBoxParserTyped& other) {
  if (this == &other) return *this;
  VariBoxParserBase::operator=(other);
  this->setAdaptor(other.getAdaptor());
  min = other.min;
  max = other.max;
  value = other.value;
  scale = other.scale;
  scaled = other.scaled;
  return *this;
}

template <typename T>
bool VariBoxParserTyped<T>::setValueInternal(T v, int flags) {
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
bool VariBoxParserTyped<T>::handleNoChange() {
  return this->requestSetNewDataValue(value, getDataChangeType());
}

template <typename T>
void VariBoxParserTyped<T>::setNewWidgetValue(T& v) {
  if (setValueInternal(v, 0)) notifyValidatedTextChange(false);
}

template <typename T>
bool VariBoxParserTyped<T>::setValue(T v) {
  const PublishGuard guard(this);
  const bool changed = setValueInternal(v, 2);
  if (changed && guard.parserAlive()) notifyValidatedTextChange(false);
  return changed;
}

template class VariBoxParserTyped<int>;
template class VariBoxParserTyped<unsigned int>;
template class VariBoxParserTyped<float>;
template class VariBoxParserTyped<double>;
