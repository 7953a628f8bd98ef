#pragma once
// A button that opens a list of kind T below itself while it is down. T is the list class (a
// Menu kind: it has popUp, setMinWidth and an idstring); DropDownMenuButton is the one user.
//
//   input                            list closed                  list open
//   left press, Return, space        down; reports its message,   up; the list closes;
//                                    then the list opens below    handleSecondClick()
//   left release                     -                            stays down
//   message from the open list       -                            handleDropDownMessage; when
//                                                                 it says so, the list goes
//   "menu_poot" from anyone          up                           up; the list closes
//   setActive(false)                 -                            up; the list closes
//
// A list counts as open only while its handle is alive and the object is of T's kind: a list
// destroyed behind the button's back is forgotten, and the next press opens a new one (the
// button comes back up first if it was left down).
//
// Decisions where the behaviour was left open:
// - The button stays down while its list is open and comes up when the list closes (a choice,
//   a press outside, "poot"). The pop-up's catcher takes a press outside the list, the
//   button's own face included, so a second press on the face closes the list and does not
//   open it again.
// - The list opens with its top-left corner at the button's bottom-left corner, at least as
//   wide as the button, and is kept on the screen. A button not on a screen, or a list with
//   nothing in it, opens nothing and the button comes back up.
// - A button deleted while its list is open takes the list with it.
// - The face is a button's face; the label keeps clear of the arrow column at the right end
//   (Glib::DropDownLook), which shows the arrow and, when asked, a separator.
#include "buttons/Button.h"
#include "dropdowns/DropDownSettings.h"
#include "menus/Menu.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/DropDownLook.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/RootGlob.h"
#include "platform/kw/SharedRecord.h"

template <typename T>
class DropDownButton : public Button {
 public:
  DropDownButton(const WString& label, const String& message, const GlobCreationInfo& info)
      : Button(label, message, info) {
    setTextAlignment(TextAlignment::Left);
  }
  DropDownButton(const WString& label, const char* message, unsigned short width,
                 unsigned short height, int flag, Canvas* parent)
      : Button(label, message, width, height, flag, parent) {
    setTextAlignment(TextAlignment::Left);
  }
  explicit DropDownButton(const ButtonInitArgs& args) : Button(args) {
    setTextAlignment(TextAlignment::Left);
  }
  ~DropDownButton() override { removeMenuFromScreen(); }

  // Opens the list; false when one is open already or nothing could be shown.
  bool displayDropDown() {
    if (isDropDownValid()) return false;
    return openList();
  }
  void removeMenuFromScreen() {
    if (T* l = dropDown()) delete l;
    list_.reset();
  }
  bool isDropDownValid() const { return dropDown() != nullptr; }
  // The open list, or null.
  T* dropDown() const {
    T* l = list_.get();
    return l && l->m_is_type(listKind()) ? l : nullptr;
  }
  // A press on the face while the list is open (it has closed the list already).
  virtual void handleSecondClick() {}

  void setDrawArrow(bool on) {
    if (on == ddSettings_->drawArrow) return;
    ddSettings_.edit().drawArrow = on;
    update();
  }
  bool getDrawArrow() const { return ddSettings_->drawArrow; }
  void setDrawSeparator(bool on) {
    if (on == ddSettings_->drawSeparator) return;
    ddSettings_.edit().drawSeparator = on;
    update();
  }
  bool getDrawSeparator() const { return ddSettings_->drawSeparator; }
  void setBoldLabel(bool on) {
    if (on == ddSettings_->boldLabel) return;
    ddSettings_.edit().boldLabel = on;
    update();
  }
  // The font of the label: the standard font, bold when asked.
  Glib::FontPtr labelFont() const {
    Glib::FontDesc f;
    if (ddSettings_->boldLabel) f.style = Glib::FontDesc::Bold;
    return Glib::fonts().get(f);
  }
  const DropDownSettings& dropDownSettings() const { return *ddSettings_; }

