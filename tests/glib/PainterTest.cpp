// The painter, read back through the pixels: coordinates, clipping, bevels, text and symbols.
#include <gtest/gtest.h>

#include <cairo.h>

#include <array>
#include <cstdlib>
#include <filesystem>

#include <unistd.h>

#include "platform/glib/FontCache.h"
#include "platform/glib/Image.h"
#include "platform/glib/ImageCache.h"
#include "platform/glib/Symbols.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"
#include "tests/glib/PaintGlob.h"

namespace {

const Colour kRed = Colour::fromHex(0xD03030);
const Colour kGreen = Colour::fromHex(0x30C040);
const Colour kBlue = Colour::fromHex(0x3050D0);
const Colour kGrey = Colour::fromHex(0x404040);
const Colour kWhite = Colour::fromHex(0xFFFFFF);

bool near(uint32_t a, uint32_t b, int tolerance = 2) {
  for (int shift = 0; shift < 32; shift += 8) {
    if (std::abs(int((a >> shift) & 0xFF) - int((b >> shift) & 0xFF)) > tolerance) return false;
  }
  return true;
}

// The bounding box (root coordinates) of pixels inside `area` that differ from `background`.
Kw::Box<int> inkIn(const Harness& h, const Kw::Box<int>& area, const Colour& background) {
  Kw::Box<int> ink;
  for (int y = area.y0; y < area.y1; ++y) {
    for (int x = area.x0; x < area.x1; ++x) {
      if (h.pixelAt(x, y) != Harness::argb(background))
        ink = ink.united(Kw::Box<int>(x, y, x + 1, y + 1));
    }
  }
  return ink;
}

TEST(GlibPainter, InertOutsideAPaintPass) {
  Harness h(50, 50);
  PaintGlob g(h.place(0, 0, 20, 20), nullptr);
  Glib::Painter p(*g.canvas());
  EXPECT_FALSE(p.active());
  EXPECT_EQ(p.cairo(), nullptr);
  p.fillRect(p.bounds(), kRed);
  p.text(L"x", p.bounds(), *Glib::fonts().standard(), kRed);
  p.pushClip(Kw::Box<int>(0, 0, 5, 5));
  p.popClip();
  p.popClip();
  EXPECT_TRUE(p.symbol(Glib::kSymbolTick, p.bounds(), kRed)) << "a known code, drawn nowhere";
  EXPECT_FALSE(p.symbol('Q', p.bounds(), kRed));
}

TEST(GlibPainter, CoordinatesAreBottomUpAndClippedToTheCanvas) {
  Harness h(60, 40);
  PaintGlob g(h.place(10, 5, 20, 10), [](Glib::Painter& p) {
    p.fillRect(p.bounds(), kGrey);
    p.fillRect(Kw::Box<int>(0, 0, 5, 3), kRed);        // bottom-left corner
    p.fillRect(Kw::Box<int>(-50, 8, 100, 60), kBlue);  // spills over every edge
    p.line(XY<int>(6, 4), XY<int>(9, 4), kGreen);      // both ends included
  });
  h.render();
  EXPECT_EQ(h.pixelAt(10, 5), Harness::argb(kRed));
  EXPECT_EQ(h.pixelAt(14, 7), Harness::argb(kRed));
  EXPECT_EQ(h.pixelAt(15, 5), Harness::argb(kGrey));
  EXPECT_EQ(h.pixelAt(10, 8), Harness::argb(kGrey));
  EXPECT_EQ(h.pixelAt(10, 13), Harness::argb(kBlue));
  EXPECT_EQ(h.pixelAt(29, 14), Harness::argb(kBlue));
  const uint32_t screen = Harness::argb(h.root().getPalette().get(Palette::Window));
  EXPECT_EQ(h.pixelAt(9, 13), screen);
  EXPECT_EQ(h.pixelAt(30, 13), screen);
  EXPECT_EQ(h.pixelAt(20, 15), screen);
  EXPECT_EQ(inkIn(h, Kw::Box<int>(15, 9, 30, 10), kGrey), Kw::Box<int>(16, 9, 20, 10));
}

TEST(GlibPainter, ChildrenAreClippedToTheirParent) {
  Harness h(60, 40);
  PaintGlob parent(h.place(10, 10, 20, 20),
                   [](Glib::Painter& p) { p.fillRect(p.bounds(), kGrey); });
  PaintGlob child(GlobCreationInfo(30, 30, parent.canvas(), 10, 10),
                  [](Glib::Painter& p) { p.fillRect(p.bounds(), kRed); });
  h.render();
  EXPECT_EQ(h.pixelAt(29, 29), Harness::argb(kRed));
  EXPECT_EQ(h.pixelAt(25, 15), Harness::argb(kGrey));
  EXPECT_NE(h.pixelAt(30, 29), Harness::argb(kRed));
  EXPECT_NE(h.pixelAt(29, 30), Harness::argb(kRed));
}

TEST(GlibPainter, PushedClipsNestAndUnwind) {
  Harness h(40, 40);
  PaintGlob g(h.place(0, 0, 40, 40), [](Glib::Painter& p) {
    p.fillRect(p.bounds(), kGrey);
    p.pushClip(Kw::Box<int>(0, 0, 20, 40));
    p.pushClip(Kw::Box<int>(10, 0, 40, 10));  // only 10..20 x 0..10 remains
    p.fillRect(p.bounds(), kRed);
    p.popClip();
    p.fillRect(Kw::Box<int>(0, 30, 40, 40), kBlue);  // left half only
    // Left open on purpose: the painter unwinds it.
    p.pushClip(Kw::Box<int>(0, 0, 1, 1));
  });
  h.render();
  EXPECT_EQ(inkIn(h, Kw::Box<int>(0, 0, 40, 30), kGrey), Kw::Box<int>(10, 0, 20, 10));
  EXPECT_EQ(h.pixelAt(19, 35), Harness::argb(kBlue));
  EXPECT_EQ(h.pixelAt(20, 35), Harness::argb(kGrey));
  // A later frame starts from a clean clip.
  g.setPaint([](Glib::Painter& p) { p.fillRect(p.bounds(), kGreen); });
  g.update();
  h.render();
  EXPECT_EQ(h.pixelAt(39, 39), Harness::argb(kGreen));
}

TEST(GlibPainter, DepthBoxesLightFromTheTopLeft) {
  Harness h(80, 30);
  const Colour light = Colour::fromHex(0xA0A0A0);
  const Colour shadow = Colour::fromHex(0x101010);
  PaintGlob g(h.place(0, 0, 80, 30), [&](Glib::Painter& p) {
    p.depthBox(Kw::Box<int>(0, 0, 40, 30), Glib::Bevel::Raised, 3, light, shadow, kGrey);
    p.fillRect(Kw::Box<int>(40, 0, 80, 30), kGrey);
    p.depthBox(Kw::Box<int>(40, 0, 80, 30), Glib::Bevel::Sunken, 3, light, shadow);
  });
  h.render();
  // Raised: light top edge and left edge, shadow bottom and right edges, face inside.
  EXPECT_EQ(h.pixelAt(10, 29), Harness::argb(light));
  EXPECT_EQ(h.pixelAt(0, 15), Harness::argb(light));
  EXPECT_EQ(h.pixelAt(10, 0), Harness::argb(shadow));
  EXPECT_EQ(h.pixelAt(39, 15), Harness::argb(shadow));
  EXPECT_EQ(h.pixelAt(20, 15), Harness::argb(kGrey));
  // Inner rings fade towards the face.
  const uint32_t ring2 = h.pixelAt(10, 28);
  EXPECT_NE(ring2, Harness::argb(light));
  EXPECT_GT(ring2 & 0xFF, Harness::argb(kGrey) & 0xFF);
  // Sunken: the other way round, blended over the face drawn before.
  EXPECT_EQ(h.pixelAt(50, 29), Harness::argb(shadow));
  EXPECT_EQ(h.pixelAt(50, 0), Harness::argb(light));
  EXPECT_EQ(h.pixelAt(79, 15), Harness::argb(light));
  EXPECT_EQ(h.pixelAt(60, 15), Harness::argb(kGrey));
}

TEST(GlibPainter, FocusRectIsADottedFrameInside) {
  Harness h(30, 20);
  PaintGlob g(h.place(0, 0, 30, 20), [](Glib::Painter& p) {
    p.fillRect(p.bounds(), kGrey);
    p.focusRect(Kw::Box<int>(4, 4, 24, 14), kWhite);
  });
  h.render();
  EXPECT_EQ(inkIn(h, Kw::Box<int>(0, 0, 30, 20), kGrey), Kw::Box<int>(4, 4, 24, 14));
  // Every other pixel along the top edge, crisp (the right edge's dots start in the corner).
  for (int x = 4; x < 23; ++x) {
    EXPECT_EQ(h.pixelAt(x, 13), Harness::argb((x - 4) % 2 == 0 ? kWhite : kGrey)) << x;
  }
  EXPECT_EQ(h.pixelAt(4, 12), Harness::argb(kGrey));
  EXPECT_EQ(h.pixelAt(4, 11), Harness::argb(kWhite));
  EXPECT_EQ(h.pixelAt(10, 10), Harness::argb(kGrey)) << "the inside is left alone";
}

TEST(GlibPainter, DepthBoxOnTinyOrEmptyBoxesStaysInside) {
  Harness h(20, 20);
  PaintGlob g(h.place(0, 0, 20, 20), [&](Glib::Painter& p) {
    p.fillRect(p.bounds(), kGrey);
    p.depthBox(Kw::Box<int>(2, 2, 5, 4), Glib::Bevel::Raised, 8, kWhite, kRed, kBlue);
    p.depthBox(Kw::Box<int>(9, 9, 9, 15), Glib::Bevel::Raised, 2, kWhite, kRed);
    p.depthBox(Kw::Box<int>(12, 12, 14, 14), Glib::Bevel::Sunken, -3, kWhite, kRed);
  });
  h.render();
  EXPECT_EQ(inkIn(h, Kw::Box<int>(0, 0, 20, 20), kGrey), Kw::Box<int>(2, 2, 5, 4));
}

TEST(GlibPainter, TextIsAlignedAndCentredInItsBox) {
  Harness h(200, 60);
  auto font = Glib::fonts().standard();
  const Kw::Box<int> box(20, 10, 180, 40);
  auto drawWith = [&](TextAlignment a) {
    return [&, a](Glib::Painter& p) {
      p.fillRect(p.bounds(), kGrey);
      p.text(L"Tempo", box, *font, kWhite, a);
    };
  };
  PaintGlob g(h.place(0, 0, 200, 60), drawWith(TextAlignment::Left));
  h.render();
  const Kw::Box<int> left = inkIn(h, box, kGrey);
  g.setPaint(drawWith(TextAlignment::Right));
  g.update();
  h.render();
  const Kw::Box<int> right = inkIn(h, box, kGrey);
  g.setPaint(drawWith(TextAlignment::Centred));
  g.update();
  h.render();
  const Kw::Box<int> centred = inkIn(h, box, kGrey);

  ASSERT_FALSE(left.empty());
  EXPECT_LE(left.x0 - box.x0, 2);
  EXPECT_LE(box.x1 - right.x1, 2);
  EXPECT_LE(std::abs((centred.x0 - box.x0) - (box.x1 - centred.x1)), 2);
  // The same ink, less at most an anti-aliased column that the box edge cuts off.
  EXPECT_LE(std::abs(left.width() - right.width()), 1);
  // Vertically centred: the ink sits within a few pixels of the middle.
  EXPECT_LE(std::abs((left.y0 + left.y1) - (box.y0 + box.y1)), 4);
}

TEST(GlibPainter, TextNeverLeavesItsBox) {
  Harness h(120, 40);
  auto font = Glib::fonts().get(Glib::FontDesc("", 30));
  const Kw::Box<int> box(30, 15, 90, 25);
  PaintGlob g(h.place(0, 0, 120, 40), [&](Glib::Painter& p) {
    p.fillRect(p.bounds(), kGrey);
    p.text(WString(5000, L'W'), box, *font, kWhite, TextAlignment::Centred,
           Glib::TextStyles::Shadowed);
  });
  h.render();
  const Kw::Box<int> ink = inkIn(h, Kw::Box<int>(0, 0, 120, 40), kGrey);
  ASSERT_FALSE(ink.empty());
  EXPECT_TRUE(box.contains(ink));
  EXPECT_LE(ink.x0 - box.x0, 2) << "text wider than its box starts at the left edge";
}

TEST(GlibPainter, TextWithInvalidCharactersDrawsMarks) {
  Harness h(120, 30);
  WString text = L"a";
  text += wchar_t(0xDC00);
  text += wchar_t(1);
  PaintGlob g(h.place(0, 0, 120, 30), [&](Glib::Painter& p) {
    p.fillRect(p.bounds(), kGrey);
    p.text(text, p.bounds(), *Glib::fonts().standard(), kWhite, TextAlignment::Left);
  });
  h.render();
  const Kw::Box<int> ink = inkIn(h, Kw::Box<int>(0, 0, 120, 30), kGrey);
  EXPECT_GT(ink.width(), Glib::fonts().standard()->textWidth(L"a"));
}

TEST(GlibPainter, SymbolsPointWhereTheirCodesSay) {
  Harness h(40, 20);
  auto inkRows = [&](int code) {
    PaintGlob g(h.place(0, 0, 20, 20), [code](Glib::Painter& p) {
      p.fillRect(p.bounds(), kGrey);
      EXPECT_TRUE(p.symbol(code, p.bounds(), kWhite));
    });
    h.render();
    // Ink pixels in the upper and lower halves, and in the left and right halves.
    int up = 0, down = 0, left = 0, right = 0;
    for (int y = 0; y < 20; ++y) {
      for (int x = 0; x < 20; ++x) {
        if (h.pixelAt(x, y) == Harness::argb(kGrey)) continue;
        // The widest row is the triangle's base.
        (y >= 10 ? up : down)++;
        (x >= 10 ? right : left)++;
      }
    }
    return std::array<int, 4>{up, down, left, right};
  };
  // The base (more ink) is on the side the triangle points away from.
  auto d = inkRows(Glib::kSymbolDown);
  EXPECT_GT(d[0], d[1]) << "'H' points down";
  auto u = inkRows(Glib::kSymbolUp);
  EXPECT_GT(u[1], u[0]) << "'I' points up";
  auto r = inkRows('>');
  EXPECT_GT(r[2], r[3]) << "'>' points right";
  auto l = inkRows('<');
  EXPECT_GT(l[3], l[2]) << "'<' points left";
  for (int code :
       {Glib::kSymbolTick, Glib::kSymbolCross, Glib::kSymbolMinimise, Glib::kSymbolPin}) {
    auto ink = inkRows(code);
    EXPECT_GT(ink[0] + ink[1], 6) << code;
  }

  PaintGlob g(h.place(20, 0, 20, 20), [](Glib::Painter& p) {
    p.fillRect(p.bounds(), kGrey);
    EXPECT_FALSE(p.symbol('Q', p.bounds(), kWhite));
    EXPECT_FALSE(Glib::drawSymbol(p, -1, p.bounds(), kWhite));
  });
  h.render();
  EXPECT_TRUE(inkIn(h, Kw::Box<int>(20, 0, 40, 20), kGrey).empty());
}

TEST(GlibImages, MissingFileGivesAPlaceholderReportedOnce) {
  Diagnostics::Capture diag;
  const String path = "/nonexistent/dir/icon-missing-once.png";
  auto a = Glib::Image::load(path, 24, 12);
  auto b = Glib::Image::load(path, 24, 12);
  EXPECT_EQ(a.get(), b.get());
  EXPECT_TRUE(a->isPlaceholder());
  EXPECT_EQ(a->width(), 24);
  EXPECT_EQ(a->height(), 12);
  Glib::ImageCache::instance().clear();
  Glib::Image::load(path);
  int lines = 0;
  for (const auto& l : diag.lines()) lines += l.find(path) != String::npos;
  EXPECT_EQ(lines, 1);
  EXPECT_EQ(Glib::Image::load("", 0, 0)->width(), Glib::Image::kPlaceholderSize);
  EXPECT_EQ(Glib::Image::placeholder(1 << 20, -5)->width(), 4096);
}

TEST(GlibImages, PngTransparencyBlendsOverTheCanvas) {
  const auto dir =
      std::filesystem::temp_directory_path() / ("globkit-images-" + std::to_string(getpid()));
  std::filesystem::create_directories(dir);
  const String path = (dir / "half.png").string();
  {
    // 4 x 2: the left half opaque red, the right half clear; the top row's last pixel half
    // transparent white.
    cairo_surface_t* s = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, 4, 2);
    cairo_t* cr = cairo_create(s);
    cairo_set_source_rgb(cr, kRed.r, kRed.g, kRed.b);
    cairo_rectangle(cr, 0, 0, 2, 2);
    cairo_fill(cr);
    cairo_set_source_rgba(cr, 1, 1, 1, 0.5);
    cairo_rectangle(cr, 3, 0, 1, 1);
    cairo_fill(cr);
    cairo_destroy(cr);
    ASSERT_EQ(cairo_surface_write_to_png(s, path.c_str()), CAIRO_STATUS_SUCCESS);
    cairo_surface_destroy(s);
  }
  auto img = Glib::Image::load(path);
  ASSERT_FALSE(img->isPlaceholder());
  Harness h(20, 20);
  PaintGlob g(h.place(0, 0, 20, 20), [&](Glib::Painter& p) {
    p.fillRect(p.bounds(), kBlue);
    p.image(*img, XY<int>(5, 5));
  });
  h.render();
  EXPECT_EQ(h.pixelAt(5, 5), Harness::argb(kRed));   // bottom-left of the image
  EXPECT_EQ(h.pixelAt(7, 5), Harness::argb(kBlue));  // clear: the canvas shows through
  EXPECT_TRUE(near(h.pixelAt(8, 6), Harness::argb(mix(kBlue, kWhite, 0.5))));
  EXPECT_EQ(h.pixelAt(5, 7), Harness::argb(kBlue));  // above the image
  std::filesystem::remove_all(dir);
}

}  // namespace
