#include "platform/misc/PreferenceCodec.h"

#include "platform/misc/BackslashEscapes.h"

#include <set>

namespace {

const char kHeader[] = "# globkit preferences: key=value, escaped; see PreferenceCodec.h\n";

// Length of the well-formed UTF-8 sequence starting at `i`, or 0 when there is none.
std::size_t utf8Length(std::string_view s, std::size_t i) {
  const auto lead = static_cast<unsigned char>(s[i]);
  std::size_t len = 0;
  if (lead >= 0xC2 && lead <= 0xDF) {
    len = 2;
  } else if (lead >= 0xE0 && lead <= 0xEF) {
    len = 3;
  } else if (lead >= 0xF0 && lead <= 0xF4) {
    len = 4;
  }
  if (len == 0 || i + len > s.size()) return 0;
  return Kw::isValidUtf8(s.substr(i, len)) ? len : 0;
}

void appendHex(String& out, unsigned char byte) {
  static const char digits[] = "0123456789abcdef";
  out += "\\x";
  out += digits[byte >> 4];
  out += digits[byte & 0xF];
}

}  // namespace

String PreferenceCodec::escape(std::string_view bytes, bool isKey) {
  String out;
  out.reserve(bytes.size());
  for (std::size_t i = 0; i < bytes.size();) {
    const auto c = static_cast<unsigned char>(bytes[i]);
    if (c >= 0x80) {
      if (const std::size_t len = utf8Length(bytes, i)) {
        out.append(bytes.substr(i, len));
        i += len;
      } else {
        appendHex(out, c);
        ++i;
      }
      continue;
    }
    switch (c) {
      case '\\':
        out += "\\\\";
        break;
      case '\n':
        out += "\\n";
        break;
      case '\r':
        out += "\\r";
        break;
      case '\t':
        out += "\\t";
        break;
      case '=':
        out += isKey ? "\\=" : "=";
        break;
      case '#':
        if (isKey && i == 0) {
          appendHex(out, c);
        } else {
          out += '#';
        }
        break;
      default:
        if (c < 0x20 || c == 0x7F) {
          appendHex(out, c);
        } else {
          out += static_cast<char>(c);
        }
    }
    ++i;
  }
  return out;
}

bool PreferenceCodec::unescape(std::string_view text, String& out) {
  return BackslashEscapes::decode(text, out, BackslashEscapes::Set::WithBytes);
}

String PreferenceCodec::serialise(const Entries& entries) {
  String out = kHeader;
  for (const auto& [key, value] : entries) {
    out += escape(key, true);
    out += '=';
    out += escape(value, false);
    out += '\n';
  }
  return out;
}

PreferenceCodec::ParseResult PreferenceCodec::parse(std::string_view text, Entries& out) {
  ParseResult result;
  std::set<String> seen;
  int lineNo = 0;
  while (!text.empty()) {
    const std::size_t end = text.find('\n');
    std::string_view line = text.substr(0, end);
    text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
    ++lineNo;
    // Tolerate a file whose line ends were converted by an editor.
    if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
    if (line.empty() || line.front() == '#') continue;

    // The separator is the first '=' not preceded by an escaping backslash.
    std::size_t sep = std::string_view::npos;
    for (std::size_t i = 0; i < line.size(); ++i) {
      if (line[i] == '\\') {
        ++i;
      } else if (line[i] == '=') {
        sep = i;
        break;
      }
    }
    String key;
    String value;
    if (sep == std::string_view::npos || sep == 0 || !unescape(line.substr(0, sep), key) ||
        !unescape(line.substr(sep + 1), value)) {
      result.corruptLines.push_back(lineNo);
      continue;
    }
    if (!seen.insert(key).second) result.duplicateLines.push_back(lineNo);
    out[key] = std::move(value);
  }
  return result;
}