  void switch_state(button_state newState, bool silent) override {
    const bool wasOpen = isDropDownValid();
    GlobHandle<DropDownButton> self(this);
    Button::switch_state(newState, silent);
    if (!self) return;  // the report's receiver deleted us
    if (get_state() == kButtonDown) {
      if (!isDropDownValid()) openList();
    } else if (isDropDownValid()) {
      removeMenuFromScreen();
    }
    if (wasOpen && newState == kButtonUp && !silent && self) handleSecondClick();
  }

  // A button made inactive closes its list.
  void setActive(bool active, bool redraw) override {
    if (!active) removeMenuFromScreen();
    Button::setActive(active, redraw);
  }

  int react(Event* e) override {
    if (message_event(e)) return reactToMessage(e);
    if (mouse_left_event(e)) {
      // A list gone behind our back leaves no stale state: the press opens a new one.
      if (mouse_down_event(e) && get_state() == kButtonDown && !isDropDownValid()) {
        set_state(kButtonUp, true);
      }
      if (mouse_up_event(e) && isDropDownValid()) return 1;
    }
    return Button::react(e);
  }

  void drawText() override {
    Glib::Painter p(*canvas());
    if (!p.active()) return;
    const Kw::Box<int> face = p.bounds();
    const Glib::DropDownLook look(getPalette());
    const bool flat = get_style() == kButtonStyleFlat;
    const bool down = get_state() == kButtonDown;
    if (ddSettings_->drawArrow) {
      look.arrow(p, face, Glib::ButtonLook::pressShift(down, flat), labelColour());
      if (ddSettings_->drawSeparator) look.separator(p, face, isActive());
    }
    drawLabel(p, ddSettings_->drawArrow ? Glib::DropDownLook::labelRoom(face) : face);
  }

 protected:
  // A new list over the button's entries, owned by nobody yet; null when there is nothing to
  // show.
  virtual T* makeMenu() = 0;
  // Called once the new list is on the screen.
  virtual void listShown(T* list) {}
  // A message from the open list; true means the list is done and goes.
  virtual bool handleDropDownMessage(const String& msg) { return true; }
  // The kind name a live list answers to.
  virtual const char* listKind() const { return "menu"; }
  // The label inside `room` (the face less the arrow column).
  virtual void drawLabel(Glib::Painter& p, const Kw::Box<int>& room) {
    const int side = std::min(room.width() / 2, get_bevel_width() + 2);
    const Kw::Box<int> box = Glib::ButtonLook::pressed(
        Kw::Box<int>(room.x0 + side, room.y0 + 1, room.x1 - 2, room.y1 - 1),
        get_state() == kButtonDown, get_style() == kButtonStyleFlat);
    if (box.empty()) return;
    p.text(shownLabel(), box, *labelFont(), labelColour(), getTextAlignment(), getTextStyle());
  }

  DropDownSettings& editDropDownSettings() { return ddSettings_.edit(); }

 private:
  bool openList() {
    RootGlob* screen = root();
    T* list = screen ? makeMenu() : nullptr;
    if (list) {
      list->setMinWidth(width());
      const Kw::Box<int> r = canvas()->rootRect();
      if (list->popUp(*screen, XY<int>(r.x0, r.y0))) {
        // The pop-up copied our palette, which is the pressed face's while we are down; the
        // list is a menu and takes the menu colours of the palette around the button.
        list->setPalette(surroundingPalette());
        list->update();
        list_ = GlobHandle<T>(list);
        listShown(list);
        return true;
      }
      delete list;
    }
    set_state(kButtonUp, true);
    return false;
  }

  const Palette& surroundingPalette() const {
    if (const Glob* around = parent()) return around->getPalette();
    if (const RootGlob* screen = root()) return screen->getPalette();
    return getPalette();
  }

  int reactToMessage(Event* e) {
    GlobHandle<DropDownButton> self(this);
    const String msg = e->text();
    T* open = dropDown();
    if (open && event_to_sender_glob(e) == open) {
      if (handleDropDownMessage(msg) && self) removeMenuFromScreen();
      return 1;
    }
    if (msg == Menu::pootMsg_) {
      switch_state(kButtonUp, true);
      if (!self) return 1;
    }
    return Button::react(e);
  }

  GlobHandle<T> list_;
  Kw::SharedRecord<DropDownSettings> ddSettings_;
};
