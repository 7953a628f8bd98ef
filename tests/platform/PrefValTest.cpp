#include <gtest/gtest.h>

#include <limits>

#include "TempDir.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/EditorPreferences.h"
#include "platform/misc/PrefVal.h"

TEST(PrefVal, TypedValuesSurviveTheFileAndBadTextGivesTheDefault) {
  TempDir dir;
  const String path = dir.file("preferences");
  EditorPreferences store(path);
  PrefVal<bool> flag("show grid", true, &store);
  PrefVal<double> ratio("ratio", 1.5, &store);
  PrefVal<int> count("count", 3, &store);
  EXPECT_TRUE(flag.get());
  flag = !flag;
  ratio = 0.1;
  count = -42;

  EditorPreferences reread(path);
  EXPECT_FALSE(PrefVal<bool>("show grid", true, &reread).get());
  EXPECT_EQ(PrefVal<double>("ratio", 1.5, &reread).get(), 0.1);  // exactly
  EXPECT_EQ(PrefVal<int>("count", 3, &reread).get(), -42);

  Diagnostics::Capture diag;
  store.setPreference("count", "lots");
  EXPECT_EQ(count.get(), 3);
  EXPECT_TRUE(diag.contains("not of its type"));
  ratio = std::numeric_limits<double>::quiet_NaN();
  EXPECT_EQ(ratio.get(), 0.1);
  EXPECT_TRUE(diag.contains("not finite"));

  flag.reset();
  EXPECT_FALSE(store.hasPreference("show grid"));
  EXPECT_TRUE(flag.get());
}
