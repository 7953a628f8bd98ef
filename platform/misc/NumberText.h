#pragma once
// Numbers as they are written in configuration and preference files: decimal, parsed as a
// whole (surrounding spaces and tabs and one leading '+' allowed), doubles finite.
#include <string_view>

#include "platform/kw/String.h"

class NumberText {
 public:
  enum class Result { Ok, Malformed, OutOfRange, NotFinite };

  // `out` is changed only when the result is Ok.
  static Result parse(std::string_view text, int& out);
  static Result parse(std::string_view text, double& out);
  // The shortest text that parses back to the same double.
  static String format(double value);
  // "is not a number", "is out of range", ...
  static const char* describe(Result result);
};
