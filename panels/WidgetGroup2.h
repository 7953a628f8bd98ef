#pragma once
// A group that arranges its widgets itself: one row per widget, top to bottom in the order
// they were added, each starting at the user area's left edge, rows `gap` pixels apart. Its
// height follows its rows (it is always auto-sized), and a grouped group that changes height
// moves the rows below it.
//
// Choices made here:
// - addRow(widget) is addWidget at the next row; widgets added through addWidget keep the
//   position they were given and are left out of the rows.
#include "panels/WidgetGroupEx.h"

class WidgetGroup2 : public WidgetGroupEx {
 public:
  static constexpr int kDefaultRowGap = 4;

  WidgetGroup2(const GlobCreationInfo& info, const WString& title);

  bool addRow(Glob* widget);
  void setRowGap(int gap);
  int getRowGap() const { return gap_; }
  int rowCount() const { return static_cast<int>(rows_.size()); }
  const char* idstring() const override { return "widgetgroup2"; }

 private:
  // Places every row again from the top.
  void arrange();

  int gap_ = kDefaultRowGap;
  std::vector<GlobHandle<>> rows_;
};
