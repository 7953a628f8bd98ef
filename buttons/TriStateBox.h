#pragma once
// A check box that can also show an indeterminate state (say, for a setting that differs
// across a selection). The indeterminate mark is display only: the value stays the bool, and
// the owner clears the mark when the selection becomes uniform. While it shows, the mark
// replaces the tick.
#include "buttons/Checkbox.h"

class TriStateBox : public Checkbox {
 public:
  using Checkbox::Checkbox;

  // Stores the setting; repaints when `redraw` is set and it changed.
  void setTriState(bool triState, bool redraw);
  bool getTriState() const { return triState; }

  void draw() override;
  const char* idstring() const override { return "tristatebox"; }
  String describeValue() const override;

 private:
  bool triState = false;
};
