#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>

#include <csignal>
#include <cstdlib>
#include <filesystem>

#include "TempDir.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/EditorPreferences.h"

namespace {

// Raises the file size limit back and restores the signal disposition when a test ends, so a
// failed assertion cannot leave the process crippled.
class FileSizeLimit {
 public:
  explicit FileSizeLimit(rlim_t bytes) {
    getrlimit(RLIMIT_FSIZE, &saved_);
    // Without this the write past the limit would kill the test instead of failing.
    previousHandler_ = std::signal(SIGXFSZ, SIG_IGN);
    rlimit limited = saved_;
    limited.rlim_cur = bytes;
    setrlimit(RLIMIT_FSIZE, &limited);
  }
  ~FileSizeLimit() {
    setrlimit(RLIMIT_FSIZE, &saved_);
    std::signal(SIGXFSZ, previousHandler_);
  }

 private:
  rlimit saved_{};
  void (*previousHandler_)(int) = nullptr;
};

}  // namespace

TEST(EditorPreferences, EveryKeyAndValueRoundTripsThroughTheFile) {
  TempDir dir;
  const String path = dir.file("preferences");
  const std::map<String, String> awkward = {
      {"Menu (tools) : Colour = grading", "ExpandedGroupItem"},
      {"#not a comment", "=leading equals"},
      {"line\nbreak", "value\nwith\r\nline ends\n"},
      {"back\\slash", "\\x41 is not an escape\\"},
      {"tab\tkey", "\t"},
      {String("nul\0key", 7), String("a\0b", 3)},
      {"bad utf8 \xC3", "\xFF\xFE lone \x80 and overlong \xC0\xAF"},
      {"caf\xC3\xA9 \xF0\x9F\x98\x80", "\xE2\x82\xAC 12"},
      {"empty", ""},
      {" spaces ", "  both ends  "},
  };
  {
    EditorPreferences p(path);
    for (const auto& [k, v] : awkward) EXPECT_TRUE(p.setPreference(k, v));
  }
  // Well-formed UTF-8 stays legible in the file; the comment-like key cannot start a comment.
  const String text = TempDir::read(path);
  EXPECT_NE(text.find("caf\xC3\xA9"), String::npos);
  EXPECT_EQ(text.find("\n#not"), String::npos);

  Diagnostics::Capture diag;
  EditorPreferences reread(path);
  EXPECT_EQ(reread.allPreferences(), awkward);
  EXPECT_TRUE(diag.lines().empty());
}

TEST(EditorPreferences, AutoSaveWritesChangesOnlyWhenSomethingChanged) {
  TempDir dir;
  const String path = dir.file("sub/dir/preferences");  // missing folders are created
  EditorPreferences p(path);
  EXPECT_TRUE(p.autoSave());
  EXPECT_EQ(p.getPreference("a", "fallback"), "fallback");
  EXPECT_FALSE(p.hasPreference("a"));

  p.setPreference("a", "1");
  EXPECT_EQ(EditorPreferences(path).getPreference("a"), "1");
  EXPECT_FALSE(p.hasUnsavedChanges());

  // Setting the same value again must not touch the file.
  std::filesystem::remove(path);
  p.setPreference("a", "1");
  EXPECT_FALSE(std::filesystem::exists(path));

  EXPECT_TRUE(p.removePreference("a"));
  EXPECT_FALSE(p.removePreference("a"));
  EXPECT_FALSE(EditorPreferences(path).hasPreference("a"));

  p.setAutoSave(false);
  p.setPreference("b", "2");
  EXPECT_TRUE(p.hasUnsavedChanges());
  EXPECT_FALSE(EditorPreferences(path).hasPreference("b"));
  EXPECT_TRUE(p.save());
  EXPECT_EQ(EditorPreferences(path).getPreference("b"), "2");
  // No temporary files are left behind.
  EXPECT_EQ(dir.entryCount(), 1u);
}

