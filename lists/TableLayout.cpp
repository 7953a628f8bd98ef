#include "lists/TableLayout.h"

#include <algorithm>

#include "lists/DataColumn.h"

TableLayout::TableLayout(const std::vector<DataColumn>& columns, int viewWidth, int offset)
    : viewWidth_(std::max(0, viewWidth)) {
  int scrolling = 0;
  for (const DataColumn& c : columns) {
    (c.isSticky() ? stickyWidth_ : scrolling) += c.getWidth();
  }
  totalWidth_ = stickyWidth_ + scrolling;
  maxOffset_ = std::max(0, totalWidth_ - viewWidth_);
  offset_ = std::clamp(offset, 0, maxOffset_);

  int x = 0;
  for (int pass = 0; pass < 2; ++pass) {
    const bool sticky = pass == 0;
    for (size_t i = 0; i < columns.size(); ++i) {
      if (columns[i].isSticky() != sticky) continue;
      Span s;
      s.column = static_cast<int>(i);
      s.x0 = sticky ? x : x - offset_;
      s.x1 = s.x0 + columns[i].getWidth();
      const int left = sticky ? 0 : stickyWidth_;
      s.clipX0 = std::clamp(s.x0, left, viewWidth_);
      s.clipX1 = std::clamp(s.x1, left, viewWidth_);
      if (sticky) {
        s.clipX0 = std::min(s.x0, viewWidth_);
        s.clipX1 = std::min(s.x1, viewWidth_);
      }
      spans_.push_back(s);
      x += columns[i].getWidth();
    }
  }
}

const TableLayout::Span* TableLayout::spanOf(int column) const {
  for (const Span& s : spans_) {
    if (s.column == column) return &s;
  }
  return nullptr;
}

int TableLayout::columnAt(int x) const {
  for (const Span& s : spans_) {
    if (s.visible() && x >= s.clipX0 && x < s.clipX1) return s.column;
  }
  return -1;
}

int TableLayout::edgeAt(int x) const {
  int found = -1;
  for (const Span& s : spans_) {
    if (!s.visible() || s.x1 != s.clipX1) continue;  // an edge scrolled out of view
    if (x >= s.x1 - kEdgeSlop && x <= s.x1 + kEdgeSlop) found = s.column;
  }
  return found;
}

int TableLayout::offsetShowing(int column) const {
  const Span* s = spanOf(column);
  if (!s) return offset_;
  // Positions without any offset.
  const int x0 = s->x0 + offset_;
  const int x1 = s->x1 + offset_;
  if (x0 < stickyWidth_) return offset_;  // a sticky column
  const int room = viewWidth_ - stickyWidth_;
  int offset = offset_;
  if (x1 - offset > viewWidth_) offset = x1 - viewWidth_;
  if (x0 - offset < stickyWidth_ || x1 - x0 > room) offset = x0 - stickyWidth_;
  return std::clamp(offset, 0, maxOffset_);
}

int TableLayout::neighbour(int column, int step) const {
  for (size_t i = 0; i < spans_.size(); ++i) {
    if (spans_[i].column != column) continue;
    const long j = static_cast<long>(i) + (step < 0 ? -1 : 1);
    if (j < 0 || j >= static_cast<long>(spans_.size())) return column;
    return spans_[static_cast<size_t>(j)].column;
  }
  return spans_.empty() ? -1 : spans_.front().column;
}
