#pragma once
// Narrow (UTF-8) and wide strings of the core module, with lossless-or-replaced conversion.
#include <string>
#include <string_view>

using String = std::string;
using WString = std::wstring;

namespace Kw {

// Decodes UTF-8 into wide characters. Malformed sequences, overlong forms, surrogates and code
// points above U+10FFFF each become U+FFFD; decoding never stops early.
WString toWide(std::string_view utf8);

// Encodes wide characters as UTF-8. Lone surrogates and values above U+10FFFF become U+FFFD.
String toUtf8(std::wstring_view wide);

// True when the bytes are well-formed UTF-8.
bool isValidUtf8(std::string_view bytes);

}  // namespace Kw
