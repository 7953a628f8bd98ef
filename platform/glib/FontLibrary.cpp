#include "platform/glib/FontLibrary.h"

#include <sys/stat.h>
#include <algorithm>
#include <cctype>

#include "platform/glib/FontDesc.h"
#include "platform/misc/Diagnostics.h"

#ifndef GLOBKIT_FONT_DIR
#define GLOBKIT_FONT_DIR "/usr/share/fonts/truetype/dejavu"
#endif

namespace Glib {

namespace {

// An application's face without a bold or italic file of its own is slanted or emboldened
// rather than drawn upright and plain; the library's own families have all four styles.
constexpr const char* kRules = R"(<?xml version="1.0"?>
<fontconfig>
  <match target="font">
    <test name="slant"><const>roman</const></test>
    <test target="pattern" name="slant" compare="not_eq"><const>roman</const></test>
    <edit name="matrix" mode="assign">
      <times><name>matrix</name>
        <matrix><double>1</double><double>0.2</double><double>0</double><double>1</double></matrix>
      </times>
    </edit>
    <edit name="slant" mode="assign"><const>oblique</const></edit>
  </match>
  <match target="font">
    <test name="weight" compare="less_eq"><const>medium</const></test>
    <test target="pattern" name="weight" compare="more_eq"><const>bold</const></test>
    <edit name="embolden" mode="assign"><bool>true</bool></edit>
    <edit name="weight" mode="assign"><const>bold</const></edit>
  </match>
</fontconfig>
)";

String lowered(const String& s) {
  String out;
  for (char c : s) {
    if (c != ' ') out += static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
  }
  return out;
}

// Generic and common names, blanks removed and lower case, and the library's face for each.
const char* genericFamily(const String& face) {
  static const struct {
    const char* name;
    const char* family;
  } kAliases[] = {
      {"sans", kDefaultFontFace},        {"sans-serif", kDefaultFontFace},
      {"system-ui", kDefaultFontFace},   {"serif", kSerifFontFace},
      {"monospace", kMonospaceFontFace}, {"mono", kMonospaceFontFace},
      {"courier", kMonospaceFontFace},   {"couriernew", kMonospaceFontFace},
  };
  const String key = lowered(face);
  for (const auto& a : kAliases) {
    if (key == a.name) return a.family;
  }
  return nullptr;
}

bool isFile(const String& path) {
  struct stat st {};
  return stat(path.c_str(), &st) == 0 && S_ISREG(st.st_mode);
}

}  // namespace

const char* const FontLibrary::kFontDir = GLOBKIT_FONT_DIR;

const std::vector<String>& FontLibrary::libraryFiles() {
  static const std::vector<String> files = {
      "DejaVuSans.ttf",
      "DejaVuSans-Bold.ttf",
      "DejaVuSans-Oblique.ttf",
      "DejaVuSans-BoldOblique.ttf",
      "DejaVuSansMono.ttf",
      "DejaVuSansMono-Bold.ttf",
      "DejaVuSansMono-Oblique.ttf",
      "DejaVuSansMono-BoldOblique.ttf",
      "DejaVuSerif.ttf",
      "DejaVuSerif-Bold.ttf",
      "DejaVuSerif-Italic.ttf",
      "DejaVuSerif-BoldItalic.ttf",
  };
  return files;
}

FontLibrary::FontLibrary() {
  for (const String& name : libraryFiles()) {
    const String path = String(kFontDir) + "/" + name;
    const String why = unusable(path);
    if (why.empty()) {
      files_.push_back(path);
    } else {
      diagWarning("font file " + path + " " + why +
                  "; its face falls back to the system's fonts (tools/bootstrap installs it)\n");
    }
  }
  config_ = build(files_);
}

FontLibrary::~FontLibrary() {
  if (config_) FcConfigDestroy(config_);
}

String FontLibrary::unusable(const String& path) {
  if (!isFile(path)) return "is missing";
  FcFontSet* set = FcFontSetCreate();
  int count = 0;
  FcFreeTypeQueryAll(reinterpret_cast<const FcChar8*>(path.c_str()), static_cast<unsigned>(-1),
                     nullptr, &count, set);
  String why;
  if (set->nfont == 0) why = "holds no font";
  for (int i = 0; i < set->nfont && why.empty(); ++i) {
    // The shaper takes TrueType and OpenType outlines only.
    FcChar8* format = nullptr;
    if (FcPatternGetString(set->fonts[i], FC_FONTFORMAT, 0, &format) != FcResultMatch ||
        (String(reinterpret_cast<const char*>(format)) != "TrueType" &&
         String(reinterpret_cast<const char*>(format)) != "CFF")) {
      why = "is not a TrueType or OpenType font";
    }
  }
  FcFontSetDestroy(set);
  return why;
}

FcConfig* FontLibrary::build(const std::vector<String>& paths) {
  FcConfig* config = FcConfigCreate();
  // Paths are taken as given, whatever root the environment names for the system's fonts.
  FcConfigSetSysRoot(config, nullptr);
  FcConfigParseAndLoadFromMemory(config, reinterpret_cast<const FcChar8*>(kRules), FcFalse);
  // No font folders: the system set stays empty and every face comes from the files below.
  FcConfigBuildFonts(config);
  for (const String& path : paths) {
    FcConfigAppFontAddFile(config, reinterpret_cast<const FcChar8*>(path.c_str()));
  }
  return config;
}

bool FontLibrary::addFile(const String& path) {
  const String why = unusable(path);
  if (!why.empty()) {
    diagWarning("font file " + path + " " + why + "; not added\n");
    return false;
  }
  if (std::find(files_.begin(), files_.end(), path) != files_.end()) return true;
  files_.push_back(path);
  FcConfig* next = build(files_);
  if (config_) FcConfigDestroy(config_);
  config_ = next;
  return true;
}

String FontLibrary::family(const String& face) const {
  const char* generic = genericFamily(face);
  const String name = generic ? String(generic) : face;
  if (name.empty() || !config_) return String();
  FcPattern* pattern = FcPatternCreate();
  FcPatternAddString(pattern, FC_FAMILY, reinterpret_cast<const FcChar8*>(name.c_str()));
  FcObjectSet* objects = FcObjectSetBuild(FC_FAMILY, nullptr);
  FcFontSet* found = FcFontList(config_, pattern, objects);
  const bool carried = found && found->nfont > 0;
  if (found) FcFontSetDestroy(found);
  FcObjectSetDestroy(objects);
  FcPatternDestroy(pattern);
  return carried ? name : String();
}

}  // namespace Glib
