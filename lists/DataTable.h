#pragma once
// A table of data columns over a data supplier: a header strip with the field names, rows of
// cells side by side, and one vertical scroll bar at the right that all columns share. Only
// the rows in view are asked for and drawn, so a million rows cost what a hundred do.
//
//   input                                    does
//   left press on a cell                     makes it current and tags its row alone;
//                                            Ctrl: toggles the row's tag; Shift: tags the
//                                            rows from the last plain press to this one
//   second press on the same cell (400 ms)   edits it (see editing)
//   drag from a row, in a can-swap column    moves the row along with the pointer, one swap
//                                            with its neighbour per row crossed
//   press on the "add" row                   asks the supplier for a row (requestAddRow)
//   drag a resizeable column's header edge   resizes it (never below its minimum width)
//   wheel, scroll bar                        scrolls; an edit in progress is stored first
//   Up/Down, Left/Right                      moves the current cell (sideways scrolling
//                                            follows it past the sticky columns)
//   Page Up/Down, Home/End                   by a page of rows, to the first or last row
//   Return                                   edits the current cell (on the "add" row: adds)
//   Space                                    toggles the current row's tag
//
// Editing: only a cell whose column and whose own state (isReadOnly) both allow it. A cell
// with choices (getFieldChoices) opens the list of choices; any other a text box over the
// cell, holding its text, all selected. Return or leaving the box stores the text with
// storeFieldText; Escape cancels. In a column that can edit tagged items, a tagged row's
// edit is stored in every tagged row.
//
// Messages to the owner (the parent), sent synchronously after the change: currentCellMsg,
// cellEditedMsg, tagsChangedMsg, rowsSwappedMsg (at the release that ends a row drag),
// rowAddedMsg and columnResizedMsg (at the release). The owner may delete the table, or
// change its supplier, while it hears them.
//
// Decisions where the behaviour was left open:
// - Row height is the tallest line height of the columns; the header is kHeaderHeight tall.
// - The supplier's row count is read whenever it is needed; a table showing rows that have
//   gone shows the new end instead, and moves its current cell to the last row. A change of
//   the supplier's data version drops an edit in progress (its row may hold another record).
// - A table without a supplier, or without columns, shows an empty well.
// - The "add" row is shown when setShowAddRow(true); the supplier decides whether a press on
//   it adds anything.
// - The table does not own its supplier; the supplier must outlive it or be replaced first.
#include <vector>

#include "foundation/GlobTabStop.h"
#include "foundation/rect.h"
#include "lists/DataColumn.h"
#include "lists/DataSupplier.h"
#include "lists/TableLayout.h"
#include "platform/glob/GlobHandle.h"

class CellEditor;
class ChoiceList;
class ScrollBar;

class DataTable : public rect, public GlobTabStop {
 public:
  static constexpr int kHeaderHeight = 22;
  static constexpr double kSecondClickMs = 400.0;

  static const String currentCellMsg;    // "DataTable::currentCell"
  static const String cellEditedMsg;     // "DataTable::cellEdited"
  static const String tagsChangedMsg;    // "DataTable::tagsChanged"
  static const String rowsSwappedMsg;    // "DataTable::rowsSwapped"
  static const String rowAddedMsg;       // "DataTable::rowAdded"
  static const String columnResizedMsg;  // "DataTable::columnResized"

  explicit DataTable(const GlobCreationInfo& info, DataSupplier* supplier = nullptr);
  DataTable(unsigned short width, unsigned short height, int flag, Canvas* parent);
  ~DataTable() override;

  // --- Data ---
  void setSupplier(DataSupplier* supplier);
  DataSupplier* supplier() const { return supplier_; }
  // The supplier's data changed: count the rows again and repaint.
  void refresh();
  // Rows of the supplier (0 without one).
  unsigned rowCount() const;

  // --- Columns ---
  void addColumn(const DataColumn& column);
  void setColumns(const std::vector<DataColumn>& columns);
  // False for a column that does not exist.
  bool setColumn(int index, const DataColumn& column);
  const std::vector<DataColumn>& columns() const { return columns_; }
  void setShowAddRow(bool show);
  bool showsAddRow() const { return showAddRow_; }

  // --- View and current cell ---
  int rowHeight() const;
  // Rows that fit whole below the header.
  int visibleRows() const;
  unsigned firstRow() const;
  void scrollToRow(unsigned row);
  int horizontalOffset() const { return layout().offset(); }
  XY<int> currentCell() const { return current_; }
  // False for a cell that does not exist; otherwise makes it current and brings it into view.
  bool setCurrentCell(XY<int> cell);
  // The cell's box in the table (empty when not shown) and the cell at a point ({-1, -1}
  // for none; the "add" row is row rowCount()).
  Kw::Box<int> cellBox(XY<int> cell) const;
  XY<int> cellAt(XY<int> pos) const;
  ScrollBar* scrollBar() const { return bar_; }
  TableLayout layout() const;

  // --- Editing ---
  bool beginEdit(XY<int> cell);
  // Stores (or drops) an edit in progress; nothing when there is none.
  void endEdit(bool store);
  bool isEditing() const;
  CellEditor* editor() const;
  ChoiceList* choiceList() const;

  // --- Glob ---
  int react(Event* e) override;
  void draw() override;
  void reshape() override;
  void handle_kbd_focus() override { update(); }
  const char* idstring() const override { return "datatable"; }
  String contextString(const XY<int>& pos, CanvasClient* asker) override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  String describeValue() const override;

 private:
  enum class Drag { None, Row, Resize };

  void init(DataSupplier* supplier);
  int viewWidth() const;
  int rowsTop() const { return height() - kHeaderHeight; }
  unsigned totalRows() const;
  unsigned maxFirst() const;
  // Brings the view up to the supplier's current rows; false when the table went away.
  void syncWithSupplier();
  void showFrom(unsigned first);
  void updateBar();
  void ensureVisible(XY<int> cell);
  bool tellOwner(const String& msg);

  int handleMouseEvent(Event* e);
  int handleLeftPress(Event* e);
  void handleDrag(Event* e);
  void handleRelease();
  int handleKey(unsigned key);
  int handleMessage(Event* e);
  void moveCurrent(int dx, int dy);

  void tagOnly(unsigned row);
  void toggleTag(unsigned row);
  void tagRange(unsigned from, unsigned to);
  void store(XY<int> cell, const String& text);
  bool addRow();

  DataSupplier* supplier_ = nullptr;
  std::vector<DataColumn> columns_;
  ScrollBar* bar_ = nullptr;  // a child: lives as long as the table
  bool showAddRow_ = false;
  unsigned first_ = 0;
  int offset_ = 0;
  XY<int> current_{0, 0};
  unsigned anchorRow_ = 0;
  unsigned long version_ = 0;

  Drag drag_ = Drag::None;
  unsigned dragRow_ = 0;
  int dragColumn_ = -1;
  int resizeStartWidth_ = 0;
  bool dragSwapped_ = false;
  double lastPressTime_ = -1e18;
  XY<int> lastPressCell_{-1, -1};

  GlobHandle<CellEditor> editor_;
  GlobHandle<ChoiceList> chooser_;
  XY<int> editCell_{-1, -1};
};
