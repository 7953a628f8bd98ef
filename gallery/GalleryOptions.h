#pragma once
// The gallery's command line:
//   --headless          no window, even when a display is available; with nothing else
//                       asked, every page is written as a PNG into a new directory in /tmp
//   --screenshot DIR    every page to DIR/page-NAME.png (each path printed), then exit
//   --log FILE          the message log also written to FILE, one line per message
//   --dump-tree         the Glob tree as JSON on stdout once the first frame is shown
//   --size WxH          the window's size in window units (default 1280x820)
//   --palette NAME      the look: dark (the default) or light
//   --page TITLE        the page shown first (built at once), by its tab's title
#include "platform/glob/Palette.h"
#include "platform/kw/String.h"

struct GalleryOptions {
  bool headless = false;
  bool dumpTree = false;
  bool help = false;
  String screenshotDir;
  String logFile;
  String startPage;
  int width = 1280;
  int height = 820;
  Palette palette = Palette::dark();

  // Reads the arguments; false with `error` set when they make no sense.
  bool parse(int argc, char** argv, String& error);
  static const char* usage();
};
