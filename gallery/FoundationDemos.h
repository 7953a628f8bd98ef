#pragma once
// The foundation page's two demonstrations: one model value shown by two bound controls, and a
// row of focus stops that Tab and Shift+Tab walk through.
#include "foundation/TabOrderManager.h"
#include "platform/glob/Glob.h"
#include "platform/misc/ValServer.h"

class LevelMeter;

// Owns the model value; its two meters are bound to it through one shared adaptor.
class BindingDemo : public Glob {
 public:
  explicit BindingDemo(const GlobCreationInfo& info);
  const char* idstring() const override { return "bindingdemo"; }
  void draw() override;

 private:
  ValServer<int> level_;
};

// Owns the tab order of its chips; Tab and Shift+Tab pressed on a chip bubble up to it.
class FocusRow : public Glob {
 public:
  FocusRow(const GlobCreationInfo& info, int chips);
  int react(Event* e) override;
  const char* idstring() const override { return "focusrow"; }

 private:
  TabOrderManager order_;
};
