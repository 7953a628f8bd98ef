#include <gtest/gtest.h>

#include "lists/CellEditor.h"
#include "lists/ChoiceList.h"
#include "lists/DataTable.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "tests/lists/TableTestSupport.h"
#include "values/ScrollBar.h"

namespace {

// A table of three 100-pixel columns, 20-pixel rows under a 22-pixel header, on a probe.
struct DataTableTest : ::testing::Test {
  explicit DataTableTest(unsigned rows = 50) : supplier(rows) {
    table = new DataTable(GlobCreationInfo(316, 222, probe.canvas(), 10, 10), &supplier);
    for (int i = 0; i < 3; ++i) table->addColumn(DataColumn(100));
  }
  // The centre of a cell in root coordinates (the table sits at 10, 10).
  XY<int> at(int column, int shownRow) const {
    return XY<int>(10 + column * 100 + 50, 10 + 200 - shownRow * 20 - 10);
  }
  void doubleClick(XY<int> p) {
    h.click(p);
    h.advance(50);
    h.click(p);
  }

  Harness h{400, 300};
  MessageProbe probe{GlobCreationInfo(400, 300, h.canvas(), 0, 0)};
  MemorySupplier supplier;
  DataTable* table = nullptr;
};

struct BigTableTest : DataTableTest {
  BigTableTest() : DataTableTest(1000000) {}
};

}  // namespace

TEST_F(BigTableTest, OnlyTheRowsInViewAreAskedFor) {
  h.render();
  EXPECT_EQ(table->visibleRows(), 10);
  EXPECT_LE(supplier.textAsks, 3 * 11);
  EXPECT_LE(supplier.highestRowAsked, 10);

  table->scrollToRow(999990);
  supplier.textAsks = 0;
  h.render();
  EXPECT_EQ(table->firstRow(), 999990u);
  EXPECT_LE(supplier.textAsks, 3 * 11);
  EXPECT_NEAR(table->scrollBar()->getThumbPos(), 0.99999, 1e-6);
}

TEST_F(DataTableTest, ClicksTagRowsAndMoveTheCurrentCell) {
  h.click(at(1, 2));
  EXPECT_EQ(table->currentCell(), XY<int>(1, 2));
  EXPECT_EQ(supplier.tags, (std::set<unsigned>{2}));
  EXPECT_EQ(probe.count(DataTable::currentCellMsg), 1);
  EXPECT_EQ(probe.count(DataTable::tagsChangedMsg), 1);

  h.setModifiers(kKeyShift);
  h.click(at(0, 5));
  EXPECT_EQ(supplier.tags, (std::set<unsigned>{2, 3, 4, 5}));
  h.setModifiers(kKeyCtrl);
  h.click(at(0, 3));
  EXPECT_EQ(supplier.tags, (std::set<unsigned>{2, 4, 5}));
  h.setModifiers(0);
  h.advance(1000);
  h.click(at(2, 7));  // a plain click tags its row alone
  EXPECT_EQ(supplier.tags, (std::set<unsigned>{7}));
  EXPECT_EQ(probe.count(DataTable::tagsChangedMsg), 4);
}

TEST_F(DataTableTest, KeysMoveTheCurrentCellAndScroll) {
  table->set_kbd_focus();
  h.key(kKeyDown);
  h.key(kKeyRight);
  EXPECT_EQ(table->currentCell(), XY<int>(1, 1));
  h.key(kKeyPageDown);
  EXPECT_EQ(table->currentCell(), XY<int>(1, 10));
  EXPECT_EQ(table->firstRow(), 1u);  // brought into view
  h.key(kKeyEnd);
  EXPECT_EQ(table->currentCell(), XY<int>(1, 49));
  EXPECT_EQ(table->firstRow(), 40u);
  h.key(kKeyHome);
  EXPECT_EQ(table->currentCell(), XY<int>(1, 0));
  EXPECT_EQ(table->firstRow(), 0u);
  h.key(kKeyUp);  // at the top already: nothing
  h.key(kKeySpace);
  EXPECT_EQ(supplier.tags, (std::set<unsigned>{0}));
  EXPECT_EQ(probe.count(DataTable::currentCellMsg), 5);
}

TEST_F(DataTableTest, TheScrollBarAndTheWheelScrollTheRows) {
  h.wheel(at(0, 0), -3);
  EXPECT_EQ(table->firstRow(), 3u);
  h.click(Harness::centreOf(*table->scrollBar()->incrementButton()));
  EXPECT_EQ(table->firstRow(), 4u);
  EXPECT_NEAR(table->scrollBar()->getThumbPos(), 4.0 / 50, 1e-6);
}

