#include "panels/WidgetGroup2.h"

WidgetGroup2::WidgetGroup2(const GlobCreationInfo& info, const WString& title)
    : WidgetGroupEx(info, title) {
  setAutoSize(true);
}

bool WidgetGroup2::addRow(Glob* widget) {
  if (!widget || !is_good_glob_ptr(widget)) return false;
  if (!addWidget(widget, XY<int>(0, 0), OriginInnerTopLeft)) return false;
  rows_.emplace_back(widget);
  arrange();
  return true;
}

void WidgetGroup2::setRowGap(int gap) {
  if (gap < 0 || gap == gap_) return;
  gap_ = gap;
  arrange();
}

void WidgetGroup2::arrange() {
  int top = 0;
  for (const GlobHandle<>& h : rows_) {
    Glob* g = h.get();
    if (!g || !isChildWidget(g)) continue;
    setWidgetPos(g, XY<int>(0, top), OriginInnerTopLeft);
    top += g->height() + gap_;
  }
  fitHeight();
}
