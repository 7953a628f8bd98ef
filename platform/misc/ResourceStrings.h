#pragma once
// The resource string table: user-interface texts by number.
//
// File form (UTF-8), one string per line: the id in decimal, a tab, the text. In the text,
// \t \n \r and \\ stand for tab, line feed, carriage return and backslash; no other escape
// exists. Blank lines and lines starting with '#' are ignored. A line with a bad id (not a
// decimal number that fits in unsigned int), no tab, or a bad escape is reported and skipped.
// Invalid UTF-8 in a text is kept with U+FFFD in place of each bad sequence, and reported. When
// an id appears twice, the first text is kept and the later line is reported and skipped.
//
// Looking up an unknown id asks the table's fallback, if it has one; failing that it gives the
// visible placeholder "[missing string <id>]" and a diagnostic the first time that id is asked
// for.
#include <map>
#include <set>
#include <string_view>

#include "platform/kw/String.h"

class ResourceStrings {
 public:
  // Replaces the table with the file's strings. When the file cannot be read, the table is
  // kept, a diagnostic is printed and false is returned.
  bool loadFile(const String& path);
  // Replaces the table with the strings of `text`; `origin` names it in diagnostics.
  void loadText(std::string_view text, const String& origin = "strings");

  // Adds or replaces one string.
  void set(unsigned int id, const WString& text) { table_[id] = text; }
  bool contains(unsigned int id) const { return table_.count(id) != 0; }
  WString lookup(unsigned int id) const;
  std::size_t size() const { return table_.size(); }
  // Empties the table; the fallback stays.
  void clear();
  // The table asked for ids this one lacks (null for none). It must outlive this table.
  void setFallback(const ResourceStrings* fallback) { fallback_ = fallback; }

  static WString placeholder(unsigned int id);

 private:
  std::map<unsigned int, WString> table_;
  const ResourceStrings* fallback_ = nullptr;
  // Ids already reported missing.
  mutable std::set<unsigned int> reported_;
};

// The application's string table, empty until the application loads one. Its fallback is
// libraryStrings(), so that the library's own texts show even when the application's table
// lacks them.
ResourceStrings& resourceStrings();
// The library's default texts (LibraryStrings.cpp).
const ResourceStrings& libraryStrings();
