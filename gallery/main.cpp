// The gallery: every control of the library on a page per subsystem, in a window when there is
// a display and headless otherwise, with a live log of the messages the controls send.
#include <stdlib.h>
#include <sys/stat.h>

#include <cctype>
#include <cstdio>
#include <memory>

#include "gallery/GalleryApp.h"
#include "gallery/GalleryOptions.h"
#include "gallery/TreeDump.h"
#include "platform/backend/HeadlessBackend.h"
#include "platform/backend/WindowBackend.h"
#include "text/KwToolTip.h"
#include "text/PanelTitleTextBox.h"

namespace {

// "Check boxes & radio sets" -> "check-boxes-radio-sets".
String slug(const String& title) {
  String out;
  for (const char ch : title) {
    const auto c = static_cast<unsigned char>(ch);
    if (std::isalnum(c)) {
      out += static_cast<char>(std::tolower(c));
    } else if (!out.empty() && out.back() != '-') {
      out += '-';
    }
  }
  while (!out.empty() && out.back() == '-') out.pop_back();
  return out;
}

int writeScreenshots(Backend& screen, GalleryApp& app, const String& dir) {
  ::mkdir(dir.c_str(), 0755);
  int failures = 0;
  for (int i = 0; i < app.pageCount(); ++i) {
    app.selectPage(i);
    screen.root().pumpQueue();
    const String path = dir + "/page-" + slug(app.page(i)->title()) + ".png";
    if (screen.screenshot(path)) {
      std::printf("%s\n", path.c_str());
    } else {
      ++failures;
    }
  }
  std::fflush(stdout);
  return failures == 0 ? 0 : 1;
}

void dumpTree(Backend& screen, double scale) {
  std::fputs(TreeDump::toJson(screen.root(), scale).c_str(), stdout);
  std::fflush(stdout);
}

}  // namespace

int main(int argc, char** argv) {
  GalleryOptions options;
  String error;
  if (!options.parse(argc, argv, error)) {
    std::fprintf(stderr, "globkit-gallery: %s\n%s", error.c_str(), GalleryOptions::usage());
    return 2;
  }
  if (options.help) {
    std::fputs(GalleryOptions::usage(), stdout);
    return 0;
  }

  MessageLog log;
  if (!options.logFile.empty() && !log.attachFile(options.logFile)) return 1;

  std::unique_ptr<WindowBackend> window;
  if (!options.headless) {
    window = WindowBackend::open("globkit gallery", options.width, options.height);
    if (!window) std::fprintf(stderr, "globkit-gallery: no window available, running headless\n");
  }
  std::unique_ptr<HeadlessBackend> headless;
  if (!window) headless = std::make_unique<HeadlessBackend>(options.width, options.height);
  Backend& screen = window ? static_cast<Backend&>(*window) : *headless;
  const double scale = window ? window->pixelScale() : 1.0;
  // Everything made on the screen from here on takes its palette.
  screen.root().setPalette(options.palette);

  auto app = std::make_unique<GalleryApp>(screen.root(), log);
  // Help under the pointer for every control of every page.
  KwToolTip::registerTypes(screen.root());
  for (int i = 0; i < app->pageCount() && !options.startPage.empty(); ++i) {
    if (app->pageTitle(i) == options.startPage) app->selectPage(i);
  }
  screen.render();
  int status = 0;
  if (options.dumpTree) dumpTree(screen, scale);
  if (!options.screenshotDir.empty()) {
    status = writeScreenshots(screen, *app, options.screenshotDir);
  } else if (window) {
    while (window->step(16)) {
      // A new window size: lay out and show it at once rather than a frame later.
      if (app->fitToScreen()) window->render();
    }
  } else if (!options.dumpTree) {
    // Headless with nothing asked: the pages as pictures are what there is to show.
    char dir[] = "/tmp/globkit-gallery-XXXXXX";
    if (::mkdtemp(dir)) {
      std::fprintf(stderr, "globkit-gallery: every page written as a PNG:\n");
      status = writeScreenshots(screen, *app, dir);
    } else {
      std::fprintf(stderr, "globkit-gallery: cannot make a directory for the screenshots\n");
      status = 1;
    }
  }
  app.reset();
  return status;
}
