#include "platform/misc/EditorPreferences.h"

#include <cstdlib>

#include "platform/misc/Diagnostics.h"
#include "platform/misc/FileText.h"
#include "platform/misc/PreferenceCodec.h"

namespace {

const String kWho = "EditorPreferences: ";

// The first few line numbers; a badly damaged file must not make a huge diagnostic.
String lineList(const std::vector<int>& lines) {
  constexpr std::size_t kShown = 10;
  String out;
  for (std::size_t i = 0; i < lines.size() && i < kShown; ++i) {
    if (i != 0) out += ", ";
    out += std::to_string(lines[i]);
  }
  if (lines.size() > kShown) out += " and " + std::to_string(lines.size() - kShown) + " more";
  return out;
}

}  // namespace

EditorPreferences::EditorPreferences() : path_(defaultPath()) {}

EditorPreferences::EditorPreferences(const String& path) : path_(path) {}

String EditorPreferences::defaultPath() {
  const char* xdg = std::getenv("XDG_CONFIG_HOME");
  // Relative values of the variable are to be ignored.
  if (xdg != nullptr && xdg[0] == '/') return String(xdg) + "/globkit/preferences";
  const char* home = std::getenv("HOME");
  if (home != nullptr && home[0] != '\0') return String(home) + "/.config/globkit/preferences";
  return String();
}

void EditorPreferences::ensureLoaded() const {
  if (loaded_) return;
  loaded_ = true;
  loadFromFile();
}

bool EditorPreferences::loadFromFile() const {
  values_.clear();
  readFailed_ = false;
  if (path_.empty()) return true;
  String text;
  String error;
  switch (FileText::read(path_, text, error)) {
    case FileText::ReadResult::Missing:
      return true;
    case FileText::ReadResult::Failed:
      readFailed_ = true;
      diagWarning(kWho + error + "; using defaults, and not saving automatically over it");
      return false;
    case FileText::ReadResult::Ok:
      break;
  }
  const PreferenceCodec::ParseResult result = PreferenceCodec::parse(text, values_);
  // What setPreference would refuse is not taken from the file either.
  std::size_t oversized = 0;
  for (auto it = values_.begin(); it != values_.end();) {
    const bool tooBig = it->first.size() > kMaxKeyBytes || it->second.size() > kMaxValueBytes;
    oversized += tooBig ? 1 : 0;
    it = tooBig ? values_.erase(it) : std::next(it);
  }
  if (oversized != 0) {
    diagWarning(kWho + path_ + ": skipped " + std::to_string(oversized) + " oversized entr" +
                (oversized == 1 ? "y" : "ies"));
  }
  if (!result.corruptLines.empty()) {
    diagWarning(kWho + path_ + ": skipped corrupt line(s) " + lineList(result.corruptLines));
  }
  if (!result.duplicateLines.empty()) {
    diagWarning(kWho + path_ + ": duplicate key(s) at line(s) " + lineList(result.duplicateLines) +
                "; the later value is used");
  }
  return true;
}

String EditorPreferences::getPreference(const String& key, const String& def) const {
  ensureLoaded();
  const auto it = values_.find(key);
  return it == values_.end() ? def : it->second;
}

bool EditorPreferences::hasPreference(const String& key) const {
  ensureLoaded();
  return values_.count(key) != 0;
}

const std::map<String, String>& EditorPreferences::allPreferences() const {
  ensureLoaded();
  return values_;
}

bool EditorPreferences::setPreference(const String& key, const String& value) {
  if (key.empty() || key.size() > kMaxKeyBytes) {
    diagWarning(kWho + "refused a key of " + std::to_string(key.size()) + " bytes");
    return false;
  }
  if (value.size() > kMaxValueBytes) {
    diagWarning(kWho + "refused a value of " + std::to_string(value.size()) + " bytes for key '" +
                key.substr(0, 80) + "'");
    return false;
  }
  ensureLoaded();
  const auto it = values_.find(key);
  if (it != values_.end() && it->second == value) return true;
  values_[key] = value;
  changed();
  return true;
}

bool EditorPreferences::removePreference(const String& key) {
  ensureLoaded();
  if (values_.erase(key) == 0) return false;
  changed();
  return true;
}

void EditorPreferences::changed() {
  dirty_ = true;
  if (autoSave_ && !path_.empty() && !readFailed_) save();
}

void EditorPreferences::setPath(const String& path) {
  path_ = path;
  loaded_ = true;
  dirty_ = false;
  loadFromFile();
}

bool EditorPreferences::reload() {
  loaded_ = true;
  dirty_ = false;
  return loadFromFile();
}

bool EditorPreferences::save() {
  if (path_.empty()) {
    diagWarning(kWho + "no preferences file; values kept in memory only");
    return false;
  }
  ensureLoaded();
  String error;
  if (!FileText::writeAtomically(path_, PreferenceCodec::serialise(values_), error)) {
    diagError(kWho + error + "; preferences not saved");
    return false;
  }
  dirty_ = false;
  readFailed_ = false;
  return true;
}

EditorPreferences& prefs() {
  static EditorPreferences instance;
  return instance;
}
