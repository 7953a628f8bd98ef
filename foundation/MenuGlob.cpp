#include "foundation/MenuGlob.h"

#include <cstdlib>

#include "menus/Menu.h"
#include "menus/MenuItemList.h"
#include "platform/glib/look/MenuLook.h"
#include "platform/glob/RootGlob.h"
#include "platform/misc/UIString.h"
#include "platform/misc/configb.h"

MenuGlob::MenuGlob(const GlobCreationInfo& info) : Glob(info) {}

MenuGlob::MenuGlob(unsigned short width, unsigned short height, int flag, Canvas* parent)
    : Glob(width, height, flag, parent) {}

MenuGlob::MenuGlob(unsigned short width, unsigned short height, const Palette& palette, bool flag,
                   Canvas* parent)
    : Glob([&] {
        GlobCreationInfo info = GlobCreationInfo::withFlags(width, height, flag ? 1 : 0, parent);
        info.palette = palette;
        return info;
      }()) {}

MenuGlob::MenuGlob(const configb&, unsigned short width, unsigned short height)
    : Glob(GlobCreationInfo(width, height, nullptr)) {}

MenuGlob::MenuState& MenuGlob::menuState() {
  if (!menuState_) menuState_ = std::make_unique<MenuState>();
  return *menuState_;
}

const MenuGlob::MenuState& MenuGlob::menuState() const {
  static const MenuState kNone;
  return menuState_ ? *menuState_ : kNone;
}

MenuGlob::~MenuGlob() {
  removeMenu();
}

// --- Settings ---

void MenuGlob::setMenuBaseCol(const Colour& c) {
  menuState().hasMenuBaseCol = true;
  menuState().menuBaseCol = c;
}

Colour MenuGlob::getMenuBaseCol() const {
  return menuState().hasMenuBaseCol ? menuState().menuBaseCol : Glib::MenuLook(getPalette()).face();
}

Colour MenuGlob::getMenuItemCol() const {
  return Glib::MenuLook(getPalette()).itemFace();
}

Colour MenuGlob::getMenuTextCol() const {
  return Glib::MenuLook(getPalette()).itemText();
}

void MenuGlob::setMenuTitle(unsigned int resourceId) {
  menuState().menuTitle = UIString(resourceId).toWString();
}

void MenuGlob::setDefaultGroupState(MenuGroupState s) {
  // The default cannot be "the default".
  if (s == GroupExpanded || s == GroupCompressed) menuState().defaultGroupState = s;
}

// --- Building ---

void MenuGlob::itemsChanged() {
  menuState().itemsChanged = true;
}

MenuItem MenuGlob::newItem(const WString& label, const String& msg, MenuItemType type) const {
  return MenuItem(label, msg, getMenuItemCol(), getMenuTextCol(), type);
}

uint32_t MenuGlob::addMenuItem(const WString& label, const String& msg, bool active) {
  MenuItem item = newItem(label, msg, menuState().inGroup ? GroupedMenuItem : SimpleMenuItem);
  item.setActive(active);
  menuState().items.push_back(item);
  menuState().items.back().id(item.id());
  itemsChanged();
  return item.id();
}

uint32_t MenuGlob::addMenuItem(unsigned int resourceId, const String& msg, bool active) {
  return addMenuItem(UIString(resourceId).toWString(), msg, active);
}

uint32_t MenuGlob::addMenuItem(const MenuItem& item) {
  menuState().items.push_back(item);
  MenuItem& stored = menuState().items.back();
  if (menuState().inGroup && stored.type() == SimpleMenuItem) stored.type(GroupedMenuItem);
  itemsChanged();
  return stored.id();
}

uint32_t MenuGlob::addIconicMenuItem(const WString& image, const WString& pressedImage,
                                     const String& msg) {
  MenuItem item = newItem(image + L"," + pressedImage, msg, IconicMenuItem);
  menuState().items.push_back(item);
  menuState().items.back().id(item.id());
  itemsChanged();
  return item.id();
}

uint32_t MenuGlob::startMenuGroup(const WString& label, MenuGroupState state) {
  menuState().inGroup = false;
  if (state == GroupDefault) state = menuState().defaultGroupState;
  MenuItem header =
      newItem(label, String(), state == GroupCompressed ? CompressedGroupItem : ExpandedGroupItem);
  header.setTextDisplayMode(MenuItem::kHeaderTextDisplayMode);
  header.fCol(Glib::MenuLook(getPalette()).subHeadingText());
  menuState().items.push_back(header);
  menuState().items.back().id(header.id());
  menuState().inGroup = true;
  itemsChanged();
  return header.id();
}

