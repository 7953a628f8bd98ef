// The gallery: every control of the library on a page per subsystem, in a window when there is
// a display and headless otherwise, with a live log of the messages the controls send.
#include <stdlib.h>
#include <sys/stat.h>

#include <cctype>
#include <cstdio>
#include <memory>

#include "gallery/ColourChip.h"
#include "gallery/ColourWell.h"
#include "gallery/GalleryApp.h"
#include "gallery/GalleryOptions.h"
#include "gallery/TreeDump.h"
#include "panels/StandardPanel.h"
#include "platform/backend/HeadlessBackend.h"
#include "platform/backend/WindowBackend.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/GlobLayoutFile.h"
#include "platform/misc/EditorPreferences.h"
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

// The gallery's saved panel layout, in the folder of the user's preferences; empty when there
// is no such folder.
String layoutPath() {
  const String prefsFile = EditorPreferences::defaultPath();
  const size_t slash = prefsFile.rfind('/');
  return slash == String::npos ? String() : prefsFile.substr(0, slash + 1) + "gallery-layout";
}

// A panel moved by its title strip, with colours to drag onto a well.
Glob* makeDragDropPanel(RootGlob& screen) {
  constexpr int kWidth = 196, kHeight = 92, kChip = 30;
  auto* panel = new StandardPanel(
      GlobCreationInfo(kWidth, kHeight, screen.canvas(), screen.width() - kWidth - 12, 224));
  panel->set_name("Drag and drop");
  panel->setBorderStyle(UifBorderRaised);
  panel->addStandardWidgets(StdPinButton);
  panel->set_movable(1);
  const uint32_t colours[] = {0xD9534F, 0x5CB85C, 0x428BCA};
  int x = 12;
  for (uint32_t rgb : colours) {
    auto* chip = new ColourChip(GlobCreationInfo(kChip, kChip, panel->canvas()), rgb);
    chip->set_name(ColourChip::hexOf(rgb));
    panel->addWidget(chip, x, 14);
    x += kChip + 8;
  }
  auto* well = new ColourWell(GlobCreationInfo(50, kChip + 10, panel->canvas()), 0x808080);
  well->set_name("Colour well");
  panel->addWidget(well, kWidth - 62, 9);
  return panel;
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
  // The floating panel the user may move; where it was left is kept next to the preferences.
  GlobHandle<> dragPanel(makeDragDropPanel(screen.root()));
  GlobLayoutFile layout(layoutPath(), "globkit-gallery");
  if (!layout.path().empty() && !layout.restore({dragPanel.get()}) &&
      layout.lastError() != "no saved layout") {
    std::fprintf(stderr, "globkit-gallery: saved layout not used (%s)\n",
                 layout.lastError().c_str());
  }
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
  if (window && !layout.path().empty() && dragPanel) layout.save({dragPanel.get()});
  app.reset();
  return status;
}