TEST_F(DataTableTest, DoubleClickEditsAndReturnStores) {
  doubleClick(at(0, 1));
  ASSERT_TRUE(table->editor());
  EXPECT_EQ(table->editor()->getText(), L"r1c0");
  h.type(L"new; DROP 'x'");
  h.key(kKeyReturn);
  EXPECT_FALSE(table->isEditing());
  ASSERT_EQ(supplier.stores.size(), 1u);
  EXPECT_EQ(supplier.stores[0].first, XY<int>(0, 1));
  EXPECT_EQ(supplier.stores[0].second, "new; DROP 'x'");
  EXPECT_EQ(probe.count(DataTable::cellEditedMsg), 1);
  EXPECT_TRUE(table->hasKbdFocus());  // back to the table

  h.key(kKeyReturn);  // edits the current cell
  ASSERT_TRUE(table->editor());
  h.type(L"gone");
  h.key(kKeyEscape);
  EXPECT_FALSE(table->isEditing());
  EXPECT_EQ(supplier.stores.size(), 1u);
}

TEST_F(DataTableTest, ReadOnlyColumnsAndCellsAreNotEdited) {
  DataColumn locked(100);
  locked.setReadOnly(DataColumn::ReadOnly);
  table->setColumn(1, locked);
  supplier.readOnlyCells.insert({0, 3});
  doubleClick(at(1, 2));
  EXPECT_FALSE(table->isEditing());
  h.advance(1000);
  doubleClick(at(0, 3));
  EXPECT_FALSE(table->isEditing());
  EXPECT_FALSE(table->beginEdit(XY<int>(0, 50)));  // beyond the rows
  EXPECT_FALSE(table->beginEdit(XY<int>(7, 0)));
  EXPECT_TRUE(table->beginEdit(XY<int>(0, 2)));
}

TEST_F(DataTableTest, EditsOfTaggedRowsFollowTheColumn) {
  DataColumn together(100);
  together.setCanEditTaggedItems(true);
  table->setColumn(0, together);
  supplier.tags = {1, 4, 6};
  ASSERT_TRUE(table->beginEdit(XY<int>(0, 4)));
  h.type(L"all");
  h.key(kKeyReturn);
  ASSERT_EQ(supplier.stores.size(), 3u);
  EXPECT_EQ(supplier.stores[2].first, XY<int>(0, 6));

  supplier.stores.clear();
  ASSERT_TRUE(table->beginEdit(XY<int>(1, 4)));  // a column that edits one row
  h.type(L"one");
  h.key(kKeyReturn);
  ASSERT_EQ(supplier.stores.size(), 1u);
  EXPECT_EQ(supplier.stores[0].first, XY<int>(1, 4));
}

TEST_F(DataTableTest, ChoicesArePickedFromAListUnderTheCell) {
  doubleClick(at(2, 0));
  ChoiceList* list = table->choiceList();
  ASSERT_TRUE(list);
  EXPECT_EQ(list->choices().size(), 3u);
  EXPECT_LT(list->get_y() + list->height(), table->get_y() + 200 - 20 + 1);  // below the cell
  h.key(kKeyDown);
  h.key(kKeyReturn);
  EXPECT_FALSE(table->choiceList());
  ASSERT_EQ(supplier.stores.size(), 1u);
  EXPECT_EQ(supplier.stores[0].second, "video");

  ASSERT_TRUE(table->beginEdit(XY<int>(2, 1)));
  h.key(kKeyEscape);
  EXPECT_FALSE(table->isEditing());
  EXPECT_EQ(supplier.stores.size(), 1u);

  ASSERT_TRUE(table->beginEdit(XY<int>(2, 1)));
  h.click(Harness::centreOf(*table->choiceList()) + XY<int>(0, -20));  // the third choice
  EXPECT_EQ(supplier.stores.back().second, "still");
}

TEST_F(DataTableTest, RowsAreReorderedByDraggingInASwappingColumn) {
  h.drag(at(0, 1), at(0, 3));  // a column that cannot swap
  EXPECT_TRUE(supplier.swaps.empty());

  DataColumn handle(100);
  handle.setCanSwapItems(true);
  table->setColumn(0, handle);
  h.advance(1000);
  h.drag(at(0, 1), at(0, 4), 6);
  ASSERT_EQ(supplier.swaps.size(), 3u);
  EXPECT_EQ(supplier.swaps[0].a, 1u);
  EXPECT_EQ(supplier.swaps[0].b, 2u);
  EXPECT_EQ(supplier.swaps[2].b, 4u);
  EXPECT_EQ(supplier.swaps[0].column, 0u);
  EXPECT_EQ(table->currentCell(), XY<int>(0, 4));
  EXPECT_EQ(supplier.getFieldText(XY<int>(0, 4)).getString(), "r1c0");
  EXPECT_EQ(probe.count(DataTable::rowsSwappedMsg), 1);
}

