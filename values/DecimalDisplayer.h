#pragma once
// A ready-made displayer for float and double with a fixed number of decimals ("0.250").
#include "values/UnitDisplayer.h"

template <typename T>
class DecimalDisplayer : public UnitDisplayer<T> {
 public:
  explicit DecimalDisplayer(int decimals, unsigned char maxNumChars = 0)
      : UnitDisplayer<T>(WString(), decimals, maxNumChars) {}
};
