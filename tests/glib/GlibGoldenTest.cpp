// The drawing primitives' looks, each compared with a reviewed image.
#include <gtest/gtest.h>

#include "platform/glib/FontCache.h"
#include "platform/glib/Image.h"
#include "platform/glib/Symbols.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "tests/glib/PaintGlob.h"

namespace {

const Palette kLook;

TEST(GlibGolden, DepthBoxesRaisedAndSunken) {
  Harness h(140, 40);
  PaintGlob g(h.place(0, 0, 140, 40), [](Glib::Painter& p) {
    p.fillRect(p.bounds(), kLook.get(Palette::Window));
    const Colour face = kLook.get(Palette::Button);
    p.fillRect(Kw::Box<int>(6, 6, 66, 34), face);
    p.depthBox(Kw::Box<int>(6, 6, 66, 34), Glib::Bevel::Raised, 4, kLook.get(Palette::Light),
               kLook.get(Palette::Shadow));
    p.fillRect(Kw::Box<int>(74, 6, 134, 34), face);
    p.depthBox(Kw::Box<int>(74, 6, 134, 34), Glib::Bevel::Sunken, 2, kLook.get(Palette::Light),
               kLook.get(Palette::Shadow));
  });
  auto r = GoldenImage::check(h, g, "glib_depth_boxes");
  EXPECT_TRUE(r) << r.message;
}

TEST(GlibGolden, Gradients) {
  Harness h(120, 40);
  PaintGlob g(h.place(0, 0, 120, 40), [](Glib::Painter& p) {
    p.verticalGradient(Kw::Box<int>(0, 0, 60, 40), kLook.get(Palette::Shadow),
                       kLook.get(Palette::Light));
    p.horizontalGradient(Kw::Box<int>(60, 0, 120, 40), kLook.get(Palette::Base),
                         kLook.get(Palette::Highlight));
  });
  auto r = GoldenImage::check(h, g, "glib_gradients");
  EXPECT_TRUE(r) << r.message;
}

TEST(GlibGolden, TextAlignedInBoxes) {
  Harness h(160, 84);
  PaintGlob g(h.place(0, 0, 160, 84), [](Glib::Painter& p) {
    p.fillRect(p.bounds(), kLook.get(Palette::Window));
    const auto font = Glib::fonts().standard();
    const Colour text = kLook.get(Palette::WindowText);
    const TextAlignment aligns[] = {TextAlignment::Left, TextAlignment::Right,
                                    TextAlignment::Centred};
    for (int i = 0; i < 3; ++i) {
      const Kw::Box<int> box(4, 58 - 26 * i, 156, 80 - 26 * i);
      p.fillRect(box, kLook.get(Palette::Base));
      p.text(L"Gain 12 dB", box, *font, text, aligns[i]);
    }
  });
  auto r = GoldenImage::check(h, g, "glib_text_alignment");
  EXPECT_TRUE(r) << r.message;
}

TEST(GlibGolden, Symbols) {
  const int codes[] = {Glib::kSymbolDown,     Glib::kSymbolRight, Glib::kSymbolUp,
                       Glib::kSymbolLeft,     Glib::kSymbolTick,  Glib::kSymbolCross,
                       Glib::kSymbolMinimise, Glib::kSymbolPin};
  Harness h(8 * 20, 20);
  PaintGlob g(h.place(0, 0, 8 * 20, 20), [&](Glib::Painter& p) {
    p.fillRect(p.bounds(), kLook.get(Palette::Button));
    for (int i = 0; i < 8; ++i) {
      p.symbol(codes[i], Kw::Box<int>(i * 20 + 2, 2, i * 20 + 18, 18),
               kLook.get(Palette::ButtonText));
    }
  });
  auto r = GoldenImage::check(h, g, "glib_symbols");
  EXPECT_TRUE(r) << r.message;
}

TEST(GlibGolden, ImagePlaceholder) {
  Harness h(40, 30);
  Diagnostics::Capture quiet;
  const auto img = Glib::Image::load("/nonexistent/golden-placeholder.png", 24, 18);
  PaintGlob g(h.place(0, 0, 40, 30), [&](Glib::Painter& p) {
    p.fillRect(p.bounds(), kLook.get(Palette::Window));
    p.image(*img, XY<int>(8, 6));
  });
  auto r = GoldenImage::check(h, g, "glib_image_placeholder");
  EXPECT_TRUE(r) << r.message;
}

}  // namespace
