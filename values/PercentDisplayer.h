#pragma once
// A ready-made displayer for percentages ("75%", "12.5%"). A value kept as a fraction of one
// is shown in percent by giving the parser a scale of 100.
#include "values/UnitDisplayer.h"

template <typename T>
class PercentDisplayer : public UnitDisplayer<T> {
 public:
  explicit PercentDisplayer(int decimals = 0, unsigned char maxNumChars = 0)
      : UnitDisplayer<T>(L"%", decimals, maxNumChars) {}
};
