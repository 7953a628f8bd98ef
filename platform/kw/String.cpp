#include "platform/kw/String.h"

namespace Kw {
namespace {

constexpr wchar_t kReplacement = 0xFFFD;

// Length of the sequence a lead byte announces, 0 when the byte cannot start one.
int sequenceLength(unsigned char lead) {
  if (lead < 0x80) return 1;
  if (lead >= 0xC2 && lead <= 0xDF) return 2;
  if (lead >= 0xE0 && lead <= 0xEF) return 3;
  if (lead >= 0xF0 && lead <= 0xF4) return 4;
  return 0;
}

// Decodes one code point at `i`; advances `i` past it (or past one bad byte) and returns
// the code point, or -1 for a malformed sequence.
long decodeOne(std::string_view s, size_t& i) {
  const auto lead = static_cast<unsigned char>(s[i]);
  const int len = sequenceLength(lead);
  if (len == 0) {
    ++i;
    return -1;
  }
  if (len == 1) {
    ++i;
    return lead;
  }
  long cp = lead & (0x7F >> len);
  size_t j = i + 1;
  for (int k = 1; k < len; ++k, ++j) {
    if (j >= s.size()) {
      i = j;
      return -1;
    }
    const auto c = static_cast<unsigned char>(s[j]);
    if ((c & 0xC0) != 0x80) {
      i = j;  // resume at the byte that broke the sequence
      return -1;
    }
    cp = (cp << 6) | (c & 0x3F);
  }
  i = j;
  const bool overlong = (len == 3 && cp < 0x800) || (len == 4 && cp < 0x10000);
  const bool surrogate = cp >= 0xD800 && cp <= 0xDFFF;
  if (overlong || surrogate || cp > 0x10FFFF) return -1;
  return cp;
}

void appendUtf8(String& out, unsigned long cp) {
  if (cp < 0x80) {
    out += static_cast<char>(cp);
  } else if (cp < 0x800) {
    out += static_cast<char>(0xC0 | (cp >> 6));
    out += static_cast<char>(0x80 | (cp & 0x3F));
  } else if (cp < 0x10000) {
    out += static_cast<char>(0xE0 | (cp >> 12));
    out += static_cast<char>(0x80 | ((cp >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (cp & 0x3F));
  } else {
    out += static_cast<char>(0xF0 | (cp >> 18));
    out += static_cast<char>(0x80 | ((cp >> 12) & 0x3F));
    out += static_cast<char>(0x80 | ((cp >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (cp & 0x3F));
  }
}

}  // namespace

WString toWide(std::string_view utf8) {
  WString out;
  out.reserve(utf8.size());
  size_t i = 0;
  while (i < utf8.size()) {
    const long cp = decodeOne(utf8, i);
    out += cp < 0 ? kReplacement : static_cast<wchar_t>(cp);
  }
  return out;
}

String toUtf8(std::wstring_view wide) {
  String out;
  out.reserve(wide.size());
  for (wchar_t w : wide) {
    auto cp = static_cast<unsigned long>(static_cast<std::make_unsigned_t<wchar_t>>(w));
    if ((cp >= 0xD800 && cp <= 0xDFFF) || cp > 0x10FFFF) cp = 0xFFFD;
    appendUtf8(out, cp);
  }
  return out;
}

bool isValidUtf8(std::string_view bytes) {
  size_t i = 0;
  while (i < bytes.size()) {
    if (decodeOne(bytes, i) < 0) return false;
  }
  return true;
}

}  // namespace Kw