TEST(EditorPreferences, CorruptLinesAreSkippedAndGoodLinesKept) {
  TempDir dir;
  const String path = dir.file("preferences");
  TempDir::write(path,
                 "# comment\n"
                 "good=1\n"
                 "no separator here\n"  // line 3
                 "=no key\n"            // line 4
                 "bad\\qescape=x\n"     // line 5
                 "short=\\x4\n"         // line 6
                 "dos=line end\r\n"
                 "\n"
                 "good=2\n"  // line 9: a duplicate, the later one wins
                 "trailing=backslash\\");
  Diagnostics::Capture diag;
  EditorPreferences p(path);
  EXPECT_EQ(p.allPreferences(), (std::map<String, String>{{"good", "2"}, {"dos", "line end"}}));
  EXPECT_TRUE(diag.contains("corrupt line(s) 3, 4, 5, 6, 10"));
  EXPECT_TRUE(diag.contains("duplicate key(s) at line(s) 9"));
}

TEST(EditorPreferences, UnreadableFileGivesDefaultsAndIsNotOverwrittenByAutoSave) {
  TempDir dir;
  const String path = dir.file("preferences");
  // A directory where the file should be: it exists but cannot be read as a file.
  std::filesystem::create_directory(path);
  TempDir::write(path + "/keep", "x");

  Diagnostics::Capture diag;
  EditorPreferences p(path);
  EXPECT_EQ(p.getPreference("k", "def"), "def");
  EXPECT_TRUE(diag.contains("cannot read"));

  diag.clear();
  EXPECT_TRUE(p.setPreference("k", "v"));  // kept in memory
  EXPECT_EQ(p.getPreference("k"), "v");
  EXPECT_TRUE(diag.lines().empty());  // auto-save did not try
  EXPECT_TRUE(p.hasUnsavedChanges());

  EXPECT_FALSE(p.save());  // an explicit save tries, and fails cleanly
  EXPECT_TRUE(diag.contains("not saved"));
  EXPECT_EQ(TempDir::read(path + "/keep"), "x");
  EXPECT_EQ(dir.entryCount(), 1u);
}

TEST(EditorPreferences, FailedWriteLeavesThePreviousFileIntact) {
  TempDir dir;
  const String path = dir.file("preferences");
  EditorPreferences p(path);
  p.setPreference("keep", "old");
  const String before = TempDir::read(path);

  Diagnostics::Capture diag;
  {
    // The new file would exceed the limit, so writing it fails half-way.
    FileSizeLimit limit(4096);
    EXPECT_TRUE(p.setPreference("big", String(20000, 'x')));
  }
  EXPECT_TRUE(diag.contains("not saved"));
  EXPECT_EQ(TempDir::read(path), before);
  EXPECT_EQ(dir.entryCount(), 1u);
  EXPECT_TRUE(p.hasUnsavedChanges());
  EXPECT_EQ(p.getPreference("big").size(), 20000u);

  // Once writing works again, the next save carries everything.
  EXPECT_TRUE(p.save());
  EXPECT_EQ(EditorPreferences(path).getPreference("big").size(), 20000u);
}

TEST(EditorPreferences, UnwritableDirectoryIsReportedAndValuesStayInMemory) {
  TempDir dir;
  TempDir::write(dir.file("plain-file"), "");
  // The parent of the preferences file is a plain file: no directory can be made there.
  EditorPreferences p(dir.file("plain-file/globkit/preferences"));
  Diagnostics::Capture diag;
  EXPECT_TRUE(p.setPreference("k", "v"));
  EXPECT_TRUE(diag.contains("cannot create directory"));
  EXPECT_EQ(p.getPreference("k"), "v");
  EXPECT_FALSE(p.save());

  // With no path at all the values live in memory only.
  EditorPreferences memory{String()};
  diag.clear();
  EXPECT_TRUE(memory.setPreference("k", "v"));
  EXPECT_TRUE(diag.lines().empty());
  EXPECT_FALSE(memory.save());
  EXPECT_TRUE(diag.contains("memory only"));
}

