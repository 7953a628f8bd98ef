#pragma once
// A drop-down button: it shows the selected entry of its list and, pressed, opens the list
// below itself (DropDownButton<DropDownMenu>). Choosing an entry selects it, publishes the
// physical index through the selected item server and tells the parent "ddMenuBtnMsg". The
// wheel and the Up and Down keys step the selection without opening the list.
//
//   input                          does
//   press (mouse, Return, space)   "ddMeenuBtnClickMsg" to the parent, then the list opens
//   "DDMSG<n>" from the list       entry n is selected, "ddMenuBtnMsg" to the parent, closes
//   other message from the list    passed on to the parent as ours ("MenuAdd"...), closes
//   "menu_poot" from the list      group states kept under the prefs key; nothing selected
//   wheel (when enabled)           up: nearest steppable entry before; down: after; no wrap
//   Up / Down                      as the wheel up / down
//
// Decisions where the behaviour was left open:
// - Indices are physical indices into the entries: setSelectedItem(int), getSelectedItem(),
//   the server and the number in "DDMSG<n>" all count every entry, headers included. A list
//   without groups counts the same either way. getLogicalItemIndexFromMessage maps "DDMSG<n>"
//   to n when n names an entry, and to -1 otherwise ("DDMSG", "DDMSG-1", past the end...).
// - setSelectedItem refuses (false, selection kept, a diagnostic) an index that names no
//   entry, a group header or an iconic item, and a name that no entry shows. Inactive entries
//   may be selected by the program; the user cannot choose them.
// - Stepping lands only on entries the user could choose that have a message and whose flag
//   DropDownChoices::kNoStepFlag (4) is clear; the list still offers the others. An action
//   entry (below) is stepped onto like any other and becomes the selection.
// - A wheel event of zero steps counts as a step down (toward later entries), as every delta
//   of 0 or less does.
// - The label is the selected entry's display string; with nothing selected, the title given
//   at construction. The parent hears "ddMenuBtnMsg" only for the user's choices and steps,
//   never for setSelectedItem.
// - An entry given with a message of its own (not "DDMSG<n>") is an action: choosing it sends
//   that message to the parent and selects nothing.
// - "ddMeenuBtnClickMsg" is the button's message: it goes to the parent on the press that
//   opens the list.
#include <vector>

#include "dropdowns/DDBtnInitArgs.h"
#include "dropdowns/DropDownButton.h"
#include "dropdowns/DropDownMenu.h"
#include "menus/DropDownMenuData.h"
#include "platform/misc/ValServer.h"

namespace Glib {
class iFont;
}

class DropDownMenuButton : public DropDownButton<DropDownMenu> {
 public:
  static const char* const dropDownMenuButtonMsg;         // "ddMenuBtnMsg"
  static const char* const dropDownMenuButtonClickedMsg;  // "ddMeenuBtnClickMsg"
  // Room beside the text that autoSize and calcWidth leave for the bevel and the arrow.
  static constexpr int kTextPadding = 14;

  explicit DropDownMenuButton(const DDBtnInitArgs& args);
  DropDownMenuButton(const WString& title, const std::vector<WString>& entries,
                     const GlobCreationInfo& info);
  DropDownMenuButton(const WString& title, const std::vector<WString>& entries,
                     const Colour& colour, unsigned short width, unsigned short height,
                     Canvas* parent);
  ~DropDownMenuButton() override;

  // --- Entries and selection ---
  void setStrings(const std::vector<WString>& entries);
  void setStrings(const std::vector<MenuItem>& items);
  int getSelectedItem() const { return data_.getSelectedItemPhysical(); }
  WString getSelectedItemNameW() const { return data_.getSelectedItemNameW(); }
  int getNumItems() const { return static_cast<int>(data_.items.size()); }
  const DropDownMenuData& menuData() const { return data_; }
  // The current option of the multi-choice entry shown as `label`; empty when none.
  WString getCurrentChoice(const WString& label) const;
  bool setSelectedItem(int index);
  bool setSelectedItem(const WString& name);
  ValServer<int>& getSelectedItemServer() { return selected_; }

  // --- Messages ---
  static String buildMsgForItem(int n);
  int getLogicalItemIndexFromMessage(const String& msg) const;

  // --- Settings ---
  void setWheelEnabled(bool on);
  bool getWheelEnabled() const { return dropDownSettings().wheelEnabled; }
  void setPrefsKey(const String& key);
  const String& getPrefsKey() const { return dropDownSettings().prefsKey; }
  void setShowSelection(bool on);
  void setMaxVisibleRows(int rows);
  // The list gets an add row (MenuWithAddButton) labelled `label` (the default when empty).
  void setAddEntry(bool on, const WString& label = WString());
  bool hasAddEntry() const { return dropDownSettings().addEntry; }

  // --- Size ---
  // The width the button needs for `text` in `font`.
  static int calcWidth(const WString& text, const Glib::iFont& font);
  // Widens or narrows the button to its widest entry, keeping its left edge.
  void autoSize();

  // --- The list ---
  virtual DropDownMenu* generateDropDown() { return makeMenu(); }
  virtual bool handleDropDownMessage(const String& msg) override;
  virtual void informOwner();
  virtual void handleMouseWheelDelta(int delta);

  // The widget value is the selected entry's name: a name pushed from the model selects its
  // entry; a name no entry shows is refused and the selection kept.
  void setNewWidgetValue(WString& value) override;
  int react(Event* e) override;
  const char* idstring() const override { return "ddmenubutton"; }

 protected:
  DropDownMenu* makeMenu() override;
  const char* listKind() const override { return "DropDownMenu"; }
  // Scrolls the selected entry into view.
  void listShown(DropDownMenu* list) override;
  // Shows the selection on the face; subclasses with another face override.
  virtual void selectionShown();

 private:
  void init(const std::vector<MenuItem>& items, int selected);
  // Entries left at the default row colours take the look of the palette around the button,
  // so that a list opened in the light palette is light. Work is done only when that palette's
  // colours differ from those the entries have.
  void colourEntries();

  DropDownMenuData data_;
  ValServer<int> selected_{-1};
  WString title_;
  Colour entryFace_;  // the row colours that count as "default" in the entries now
  Colour entryText_;
};
