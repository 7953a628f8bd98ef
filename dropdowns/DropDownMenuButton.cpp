#include "dropdowns/DropDownMenuButton.h"

#include <algorithm>

#include "dropdowns/DropDownChoices.h"
#include "dropdowns/MenuWithAddButton.h"
#include "menus/MenuItemList.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/iFont.h"
#include "platform/glib/look/MenuLook.h"
#include "platform/glob/KeyCodes.h"
#include "platform/misc/Diagnostics.h"

const char* const DropDownMenuButton::dropDownMenuButtonMsg = "ddMenuBtnMsg";
const char* const DropDownMenuButton::dropDownMenuButtonClickedMsg = "ddMeenuBtnClickMsg";

DropDownMenuButton::DropDownMenuButton(const DDBtnInitArgs& args)
    : DropDownButton<DropDownMenu>(args), title_(args.label) {
  if (!(args.dropDown == DropDownSettings())) editDropDownSettings() = args.dropDown;
  if (args.message.empty()) set_message(dropDownMenuButtonClickedMsg);
  init(args.items.empty() ? DropDownChoices::itemsFromStrings(args.entries) : args.items,
       args.selected);
}

DropDownMenuButton::DropDownMenuButton(const WString& title, const std::vector<WString>& entries,
                                       const GlobCreationInfo& info)
    : DropDownButton<DropDownMenu>(title, dropDownMenuButtonClickedMsg, info), title_(title) {
  init(DropDownChoices::itemsFromStrings(entries), 0);
}

DropDownMenuButton::DropDownMenuButton(const WString& title, const std::vector<WString>& entries,
                                       const Colour& colour, unsigned short width,
                                       unsigned short height, Canvas* parent)
    : DropDownButton<DropDownMenu>(title, dropDownMenuButtonClickedMsg, width, height, 0, parent),
      title_(title) {
  setCol(colour, false);
  init(DropDownChoices::itemsFromStrings(entries), 0);
}

DropDownMenuButton::~DropDownMenuButton() = default;

void DropDownMenuButton::init(const std::vector<MenuItem>& items, int selected) {
  entryFace_ = MenuItem::getDefaultColour();
  entryText_ = Palette().get(Palette::WindowText);
  setStrings(items);
  // A header at the default place is no request; anything else that names no row is refused.
  const bool defaultOnHeader = selected == 0 && MenuItemList::isGroupHeader(data_.items, 0);
  if (!data_.items.empty() && selected != data_.selected && !defaultOnHeader) {
    setSelectedItem(selected);
  }
  set_name(Kw::toUtf8(title_));
}

// --- Entries and selection ---

void DropDownMenuButton::setStrings(const std::vector<WString>& entries) {
  setStrings(DropDownChoices::itemsFromStrings(entries));
}

void DropDownMenuButton::setStrings(const std::vector<MenuItem>& items) {
  removeMenuFromScreen();
  data_.items = items;
  DropDownChoices::fillSelectMessages(data_.items);
  // The selection stays when its entry still can be one; else the first that can.
  int keep = data_.selected;
  if (!DropDownChoices::isChoosable(data_.items, keep)) {
    keep = -1;
    for (int i = 0; i < getNumItems() && keep < 0; ++i) {
      if (DropDownChoices::isChoosable(data_.items, i)) keep = i;
    }
  }
  data_.selected = keep;
  selected_.setValue(keep);
  selectionShown();
}

WString DropDownMenuButton::getCurrentChoice(const WString& label) const {
  const int i = MenuItemList::findByDisplayString(data_.items, label);
  return i < 0 ? WString() : data_.items[i].getCurOptionStr();
}

bool DropDownMenuButton::setSelectedItem(int index) {
  const bool row = index >= 0 && index < getNumItems() && !data_.items[index].isGroupHeader() &&
                   data_.items[index].type() != IconicMenuItem;
  if (!row) {
    diagWarning("DropDownMenuButton::setSelectedItem: no entry " + std::to_string(index) +
                ", selection kept\n");
    return false;
  }
  if (index == data_.selected) return true;
  data_.selected = index;
  selectionShown();
  // Observers may delete the button; nothing of it is touched after.
  selected_.setValue(index);
  return true;
}

bool DropDownMenuButton::setSelectedItem(const WString& name) {
  const int i = MenuItemList::findByDisplayString(data_.items, name);
  if (i < 0) {
    diagWarning("DropDownMenuButton::setSelectedItem: no entry \"" + Kw::toUtf8(name) +
                "\", selection kept\n");
    return false;
  }
  return setSelectedItem(i);
}

void DropDownMenuButton::selectionShown() {
  const WString name = data_.getSelectedItemNameW();
  setString(name.empty() ? title_ : name);
}

// --- Messages ---

String DropDownMenuButton::buildMsgForItem(int n) {
  return DropDownChoices::selectMessage(n);
}

// The number in a selection message is the entry's place in the list, headers counted (as
// buildMsgForItem gave it), so the mapping to the index setSelectedItem takes is the identity
// over the entries; a number that names no entry maps to -1.
int DropDownMenuButton::getLogicalItemIndexFromMessage(const String& msg) const {
  return DropDownChoices::indexFromMessage(msg, data_.items.size());
}

