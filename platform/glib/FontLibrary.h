#pragma once
// The faces the library draws with, loaded from font files it names itself into a font
// configuration of its own. Nothing of the machine's font setup (installed fonts, aliases,
// preferred faces, hinting and anti-aliasing rules, the user's configuration file) takes part
// in resolving them, so text looks the same on every machine.
//
//   face asked for                         resolves to
//   ""                                     kDefaultFontFace (filled in by FontDesc)
//   sans, sans-serif, system-ui            DejaVu Sans
//   serif                                  DejaVu Serif
//   monospace, mono, courier, courier new  DejaVu Sans Mono (kMonospaceFontFace)
//   a family of a loaded file              that family (case ignored)
//   anything else, or a library face whose file is missing
//                                          not carried: family() is empty
//
// The library's files are the DejaVu Sans, Sans Mono and Serif families in their four styles,
// read from kFontDir (Debian's fonts-dejavu-core and fonts-dejavu-extra). Characters that none
// of the loaded files has are drawn as replacement boxes, never from a machine's other fonts.
#include <fontconfig/fontconfig.h>

#include <vector>

#include "platform/kw/String.h"

namespace Glib {

class FontLibrary {
 public:
  // Where the library's font files are read from.
  static const char* const kFontDir;
  // The library's font files, by name inside kFontDir.
  static const std::vector<String>& libraryFiles();

  // Loads the library's files; each one missing or unreadable is reported once.
  FontLibrary();
  ~FontLibrary();
  FontLibrary(const FontLibrary&) = delete;
  FontLibrary& operator=(const FontLibrary&) = delete;

  // Adds an application's font file (TrueType or OpenType). Returns false, with a diagnostic
  // and the configuration unchanged, when the file cannot be read or holds no usable face.
  // A successful call replaces config().
  bool addFile(const String& path);

  // The family to ask the configuration for `face` (see the table above); empty when no
  // loaded file provides it.
  String family(const String& face) const;

  // The configuration holding exactly the loaded files. Owned here; whoever keeps it past the
  // next addFile() takes a reference of its own.
  FcConfig* config() const { return config_; }
  // Every loaded file, library files first, as full paths.
  const std::vector<String>& files() const { return files_; }

 private:
  // Why `path` cannot be loaded, or empty when it can.
  static String unusable(const String& path);
  // A configuration holding `paths`, all of them usable.
  static FcConfig* build(const std::vector<String>& paths);

  FcConfig* config_ = nullptr;
  std::vector<String> files_;
};

}  // namespace Glib
