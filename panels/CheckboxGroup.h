#pragma once
// A group headed by a check box whose state the grouped widgets follow: ticked, they are
// active; clear, inactive.
//
//   input                                  what happens
//   "Checkbox ..." from the group's box    handleStateChange(true), then "CheckboxGroupClicked"
//                                          to the parent
//   "Checkbox ..." from any other box      passed on (the group is unchanged)
//   setState(value, redraw)                the box shows `value` and the widgets follow; no
//                                          message
//
// Choices made here:
// - handleStateChange switches every grouped widget (the box is the title widget, never a
//   grouped one) inside one refresh hold, so the group repaints once.
// - useBoldText(true) makes the label bold whatever the state; setBoldWhenTicked only while
//   ticked.
#include "buttons/Checkbox.h"
#include "panels/WidgetGroupEx.h"

class CheckboxGroup : public WidgetGroupEx {
 public:
  static const char* CheckboxClickedMsg() { return "CheckboxGroupClicked"; }

  CheckboxGroup(const GlobCreationInfo& info, const WString& title, bool ticked = true);

  void setCheckboxAppearance(Checkbox::Appearance a);
  void setClicksEnabled(bool enabled);
  void setBoldWhenTicked(bool bold);
  void useBoldText(bool bold);
  bool getState() const;
  void setState(bool value, bool redraw);
  void handleStateChange(bool redraw);
  Checkbox* getCheckbox() const { return dynamic_cast<Checkbox*>(getWidget()); }

  int handleMessageEvent(const String& msg, Glob* sender) override;
  void handleWidgetAdded(const WidgetDetails& details) override;
  const char* idstring() const override { return "checkboxgroup"; }

 protected:
  void titleStored() override;

 private:
  void fitBox();
};
