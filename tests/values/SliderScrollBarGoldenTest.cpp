#include <gtest/gtest.h>

#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "tests/values/ValuesTestSupport.h"
#include "values/ScrollBar.h"
#include "values/Slider.h"

// Each look is rendered on a small screen in both palettes: one image per orientation, with
// the states side by side.
namespace {

struct LookTest : ::testing::TestWithParam<bool> {
  LookTest() {
    if (GetParam()) {
      h.root().setPalette(Palette::light());
      parent.setPalette(Palette::light());  // the controls made on it start with it
    }
  }
  String name(const char* base) const { return String(base) + (GetParam() ? "_light" : ""); }
  void expectGolden(const Kw::Box<int>& area, const char* base) {
    const GoldenResult r = GoldenImage::check(h, area, name(base));
    EXPECT_TRUE(r.ok) << r.message;
  }

  Harness h{260, 140};
  MessageProbe parent{GlobCreationInfo(260, 140, h.canvas(), 0, 0)};
};

Slider* slider(MessageProbe& parent, int x, int y, int w, int hgt, bool vertical, double pos) {
  SliderInitArgs args(GlobCreationInfo(static_cast<unsigned short>(w),
                                       static_cast<unsigned short>(hgt), parent.canvas(), x, y),
                      vertical);
  args.position = pos;
  return new Slider(args);
}

ScrollBar* bar(MessageProbe& parent, int x, int y, int length, Orientation o, double pos,
               double size, bool resizable = false) {
  const auto side = static_cast<unsigned short>(length);
  return makeScrollBar(parent.canvas(), x, y, side, side, o, pos, size, resizable);
}

}  // namespace

// Top to bottom: plain, with a point of interest, held, focused, inactive; a vertical pair.
TEST_P(LookTest, SliderStates) {
  slider(parent, 8, 110, 160, 20, false, 0.3);
  Slider* poi = slider(parent, 8, 84, 160, 20, false, 0.6);
  poi->setPointOfInterest(0.25);
  Slider* held = slider(parent, 8, 58, 160, 20, false, 0.5);
  Slider* focused = slider(parent, 8, 32, 160, 20, false, 0.8);
  Slider* off = slider(parent, 8, 6, 160, 20, false, 0.1);
  off->setActive(false, true);
  Slider* v = slider(parent, 190, 6, 24, 124, true, 0.7);
  v->setPointOfInterest(0.5);
  v->setThumbColour(Colour::fromHex(0x3C9A5F));
  slider(parent, 224, 6, 24, 124, true, 0.2)->setThumbVisibility(false);

  h.press(Harness::centreOf(*held));
  focused->set_kbd_focus();
  expectGolden(Kw::Box<int>(0, 0, 260, 140), "slider_states");
  h.release(Harness::centreOf(*held));
}

// Horizontal bars: plain, resizable, being dragged, inactive, a thumb at its minimum length
// and a thumb that fills the bar; two vertical bars.
TEST_P(LookTest, ScrollBarStates) {
  bar(parent, 8, 116, 180, kHorizontal, 0.2, 0.3);
  bar(parent, 8, 96, 180, kHorizontal, 0.4, 0.35, true);
  ScrollBar* dragged = bar(parent, 8, 76, 180, kHorizontal, 0.0, 0.25);
  bar(parent, 8, 56, 180, kHorizontal, 0.5, 0.3)->setActive(false, true);
  bar(parent, 8, 36, 180, kHorizontal, 0.99, 0.01);
  bar(parent, 8, 16, 180, kHorizontal, 0.0, 1.0);
  bar(parent, 204, 8, 124, kVertical, 0.1, 0.4);
  bar(parent, 230, 8, 124, kVertical, 0.5, 0.3, true);

  const NumRange<int, true> thumb = dragged->getThumbPixelExtents();
  const XY<int> grip(8 + (thumb.min() + thumb.max()) / 2, 84);
  h.press(grip);
  h.move(grip + XY<int>(12, 0));
  expectGolden(Kw::Box<int>(0, 0, 260, 140), "scrollbar_states");
  h.release(grip + XY<int>(12, 0));
}

INSTANTIATE_TEST_SUITE_P(Palettes, LookTest, ::testing::Values(false, true),
                         [](const ::testing::TestParamInfo<bool>& i) {
                           return i.param ? "Light" : "Dark";
                         });
