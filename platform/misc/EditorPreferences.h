#pragma once
// The user's preferences: string values by key, kept in a file.
//
// File: the path given with setPath, else $XDG_CONFIG_HOME/globkit/preferences (when that
// variable holds an absolute path), else $HOME/.config/globkit/preferences. With no path at all
// the values live in memory only. The file is read on first use (or when setPath names it);
// a missing file means no preferences yet. An unreadable file gives empty preferences and a
// diagnostic, and auto-save leaves that file alone until an explicit save() (or a successful
// reload) so that a passing read error cannot wipe the user's settings. A corrupt line is
// reported and skipped, the good lines are kept (the next save drops the corrupt line). The format
// is described in PreferenceCodec.h: every key and value round-trips exactly, whatever its bytes.
//
// Saving: save() writes the file atomically (see FileText). Auto-save is on by default, so
// that a change (a menu group opened, say) is on disk at once and survives a crash of the
// application; a failed write is reported, the change stays in memory and the previous file
// stays intact, and the next save tries again. With auto-save off, changes are written only by
// save(): they are not written on destruction.
//
// Limits: keys must be 1 to kMaxKeyBytes bytes and values at most kMaxValueBytes; larger ones
// are refused with a diagnostic and the previous value is kept.
#include <cstddef>
#include <map>

#include "platform/kw/String.h"

class EditorPreferences {
 public:
  static constexpr std::size_t kMaxKeyBytes = 4096;
  static constexpr std::size_t kMaxValueBytes = 1u << 20;

  // Uses the default path, read on first use.
  EditorPreferences();
  // Uses `path` (empty: memory only), read on first use.
  explicit EditorPreferences(const String& path);
  EditorPreferences(const EditorPreferences&) = delete;
  EditorPreferences& operator=(const EditorPreferences&) = delete;

  String getPreference(const String& key, const String& def = String()) const;
  bool hasPreference(const String& key) const;
  // Returns false when the key or value is refused (see Limits); storing the value that is
  // already there changes nothing and writes nothing.
  bool setPreference(const String& key, const String& value);
  // Returns false when there was no such preference.
  bool removePreference(const String& key);
  const std::map<String, String>& allPreferences() const;

  // Switches to `path` (empty: memory only) and replaces the values with the file's contents.
  // Values not yet saved to the old file are dropped.
  void setPath(const String& path);
  String path() const { return path_; }
  // Reads the file again, replacing the values in memory. False when it could not be read.
  bool reload();
  // Writes every value now. False (with a diagnostic) when the write failed or there is no
  // path.
  bool save();
  // True when there are changes that are not yet in the file.
  bool hasUnsavedChanges() const { return dirty_; }

  void setAutoSave(bool on) { autoSave_ = on; }
  bool autoSave() const { return autoSave_; }

  // $XDG_CONFIG_HOME/globkit/preferences or $HOME/.config/globkit/preferences; empty when
  // neither variable is usable.
  static String defaultPath();

 private:
  void ensureLoaded() const;
  bool loadFromFile() const;
  void changed();

  String path_;
  mutable std::map<String, String> values_;
  mutable bool loaded_ = false;
  // The file exists but could not be read: auto-save must not replace what it may still hold.
  mutable bool readFailed_ = false;
  bool dirty_ = false;
  bool autoSave_ = true;
};

// The process's preferences, on the default path until the application calls setPath.
EditorPreferences& prefs();
