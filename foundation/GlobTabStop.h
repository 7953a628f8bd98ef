#pragma once
// The tab-stop behaviour every focusable control shares, written once:
//
//   operation                    does
//   isTabStopActive              the Glob is active and shown on its screen
//   handleTabStopFocusReceipt    the Glob takes its screen's keyboard focus
//   handleTabStopFocusLoss       if the Glob still holds the keyboard focus, its parent takes
//                                it; a Glob with no parent clears its screen's focus
//
// "Holding the focus" is always asked of the Glob's own screen, never of another one, so
// controls on two screens in one process each keep their own focus.
#include "foundation/TabOrderable.h"

class Glob;

class GlobTabStop : public TabOrderable {
 public:
  // `self` is the control's own Glob, which lives exactly as long as this base.
  explicit GlobTabStop(Glob* self) : self_(*self) {}

  bool isTabStopActive() override;
  void handleTabStopFocusReceipt() override;
  void handleTabStopFocusLoss() override;

 protected:
  bool hasKeyboardFocus() const;

 private:
  Glob& self_;
};
