#include "platform/misc/ResourceStrings.h"

#include "platform/misc/BackslashEscapes.h"

#include <charconv>

#include "platform/misc/Diagnostics.h"
#include "platform/misc/FileText.h"

namespace {

bool parseId(std::string_view s, unsigned int& id) {
  if (s.empty() || s.front() < '0' || s.front() > '9') return false;
  const auto [end, ec] = std::from_chars(s.data(), s.data() + s.size(), id);
  return ec == std::errc() && end == s.data() + s.size();
}

bool unescape(std::string_view s, String& out) {
  return BackslashEscapes::decode(s, out, BackslashEscapes::Set::Basic);
}

}  // namespace

bool ResourceStrings::loadFile(const String& path) {
  String text;
  String error;
  switch (FileText::read(path, text, error)) {
    case FileText::ReadResult::Missing:
      diagWarning("ResourceStrings: no string file " + path);
      return false;
    case FileText::ReadResult::Failed:
      diagWarning("ResourceStrings: " + error);
      return false;
    case FileText::ReadResult::Ok:
      break;
  }
  loadText(text, path);
  return true;
}

void ResourceStrings::loadText(std::string_view text, const String& origin) {
  clear();
  int lineNo = 0;
  String bytes;
  while (!text.empty()) {
    const std::size_t end = text.find('\n');
    std::string_view line = text.substr(0, end);
    text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
    ++lineNo;
    if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
    if (line.find_first_not_of(" \t") == std::string_view::npos || line.front() == '#') continue;

    const String where = "ResourceStrings: " + origin + ":" + std::to_string(lineNo) + ": ";
    const std::size_t tab = line.find('\t');
    unsigned int id = 0;
    if (tab == std::string_view::npos || !parseId(line.substr(0, tab), id) ||
        !unescape(line.substr(tab + 1), bytes)) {
      diagWarning(where + "malformed line skipped");
      continue;
    }
    if (table_.count(id) != 0) {
      diagWarning(where + "duplicate string id " + std::to_string(id) + " skipped");
      continue;
    }
    if (!Kw::isValidUtf8(bytes)) {
      diagWarning(where + "invalid UTF-8 in string " + std::to_string(id) + " replaced");
    }
    table_[id] = Kw::toWide(bytes);
  }
}

WString ResourceStrings::lookup(unsigned int id) const {
  const auto it = table_.find(id);
  if (it != table_.end()) return it->second;
  if (fallback_ && fallback_ != this && fallback_->contains(id)) return fallback_->lookup(id);
  if (reported_.insert(id).second) {
    diagWarning("ResourceStrings: missing string " + std::to_string(id));
  }
  return placeholder(id);
}

void ResourceStrings::clear() {
  table_.clear();
  reported_.clear();
}

WString ResourceStrings::placeholder(unsigned int id) {
  return L"[missing string " + std::to_wstring(id) + L"]";
}

ResourceStrings& resourceStrings() {
  static ResourceStrings table = [] {
    ResourceStrings t;
    t.setFallback(&libraryStrings());
    return t;
  }();
  return table;
}
