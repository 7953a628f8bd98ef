#pragma once
// One visible tab of a tab strip. The strip keeps a few of these and hands them the records
// that are in view as it scrolls, so a dialogue with a thousand pages has only as many tab
// Globs as fit. A tab draws through its dialogue's drawTab and passes presses to its strip.
#include "platform/glob/Glob.h"

class TabStrip;

class DialogueTab : public Glob {
 public:
  DialogueTab(const GlobCreationInfo& info, TabStrip& strip);

  // The record shown, by index in the strip; -1 for none.
  void show(int index);
  int index() const { return index_; }
  void setHover(bool hover);
  bool isHover() const { return hover_; }

  int react(Event* e) override;
  void draw() override;
  void handleMouseContainment(bool inside) override { setHover(inside); }
  MouseCursorID contextCursor(const XY<int>& pos) override { return kCursorHand; }
  const char* idstring() const override { return "tab"; }

 private:
  TabStrip& strip_;
  int index_ = -1;
  bool hover_ = false;
};
