#pragma once
// A configuration record: a small set of text values by key. Globs load their settings from
// one and dump them into one; the process keeps one for its numeric settings (Config.h).
//
// Text form, one entry per line: `key = value`. Spaces and tabs around the key and the value
// are dropped; blank lines and lines whose first non-blank character is '#' are ignored. A line
// with no '=' or an empty key is reported and skipped. When a key appears twice, the later
// line wins, so that a file can override itself.
#include <cstddef>
#include <map>
#include <set>
#include <string_view>

#include "platform/kw/String.h"

class configb {
 public:
  configb() = default;

  // Replaces the entries with those of the file. When the file cannot be read, the entries
  // are kept, a diagnostic is printed and false is returned.
  bool loadFile(const String& path);
  // Replaces the entries with those of `text`; `origin` names it in diagnostics.
  void loadText(std::string_view text, const String& origin = "configuration");

  void set(const String& key, const String& value) { entries_[key] = value; }
  bool has(const String& key) const { return entries_.count(key) != 0; }
  // The value, or null when the key is missing.
  const String* find(const String& key) const;
  String get(const String& key, const String& def = String()) const;
  bool remove(const String& key) { return entries_.erase(key) != 0; }
  void clear() {
    entries_.clear();
    reported_.clear();
  }
  std::size_t size() const { return entries_.size(); }
  const std::map<String, String>& entries() const { return entries_; }

  // True the first time it is asked about this key and value: readers that find a bad value
  // report it once, not at every read.
  bool firstReportOf(const String& key, const String& value) const;

 private:
  std::map<String, String> entries_;
  mutable std::set<String> reported_;
};