uint32_t MenuGlob::startMenuGroup(unsigned int resourceId, MenuGroupState state) {
  return startMenuGroup(UIString(resourceId).toWString(), state);
}

uint32_t MenuGlob::insertMenuItemAfter(const WString& label, const String& msg,
                                       const WString& after) {
  const int anchor = findMenuItem(after);
  if (anchor < 0) return 0;
  const MenuItem& a = menuState().items[anchor];
  const bool last = static_cast<size_t>(anchor) + 1 == menuState().items.size();
  MenuItem item(label, msg, a.col(), a.fCol(),
                !last && a.type() != SimpleMenuItem ? GroupedMenuItem : SimpleMenuItem);
  const uint32_t id = item.id();
  if (last) {
    menuState().items.push_back(item);
    menuState().items.back().id(id);
  } else {
    auto it = menuState().items.insert(menuState().items.begin() + anchor + 1, item);
    it->id(id);
  }
  itemsChanged();
  return id;
}

bool MenuGlob::removeMenuItem(const WString& label) {
  const int i = findMenuItem(label);
  if (i < 0) return false;
  if (menuState().items[i].isGroupHeader()) {
    for (size_t j = static_cast<size_t>(i) + 1; j < menuState().items.size(); ++j) {
      if (menuState().items[j].type() != GroupedMenuItem) break;
      menuState().items[j].type(SimpleMenuItem);
    }
  }
  menuState().items.erase(menuState().items.begin() + i);
  itemsChanged();
  redisplayMenu();
  return true;
}

bool MenuGlob::removeMenuItem(unsigned int resourceId) {
  return removeMenuItem(UIString(resourceId).toWString());
}

bool MenuGlob::changeMenuItem(const WString& oldLabel, const WString& newLabel) {
  const int i = findMenuItem(oldLabel);
  if (i < 0 || oldLabel == newLabel) return false;
  menuState().items[i].label(newLabel);
  if (Menu* m = openMenu()) m->changeItem(oldLabel, newLabel);
  return true;
}

bool MenuGlob::changeMenuItemMessage(const WString& label, const String& msg) {
  const int i = findMenuItem(label);
  if (i < 0) return false;
  menuState().items[i].msg(msg);
  if (Menu* m = openMenu()) m->changeMessage(label, msg);
  return true;
}

bool MenuGlob::setMenuItemChoice(const WString& label, uint64_t n) {
  const int i = findMenuItem(label);
  if (i < 0 || menuState().items[i].curOption() == n || n >= menuState().items[i].options().size())
    return false;
  menuState().items[i].setCurOption(n);
  if (Menu* m = openMenu()) m->setCurrentChoice(label, n);
  return true;
}

WString MenuGlob::getMenuItemChoice(const WString& label) const {
  const Menu* m = openMenu();
  return m ? m->getCurrentChoice(label) : WString();
}

bool MenuGlob::setMenuItemActive(uint32_t id, bool active) {
  const int i = findMenuItem(id);
  if (i < 0 || menuState().items[i].getActive() == active) return false;
  menuState().items[i].setActive(active);
  itemsChanged();
  redisplayMenu();
  return true;
}

WString MenuGlob::toggleLabel(unsigned int resourceId, bool on) {
  const WString text = UIString(resourceId).toWString();
  const size_t lf = text.find(L'\n');
  if (lf != WString::npos) return on ? text.substr(lf + 1) : text.substr(0, lf);
  return on ? L"\u2713 " + text : text;
}

bool MenuGlob::toggleMenuEntry(bool& flag, unsigned int resourceId) {
  const WString before = toggleLabel(resourceId, flag);
  flag = !flag;
  return changeMenuItem(before, toggleLabel(resourceId, flag));
}

bool MenuGlob::toggleMenuEntry(PrefVal<bool>& flag, unsigned int resourceId) {
  bool value = flag.get();
  const bool changed = toggleMenuEntry(value, resourceId);
  flag.set(value);
  return changed;
}

void MenuGlob::clearMenu() {
  menuState().items.clear();
  menuState().inGroup = false;
  itemsChanged();
}

int MenuGlob::findMenuItem(const WString& label) const {
  return MenuItemList::findByDisplayString(menuState().items, label);
}

int MenuGlob::findMenuItem(uint32_t id) const {
  return MenuItemList::findById(menuState().items, id);
}

// --- The pop-up ---

Menu* MenuGlob::openMenu() const {
  Menu* m = menuState_ ? menuState_->menu.get() : nullptr;
  return m && m->m_is_type("menu") ? m : nullptr;
}

