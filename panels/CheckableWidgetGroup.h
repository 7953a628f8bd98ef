#pragma once
// A group whose title is a check box that switches the grouped widgets on and off.
//
//   input                                    what happens
//   the title box toggled by the user        setState(ticked, true): the grouped widgets are
//   ("WidgetGroupCheckbox TICKED"/"CLEAR")   activated or deactivated; then the parent gets
//                                            "WidgetGroupStateToggled"
//   setState(value, redraw)                  the box shows `value`, the widgets follow; no
//                                            message
//
// Choices made here:
// - The check box is the group's title widget, labelled with the group title, its width
//   following the title; its messages start with "WidgetGroupCheckbox " (prefix kept apart
//   from plain check boxes so that a grouped check box is never mistaken for it).
// - A group starts ticked, its widgets active.
#include "panels/WidgetGroupEx.h"

class Checkbox;

class CheckableWidgetGroup : public WidgetGroupEx {
 public:
  static const char* const groupStateToggledMsg;  // "WidgetGroupStateToggled"
  static const char* const checkboxPrefix;        // "WidgetGroupCheckbox "

  CheckableWidgetGroup(const GlobCreationInfo& info, const WString& title, bool ticked = true);

  void setState(bool value, bool redraw);
  bool getState() const { return state_; }
  Checkbox* getCheckbox() const;

  int handleMessageEvent(const String& msg, Glob* sender) override;
  void handleWidgetAdded(const WidgetDetails& details) override;
  const char* idstring() const override { return "checkablegroup"; }

 protected:
  void titleStored() override;

 private:
  bool state_ = true;
};
