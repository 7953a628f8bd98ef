#pragma once
// Two check boxes that together show one bool: the first ("true") box is ticked when the
// value is true, the second ("false") box when it is false, and exactly one of them is ticked
// at any time. A click on the clear box selects it and asks the bound model for the new value.
//
// Choices made here:
// - setWidgets(trueBox, falseBox, state): the first box stands for true, the second for false;
//   `state` is the value shown until the model says otherwise (true ticks the first box).
//   Both boxes get checkboxCallback as their user function, so a click on the ticked box does
//   nothing and no box toggles on its own.
// - After a user selection the clicked box reports its message prefix (no state word) to its
//   parent, like a managed row of check boxes.
// - getState() is the model's value when bound, else the value shown; getWidgetState() is
//   always the value the boxes show.
// - setState(value) is a program change: it shows the value and, when bound, asks the model.
//   setNewWidgetValue only shows.
// - The set is not a Glob: its boxes belong to their panel. Boxes deleted behind its back are
//   skipped; a set destroyed first takes its callback off the live boxes.
#include "buttons/Checkbox.h"
#include "foundation/ValWidget.h"
#include "platform/glob/GlobHandle.h"

class BoolRadioSet : public ValWidget<bool> {
 public:
  BoolRadioSet() = default;
  ~BoolRadioSet() override;

  void setWidgets(Checkbox* trueBox, Checkbox* falseBox, bool state);
  Checkbox* trueBox() const { return true_.get(); }
  Checkbox* falseBox() const { return false_.get(); }

  bool getState();
  void setState(bool value);
  bool getWidgetState() const { return shown_; }

  bool getWidgetValue() override { return shown_; }
  void setNewWidgetValue(bool& value) override { show(value); }
  void setEnabledState(bool enabled) override;

  static void checkboxCallback(Checkbox* box, void* set);

 private:
  void show(bool value);
  void release(Checkbox* box);
  void clicked(Checkbox* box);

  GlobHandle<Checkbox> true_;
  GlobHandle<Checkbox> false_;
  bool shown_ = false;
};
