#pragma once
// A ready-made displayer: the value as a number followed by a unit suffix (L" Hz", L" s",
// L" fr"), with a chosen number of decimals for the floating types. Typing may leave the unit
// out. The integer, decimal and percentage displayers are this one with fixed settings.
//
// Choices made here:
// - Text that cannot be read gives back the value last shown (integers), or NaN (floating
//   types), which the parser refuses: either way the old value and its text come back.
// - The maximum length is the constructor's; 0 sets none.
#include "values/NumberText.h"
#include "values/VariBoxParserBasicDisplayerBase.h"

template <typename T>
class UnitDisplayer : public VariBoxParserBasicDisplayerBase<T> {
 public:
  explicit UnitDisplayer(const WString& suffix, int decimals = 0, unsigned char maxNumChars = 0);
  virtual ~UnitDisplayer() = default;

  WString format(T value) override;
  T parse(const WString& text) override;
  String getAllowedCharacters() override;
  unsigned char getMaxNumChars() override { return maxNumChars_; }

  const WString& suffix() const { return suffix_; }
  int decimals() const { return decimals_; }

 private:
  WString suffix_;
  int decimals_;
  unsigned char maxNumChars_;
  T lastShown_{};
};

extern template class UnitDisplayer<int>;
extern template class UnitDisplayer<unsigned int>;
extern template class UnitDisplayer<float>;
extern template class UnitDisplayer<double>;
