// Every gallery page, rendered headless in the dark and the light palette: the light rendering
// must really be light (not the dark one again, not blank) and still carry dark ink to read.
#include <gtest/gtest.h>

#include <cairo.h>

#include <memory>
#include <set>
#include <vector>

#include "gallery/GalleryApp.h"
#include "gallery/MessageLog.h"
#include "platform/backend/HeadlessBackend.h"
#include "platform/glob/RootGlob.h"

namespace {

constexpr int kWidth = 900, kHeight = 640;

struct Page {
  String title;
  std::vector<uint32_t> pixels;  // 0xRRGGBB, top-down
};

std::vector<Page> renderEveryPage(const Palette& palette) {
  HeadlessBackend screen(kWidth, kHeight);
  screen.root().setPalette(palette);
  MessageLog log;
  auto app = std::make_unique<GalleryApp>(screen.root(), log);
  std::vector<Page> pages;
  for (int i = 0; i < app->pageCount(); ++i) {
    app->selectPage(i);
    screen.root().pumpQueue();
    screen.render();
    cairo_surface_t* s = screen.surface();
    cairo_surface_flush(s);
    const unsigned char* data = cairo_image_surface_get_data(s);
    const int stride = cairo_image_surface_get_stride(s);
    Page page{app->page(i)->title(), {}};
    for (int y = 0; y < kHeight; ++y) {
      const auto* row = reinterpret_cast<const uint32_t*>(data + y * stride);
      for (int x = 0; x < kWidth; ++x) page.pixels.push_back(row[x] & 0xFFFFFF);
    }
    pages.push_back(std::move(page));
  }
  app.reset();
  return pages;
}

double lightness(uint32_t rgb) {
  const double r = ((rgb >> 16) & 0xFF) / 255.0, g = ((rgb >> 8) & 0xFF) / 255.0,
               b = (rgb & 0xFF) / 255.0;
  return 0.2126 * r + 0.7152 * g + 0.0722 * b;
}

double meanLightness(const std::vector<uint32_t>& px) {
  double sum = 0;
  for (uint32_t p : px) sum += lightness(p);
  return sum / static_cast<double>(px.size());
}

}  // namespace

TEST(GalleryPalettes, EveryPageRendersLightAndDark) {
  const std::vector<Page> dark = renderEveryPage(Palette::dark());
  const std::vector<Page> light = renderEveryPage(Palette::light());
  ASSERT_EQ(dark.size(), light.size());
  ASSERT_GE(light.size(), 8u);
  for (size_t i = 0; i < light.size(); ++i) {
    const Page& d = dark[i];
    const Page& l = light[i];
    ASSERT_EQ(d.title, l.title);
    size_t differ = 0, ink = 0;
    std::set<uint32_t> colours;
    for (size_t k = 0; k < l.pixels.size(); ++k) {
      differ += l.pixels[k] != d.pixels[k];
      ink += lightness(l.pixels[k]) < 0.25;
      colours.insert(l.pixels[k]);
    }
    const double total = static_cast<double>(l.pixels.size());
    // The light look replaces the dark one nearly everywhere...
    EXPECT_GT(differ / total, 0.8) << l.title;
    // ...is light overall where the dark one is dark...
    EXPECT_GT(meanLightness(l.pixels), 0.6) << l.title;
    EXPECT_LT(meanLightness(d.pixels), 0.35) << d.title;
    // ...and is not blank: many shades, and dark text to read.
    EXPECT_GT(colours.size(), 40u) << l.title;
    EXPECT_GT(ink / total, 0.002) << l.title;
  }
}
