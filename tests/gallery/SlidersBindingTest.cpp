// The sliders page's trim: a slider and a value box bound to one model value, each moving the
// other through the binding alone.
#include <gtest/gtest.h>

#include <cmath>

#include "gallery/GalleryApp.h"
#include "gallery/MessageLog.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "tests/gallery/GalleryTestSupport.h"
#include "values/Slider.h"
#include "values/VariBox.h"
#include "values/VariFriendlyTextBox.h"

namespace {

struct TrimFixture : ::testing::Test {
  void SetUp() override {
    app->selectPage(pageTitled(*app, "Sliders & scroll bars"));
    GalleryPage* page = app->page(app->currentPage());
    ASSERT_TRUE(page);
    slider = dynamic_cast<Slider*>(findNamed(*page, "trim slider"));
    box = dynamic_cast<VariBox*>(findNamed(*page, "trim box"));
    ASSERT_TRUE(slider && box);
  }
  WString boxText() const { return box->getTextBox()->getText(); }
  XY<int> thumbCentre() const {
    // The thumb's centre runs from half a thumb in at one end to half a thumb in at the other.
    constexpr int kHalfThumb = 6;
    const double f = (slider->getPosition() + 12.0) / 24.0;
    return XY<int>(
        static_cast<int>(slider->get_x() + kHalfThumb + f * (slider->width() - 2 * kHalfThumb)),
        static_cast<int>(slider->get_y()) + slider->height() / 2);
  }

  Harness h{1300, 860};
  MessageLog log;
  GalleryApp* app = new GalleryApp(h.root(), log);
  Slider* slider = nullptr;
  VariBox* box = nullptr;
};

}  // namespace

TEST_F(TrimFixture, DraggingTheSliderRewritesTheBox) {
  EXPECT_EQ(boxText(), L"0.0 dB");
  const XY<int> from = thumbCentre();
  h.drag(from, from + XY<int>(400, 0));
  EXPECT_NEAR(slider->getPosition(), 12.0, 1e-6);
  EXPECT_EQ(boxText(), L"12.0 dB");
  h.drag(thumbCentre(), thumbCentre() - XY<int>(600, 0));
  EXPECT_NEAR(slider->getPosition(), -12.0, 1e-6);
  EXPECT_EQ(boxText(), L"-12.0 dB");
}

TEST_F(TrimFixture, TypingIntoTheBoxMovesTheSlider) {
  h.clickOn(*box->getTextBox());
  h.key(kKeyCtrl | 'A');
  h.type(L"-3.5");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_NEAR(slider->getPosition(), -3.5, 1e-6);
  EXPECT_EQ(boxText(), L"-3.5 dB");
  // Out of range is held to the range, on both controls.
  h.clickOn(*box->getTextBox());
  h.key(kKeyCtrl | 'A');
  h.type(L"40");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_NEAR(slider->getPosition(), 12.0, 1e-6);
  EXPECT_EQ(boxText(), L"12.0 dB");
}
