#include <gtest/gtest.h>

#include "TempDir.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/ResourceStrings.h"
#include "platform/misc/UIString.h"

TEST(ResourceStrings, FileFormatEscapesCommentsAndBadLines) {
  TempDir dir;
  const String path = dir.file("strings.txt");
  TempDir::write(path,
                 "# product strings\n"
                 "41\tDo it\n"
                 "\n"
                 "  \t \n"
                 "2713\tline one\\nline two\\ttabbed \\\\ done\r\n"
                 "7\t\n"                  // an empty text is a text
                 "12a\tbad id\n"          // line 7
                 "-1\tnegative\n"         // line 8
                 "4294967296\ttoo big\n"  // line 9
                 "99 no tab\n"            // line 10
                 "98\tbad \\q escape\n"   // line 11
                 "97\ttrailing \\\n"      // line 12
                 "41\tsecond 41\n"        // line 13: duplicate
                 "50\tbad \xFF utf8\n"    // line 14: kept, replaced, reported
                 "4294967295\tlargest\n");
  ResourceStrings table;
  Diagnostics::Capture diag;
  ASSERT_TRUE(table.loadFile(path));
  EXPECT_EQ(table.size(), 5u);
  EXPECT_EQ(table.lookup(41), L"Do it");
  EXPECT_EQ(table.lookup(2713), L"line one\nline two\ttabbed \\ done");
  EXPECT_TRUE(table.contains(7));
  EXPECT_EQ(table.lookup(7), L"");
  EXPECT_EQ(table.lookup(50), L"bad \uFFFD utf8");
  EXPECT_EQ(table.lookup(4294967295u), L"largest");
  for (int line : {7, 8, 9, 10, 11, 12}) {
    EXPECT_TRUE(diag.contains(path + ":" + std::to_string(line) + ": malformed")) << line;
  }
  EXPECT_TRUE(diag.contains(":13: duplicate string id 41"));
  EXPECT_TRUE(diag.contains(":14: invalid UTF-8"));
  EXPECT_EQ(diag.lines().size(), 8u);
}

TEST(ResourceStrings, UnknownIdGivesPlaceholderReportedOnce) {
  ResourceStrings table;
  Diagnostics::Capture diag;
  EXPECT_EQ(table.lookup(1234), L"[missing string 1234]");
  EXPECT_EQ(table.lookup(1234), L"[missing string 1234]");
  EXPECT_EQ(diag.lines().size(), 1u);
  table.lookup(1235);
  EXPECT_EQ(diag.lines().size(), 2u);
}

TEST(ResourceStrings, UnreadableFileKeepsTheTable) {
  TempDir dir;
  ResourceStrings table;
  table.set(1, L"one");
  Diagnostics::Capture diag;
  EXPECT_FALSE(table.loadFile(dir.file("absent")));
  EXPECT_FALSE(table.loadFile(dir.path()));
  EXPECT_EQ(table.lookup(1), L"one");
  EXPECT_EQ(diag.lines().size(), 2u);
}

TEST(UIString, LiteralsKeepTheirTextAndResourcesAreLookedUpWhenAsked) {
  const UIString narrow("caf\xC3\xA9 \xFF");
  EXPECT_FALSE(narrow.isResource());
  EXPECT_EQ(narrow.id(), 0u);
  EXPECT_EQ(narrow.toString(), "caf\xC3\xA9 \xFF");  // exactly as given
  EXPECT_EQ(narrow.toWString(), L"caf\u00E9 \uFFFD");

  const UIString wide(L"\u00E9t\u00E9");
  EXPECT_EQ(wide.toString(), "\xC3\xA9t\xC3\xA9");
  EXPECT_EQ(UIString(static_cast<const char*>(nullptr)).toWString(), L"");
  EXPECT_EQ(UIString(static_cast<const wchar_t*>(nullptr)).toString(), "");

  ResourceStrings table;
  const UIString res(2714u);
  EXPECT_TRUE(res.isResource());
  EXPECT_EQ(res.id(), 2714u);
  Diagnostics::Capture diag;
  EXPECT_EQ(res.toWString(table), L"[missing string 2714]");
  table.set(2714, L"Size \u2192");
  EXPECT_EQ(res.toString(table), "Size \xE2\x86\x92");

  // Through the application's table.
  resourceStrings().set(2714, L"global");
  EXPECT_EQ(res.toWString(), L"global");
  resourceStrings().clear();
  EXPECT_NE(UIString(5u), UIString("5"));
  EXPECT_EQ(UIString(L"x"), UIString(WString(L"x")));
}
