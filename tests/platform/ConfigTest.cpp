#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>

#include "TempDir.h"
#include "platform/misc/Config.h"
#include "platform/misc/Diagnostics.h"

TEST(Configb, TextFormTrimsSkipsCommentsAndReportsMalformedLines) {
  configb c;
  c.set("stale", "gone after loading");
  Diagnostics::Capture diag;
  c.loadText(
      "# comment\n"
      "  width =  120 \r\n"
      "\n"
      "   # indented comment\n"
      "title = a = b\n"
      "no equals sign\n"  // line 6
      " = no key\n"       // line 7
      "width = 130\n",    // the later line wins
      "test.cfg");
  EXPECT_EQ(c.entries(), (std::map<String, String>{{"width", "130"}, {"title", "a = b"}}));
  EXPECT_EQ(diag.lines().size(), 2u);
  EXPECT_TRUE(diag.contains("test.cfg:6: malformed"));
  EXPECT_TRUE(diag.contains("test.cfg:7: malformed"));
  EXPECT_EQ(c.find("missing"), nullptr);
  EXPECT_EQ(c.get("missing", "d"), "d");
}

TEST(Configb, UnreadableFileKeepsTheRecord) {
  TempDir dir;
  configb c;
  c.set("k", "v");
  Diagnostics::Capture diag;
  EXPECT_FALSE(c.loadFile(dir.file("absent")));
  EXPECT_FALSE(c.loadFile(dir.path()));  // a directory
  EXPECT_EQ(c.get("k"), "v");
  EXPECT_EQ(diag.lines().size(), 2u);
}

// Good values parse exactly and silently; every bad one gives the default with a diagnostic.
TEST(Config, IntegersParseWholeOrGiveTheDefault) {
  const std::pair<const char*, int> good[] = {
      {"200", 200}, {"+7", 7}, {"-3", -3}, {" 12\t", 12}, {"2147483647", 2147483647}};
  const char* bad[] = {"2147483648", "-99999999999", "12abc", "1.5", "", "0x10", "++1", "+-1", "+"};
  configb record;
  Diagnostics::Capture diag;
  for (const auto& [text, value] : good) {
    record.set("n", text);
    EXPECT_EQ(config_int(record, "n", -1), value) << text;
  }
  EXPECT_TRUE(diag.lines().empty());
  for (const char* text : bad) {
    record.set("n", text);
    diag.clear();
    EXPECT_EQ(config_int(record, "n", -1), -1) << text;
    EXPECT_EQ(diag.lines().size(), 1u) << text;
  }
}

TEST(Config, DoublesRefuseNonFiniteAndOutOfRangeValues) {
  const std::pair<const char*, double> good[] = {
      {"2.5", 2.5}, {"-1e3", -1000.0}, {"+.5", 0.5}, {"7", 7.0}};
  const char* bad[] = {"1e999", "-1e999", "nan", "inf", "-infinity", "1.5x", "", "1,5"};
  configb record;
  Diagnostics::Capture diag;
  for (const auto& [text, value] : good) {
    record.set("d", text);
    EXPECT_EQ(config_double(record, "d", 9.0), value) << text;
  }
  EXPECT_TRUE(diag.lines().empty());
  for (const char* text : bad) {
    record.set("d", text);
    diag.clear();
    EXPECT_EQ(config_double(record, "d", 9.0), 9.0) << text;
    EXPECT_EQ(diag.lines().size(), 1u) << text;
  }
}

TEST(Config, MissingKeysAreSilentAndBadValuesReportedOnce) {
  configb record;
  record.set("bad", "oops");
  Diagnostics::Capture diag;
  EXPECT_EQ(config_int(record, "absent", 4), 4);
  EXPECT_EQ(config_int(record, nullptr, 5), 5);
  EXPECT_EQ(diag.lines().size(), 1u);  // the null key only
  diag.clear();
  for (int i = 0; i < 3; ++i) EXPECT_EQ(config_int(record, "bad", 1), 1);
  EXPECT_EQ(diag.lines().size(), 1u);
  EXPECT_TRUE(diag.contains("bad = 'oops'"));
  record.set("bad", "worse");  // a new bad value is reported again
  EXPECT_EQ(config_int(record, "bad", 1), 1);
  EXPECT_EQ(diag.lines().size(), 2u);
}

TEST(Config, ProcessRecordComesFromTheNamedFileOrTheEnvironment) {
  TempDir dir;
  const String named = dir.file("app.cfg");
  const String fromEnv = dir.file("env.cfg");
  TempDir::write(named, "max_click_separation = 150\nscale = 1.25\n");
  TempDir::write(fromEnv, "max_click_separation = 90\n");

  ASSERT_TRUE(setConfigFile(named));
  EXPECT_EQ(config_int("max_click_separation", 200), 150);
  EXPECT_EQ(config_double("scale", 1.0), 1.25);

  const char* old = std::getenv("GLOBKIT_CONFIG");
  const String saved = old ? old : "";
  ::setenv("GLOBKIT_CONFIG", fromEnv.c_str(), 1);
  EXPECT_TRUE(loadConfigFromEnvironment());
  EXPECT_EQ(config_int("max_click_separation", 200), 90);
  EXPECT_EQ(config_double("scale", 1.0), 1.0);

  // A file that cannot be read keeps the record as it was.
  Diagnostics::Capture diag;
  EXPECT_FALSE(setConfigFile(dir.file("absent.cfg")));
  EXPECT_EQ(config_int("max_click_separation", 200), 90);

  // Settable in code.
  processConfig().clear();
  EXPECT_EQ(config_int("max_click_separation", 200), 200);
  processConfig().set("max_click_separation", "250");
  EXPECT_EQ(config_int("max_click_separation", 200), 250);
  processConfig().clear();
  old ? ::setenv("GLOBKIT_CONFIG", saved.c_str(), 1) : ::unsetenv("GLOBKIT_CONFIG");
}
