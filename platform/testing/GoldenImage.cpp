#include "platform/testing/GoldenImage.h"

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <filesystem>

#include "platform/backend/RootRenderer.h"
#include "platform/testing/Harness.h"

namespace {

String envOr(const char* var, const String& fallback) {
  const char* v = std::getenv(var);
  return v && *v ? String(v) : fallback;
}

String builtSourceDir() {
#ifdef GLOBKIT_SOURCE_DIR
  return GLOBKIT_SOURCE_DIR;
#else
  return ".";
#endif
}

String builtOutputDir() {
#ifdef GLOBKIT_BINARY_DIR
  return String(GLOBKIT_BINARY_DIR) + "/golden-out";
#else
  return "golden-out";
#endif
}

uint32_t pixel(cairo_surface_t* s, int x, int y) {
  const unsigned char* row =
      cairo_image_surface_get_data(s) + y * cairo_image_surface_get_stride(s);
  return reinterpret_cast<const uint32_t*>(row)[x];
}

int channelDifference(uint32_t a, uint32_t b) {
  int worst = 0;
  for (int shift = 0; shift < 32; shift += 8) {
    worst = std::max(worst, std::abs(static_cast<int>((a >> shift) & 0xFF) -
                                     static_cast<int>((b >> shift) & 0xFF)));
  }
  return worst;
}

// Differing pixels in red over a dimmed grey copy of the golden.
cairo_surface_t* diffImage(cairo_surface_t* golden, cairo_surface_t* actual, int channelTol) {
  const int w = cairo_image_surface_get_width(golden);
  const int h = cairo_image_surface_get_height(golden);
  cairo_surface_t* d = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, w, h);
  unsigned char* data = cairo_image_surface_get_data(d);
  const int stride = cairo_image_surface_get_stride(d);
  for (int y = 0; y < h; ++y) {
    auto* row = reinterpret_cast<uint32_t*>(data + y * stride);
    for (int x = 0; x < w; ++x) {
      const uint32_t g = pixel(golden, x, y);
      if (channelDifference(g, pixel(actual, x, y)) > channelTol) {
        row[x] = 0xFFFF0000u;
      } else {
        const uint32_t grey = (((g >> 16) & 0xFF) + ((g >> 8) & 0xFF) + (g & 0xFF)) / 9;
        row[x] = 0xFF000000u | grey << 16 | grey << 8 | grey;
      }
    }
  }
  cairo_surface_mark_dirty(d);
  return d;
}

bool writePng(cairo_surface_t* s, const String& path) {
  std::error_code ec;
  std::filesystem::create_directories(std::filesystem::path(path).parent_path(), ec);
  return cairo_surface_write_to_png(s, path.c_str()) == CAIRO_STATUS_SUCCESS;
}

}  // namespace

String GoldenImage::goldenPath(const String& name) {
  return envOr("GLOBKIT_SOURCE_DIR", builtSourceDir()) + "/tests/golden/" + name + ".png";
}

String GoldenImage::outputDir() {
  return envOr("GLOBKIT_GOLDEN_OUT", builtOutputDir());
}

bool GoldenImage::updating() {
  return envOr("GLOBKIT_UPDATE_GOLDENS", "0") == "1";
}

GoldenResult GoldenImage::check(Harness& h, const Glob& g, const String& name,
                                GoldenTolerance tol) {
  h.render();
  return check(h, g.canvas()->visibleRootRect(), name, tol);
}

GoldenResult GoldenImage::check(Harness& h, const Kw::Box<int>& rootArea, const String& name,
                                GoldenTolerance tol) {
  h.render();
  cairo_surface_t* actual = h.renderer().copyArea(rootArea);
  if (!actual) return {false, "golden " + name + ": the area to compare is not on screen"};
  GoldenResult r = compare(actual, name, tol);
  cairo_surface_destroy(actual);
  return r;
}

GoldenResult GoldenImage::compare(cairo_surface_t* actual, const String& name,
                                  GoldenTolerance tol) {
  const String path = goldenPath(name);
  if (updating()) {
    if (!writePng(actual, path)) return {false, "golden " + name + ": cannot write " + path};
    return {true, "golden " + name + " updated: " + path};
  }
  cairo_surface_flush(actual);
  cairo_surface_t* golden = cairo_image_surface_create_from_png(path.c_str());
  if (cairo_surface_status(golden) != CAIRO_STATUS_SUCCESS) {
    cairo_surface_destroy(golden);
    const String out = outputDir() + "/" + name + ".actual.png";
    writePng(actual, out);
    return {false, "golden " + name + " is missing (" + path +
                       "). To create it, run the test with GLOBKIT_UPDATE_GOLDENS=1, look at the "
                       "new PNG, and commit it. This rendering: " +
                       out};
  }
  if (cairo_image_surface_get_format(golden) != CAIRO_FORMAT_ARGB32) {
    // An opaque PNG loads without alpha; compare it as opaque ARGB.
    cairo_surface_t* argb =
        cairo_image_surface_create(CAIRO_FORMAT_ARGB32, cairo_image_surface_get_width(golden),
                                   cairo_image_surface_get_height(golden));
    cairo_t* cr = cairo_create(argb);
    cairo_set_source_surface(cr, golden, 0, 0);
    cairo_paint(cr);
    cairo_destroy(cr);
    cairo_surface_destroy(golden);
    golden = argb;
  }
  const int w = cairo_image_surface_get_width(actual);
  const int h = cairo_image_surface_get_height(actual);
  const int gw = cairo_image_surface_get_width(golden);
  const int gh = cairo_image_surface_get_height(golden);
  String problem;
  if (w != gw || h != gh) {
    problem = "size " + std::to_string(w) + "x" + std::to_string(h) + " instead of the golden's " +
              std::to_string(gw) + "x" + std::to_string(gh);
  } else {
    int differing = 0;
    int worst = 0;
    for (int y = 0; y < h; ++y) {
      for (int x = 0; x < w; ++x) {
        const int d = channelDifference(pixel(golden, x, y), pixel(actual, x, y));
        worst = std::max(worst, d);
        if (d > tol.channel) ++differing;
      }
    }
    if (differing > tol.maxPixels) {
      problem = std::to_string(differing) + " pixels differ by more than " +
                std::to_string(tol.channel) + " (at most " + std::to_string(tol.maxPixels) +
                " allowed; largest difference " + std::to_string(worst) + ")";
    }
  }
  if (problem.empty()) {
    cairo_surface_destroy(golden);
    return {true, ""};
  }
  const String actualOut = outputDir() + "/" + name + ".actual.png";
  String message = "golden " + name + ": " + problem + ". Actual: " + actualOut;
  writePng(actual, actualOut);
  if (w == gw && h == gh) {
    const String diffOut = outputDir() + "/" + name + ".diff.png";
    cairo_surface_t* diff = diffImage(golden, actual, tol.channel);
    writePng(diff, diffOut);
    cairo_surface_destroy(diff);
    message += ", diff: " + diffOut;
  }
  cairo_surface_destroy(golden);
  return {false, message};
}