TEST_F(DataTableTest, TheAddRowAsksTheSupplier) {
  table->setShowAddRow(true);
  table->scrollToRow(50);
  EXPECT_EQ(table->firstRow(), 41u);  // the add row is the last one shown
  h.click(at(0, 9));
  EXPECT_EQ(supplier.getSize(), 50u);  // refused
  EXPECT_EQ(probe.count(DataTable::rowAddedMsg), 0);
  supplier.agreeToAdd = true;
  h.click(at(0, 9));
  EXPECT_EQ(supplier.getSize(), 51u);
  EXPECT_EQ(table->currentCell().y, 50);
  EXPECT_EQ(probe.count(DataTable::rowAddedMsg), 1);
}

TEST_F(DataTableTest, HeaderEdgesResizeResizeableColumns) {
  const int edgeX = 10 + 100 - 1;
  const int headerY = 10 + 222 - 11;
  EXPECT_EQ(table->contextCursor(XY<int>(99, 211)), kCursorResizeHorizontal);
  h.drag(XY<int>(edgeX, headerY), XY<int>(edgeX + 40, headerY));
  EXPECT_EQ(table->columns()[0].getWidth(), 140);
  EXPECT_EQ(probe.count(DataTable::columnResizedMsg), 1);
  h.drag(XY<int>(edgeX + 40, headerY), XY<int>(0, headerY));
  EXPECT_EQ(table->columns()[0].getWidth(), table->columns()[0].getMinWidth());

  DataColumn fixed(100);
  fixed.setResizeable(false);
  table->setColumn(0, fixed);
  h.drag(XY<int>(edgeX, headerY), XY<int>(edgeX + 40, headerY));
  EXPECT_EQ(table->columns()[0].getWidth(), 100);
}

TEST_F(DataTableTest, TooltipsAndCursorsComeFromTheSupplier) {
  EXPECT_EQ(table->contextString(XY<int>(50, 190), nullptr), "row 0");
  EXPECT_EQ(table->contextString(XY<int>(150, 190), nullptr), "");
  EXPECT_EQ(table->contextCursor(XY<int>(150, 190)), kCursorHand);
  EXPECT_EQ(table->contextCursor(XY<int>(50, 190)), kCursorArrow);
  h.move(at(0, 2));
  EXPECT_EQ(h.root().contextStringAtPointer(), "row 2");
}

TEST_F(DataTableTest, RowsTakenAwayWhileTheEndIsShown) {
  table->set_kbd_focus();
  h.key(kKeyEnd);
  ASSERT_EQ(table->firstRow(), 40u);
  ASSERT_TRUE(table->beginEdit(XY<int>(0, 49)));
  supplier.setRows(5);
  supplier.version++;
  supplier.highestRowAsked = -1;
  h.render();
  EXPECT_LT(supplier.highestRowAsked, 5);  // the new end, nothing beyond it
  EXPECT_EQ(table->firstRow(), 0u);
  h.key(kKeyUp);  // the next event brings the table up to date
  EXPECT_FALSE(table->isEditing());
  EXPECT_TRUE(supplier.stores.empty());  // the edit was dropped, not stored elsewhere
  EXPECT_EQ(table->currentCell().y, 3);
  supplier.setRows(0);
  h.key(kKeyDown);
  h.render();
  EXPECT_EQ(table->currentCell().y, 0);
}

TEST_F(DataTableTest, AnOwnerMayDeleteTheTableWhileHearingIt) {
  struct Deleter : MessageProbe {
    using MessageProbe::MessageProbe;
    int react(Event* e) override {
      if (message_event(e) && e->text() == DataTable::currentCellMsg) {
        delete event_to_sender_glob(e);
        return 1;
      }
      return MessageProbe::react(e);
    }
  };
  auto* owner = new Deleter(GlobCreationInfo(400, 300, h.canvas(), 0, 0));
  GlobHandle<DataTable> t =
      new DataTable(GlobCreationInfo(316, 222, owner->canvas(), 10, 10), &supplier);
  t->addColumn(DataColumn(100));
  h.click(at(0, 3));
  EXPECT_FALSE(t.alive());
  EXPECT_TRUE(supplier.tags.empty());  // nothing touched after the report
  h.key(kKeyDown);
  h.render();
  delete owner;
}

TEST(DataTable, WithoutSupplierOrColumnsItIsAnEmptyWell) {
  Harness h(200, 100);
  auto* t = new DataTable(GlobCreationInfo(200, 100, h.canvas(), 0, 0));
  h.render();
  h.click(XY<int>(50, 50));
  t->set_kbd_focus();
  h.key(kKeyDown);
  h.key(kKeyReturn);
  EXPECT_FALSE(t->isEditing());
  EXPECT_EQ(t->rowCount(), 0u);
  MemorySupplier s(3);
  t->setSupplier(&s);  // no columns yet
  h.click(XY<int>(50, 50));
  h.render();
  EXPECT_EQ(s.textAsks, 0);
  t->setSupplier(nullptr);
}
