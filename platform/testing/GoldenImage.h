#pragma once
// Golden-image checks: a rendering compared, in memory, with a reviewed PNG kept in the
// repository (tests/golden/NAME.png under the source directory). A pixel differs when any of
// its channels differs by more than the tolerance; the check fails when more pixels differ
// than allowed. On failure the actual image and a diff image (differing pixels red over a
// dimmed copy of the golden) are written to the output directory, named in the message.
//
// Directories: the source tree from the GLOBKIT_SOURCE_DIR environment variable, else the one
// the library was built from; the output from GLOBKIT_GOLDEN_OUT, else golden-out in the
// build tree. GLOBKIT_UPDATE_GOLDENS=1 writes the renderings as the new goldens instead of
// comparing (look at each one before committing it).
#include <cairo.h>

#include "platform/kw/Box.h"
#include "platform/kw/String.h"

class Glob;
class Harness;

struct GoldenTolerance {
  int channel = 2;    // largest difference, in 0..255, still counted as equal
  int maxPixels = 0;  // how many differing pixels are still a pass
};

struct GoldenResult {
  bool ok = false;
  String message;  // why it failed, or what was updated
  explicit operator bool() const { return ok; }
};

class GoldenImage {
 public:
  // Renders the harness's pending damage, then checks the Glob's visible rectangle.
  static GoldenResult check(Harness& h, const Glob& g, const String& name,
                            GoldenTolerance tol = {});
  // Renders, then checks a root area (bottom-up box).
  static GoldenResult check(Harness& h, const Kw::Box<int>& rootArea, const String& name,
                            GoldenTolerance tol = {});
  // Checks an image surface (ARGB32) against the golden called `name`.
  static GoldenResult compare(cairo_surface_t* actual, const String& name,
                              GoldenTolerance tol = {});

  static String goldenPath(const String& name);
  static String outputDir();
  static bool updating();
};
