#pragma once
// A group headed by a drop-down menu button: the button shows which of its entries the group
// is set to, and choosing another tells the group's owner "MenuButtonGroupClick".
//
//   event                                   what the group does
//   its button reports "ddMenuBtnMsg"       fits the button to the choice (with auto-size),
//                                           then informOwner(): "MenuButtonGroupClick"
//   any other message from its button       passed on to the parent as the group's own
//
// Choices made here:
// - The button is the title widget, at the start of the title strip; the group's title is the
//   button's label while nothing is selected.
// - Auto-size (on by default) fits the button's width to the selected entry's label;
//   otherwise the button keeps the width it has.
// - setBoldText makes the button's label bold as well as the group's.
#include "dropdowns/DropDownMenuButton.h"
#include "panels/WidgetGroupEx.h"

class MenuButtonGroup : public WidgetGroupEx {
 public:
  static const char* const buttonClickedMsg;  // "MenuButtonGroupClick"

  MenuButtonGroup(const GlobCreationInfo& info, const WString& title,
                  const std::vector<WString>& entries = {});

  DropDownMenuButton* getBtn() const { return dynamic_cast<DropDownMenuButton*>(getWidget()); }

  void setStrings(const std::vector<WString>& entries);
  void setStrings(const std::vector<MenuItem>& items);
  bool setSelectedItem(int index);
  bool setSelectedItem(const WString& name);
  int getSelectedItem() const;
  WString getSelectedItemNameW() const;
  int getNumItems() const;
  void setMenuPrefsKey(const String& key);
  void setButtonCol(const Colour& colour);
  void setAutoSizeButton(bool on);
  bool getAutoSizeButton() const { return autoSizeButton_; }
  void setDrawButtonSeparator(bool on);
  void setBoldText(bool bold);
  virtual void informOwner();

  int handleMessageEvent(const String& msg, Glob* sender) override;
  const char* idstring() const override { return "menubuttongroup"; }

 private:
  void fitButton();

  bool autoSizeButton_ = true;
};
