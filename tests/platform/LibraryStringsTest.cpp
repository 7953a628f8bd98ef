#include <gtest/gtest.h>

#include "platform/misc/Diagnostics.h"
#include "platform/misc/ResourceStrings.h"
#include "platform/misc/UIString.h"

TEST(LibraryStrings, ApplicationTableFallsBackToTheLibrarysTexts) {
  ResourceStrings& app = resourceStrings();
  app.clear();
  EXPECT_EQ(UIString(41u).toWString(), L"OK");
  EXPECT_EQ(app.lookup(2713), L"Minimise");
  EXPECT_EQ(app.lookup(2714), L"Restore");
  // The application's own text wins, and clearing its table brings the default back.
  app.loadText("41\tApply\n");
  EXPECT_EQ(app.lookup(41), L"Apply");
  app.clear();
  EXPECT_EQ(app.lookup(41), L"OK");
  // Other tables have no fallback unless given one.
  Diagnostics::Capture missing;
  ResourceStrings plain;
  EXPECT_EQ(plain.lookup(41), ResourceStrings::placeholder(41));
  EXPECT_TRUE(missing.contains("missing string 41"));
}
