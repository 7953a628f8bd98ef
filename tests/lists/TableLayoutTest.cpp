#include <gtest/gtest.h>

#include "lists/DataColumn.h"
#include "lists/TableLayout.h"

namespace {

std::vector<DataColumn> columns(std::initializer_list<std::pair<int, bool>> widthsAndSticky) {
  std::vector<DataColumn> out;
  for (const auto& [w, sticky] : widthsAndSticky) {
    DataColumn c(static_cast<unsigned short>(w));
    c.setSticky(sticky);
    out.push_back(c);
  }
  return out;
}

}  // namespace

TEST(TableLayout, StickyColumnsComeFirstAndStayWhileTheOthersScroll) {
  // Column 2 is sticky: shown first whatever its index.
  const auto cols = columns({{100, false}, {80, false}, {50, true}});
  const TableLayout at0(cols, 150, 0);
  ASSERT_EQ(at0.spans().size(), 3u);
  EXPECT_EQ(at0.spans()[0].column, 2);
  EXPECT_EQ(at0.stickyWidth(), 50);
  EXPECT_EQ(at0.maxOffset(), 80);
  EXPECT_EQ(at0.columnAt(10), 2);
  EXPECT_EQ(at0.columnAt(60), 0);
  EXPECT_EQ(at0.columnAt(149), 0);
  EXPECT_EQ(at0.columnAt(150), -1);

  const TableLayout scrolled(cols, 150, 60);
  const TableLayout::Span* first = scrolled.spanOf(0);
  EXPECT_EQ(first->x0, -10);
  EXPECT_EQ(first->clipX0, 50);  // hidden under the sticky column, not over it
  EXPECT_EQ(scrolled.columnAt(10), 2);
  EXPECT_EQ(scrolled.columnAt(60), 0);
  EXPECT_EQ(scrolled.columnAt(100), 1);

  EXPECT_EQ(TableLayout(cols, 150, 999).offset(), 80);  // clamped
  EXPECT_EQ(TableLayout(cols, 150, -5).offset(), 0);
  EXPECT_EQ(TableLayout(cols, 500, 40).offset(), 0);  // everything fits
}

TEST(TableLayout, EdgesNeighboursAndOffsetsThatShowAColumn) {
  const auto cols = columns({{60, true}, {100, false}, {100, false}, {100, false}});
  const TableLayout l(cols, 200, 0);
  EXPECT_EQ(l.edgeAt(58), 0);
  EXPECT_EQ(l.edgeAt(63), 0);
  EXPECT_EQ(l.edgeAt(160), 1);
  EXPECT_EQ(l.edgeAt(100), -1);
  EXPECT_EQ(l.neighbour(0, -1), 0);
  EXPECT_EQ(l.neighbour(0, 1), 1);
  EXPECT_EQ(l.neighbour(3, 1), 3);

  EXPECT_EQ(l.offsetShowing(0), 0);    // sticky
  EXPECT_EQ(l.offsetShowing(1), 0);    // already shown
  EXPECT_EQ(l.offsetShowing(2), 60);   // its right edge at the view's
  EXPECT_EQ(l.offsetShowing(3), 160);  // the last one: the largest offset
  const TableLayout far(cols, 200, 160);
  EXPECT_EQ(far.offsetShowing(1), 0);  // back until its start clears the sticky column
  EXPECT_EQ(far.offsetShowing(3), 160);
}
