#pragma once
// A stand-in focusable control for the foundation page: a chip that takes the keyboard focus
// as a tab stop and shows a focus mark while it holds it.
#include "foundation/TabOrderable.h"
#include "platform/glob/Glob.h"

class FocusChip : public Glob, public TabOrderable {
 public:
  FocusChip(const GlobCreationInfo& info, const String& label);

  int react(Event* e) override;
  void draw() override;
  void handle_kbd_focus() override { update(); }
  const char* idstring() const override { return "focuschip"; }
  String describeValue() const override { return label_; }

  bool isTabStopActive() override { return isActive() && canvas_is_mapped_to_root(canvas()); }
  void handleTabStopFocusReceipt() override { set_kbd_focus(); }
  void handleTabStopFocusLoss() override;

 private:
  String label_;
};
