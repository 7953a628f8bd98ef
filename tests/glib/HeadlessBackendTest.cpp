// The back end without a window: a loop step delivers and repaints; screenshots go to PNG.
#include <gtest/gtest.h>

#include <cairo.h>

#include <filesystem>

#include <unistd.h>

#include "platform/backend/HeadlessBackend.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/MessageProbe.h"
#include "tests/glib/PaintGlob.h"

namespace {

const Colour kRed = Colour::fromHex(0xC02020);

class Screenshots : public ::testing::Test {
 protected:
  void SetUp() override {
    // Tests may run in parallel processes: each gets its own directory.
    dir_ = std::filesystem::temp_directory_path() /
           ("globkit-headless-" + std::to_string(getpid()) + "-" +
            ::testing::UnitTest::GetInstance()->current_test_info()->name());
    std::filesystem::create_directories(dir_);
  }
  void TearDown() override { std::filesystem::remove_all(dir_); }
  String path(const char* name) const { return (dir_ / name).string(); }

  std::filesystem::path dir_;
};

uint32_t pngPixel(const String& path, int x, int yTopDown, int* w = nullptr, int* h = nullptr) {
  cairo_surface_t* s = cairo_image_surface_create_from_png(path.c_str());
  EXPECT_EQ(cairo_surface_status(s), CAIRO_STATUS_SUCCESS);
  if (w) *w = cairo_image_surface_get_width(s);
  if (h) *h = cairo_image_surface_get_height(s);
  const unsigned char* row =
      cairo_image_surface_get_data(s) + yTopDown * cairo_image_surface_get_stride(s);
  const uint32_t p = reinterpret_cast<const uint32_t*>(row)[x];
  cairo_surface_destroy(s);
  return p;
}

TEST_F(Screenshots, StepDeliversAndRepaints) {
  HeadlessBackend backend(64, 48);
  auto* probe = new MessageProbe(GlobCreationInfo(10, 10, backend.root().canvas()));
  auto* g = new PaintGlob(GlobCreationInfo(20, 10, backend.root().canvas(), 0, 0),
                          [](Glib::Painter& p) { p.fillRect(p.bounds(), kRed); });
  g->send_msg(probe, "hello");
  EXPECT_TRUE(backend.step(0));
  EXPECT_EQ(probe->count("hello"), 1);
  EXPECT_EQ(g->draws, 1);
  EXPECT_EQ(backend.renderer().pixelAt(XY<int>(5, 5)), 0xFFC02020u);
  EXPECT_EQ(cairo_image_surface_get_width(backend.surface()), 64);
  backend.requestQuit();
  EXPECT_FALSE(backend.step(0));
}

TEST_F(Screenshots, RootAndGlobToPng) {
  HeadlessBackend backend(64, 48);
  auto* g =
      new PaintGlob(GlobCreationInfo(20, 10, backend.root().canvas(), 50, 2), [](Glib::Painter& p) {
        p.fillRect(p.bounds(), kRed);
        p.fillRect(Kw::Box<int>(0, 0, 1, 1), Colour(0, 0, 1));
      });
  int w = 0, h = 0;
  ASSERT_TRUE(backend.screenshot(path("root.png")));
  EXPECT_EQ(pngPixel(path("root.png"), 55, 40, &w, &h), 0xFFC02020u);
  EXPECT_EQ(w, 64);
  EXPECT_EQ(h, 48);
  // Only the visible part of the Glob: it sticks out past the root's right edge.
  ASSERT_TRUE(backend.screenshot(*g, path("glob.png")));
  EXPECT_EQ(pngPixel(path("glob.png"), 0, 9, &w, &h), 0xFF0000FFu) << "its bottom-left pixel";
  EXPECT_EQ(w, 14);
  EXPECT_EQ(h, 10);
}

TEST_F(Screenshots, RefusedWhenNothingCanBeWritten) {
  HeadlessBackend backend(32, 32);
  Diagnostics::Capture diag;
  auto* hidden = new PaintGlob(GlobCreationInfo(5, 5, backend.root().canvas()), nullptr);
  hidden->unmap_canvas();
  EXPECT_FALSE(backend.screenshot(*hidden, path("hidden.png")));
  auto* away = new PaintGlob(GlobCreationInfo(5, 5, backend.root().canvas(), 100, 100), nullptr);
  EXPECT_FALSE(backend.screenshot(*away, path("away.png")));
  EXPECT_FALSE(backend.screenshot(path("no-such-dir/x/root.png")));
  EXPECT_EQ(diag.lines().size(), 3u);
  EXPECT_FALSE(std::filesystem::exists(path("hidden.png")));
}

TEST_F(Screenshots, ImageFollowsTheRootsSize) {
  HeadlessBackend backend(32, 32);
  backend.render();
  backend.root().reshape_canvas(0, 0, 50, 20);
  backend.render();
  EXPECT_EQ(cairo_image_surface_get_width(backend.surface()), 50);
  EXPECT_EQ(cairo_image_surface_get_height(backend.surface()), 20);
  const uint32_t screen = 0xFF3C3F44u;
  EXPECT_EQ(backend.renderer().pixelAt(XY<int>(49, 19)), screen);
}

}  // namespace
