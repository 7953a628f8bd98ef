#include "gallery/GalleryOptions.h"

#include <cstdio>

namespace {
constexpr int kMinSide = 320;
constexpr int kMaxSide = 8192;
}  // namespace

const char* GalleryOptions::usage() {
  return "usage: globkit-gallery [--headless] [--screenshot DIR] [--log FILE] [--dump-tree]\n"
         "                       [--size WxH] [--palette dark|light] [--page TITLE]\n";
}

bool GalleryOptions::parse(int argc, char** argv, String& error) {
  for (int i = 1; i < argc; ++i) {
    const String arg = argv[i];
    const bool hasValue = i + 1 < argc;
    if (arg == "--headless") {
      headless = true;
    } else if (arg == "--dump-tree") {
      dumpTree = true;
    } else if (arg == "--help" || arg == "-h") {
      help = true;
    } else if (arg == "--screenshot" || arg == "--log" || arg == "--size" || arg == "--palette" ||
               arg == "--page") {
      if (!hasValue) {
        error = arg + " needs a value";
        return false;
      }
      const String value = argv[++i];
      if (arg == "--screenshot") {
        screenshotDir = value;
      } else if (arg == "--page") {
        startPage = value;
      } else if (arg == "--log") {
        logFile = value;
      } else if (arg == "--palette") {
        if (value == "dark") {
          palette = Palette::dark();
        } else if (value == "light") {
          palette = Palette::light();
        } else {
          error = "--palette wants dark or light, not '" + value + "'";
          return false;
        }
      } else {
        int w = 0, h = 0;
        char tail = 0;
        if (std::sscanf(value.c_str(), "%dx%d%c", &w, &h, &tail) != 2 || w < kMinSide ||
            h < kMinSide || w > kMaxSide || h > kMaxSide) {
          error = "--size wants WIDTHxHEIGHT, each from " + std::to_string(kMinSide) + " to " +
                  std::to_string(kMaxSide) + ", not '" + value + "'";
          return false;
        }
        width = w;
        height = h;
      }
    } else {
      error = "unknown option '" + arg + "'";
      return false;
    }
  }
  return true;
}
