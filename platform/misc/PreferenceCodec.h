#pragma once
// The text form of the preferences file. One entry per line, `key=value`; lines that are empty
// or start with '#' are ignored. Keys and values hold any bytes, so both are escaped:
//
//   \\  backslash          \n \r \t  line feed, carriage return, tab
//   \=  '=' (in keys)      \xHH      any byte, two hex digits
//
// The writer keeps printable ASCII and well-formed UTF-8 as they are (the file stays readable),
// writes other control bytes and bytes that are not part of well-formed UTF-8 as \xHH, and
// escapes a '#' that would begin a line. The first unescaped '=' separates key from value.
#include <map>
#include <string_view>
#include <vector>

#include "platform/kw/String.h"

class PreferenceCodec {
 public:
  using Entries = std::map<String, String>;

  struct ParseResult {
    std::vector<int> corruptLines;    // 1-based; skipped
    std::vector<int> duplicateLines;  // 1-based; the later entry replaced the earlier one
  };

  static String escape(std::string_view bytes, bool isKey);
  // False when the text holds an escape that the writer never produces.
  static bool unescape(std::string_view text, String& out);

  static String serialise(const Entries& entries);
  // Adds the good lines of `text` to `out`.
  static ParseResult parse(std::string_view text, Entries& out);
};
