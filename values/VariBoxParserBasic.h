#pragma once
// The linear value-box parser for int, unsigned int, float and double: a value clamped to
// [min, max], stepped by a minor and a major step with saturation at the type's limits (see
// ParserArithmetic), shown through a client-supplied displayer, optionally multiplied by a
// display scale. Every change goes through setValueInternal:
//
//   caller                    flags   then
//   init                      1       notifyValidatedTextChange(false) when it changed
//   inc / dec steps           2       (the handler's result tells the box)
//   handleParseText           3
//   setValue                  2       notifyValidatedTextChange(false) when it changed
//   setNewWidgetValue         0       notifyValidatedTextChange(false) when it changed
//
// Flag bit 0 refreshes the text even when the value is unchanged; bit 1 publishes a changed
// value to the binding with the data-change type that the box last set.
//
// Choices made here:
// - NaN is refused wherever it comes from (typed, stepped, pushed by the model, given to the
//   constructor): the previous value stays, and with bit 0 its text is put back. A NaN given
//   as min or max stands for the type's lowest or largest value; a NaN value for min.
//   Infinities are ordinary values and clamp to the range.
// - The scale applies when it is above 0; a scale of 0, negative or NaN shows the raw value.
// - A parser without a displayer shows nothing and reads every text as its current value.
// - Copies share the displayer and are bound to the same adaptor as the original.
#include "foundation/ValWidget.h"
#include "values/VariBoxParserBase.h"
#include "values/VariBoxParserBasicDisplayerBase.h"

template <typename T>
class VariBoxParserBasic : public ValWidget<T>, public VariBoxParserBase {
 public:
  VariBoxParserBasic(VariBox* owner, VariBoxParserBasicDisplayerBase<T>* displayer, T min, T max,
                     T minorStep, T majorStep, T value, T scale);
  VariBoxParserBasic(const VariBoxParserBasic& other);
  VariBoxParserBasic& operator=(const VariBoxParserBasic& other);
  ~VariBoxParserBasic() override = default;

  // --- VariBoxParserBase ---
  void init() override;
  bool handleMajorInc() override { return incInternal(majorStep); }
  bool handleMinorInc() override { return incInternal(minorStep); }
  bool handleMajorDec() override { return decInternal(majorStep); }
  bool handleMinorDec() override { return decInternal(minorStep); }
  bool handleNoChange() override;
  bool handleParseText() override;
  double getPositionWithinRange() override;

  // --- ValWidget<T> ---
  T getWidgetValue() override { return value; }
  void setNewWidgetValue(T& v) override;
  void setEnabledState(bool enabled) override { setEnabled(enabled); }

  // A programmatic change: published, but no message is sent. True when it changed.
  bool setValue(T v);
  T getValue() const { return value; }
  T getMin() const { return min; }
  T getMax() const { return max; }

 private:
  bool setValueInternal(T v, int flags);
  bool incInternal(T step);
  bool decInternal(T step);
  WString valueToString(T v);

  VariBoxParserBasicDisplayerBase<T>* displayer;
  T min;
  T max;
  T minorStep;
  T majorStep;
  T value;
  T scale;
  bool scaled;
};

extern template class VariBoxParserBasic<int>;
extern template class VariBoxParserBasic<unsigned int>;
extern template class VariBoxParserBasic<float>;
extern template class VariBoxParserBasic<double>;
