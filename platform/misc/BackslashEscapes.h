#pragma once
// Backslash escapes shared by the library's text files: \\ \n \r \t always; \= and \xHH (any
// byte) where the file format allows them.
#include <string_view>

#include "platform/kw/String.h"

class BackslashEscapes {
 public:
  enum class Set { Basic, WithBytes };

  // Decodes `text` into `out`. False on an escape outside `set` or one cut short.
  static bool decode(std::string_view text, String& out, Set set);
};
