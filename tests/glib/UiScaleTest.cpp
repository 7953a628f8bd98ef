// The user-interface scale and the rescaling of fresh canvases.
#include <gtest/gtest.h>

#include <cmath>

#include "platform/glib/UiScale.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"

namespace {

TEST(GlibUiScale, RescalesCanvasesOnlyWhenTheScaleIsNotOne) {
  Harness h(400, 300);
  Glob g(h.place(10, 21, 30, 15));
  glib_rescalecanvas(g.canvas());
  EXPECT_EQ(g.canvas()->rect(), Kw::Box<int>(10, 21, 40, 36));

  ASSERT_TRUE(Glib::UiScale::setFactor(1.5));
  glib_rescalecanvas(g.canvas());
  EXPECT_EQ(g.canvas()->rect(), Kw::Box<int>(15, 32, 60, 54));
  glib_rescalecanvas(nullptr);

  Diagnostics::Capture diag;
  EXPECT_FALSE(Glib::UiScale::setFactor(0.0));
  EXPECT_FALSE(Glib::UiScale::setFactor(std::nan("")));
  EXPECT_FALSE(Glib::UiScale::setFactor(9.0));
  EXPECT_DOUBLE_EQ(Glib::UiScale::factor(), 1.5);
  EXPECT_EQ(diag.lines().size(), 3u);
  ASSERT_TRUE(Glib::UiScale::setFactor(1.0));
}

}  // namespace
