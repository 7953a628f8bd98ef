#include "platform/misc/configb.h"

#include "platform/misc/Diagnostics.h"
#include "platform/misc/FileText.h"

namespace {

std::string_view trimmed(std::string_view s) {
  const auto blank = [](char c) { return c == ' ' || c == '\t' || c == '\r'; };
  while (!s.empty() && blank(s.front())) s.remove_prefix(1);
  while (!s.empty() && blank(s.back())) s.remove_suffix(1);
  return s;
}

}  // namespace

bool configb::loadFile(const String& path) {
  String text;
  String error;
  switch (FileText::read(path, text, error)) {
    case FileText::ReadResult::Missing:
      diagWarning("configb: no configuration file " + path);
      return false;
    case FileText::ReadResult::Failed:
      diagWarning("configb: " + error);
      return false;
    case FileText::ReadResult::Ok:
      break;
  }
  loadText(text, path);
  return true;
}

void configb::loadText(std::string_view text, const String& origin) {
  clear();
  int lineNo = 0;
  while (!text.empty()) {
    const std::size_t end = text.find('\n');
    const std::string_view line = trimmed(text.substr(0, end));
    text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
    ++lineNo;
    if (line.empty() || line.front() == '#') continue;
    const std::size_t eq = line.find('=');
    const std::string_view key = eq == std::string_view::npos ? line : trimmed(line.substr(0, eq));
    if (eq == std::string_view::npos || key.empty()) {
      diagWarning("configb: " + origin + ":" + std::to_string(lineNo) + ": malformed line skipped");
      continue;
    }
    entries_[String(key)] = String(trimmed(line.substr(eq + 1)));
  }
}

const String* configb::find(const String& key) const {
  const auto it = entries_.find(key);
  return it == entries_.end() ? nullptr : &it->second;
}

String configb::get(const String& key, const String& def) const {
  const String* v = find(key);
  return v != nullptr ? *v : def;
}

bool configb::firstReportOf(const String& key, const String& value) const {
  return reported_.insert(key + '\0' + value).second;
}
