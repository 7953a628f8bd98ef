// Golden-image checks themselves: missing goldens, tolerances, failure files, updating.
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>

#include <unistd.h>

#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "tests/glib/PaintGlob.h"

namespace {

// Points the golden directories at a scratch tree for the test's duration.
class Goldens : public ::testing::Test {
 protected:
  void SetUp() override {
    // Tests may run in parallel processes: each gets its own tree.
    root_ = std::filesystem::temp_directory_path() /
            ("globkit-golden-" + std::to_string(getpid()) + "-" +
             ::testing::UnitTest::GetInstance()->current_test_info()->name());
    std::filesystem::remove_all(root_);
    std::filesystem::create_directories(root_ / "src/tests/golden");
    keep("GLOBKIT_SOURCE_DIR", (root_ / "src").string());
    keep("GLOBKIT_GOLDEN_OUT", (root_ / "out").string());
    keep("GLOBKIT_UPDATE_GOLDENS", "0");
  }
  void TearDown() override {
    for (auto& [name, value] : saved_) {
      if (value.empty()) {
        unsetenv(name.c_str());
      } else {
        setenv(name.c_str(), value.c_str(), 1);
      }
    }
    std::filesystem::remove_all(root_);
  }
  void keep(const String& name, const String& value) {
    const char* old = std::getenv(name.c_str());
    saved_.emplace_back(name, old ? old : "");
    setenv(name.c_str(), value.c_str(), 1);
  }
  bool outFile(const char* name) const { return std::filesystem::exists(root_ / "out" / name); }

  std::filesystem::path root_;
  std::vector<std::pair<String, String>> saved_;
};

TEST_F(Goldens, MissingGoldenSaysHowToMakeIt) {
  Harness h(20, 20);
  PaintGlob g(h.place(0, 0, 10, 10),
              [](Glib::Painter& p) { p.fillRect(p.bounds(), Colour(1, 0, 0)); });
  const GoldenResult r = GoldenImage::check(h, g, "square");
  EXPECT_FALSE(r);
  EXPECT_NE(r.message.find("missing"), String::npos) << r.message;
  EXPECT_NE(r.message.find("GLOBKIT_UPDATE_GOLDENS=1"), String::npos) << r.message;
  EXPECT_TRUE(outFile("square.actual.png"));

  setenv("GLOBKIT_UPDATE_GOLDENS", "1", 1);
  EXPECT_TRUE(GoldenImage::check(h, g, "square"));
  EXPECT_TRUE(std::filesystem::exists(root_ / "src/tests/golden/square.png"));
  setenv("GLOBKIT_UPDATE_GOLDENS", "0", 1);
  EXPECT_TRUE(GoldenImage::check(h, g, "square"));
}

TEST_F(Goldens, ToleranceDecidesAndFailuresLeaveActualAndDiff) {
  Harness h(20, 20);
  Colour c(0.5, 0.5, 0.5);
  PaintGlob g(h.place(0, 0, 10, 10), [&](Glib::Painter& p) {
    p.fillRect(p.bounds(), Colour(0.5, 0.5, 0.5));
    p.fillRect(Kw::Box<int>(0, 0, 2, 2), c);
  });
  setenv("GLOBKIT_UPDATE_GOLDENS", "1", 1);
  ASSERT_TRUE(GoldenImage::check(h, g, "grey"));
  setenv("GLOBKIT_UPDATE_GOLDENS", "0", 1);

  c = Colour::fromRgb8(130, 128, 128);  // 2 away from 128 in one channel, on 4 pixels
  g.update();
  EXPECT_TRUE(GoldenImage::check(h, g, "grey", {2, 0}));
  EXPECT_FALSE(GoldenImage::check(h, g, "grey", {1, 0}));
  EXPECT_TRUE(GoldenImage::check(h, g, "grey", {1, 4}));

  c = Colour(1, 1, 1);
  g.update();
  const GoldenResult r = GoldenImage::check(h, g, "grey", {2, 3});
  EXPECT_FALSE(r);
  EXPECT_NE(r.message.find("4 pixels differ"), String::npos) << r.message;
  EXPECT_TRUE(outFile("grey.actual.png"));
  EXPECT_TRUE(outFile("grey.diff.png"));
}

TEST_F(Goldens, SizeMismatchFails) {
  Harness h(30, 30);
  PaintGlob small(h.place(0, 0, 10, 10), nullptr);
  PaintGlob large(h.place(10, 10, 12, 10), nullptr);
  setenv("GLOBKIT_UPDATE_GOLDENS", "1", 1);
  ASSERT_TRUE(GoldenImage::check(h, small, "sized"));
  setenv("GLOBKIT_UPDATE_GOLDENS", "0", 1);
  const GoldenResult r = GoldenImage::check(h, large, "sized", {255, 1000});
  EXPECT_FALSE(r);
  EXPECT_NE(r.message.find("12x10"), String::npos) << r.message;
}

}  // namespace