Menu* MenuGlob::makeMenu(Event* e, bool movePopup) {
  GlobHandle<MenuGlob> self(this);
  initialiseMenu();
  const bool agreed = reviewMenu(e);
  if (!self || !agreed) return nullptr;
  RootGlob* screen = root();
  if (!screen) return nullptr;
  if (Menu* open = openMenu()) {
    open->redisplay(menuState().items);
    open->restoreGroupStates(menuState().menuPrefsKey);
    menuState().itemsChanged = false;
    if (movePopup) {
      const XY<int> p = screen->pointer();
      const Kw::Box<int> r = open->canvas()->rect();
      open->translate_canvas(p.x - r.x0, p.y - r.y1);
    }
    return open;
  }
  if (!hasMenuItems()) return nullptr;
  MenuData data;
  data.items = menuState().items;
  data.owner = this;
  data.flags = (menuState().menuOptions & 1u ? MenuData::kCloseOnOutsideClick : 0u) |
               (menuState().menuOptions & 16u ? MenuData::kShowTitle : 0u);
  data.hasBaseColour = menuState().hasMenuBaseCol;
  data.baseColour = menuState().menuBaseCol;
  auto* m = new Menu(std::move(data));
  m->restoreGroupStates(menuState().menuPrefsKey);
  if (!m->popUp(*screen, screen->pointer())) {
    delete m;
    return nullptr;
  }
  menuState().menu = GlobHandle<Menu>(m);
  menuState().itemsChanged = false;
  return m;
}

const std::vector<MenuItem>& MenuGlob::getMenuItems(Event* e) {
  reviewMenu(e);
  return menuState().items;
}

void MenuGlob::redisplayMenu() {
  if (Menu* m = openMenu()) {
    m->redisplay(menuState().items);
    menuState().itemsChanged = false;
  }
}

void MenuGlob::updateMenuIfNecessary() {
  if (openMenu() && menuNeedsUpdate()) redisplayMenu();
}

void MenuGlob::removeMenu() {
  if (!menuState_) return;  // never had a menu: nothing to make just to clear it
  if (Menu* m = openMenu()) delete m;
  menuState_->menu.reset();
}

void MenuGlob::handleMenuClosed() {
  Menu* m = openMenu();
  if (!m) return;
  m->saveGroupStates(menuState().menuPrefsKey);
  // The pop-up's list is the owner's, unless the owner changed its own since: match by display
  // string, trying the same position first.
  const std::vector<MenuItem>& shown = m->items();
  for (size_t i = 0; i < menuState().items.size(); ++i) {
    MenuItem& it = menuState().items[i];
    if (it.options().empty() && !it.isGroupHeader()) continue;
    const WString name = it.getDisplayString();
    int j = i < shown.size() && shown[i].getDisplayString() == name
                ? static_cast<int>(i)
                : MenuItemList::findByDisplayString(shown, name);
    if (j < 0) continue;
    if (!it.options().empty() && shown[j].curOption() < it.options().size()) {
      it.setCurOption(shown[j].curOption());
    }
    if (it.isGroupHeader() && shown[j].isGroupHeader()) it.type(shown[j].type());
  }
  menuState().menu.reset();
}

bool MenuGlob::handleRightPress(Event* e) {
  const XY<int> d = e->distance();
  if (std::abs(d.x) >= kClickSlop || std::abs(d.y) >= kClickSlop) return false;
  GlobHandle<MenuGlob> self(this);
  initialiseMenu();
  if (!self || !hasMenuItems()) return false;
  const unsigned short x = static_cast<unsigned short>(std::max(0, e->pos.x));
  const unsigned short y = static_cast<unsigned short>(std::max(0, e->pos.y));
  if (handleMenuClick(x, y) || !self) return false;
  return makeMenu(e, true) != nullptr || !self;
}

int MenuGlob::react(Event* e) {
  if (message_event(e)) {
    const String& msg = e->text();
    // A Glob with nothing to show lets the request go on.
    if (msg == kScrewdriverMsg) return makeMenu(e, true) ? 1 : Glob::react(e);
    if (msg == Menu::itemSelectedMsg_) {
      updateMenuIfNecessary();
      return 1;
    }
    if (msg == Menu::pootMsg_) {
      handleMenuClosed();
      return 1;
    }
  } else if (mouse_right_event(e) && mouse_down_event(e) && !mouse_chord_event(e)) {
    if (handleRightPress(e)) return 1;
  }
  return Glob::react(e);
}
