#pragma once
// One entry of the page selector. A click (press and release over it) tells its owner with
// the message "PageSelected"; the entry's name is the page title.
#include "platform/glob/Glob.h"

class PageTab : public Glob {
 public:
  static constexpr const char* selectedMsg = "PageSelected";

  PageTab(const GlobCreationInfo& info, const String& title, int index, bool ready);

  int index() const { return index_; }
  void setSelected(bool selected);
  bool isSelected() const { return selected_; }

  int react(Event* e) override;
  void draw() override;
  void handleMouseContainment(bool inside) override;
  MouseCursorID contextCursor(const XY<int>& pos) override { return kCursorHand; }
  const char* idstring() const override { return "pagetab"; }
  String describeValue() const override { return title_; }

 private:
  String title_;
  int index_;
  bool ready_;
  bool selected_ = false;
  bool hover_ = false;
  bool pressed_ = false;
};
