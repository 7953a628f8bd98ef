#pragma once
// A saved layout of an application's top Globs (panels, tool windows) in a file of its own.
//
// The file is a header line, the application's name, the id paths of the Globs it holds, their
// dumped entries and a closing line that counts the entries:
//
//   # globkit layout
//   layout.format = 1
//   layout.application = gallery
//   layout.globs = gallery/pages|gallery/log
//   gallery/pages.x = 24
//   ...
//   layout.end = 14
//
// It is written atomically (a temporary file renamed over the old one), so a crash leaves the
// previous layout. restore refuses, with a diagnostic and nothing changed, a file that is
// missing, unreadable, not a layout, of another application or format, cut short, or made for
// another set of Globs; the caller then keeps its default layout. Numbers out of range are
// refused by each Glob's load, which keeps that Glob as it was.
#include <vector>

#include "platform/kw/String.h"

class Glob;
class configb;

class GlobLayoutFile {
 public:
  static constexpr int kFormat = 1;

  GlobLayoutFile(String path, String application);

  const String& path() const { return path_; }
  // Why the last save or restore failed; empty after a success.
  const String& lastError() const { return error_; }

  // Dumps every Glob of `globs` (null or deleted ones are left out) and writes the file.
  bool save(const std::vector<Glob*>& globs);
  // Reads the file and loads every Glob of `globs` from it. False when the file was refused
  // or some Glob refused its entries.
  bool restore(const std::vector<Glob*>& globs);

  // The text save writes, and its reading back into entries (false with lastError set when
  // the text is refused); for tests and tools.
  String compose(const std::vector<Glob*>& globs);
  bool parse(const String& text, const std::vector<Glob*>& globs, configb& out);

 private:
  bool fail(const String& why);

  String path_;
  String application_;
  String error_;
};
