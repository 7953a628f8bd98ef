#include "buttons/ImageSearchPath.h"
#include "gallery/GalleryPages.h"
#include "menus/Menu.h"
#include "panels/StandardPanel.h"
#include "text/TextBox.h"
#include "text/TextLabel.h"

namespace {

// A panel with a context menu of every kind of row. It builds the menu once, on the first right
// click, and passes the messages of chosen items on to the page, so they show in the log. The
// group states are kept in the preferences under the menu's key, so they survive a restart.
class MenuDemoPanel : public StandardPanel {
 public:
  static constexpr int kLongListLength = 200;

  explicit MenuDemoPanel(const GlobCreationInfo& info) : StandardPanel(info) {
    setBorderStyle(UifBorderSunken);
    setTitle(L"Right-click anywhere on this panel");
    setMenuTitle(L"Tools");
    setMenuPrefsKey("Gallery menus");
    setContextString("Right-click for the menu; its groups stay as you leave them");
    auto* hint = new TextLabel(L"Right-click here for the menu", getPalette(), 0, false, canvas());
    hint->reshape_canvas(16, info.height / 2 - 12, info.width - 32, 24);
  }

  void initialiseMenu() override {
    if (!menuItems().empty()) return;
    addIconicMenuItem(L"pin", L"pinned", "icon: pin");
    addIconicMenuItem(L"settings", L"settings", "icon: settings");
    addMenuItem(L"Open||Ctrl+O", "open");
    addMenuItem(L"Save||Ctrl+S", "save");
    addMenuItem(L"Revert", "revert", false);
    startMenuGroup(L"View");
    addMenuItem(L"Zoom||[Fit] 100% [200%]", "zoom");
    addMenuItem(L"Units||[Frames] Seconds [Timecode]", "units");
    addMenuItem(L"Grid||Ctrl+G", "grid");
    startMenuGroup(L"Edit", GroupCompressed);
    addMenuItem(L"Undo||Ctrl+Z", "undo");
    addMenuItem(L"Redo||Ctrl+Y", "redo");
    startMenuGroup(L"Recent clips", GroupCompressed);
    for (int i = 1; i <= kLongListLength; ++i) {
      addMenuItem(L"Clip " + std::to_wstring(i), "clip " + std::to_string(i));
    }
    endMenuGroup();
  }

  int handleMessageEvent(const String& msg, Glob*) override {
    if (Glob* page = parent()) call_msg(page, msg.c_str());
    return 1;
  }
};

}  // namespace

void buildMenusPage(GalleryPage& page) {
#ifdef GLOBKIT_GALLERY_ICONS
  imageSearchPath().addDirectory(GLOBKIT_GALLERY_ICONS);
#endif
  imageSearchPath().addDirectory("gallery/icons");

  page.addCard("POP-UP MENU", 0, GalleryPage::kContentTop, 470, 300);
  auto* panel = new MenuDemoPanel(page.place(16, GalleryPage::kContentTop + 44, 438, 240));
  panel->set_name("Menu panel");

  page.addCard("TEXT BOX MENU", 490, GalleryPage::kContentTop, 470, 120);
  TextBox::InitArgs args;
  args.info = page.place(506, GalleryPage::kContentTop + 60, 300, 24);
  args.text = L"Right-click for Cut, Copy and Paste";
  auto* box = new TextBox(args);
  box->set_name("Text box with edit menu");
}
