#pragma once
// What the linear and the logarithmic parsers share: a value of type T clamped to [min, max],
// an optional display scale, the binding to a model value, and setValueInternal, the single
// path of every change. A family decides how a value becomes text (valueToString) and how it
// steps.
//
// setValueInternal's flags: bit 0 refreshes the text even when the value is unchanged; bit 1
// publishes a changed value to the binding with the data-change type that the box last set.
// NaN is refused wherever it comes from: the previous value stays, and with bit 0 its text is
// put back. A NaN given as min or max stands for the type's lowest or largest value; a NaN
// value for min. The scale applies when it is above 0.
#include "foundation/ValWidget.h"
#include "values/VariBoxParserBase.h"

template <typename T>
class VariBoxParserTyped : public ValWidget<T>, public VariBoxParserBase {
 public:
  ~VariBoxParserTyped() override = default;

  // --- VariBoxParserBase ---
  bool handleNoChange() override;

  // --- ValWidget<T> ---
  T getWidgetValue() override { return value; }
  void setNewWidgetValue(T& v) override;
  void setEnabledState(bool enabled) override { setEnabled(enabled); }

  // A programmatic change: published, but no message is sent. True when it changed.
  bool setValue(T v);
  T getValue() const { return value; }
  T getMin() const { return min; }
  T getMax() const { return max; }

 protected:
  VariBoxParserTyped(VariBox* owner, T min, T max, T value, T scale);
  VariBoxParserTyped(const VariBoxParserTyped& other);
  VariBoxParserTyped& operator=(const VariBoxParserTyped& other);

  bool setValueInternal(T v, int flags);
  virtual WString valueToString(T v) const = 0;

  T min;
  T max;
  T value;
  T scale;
  bool scaled;
};

extern template class VariBoxParserTyped<int>;
extern template class VariBoxParserTyped<unsigned int>;
extern template class VariBoxParserTyped<float>;
extern template class VariBoxParserTyped<double>;