TEST(EditorPreferences, OversizedKeysAndValuesAreRefusedKeepingThePreviousValue) {
  TempDir dir;
  const String path = dir.file("preferences");
  EditorPreferences p(path);
  const String largest(EditorPreferences::kMaxValueBytes, '\n');  // escapes to twice its size
  EXPECT_TRUE(p.setPreference("v", largest));

  Diagnostics::Capture diag;
  EXPECT_FALSE(p.setPreference("v", largest + "!"));
  EXPECT_TRUE(diag.contains("refused a value"));
  EXPECT_FALSE(p.setPreference("", "x"));
  EXPECT_FALSE(p.setPreference(String(EditorPreferences::kMaxKeyBytes + 1, 'k'), "x"));
  EXPECT_TRUE(p.setPreference(String(EditorPreferences::kMaxKeyBytes, 'k'), "x"));
  EXPECT_EQ(EditorPreferences(path).getPreference("v"), largest);

  // An oversized entry written into the file by hand is skipped on reading.
  TempDir::write(path, "v=" + String(EditorPreferences::kMaxValueBytes + 1, 'a') + "\nsmall=1\n");
  diag.clear();
  EditorPreferences reread(path);
  EXPECT_EQ(reread.allPreferences(), (std::map<String, String>{{"small", "1"}}));
  EXPECT_TRUE(diag.contains("skipped 1 oversized entry"));
}

TEST(EditorPreferences, SavingKeepsTheFilesPermissions) {
  TempDir dir;
  const String path = dir.file("preferences");
  TempDir::write(path, "a=1\n");
  ::chmod(path.c_str(), 0640);
  EditorPreferences p(path);
  p.setPreference("a", "2");
  struct stat st {};
  ASSERT_EQ(::stat(path.c_str(), &st), 0);
  EXPECT_EQ(st.st_mode & 0777, 0640u);
}

TEST(EditorPreferences, DefaultPathFollowsTheEnvironment) {
  const char* oldXdg = std::getenv("XDG_CONFIG_HOME");
  const char* oldHome = std::getenv("HOME");
  const String savedXdg = oldXdg ? oldXdg : "";
  const String savedHome = oldHome ? oldHome : "";

  ::setenv("XDG_CONFIG_HOME", "/cfg", 1);
  ::setenv("HOME", "/home/u", 1);
  EXPECT_EQ(EditorPreferences::defaultPath(), "/cfg/globkit/preferences");
  ::setenv("XDG_CONFIG_HOME", "relative/cfg", 1);  // relative values are ignored
  EXPECT_EQ(EditorPreferences::defaultPath(), "/home/u/.config/globkit/preferences");
  ::unsetenv("XDG_CONFIG_HOME");
  ::unsetenv("HOME");
  EXPECT_EQ(EditorPreferences::defaultPath(), "");

  oldXdg ? ::setenv("XDG_CONFIG_HOME", savedXdg.c_str(), 1) : ::unsetenv("XDG_CONFIG_HOME");
  oldHome ? ::setenv("HOME", savedHome.c_str(), 1) : ::unsetenv("HOME");
}

TEST(EditorPreferences, ProcessInstanceFollowsSetPath) {
  TempDir dir;
  const String first = dir.file("first");
  const String second = dir.file("second");
  TempDir::write(second, "from=second\n");

  EditorPreferences& p = prefs();
  EXPECT_EQ(&p, &prefs());
  p.setPath(first);
  p.setPreference("from", "first");
  p.setPath(second);  // the values are replaced by the new file's
  EXPECT_EQ(p.getPreference("from"), "second");
  EXPECT_EQ(EditorPreferences(first).getPreference("from"), "first");
  // Leave the process instance in memory: later tests must not write to a removed folder, and
  // no test may write to the user's real file.
  p.setPath(String());
  EXPECT_FALSE(p.hasPreference("from"));
}
