#pragma once
// The linear value-box parser for int, unsigned int, float and double: a value clamped to
// [min, max], stepped by a minor and a major step with saturation at the type's limits (see
// ParserArithmetic), shown through a client-supplied displayer, optionally multiplied by a
// display scale. Every change goes through setValueInternal (VariBoxParserTyped):
//
//   caller                    flags   then
//   init                      1       notifyValidatedTextChange(false) when it changed
//   inc / dec steps           2       (the handler's result tells the box)
//   handleParseText           3
//   setValue                  2       notifyValidatedTextChange(false) when it changed
//   setNewWidgetValue         0       notifyValidatedTextChange(false) when it changed
//
// Choices made here (the NaN and scale rules are VariBoxParserTyped's):
// - Infinities are ordinary values and clamp to the range; a scale of 0, negative or NaN shows
//   the raw value.
// - A parser without a displayer shows nothing and reads every text as its current value.
// - Copies share the displayer and are bound to the same adaptor as the original.
#include "values/VariBoxParserBasicDisplayerBase.h"
#include "values/VariBoxParserTyped.h"

template <typename T>
class VariBoxParserBasic : public VariBoxParserTyped<T> {
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
  bool handleParseText() override;
  double getPositionWithinRange() override;

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

  bool incInternal(T step);
  bool decInternal(T step);
  WString valueToString(T v) const override;

  VariBoxParserBasicDisplayerBase<T>* displayer;
  T minorStep;
  T majorStep;
};

extern template class VariBoxParserBasic<int>;
extern template class VariBoxParserBasic<unsigned int>;
extern template class VariBoxParserBasic<float>;
extern template class VariBoxParserBasic<double>;
