#pragma once
// A Glob that can own a context menu: it builds a flat list of menu items (with groups,
// multi-choice and iconic items), opens the pop-up on a right click or on the "screwdriver"
// message, and takes back what the user changed there when the pop-up closes.
//
//   event                                  does
//   right press (moved < 5 px), items      opens the pop-up at the pointer unless
//                                          handleMenuClick says no; a Glob without items lets
//                                          the press go on to its parent
//   "screwdriver"                          opens the pop-up at the pointer
//   "menu_itemSelected"                    updates the open pop-up if the items changed
//   "menu_poot" (the pop-up closes)        saves group states under the prefs key, copies the
//                                          current options and group states back, forgets it
//
// Decisions where the behaviour was left open:
// - The pop-up opens with its top-left corner at the pointer, kept on the owner's screen; an
//   owner that is not on a screen, or has no items, opens nothing.
// - The owner needs an update (updateMenuIfNecessary) when its list changed since the pop-up
//   was given it.
// - Removing, activating or relabelling an item while the pop-up is open shows the change there.
// - An owner deleted while its pop-up is open takes the pop-up with it.
// - toggleMenuEntry's two label forms: a resource text with a line feed holds the form for
//   "off" before it and the form for "on" after it; a text without one is the "off" form, and
//   the "on" form is the same text after a check mark.
// - Display strings are compared exactly, case included.
// - setMenuItemChoice refuses a choice outside the item's options.
#include <cstdint>
#include <memory>
#include <vector>

#include "menus/MenuItem.h"
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/misc/PrefVal.h"

class Menu;
class configb;

enum MenuGroupState : int {
  GroupExpanded = 0,
  GroupCompressed = 1,
  GroupDefault = 2,  // the owner's default group state
};

class MenuGlob : public Glob {
 public:
  static constexpr const char* kScrewdriverMsg = "screwdriver";
  static constexpr unsigned kDefaultMenuOptions = 17;
  // How far a right press may have moved and still open the menu.
  static constexpr int kClickSlop = 5;

  explicit MenuGlob(const GlobCreationInfo& info);
  MenuGlob(unsigned short width, unsigned short height, int flag, Canvas* parent);
  MenuGlob(unsigned short width, unsigned short height, const Palette& palette, bool flag,
           Canvas* parent);
  MenuGlob(const configb& config, unsigned short width, unsigned short height);
  ~MenuGlob() override;

  // --- Hooks ---
  // Builds the menu the first time it is needed. The base has none.
  virtual void initialiseMenu() {}
  // Called before the menu shows, with the event that asked for it (may be null), to rebuild
  // or adjust the items; returns false to show nothing. The base agrees.
  virtual bool reviewMenu(Event* e) { return true; }
  // True when a right click at (x, y) of this Glob must not open the menu.
  virtual bool handleMenuClick(unsigned short x, unsigned short y) { return false; }
  // The pop-up's title; empty for none.
  virtual WString getMenuTitle() { return menuState().menuTitle; }

  // --- Settings ---
  void setMenuBaseCol(const Colour& c);
  // Kept without effect on purpose: new items always take the palette's colours.
  void setMenuItemCol(const Colour&) {}
  void setMenuTextCol(const Colour&) {}
  Colour getMenuBaseCol() const;
  Colour getMenuItemCol() const;
  Colour getMenuTextCol() const;
  void setMenuTitle(const WString& title) { menuState().menuTitle = title; }
  void setMenuTitle(unsigned int resourceId);
  void setMenuPrefsKey(const String& key) { menuState().menuPrefsKey = key; }
  const String& getMenuPrefsKey() const { return menuState().menuPrefsKey; }
  void setDefaultGroupState(MenuGroupState s);
  void setMenuOptions(unsigned options) { menuState().menuOptions = options; }
  unsigned getMenuOptions() const { return menuState().menuOptions; }

  // --- Building (ids of new items, 0 when nothing was added) ---
  uint32_t addMenuItem(const WString& label, const String& msg, bool active = true);
  uint32_t addMenuItem(unsigned int resourceId, const String& msg, bool active = true);
  uint32_t addMenuItem(const MenuItem& item);
  uint32_t addIconicMenuItem(const WString& image, const WString& pressedImage, const String& msg);
  uint32_t startMenuGroup(const WString& label, MenuGroupState state = GroupDefault);
  uint32_t startMenuGroup(unsigned int resourceId, MenuGroupState state = GroupDefault);
  void endMenuGroup() {
    if (menuState_) menuState_->inGroup = false;
  }
  uint32_t insertMenuItemAfter(const WString& label, const String& msg, const WString& after);
  bool removeMenuItem(const WString& label);
  bool removeMenuItem(unsigned int resourceId);
  bool changeMenuItem(const WString& oldLabel, const WString& newLabel);
  bool changeMenuItemMessage(const WString& label, const String& msg);
  bool setMenuItemChoice(const WString& label, uint64_t n);
  WString getMenuItemChoice(const WString& label) const;
  bool setMenuItemActive(uint32_t id, bool active);
  bool toggleMenuEntry(bool& flag, unsigned int resourceId);
  bool toggleMenuEntry(PrefVal<bool>& flag, unsigned int resourceId);
  void clearMenu();
  int findMenuItem(const WString& label) const;
  int findMenuItem(uint32_t id) const;
  const std::vector<MenuItem>& menuItems() const { return menuState().items; }

  // The two labels toggleMenuEntry shows for a resource text, for the flag off and on.
  static WString toggleLabel(unsigned int resourceId, bool on);

  // --- The pop-up ---
  // Opens the pop-up (or refreshes the open one); null when nothing shows.
  Menu* makeMenu(Event* e, bool movePopup);
  const std::vector<MenuItem>& getMenuItems(Event* e);
  void redisplayMenu();
  void updateMenuIfNecessary();
  void removeMenu();
  // The open pop-up, or null.
  Menu* openMenu() const;

  // --- Glob ---
  int react(Event* e) override;

 protected:
  // True when the items changed since the open pop-up was given them.
  virtual bool menuNeedsUpdate() const { return menuState().itemsChanged; }

  // Everything about the menu a Glob may own. Most Globs never build one, so it is made on
  // first use and costs them a pointer.
  struct MenuState {
    std::vector<MenuItem> items;
    GlobHandle<Menu> menu;
    bool hasMenuBaseCol = false;
    Colour menuBaseCol;
    WString menuTitle;
    String menuPrefsKey;
    unsigned menuOptions = kDefaultMenuOptions;
    bool inGroup = false;
    MenuGroupState defaultGroupState = GroupExpanded;
    bool itemsChanged = false;
  };
  MenuState& menuState();
  // The state, or the defaults of one never made.
  const MenuState& menuState() const;

 private:
  bool handleRightPress(Event* e);
  void handleMenuClosed();
  MenuItem newItem(const WString& label, const String& msg, MenuItemType type) const;
  void itemsChanged();
  bool hasMenuItems() const { return menuState_ && !menuState_->items.empty(); }

  std::unique_ptr<MenuState> menuState_;
};