bool DropDownMenuButton::handleDropDownMessage(const String& msg) {
  GlobHandle<DropDownMenuButton> self(this);
  if (msg == Menu::pootMsg_) {
    if (DropDownMenu* list = dropDown()) list->saveGroupStates(getPrefsKey());
  } else if (!msg.empty()) {
    Drawable::disableRedraws();
    if (msg.rfind(DropDownChoices::kSelectPrefix, 0) == 0) {
      const int index = getLogicalItemIndexFromMessage(msg);
      if (index >= 0 && setSelectedItem(index) && self) informOwner();
    } else if (Glob* to = parent()) {
      send_message_event(this, to, msg);
    }
    Drawable::enableRedraws();
  }
  if (self) switch_state(kButtonUp, true);
  return true;
}

void DropDownMenuButton::informOwner() {
  if (Glob* to = parent()) send_message_event(this, to, dropDownMenuButtonMsg);
}

void DropDownMenuButton::handleMouseWheelDelta(int delta) {
  const int next = DropDownChoices::step(data_.items, data_.selected, delta);
  if (next < 0) return;
  GlobHandle<DropDownMenuButton> self(this);
  if (setSelectedItem(next) && self) informOwner();
}

void DropDownMenuButton::setNewWidgetValue(WString& value) {
  if (value != getSelectedItemNameW()) setSelectedItem(value);
}

int DropDownMenuButton::react(Event* e) {
  if (mouse_wheel_event(e)) {
    if (getWheelEnabled()) handleMouseWheelDelta(e->wheelSteps());
    return 1;
  }
  if (key_press_event(e)) {
    const unsigned k = e->keyCode();
    if (k == kKeyUp || k == kKeyDown) {
      handleMouseWheelDelta(k == kKeyUp ? 1 : -1);
      return 1;
    }
  }
  return DropDownButton<DropDownMenu>::react(e);
}

void DropDownMenuButton::colourEntries() {
  const Glob* around = parent();
  const Glib::MenuLook look(around ? around->getPalette() : getPalette());
  const Colour face = look.itemFace();
  const Colour text = look.itemText();
  if (face == entryFace_ && text == entryText_) return;
  for (MenuItem& it : data_.items) {
    if (it.col() == entryFace_) it.col(face);
    if (it.fCol() == entryText_) it.fCol(text);
  }
  entryFace_ = face;
  entryText_ = text;
}

DropDownMenu* DropDownMenuButton::makeMenu() {
  if (data_.items.empty()) return nullptr;
  colourEntries();
  const DropDownSettings& s = dropDownSettings();
  DropDownMenu* list;
  if (s.addEntry) {
    list = new MenuWithAddButton(
        data_, this, width(), s.addLabel.empty() ? MenuWithAddButton::kDefaultAddLabel : s.addLabel,
        &selected_);
  } else {
    list = new DropDownMenu(data_, this, s.showSelection, &selected_);
  }
  if (s.maxVisibleRows >= 0) list->setMaxVisibleRows(s.maxVisibleRows);
  list->restoreGroupStates(s.prefsKey);
  return list;
}

void DropDownMenuButton::listShown(DropDownMenu* list) {
  // The keys start from the selection; an entry the user could not choose is only shown.
  if (!list->highlightEntry(data_.selected)) list->scrollToItem(data_.selected);
}

// --- Settings ---

void DropDownMenuButton::setWheelEnabled(bool on) {
  if (on != getWheelEnabled()) editDropDownSettings().wheelEnabled = on;
}

void DropDownMenuButton::setPrefsKey(const String& key) {
  if (key != getPrefsKey()) editDropDownSettings().prefsKey = key;
}

void DropDownMenuButton::setShowSelection(bool on) {
  if (on != dropDownSettings().showSelection) editDropDownSettings().showSelection = on;
}

void DropDownMenuButton::setMaxVisibleRows(int rows) {
  rows = rows < 0 ? -1 : rows;
  if (rows != dropDownSettings().maxVisibleRows) editDropDownSettings().maxVisibleRows = rows;
}

void DropDownMenuButton::setAddEntry(bool on, const WString& label) {
  if (on == hasAddEntry() && label == dropDownSettings().addLabel) return;
  DropDownSettings& s = editDropDownSettings();
  s.addEntry = on;
  s.addLabel = label;
}

// --- Size ---

int DropDownMenuButton::calcWidth(const WString& text, const Glib::iFont& font) {
  return font.textWidth(text) + 2 * kTextPadding + Glib::DropDownLook::kArrowColumn;
}

void DropDownMenuButton::autoSize() {
  const Glib::FontPtr font = Glib::fonts().standard();
  int w = calcWidth(title_, *font);
  for (const MenuItem& it : data_.items) {
    if (it.type() != IconicMenuItem) w = std::max(w, calcWidth(it.getDisplayString(), *font));
  }
  const Kw::Box<int> r = canvas()->rect();
  if (r.width() != w) reshape_canvas(r.x0, r.y0, w, r.height());
}
