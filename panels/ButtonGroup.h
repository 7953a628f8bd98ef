#pragma once
// A group headed by a button that reads as a drop-down (DropDownButtonImposter): the button
// names what the group shows, and pressing it is the owner's business.
//
// Choices made here:
// - The button sends its message (kButtonMsg unless changed through getBtn()) to the group,
//   which passes every message from it on to its own parent unchanged, as its own.
// - The button is the title widget, as wide as its label needs plus the arrow; the group's
//   title is its label.
#include "dropdowns/DropDownButtonImposter.h"
#include "panels/WidgetGroupEx.h"

class ButtonGroup : public WidgetGroupEx {
 public:
  static constexpr const char* kButtonMsg = "ButtonGroupButton";

  ButtonGroup(const GlobCreationInfo& info, const WString& title);

  DropDownButtonImposter* getBtn() const {
    return dynamic_cast<DropDownButtonImposter*>(getWidget());
  }

  int handleMessageEvent(const String& msg, Glob* sender) override;
  const char* idstring() const override { return "buttongroup"; }

 protected:
  void titleStored() override;

 private:
  void fitButton();
};
