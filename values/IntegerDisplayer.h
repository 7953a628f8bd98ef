#pragma once
// A ready-made displayer for whole numbers in decimal ("-12", "4800"), for int and unsigned
// int; unsigned boxes accept no sign.
#include "values/UnitDisplayer.h"

template <typename T>
class IntegerDisplayer : public UnitDisplayer<T> {
 public:
  explicit IntegerDisplayer(unsigned char maxNumChars = 0)
      : UnitDisplayer<T>(WString(), 0, maxNumChars) {}
};
