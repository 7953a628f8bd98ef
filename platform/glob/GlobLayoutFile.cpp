#include "platform/glob/GlobLayoutFile.h"

#include <sstream>

#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/FileText.h"
#include "platform/misc/configb.h"

namespace {

const String kHeader = "# globkit layout";
const String kPrefix = "layout.";

String trimmed(const String& s) {
  const size_t a = s.find_first_not_of(" \t\r");
  if (a == String::npos) return String();
  const size_t b = s.find_last_not_of(" \t\r");
  return s.substr(a, b - a + 1);
}

// The id paths of the live Globs, joined by '|'.
String globList(const std::vector<Glob*>& globs) {
  String out;
  for (Glob* g : globs) {
    if (!is_good_glob_ptr(g)) continue;
    if (!out.empty()) out += "|";
    out += g->idPath();
  }
  return out;
}

}  // namespace

GlobLayoutFile::GlobLayoutFile(String path, String application)
    : path_(std::move(path)), application_(std::move(application)) {}

bool GlobLayoutFile::fail(const String& why) {
  error_ = why;
  diagWarning("layout file " + path_ + ": " + why + "\n");
  return false;
}

String GlobLayoutFile::compose(const std::vector<Glob*>& globs) {
  configb entries;
  for (Glob* g : globs) {
    if (is_good_glob_ptr(g)) g->dump(entries);
  }
  String text = kHeader + "\n";
  text += kPrefix + "format = " + std::to_string(kFormat) + "\n";
  text += kPrefix + "application = " + application_ + "\n";
  text += kPrefix + "globs = " + globList(globs) + "\n";
  for (const auto& [key, value] : entries.entries()) text += key + " = " + value + "\n";
  text += kPrefix + "end = " + std::to_string(entries.size()) + "\n";
  return text;
}

bool GlobLayoutFile::save(const std::vector<Glob*>& globs) {
  error_.clear();
  String why;
  if (!FileText::writeAtomically(path_, compose(globs), why)) return fail(why);
  return true;
}

bool GlobLayoutFile::parse(const String& text, const std::vector<Glob*>& globs, configb& out) {
  error_.clear();
  out.clear();
  std::istringstream in(text);
  String line;
  if (!std::getline(in, line) || trimmed(line) != kHeader) return fail("not a layout file");
  configb head;
  size_t count = 0;
  bool ended = false;
  while (std::getline(in, line)) {
    const String t = trimmed(line);
    if (t.empty()) continue;
    if (ended) return fail("text after the closing line");
    const size_t eq = t.find('=');
    if (eq == String::npos || eq == 0) return fail("a line that is not 'key = value': " + t);
    const String key = trimmed(t.substr(0, eq));
    const String value = trimmed(t.substr(eq + 1));
    if (key.compare(0, kPrefix.size(), kPrefix) == 0) {
      if (key == kPrefix + "end") {
        if (value != std::to_string(count)) return fail("cut short or padded: entry count");
        ended = true;
      }
      head.set(key, value);
      continue;
    }
    out.set(key, value);
    ++count;
  }
  if (!ended) return fail("cut short: no closing line");
  if (head.get(kPrefix + "format") != std::to_string(kFormat)) return fail("another format");
  if (head.get(kPrefix + "application") != application_) {
    return fail("written by another application (" + head.get(kPrefix + "application") + ")");
  }
  if (head.get(kPrefix + "globs") != globList(globs)) {
    return fail("made for another set of panels");
  }
  if (out.size() != count) return fail("an entry given twice");
  return true;
}

bool GlobLayoutFile::restore(const std::vector<Glob*>& globs) {
  error_.clear();
  String text, why;
  switch (FileText::read(path_, text, why)) {
    case FileText::ReadResult::Missing:
      error_ = "no saved layout";
      return false;
    case FileText::ReadResult::Failed:
      return fail(why);
    case FileText::ReadResult::Ok:
      break;
  }
  configb entries;
  if (!parse(text, globs, entries)) return false;
  // A Glob's load may delete others of the list: each is checked before its turn.
  std::vector<GlobHandle<>> handles(globs.begin(), globs.end());
  bool ok = true;
  for (const auto& h : handles) {
    if (Glob* g = h.get(); g && !g->load(entries)) ok = false;
  }
  if (!ok) error_ = "some entries were refused";
  return ok;
}
