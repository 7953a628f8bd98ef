#pragma once
// A gallery stand-in for a scrolled list: rows of text with a vertical scroll bar at the right.
// The bar reports to this view, which answers each report during the call by setting the
// thumb to the rows it now shows; it passes every report on to its page for the message log.
#include "platform/glob/Glob.h"

class ScrollBar;

class ScrolledRows : public Glob {
 public:
  static constexpr int kRowHeight = 20;

  ScrolledRows(const GlobCreationInfo& info, int rows);

  int react(Event* e) override;
  void draw() override;
  const char* idstring() const override { return "scrolledrows"; }
  String describeValue() const override { return "first row " + std::to_string(first_ + 1); }

  int firstRow() const { return first_; }
  ScrollBar* bar() const { return bar_; }

 private:
  int visibleRows() const { return height() / kRowHeight; }
  void showFrom(int first);

  int rows_;
  int first_ = 0;
  ScrollBar* bar_ = nullptr;  // a child: lives as long as this view
};
