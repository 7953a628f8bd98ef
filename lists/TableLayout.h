#pragma once
// Where a table's columns lie across its width: sticky columns first, at the left, in their
// order, then the other columns in theirs, moved left by the sideways scroll offset and
// clipped where the sticky columns end. A plain value: the table makes one from its columns
// whenever it needs one, and tests drive it alone.
#include <vector>

class DataColumn;

class TableLayout {
 public:
  // How close to a column's right edge, in pixels either side, a press resizes it.
  static constexpr int kEdgeSlop = 3;

  struct Span {
    int column = -1;
    int x0 = 0;  // where the column would start, before clipping
    int x1 = 0;
    int clipX0 = 0;  // the part shown, within the view
    int clipX1 = 0;
    bool visible() const { return clipX1 > clipX0; }
  };

  TableLayout(const std::vector<DataColumn>& columns, int viewWidth, int offset);

  // The largest useful sideways offset: the scrolling columns' width beyond the view.
  int maxOffset() const { return maxOffset_; }
  int offset() const { return offset_; }
  int stickyWidth() const { return stickyWidth_; }
  int totalWidth() const { return totalWidth_; }
  // Every column in display order, shown or not.
  const std::vector<Span>& spans() const { return spans_; }
  const Span* spanOf(int column) const;
  // The column shown at x, or -1.
  int columnAt(int x) const;
  // The column whose right edge is within kEdgeSlop of x (the rightmost shown one when edges
  // meet), or -1.
  int edgeAt(int x) const;
  // The offset that shows the whole of `column` (as much as fits, its start first), changing
  // the current one as little as possible. Sticky columns are always shown: the offset stays.
  int offsetShowing(int column) const;
  // The column shown next to `column` in display order (step -1 or +1), or `column` at an end.
  int neighbour(int column, int step) const;

 private:
  std::vector<Span> spans_;
  int viewWidth_ = 0;
  int offset_ = 0;
  int maxOffset_ = 0;
  int stickyWidth_ = 0;
  int totalWidth_ = 0;
};
