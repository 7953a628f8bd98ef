// Draws the gallery's own title-strip icons (settings, pin, pinned) as 16x16 PNGs.
//
//   g++ -std=c++20 tools/gallery-icons.cpp $(pkg-config --cflags --libs cairo) -o /tmp/icons
//   /tmp/icons gallery/icons
//   /tmp/icons gallery/icons/light dark-ink
//
// Light strokes on a transparent ground, to sit on the dark-grey title strip; with "dark-ink",
// dark strokes for the pale title strip of the light palette.
#include <cairo.h>

#include <cmath>
#include <cstdio>
#include <string>

namespace {

constexpr int kSize = 16;
constexpr double kLightInk[3] = {0.86, 0.87, 0.89};
constexpr double kDarkInk[3] = {0.20, 0.22, 0.25};
const double* gInk = kLightInk;

void ink(cairo_t* cr, double alpha = 1.0) {
  cairo_set_source_rgba(cr, gInk[0], gInk[1], gInk[2], alpha);
}

// A cog: eight teeth round a ring with a hole.
void drawSettings(cairo_t* cr) {
  const double cx = 8, cy = 8;
  ink(cr);
  for (int i = 0; i < 8; ++i) {
    cairo_save(cr);
    cairo_translate(cr, cx, cy);
    cairo_rotate(cr, i * M_PI / 4);
    cairo_rectangle(cr, -1.5, -7.5, 3, 3);
    cairo_fill(cr);
    cairo_restore(cr);
  }
  cairo_arc(cr, cx, cy, 5.2, 0, 2 * M_PI);
  cairo_arc_negative(cr, cx, cy, 2.2, 2 * M_PI, 0);
  cairo_fill(cr);
}

// A push pin; `pushed` stands it upright and short, otherwise it leans out of the surface.
void drawPin(cairo_t* cr, bool pushed) {
  cairo_translate(cr, 8, 8);
  if (!pushed) cairo_rotate(cr, M_PI / 4);
  const double needle = pushed ? 3.0 : 7.0;
  ink(cr);
  // Head and collar.
  cairo_rectangle(cr, -3.5, -7, 7, 2.5);
  cairo_fill(cr);
  cairo_move_to(cr, -2, -4.5);
  cairo_line_to(cr, 2, -4.5);
  cairo_line_to(cr, 3, 0.5);
  cairo_line_to(cr, -3, 0.5);
  cairo_close_path(cr);
  cairo_fill(cr);
  cairo_rectangle(cr, -4.5, 0.5, 9, 1.5);
  cairo_fill(cr);
  // Needle.
  cairo_set_line_width(cr, 1.2);
  cairo_move_to(cr, 0, 2);
  cairo_line_to(cr, 0, 2 + needle);
  cairo_stroke(cr);
  if (pushed) {
    // The surface it is pushed into.
    ink(cr, 0.55);
    cairo_set_line_width(cr, 1.0);
    cairo_move_to(cr, -6, 5.5);
    cairo_line_to(cr, 6, 5.5);
    cairo_stroke(cr);
  }
}

bool write(const std::string& dir, const char* name, void (*paint)(cairo_t*)) {
  cairo_surface_t* s = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, kSize, kSize);
  cairo_t* cr = cairo_create(s);
  paint(cr);
  cairo_destroy(cr);
  const std::string path = dir + "/" + name;
  const bool ok = cairo_surface_write_to_png(s, path.c_str()) == CAIRO_STATUS_SUCCESS;
  cairo_surface_destroy(s);
  std::printf("%s %s\n", ok ? "wrote" : "FAILED", path.c_str());
  return ok;
}

}  // namespace

int main(int argc, char** argv) {
  const std::string dir = argc > 1 ? argv[1] : ".";
  if (argc > 2 && std::string(argv[2]) == "dark-ink") gInk = kDarkInk;
  bool ok = write(dir, "settings.png", drawSettings);
  ok = write(dir, "pin.png", [](cairo_t* cr) { drawPin(cr, false); }) && ok;
  ok = write(dir, "pinned.png", [](cairo_t* cr) { drawPin(cr, true); }) && ok;
  return ok ? 0 : 1;
}
