#pragma once
// How a linear value-box parser turns its values into text and back: the client supplies it.
// The parser borrows the displayer and never deletes it, so it has no virtual destructor; one
// displayer may serve several parsers.
#include "platform/kw/String.h"

template <typename T>
class VariBoxParserBasicDisplayerBase {
 public:
  // The text shown for a value (already multiplied by the parser's scale when it has one).
  virtual WString format(T value) = 0;
  // The value typed (the parser divides by its scale afterwards). Whatever the displayer
  // returns for text it cannot read is what the parser takes.
  virtual T parse(const WString& text) = 0;
  // The characters the box accepts.
  virtual String getAllowedCharacters() = 0;
  // The longest text accepted; 0 means no limit is set.
  virtual unsigned char getMaxNumChars() = 0;

 protected:
  ~VariBoxParserBasicDisplayerBase() = default;
};
