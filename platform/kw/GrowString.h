#pragma once
// A text built up by appending, for descriptions that many objects add to in turn.
#include <string_view>

#include "platform/kw/String.h"

class GrowString {
 public:
  GrowString& append(std::string_view s) {
    text_.append(s);
    return *this;
  }
  GrowString& operator<<(std::string_view s) { return append(s); }
  GrowString& operator<<(long long n) { return append(std::to_string(n)); }
  const String& str() const { return text_; }
  bool empty() const { return text_.empty(); }
  void clear() { text_.clear(); }

 private:
  String text_;
};
