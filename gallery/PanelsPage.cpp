#include "buttons/Button.h"
#include "gallery/GalleryPages.h"
#include "panels/StandardPanel.h"
#include "platform/glob/RootGlob.h"

namespace {

// A panel that passes what it hears on to the page, so that it shows in the message log.
class DemoPanel : public StandardPanel {
 public:
  using StandardPanel::StandardPanel;

  bool handlePoot() override {
    tellPage("poot");
    return false;
  }
  void handleFlipSize() override {
    StandardPanel::handleFlipSize();
    tellPage(getSizeState() == SizeMinimised ? "minify (minimised)" : "minify (restored)");
  }
  int handleMessageEvent(const String& msg, Glob* sender) override {
    tellPage(msg);
    return 1;
  }

 protected:
  void tellPage(const String& msg) {
    if (Glob* page = parent()) call_msg(page, msg.c_str());
  }
};

// The panel shown modally: its close and do-it buttons dismiss it.
class ModalDemoPanel : public StandardPanel {
 public:
  ModalDemoPanel(const GlobCreationInfo& info, Glob& page) : StandardPanel(info), page_(&page) {}

  bool handlePoot() override {
    dismiss("poot: modal panel dismissed");
    return false;
  }
  int handleMessageEvent(const String& msg, Glob* sender) override {
    if (msg == doItMsg) {
      dismiss("do_it: modal panel dismissed");
      return 1;
    }
    return 0;
  }

 private:
  void dismiss(const String& report) {
    if (Glob* page = page_.get()) call_msg(page, report.c_str());
    setModal(false);
    delete this;  // the framework allows a Glob to delete itself in its own handler
  }

  GlobHandle<> page_;
};

// Holds the button that opens the modal panel.
class ModalLauncher : public DemoPanel {
 public:
  using DemoPanel::DemoPanel;

  int handleMessageEvent(const String& msg, Glob* sender) override {
    if (msg != "show_modal") return DemoPanel::handleMessageEvent(msg, sender);
    RootGlob* screen = root();
    Glob* page = parent();
    if (!screen || !page) return 1;
    const int w = 360, h = 170;
    auto* modal =
        new ModalDemoPanel(GlobCreationInfo(w, h, screen->canvas(), (screen->width() - w) / 2,
                                            (screen->height() - h) / 2),
                           *page);
    modal->setBorderStyle(UifBorderFramed);
    modal->setTitle(L"Modal panel");
    modal->addStandardWidgets(StdPootButton | StdPinButton | StdDoItButton);
    modal->setModal(true);
    tellPage("show_modal");
    return 1;
  }
};

StandardPanel* dress(StandardPanel* panel, UifTypeOfBorder border, const wchar_t* title,
                     int flags) {
  panel->setBorderStyle(border);
  panel->setTitle(title);
  panel->addStandardWidgets(flags);
  return panel;
}

}  // namespace

void buildPanelsPage(GalleryPage& page) {
  page.addCard("BORDER STYLES", 0, GalleryPage::kContentTop, 600, 210);
  struct Style {
    UifTypeOfBorder border;
    const wchar_t* name;
  };
  const Style styles[] = {{UifBorderNone, L"None"},
                          {UifBorderRaised, L"Raised"},
                          {UifBorderFramed, L"Framed"},
                          {UifBorderSunken, L"Sunken"}};
  int left = 16;
  for (const Style& s : styles) {
    auto* panel = new DemoPanel(page.place(left, GalleryPage::kContentTop + 44, 134, 150));
    dress(panel, s.border, s.name, StdPootButton);
    auto* inner = new StandardPanel(GlobCreationInfo(60, 30, panel->canvas()));
    inner->setcol(panel->getPalette().get(Palette::Base), false);
    panel->addWidget(inner, XY<int>(8, 8), OriginInnerTopLeft, SurroundSunken);
    left += 144;
  }

  page.addCard("TITLE WIDGETS", 620, GalleryPage::kContentTop, 380, 210);
  auto* full = new DemoPanel(page.place(636, GalleryPage::kContentTop + 44, 348, 150));
  dress(full, UifBorderRaised, L"Channel strip",
        StdPootButton | StdSizeButton | StdPinButton | StdSettingsButton | StdDoItButton);

  page.addCard("MODAL DISPLAY", 0, GalleryPage::kContentTop + 226, 600, 170);
  auto* launcher = new ModalLauncher(page.place(16, GalleryPage::kContentTop + 270, 568, 110));
  dress(launcher, UifBorderSunken, L"", 0);
  auto* show =
      new Button(L"Show modal panel", "show_modal", GlobCreationInfo(160, 26, launcher->canvas()));
  launcher->addWidget(show, XY<int>(14, 14), OriginInnerTopLeft);
}
