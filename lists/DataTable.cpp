#include "lists/DataTable.h"

#include <algorithm>
#include <cmath>

#include "lists/CellEditor.h"
#include "lists/ChoiceList.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/TableLook.h"
#include "platform/glob/KeyCodes.h"
#include "platform/os/OS.h"
#include "values/ScrollBar.h"

const String DataTable::currentCellMsg = "DataTable::currentCell";
const String DataTable::cellEditedMsg = "DataTable::cellEdited";
const String DataTable::tagsChangedMsg = "DataTable::tagsChanged";
const String DataTable::rowsSwappedMsg = "DataTable::rowsSwapped";
const String DataTable::rowAddedMsg = "DataTable::rowAdded";
const String DataTable::columnResizedMsg = "DataTable::columnResized";

namespace {

// What a supplier draws a custom cell with: the table's painter, clipped to the cell.
class CellRenderer : public DataSupplier::iCellRenderer {
 public:
  CellRenderer(Glib::Painter& p, const DataSupplier::CellDrawContext& context, TextAlignment align,
               Glib::TextStyles::TextStyle style)
      : p_(p), context_(context), align_(align), style_(style) {}

  void fill(const Kw::Box<int>& box, const Colour& colour) override { p_.fillRect(box, colour); }
  void outline(const Kw::Box<int>& box, const Colour& colour) override {
    p_.outlineRect(box, colour);
  }
  void text(const WString& s, const Kw::Box<int>& box, const Glib::iFont& font,
            const Colour& colour, TextAlignment align) override {
    p_.text(s, box, font, colour, align, Glib::TextStyles::Plain);
  }
  void standardText(const WString& s) override {
    p_.text(s, context_.textBox, *context_.font, context_.textColour, align_, style_);
  }

 private:
  Glib::Painter& p_;
  const DataSupplier::CellDrawContext& context_;
  TextAlignment align_;
  Glib::TextStyles::TextStyle style_;
};

bool modifierHeld(unsigned key) {
  return OS()->keyboard().isKeyDown(key);
}

}  // namespace

DataTable::DataTable(const GlobCreationInfo& info, DataSupplier* supplier)
    : rect(info), GlobTabStop(this) {
  init(supplier);
}

DataTable::DataTable(unsigned short width, unsigned short height, int flag, Canvas* parent)
    : rect(width, height, flag, parent), GlobTabStop(this) {
  init(nullptr);
}

DataTable::~DataTable() {
  // The list of choices lives on the screen, not inside the table.
  if (ChoiceList* list = chooser_.get()) {
    list->dismiss();
    delete list;
  }
}

void DataTable::init(DataSupplier* supplier) {
  ScrollBarInitArgs args(
      GlobCreationInfo(ScrollBar::thickness(), static_cast<unsigned short>(std::max(0, rowsTop())),
                       canvas(), viewWidth(), 0),
      kVertical);
  bar_ = new ScrollBar(args);
  bar_->set_name("table scroll bar");
  setSupplier(supplier);
}

// --- Data ---

void DataTable::setSupplier(DataSupplier* supplier) {
  endEdit(false);
  supplier_ = supplier;
  version_ = supplier_ ? supplier_->getDataVersion() : 0;
  first_ = 0;
  current_ = XY<int>(0, 0);
  anchorRow_ = 0;
  updateBar();
  update();
}

unsigned DataTable::rowCount() const {
  return supplier_ ? supplier_->getSize() : 0;
}

unsigned DataTable::totalRows() const {
  return rowCount() + (showAddRow_ && supplier_ ? 1 : 0);
}

unsigned DataTable::maxFirst() const {
  const unsigned total = totalRows();
  const auto shown = static_cast<unsigned>(std::max(1, visibleRows()));
  return total > shown ? total - shown : 0;
}

void DataTable::refresh() {
  syncWithSupplier();
  update();
}

void DataTable::syncWithSupplier() {
  if (!supplier_) return;
  const unsigned long version = supplier_->getDataVersion();
  const unsigned rows = rowCount();
  if (version != version_ || (isEditing() && editCell_.y >= static_cast<int>(rows))) {
    version_ = version;
    endEdit(false);  // sends nothing
  }
  const unsigned first = std::min(first_, maxFirst());
  const int lastRow = static_cast<int>(totalRows()) - 1;
  const XY<int> current(current_.x, std::clamp(current_.y, 0, std::max(0, lastRow)));
  if (first != first_ || !(current == current_)) {
    first_ = first;
    current_ = current;
    update();
  }
  updateBar();
}

// --- Columns ---

void DataTable::addColumn(const DataColumn& column) {
  columns_.push_back(column);
  updateBar();
  update();
}

void DataTable::setColumns(const std::vector<DataColumn>& columns) {
  endEdit(false);
  columns_ = columns;
  current_.x = columns_.empty() ? 0 : std::min(current_.x, static_cast<int>(columns_.size()) - 1);
  updateBar();
  update();
}

bool DataTable::setColumn(int index, const DataColumn& column) {
  if (index < 0 || index >= static_cast<int>(columns_.size())) return false;
  columns_[static_cast<size_t>(index)] = column;
  updateBar();
  update();
  return true;
}

void DataTable::setShowAddRow(bool show) {
  if (show == showAddRow_) return;
  showAddRow_ = show;
  syncWithSupplier();
  update();
}

// --- View ---

int DataTable::rowHeight() const {
  int h = DataColumn::kDefaultLineHeight;
  if (!columns_.empty()) h = 0;
  for (const DataColumn& c : columns_) h = std::max(h, static_cast<int>(c.getLineHeight()));
  return h;
}

int DataTable::visibleRows() const {
  return std::max(0, rowsTop() / rowHeight());
}

int DataTable::viewWidth() const {
  return std::max(0, width() - ScrollBar::thickness());
}

unsigned DataTable::firstRow() const {
  return std::min(first_, maxFirst());
}

TableLayout DataTable::layout() const {
  return TableLayout(columns_, viewWidth(), offset_);
}

void DataTable::scrollToRow(unsigned row) {
  showFrom(row);
}

void DataTable::showFrom(unsigned first) {
  first = std::min(first, maxFirst());
  if (first != first_) {
    first_ = first;
    update();
  }
  updateBar();
}

void DataTable::updateBar() {
  if (!bar_) return;
  const double total = totalRows();
  const double shown = std::max(1, visibleRows());
  bar_->setThumbSize(total > shown ? shown / total : 1.0);
  bar_->setThumbPos(total > 0 ? firstRow() / total : 0.0);
}

void DataTable::reshape() {
  bar_->reshape_canvas(viewWidth(), 0, ScrollBar::thickness(), std::max(0, rowsTop()));
  offset_ = layout().offset();
  syncWithSupplier();
  update();
}

bool DataTable::setCurrentCell(XY<int> cell) {
  if (cell.x < 0 || cell.x >= static_cast<int>(columns_.size()) || cell.y < 0 ||
      cell.y >= static_cast<int>(totalRows())) {
    return false;
  }
  if (!(cell == current_)) {
    current_ = cell;
    update();
  }
  ensureVisible(cell);
  return true;
}

void DataTable::ensureVisible(XY<int> cell) {
  const auto row = static_cast<unsigned>(cell.y);
  const auto shown = static_cast<unsigned>(std::max(1, visibleRows()));
  if (row < firstRow())
    showFrom(row);
  else if (row >= firstRow() + shown)
    showFrom(row - shown + 1);
  const int offset = layout().offsetShowing(cell.x);
  if (offset != offset_) {
    offset_ = offset;
    update();
  }
}

Kw::Box<int> DataTable::cellBox(XY<int> cell) const {
  const TableLayout l = layout();
  const TableLayout::Span* span = l.spanOf(cell.x);
  const long i = static_cast<long>(cell.y) - static_cast<long>(firstRow());
  if (!span || !span->visible() || cell.y < 0 || i < 0) return Kw::Box<int>();
  const int top = rowsTop() - static_cast<int>(i) * rowHeight();
  if (top <= 0 || cell.y >= static_cast<int>(totalRows())) return Kw::Box<int>();
  return Kw::Box<int>(span->clipX0, std::max(0, top - rowHeight()), span->clipX1, top);
}

XY<int> DataTable::cellAt(XY<int> pos) const {
  if (pos.y < 0 || pos.y >= rowsTop() || pos.x < 0 || pos.x >= viewWidth()) return {-1, -1};
  const int column = layout().columnAt(pos.x);
  const unsigned row = firstRow() + static_cast<unsigned>((rowsTop() - 1 - pos.y) / rowHeight());
  if (column < 0 || row >= totalRows()) return {-1, -1};
  return {column, static_cast<int>(row)};
}

// --- Reporting ---

bool DataTable::tellOwner(const String& msg) {
  GlobHandle<> self(this);
  if (Glob* owner = parent()) send_message_event(this, owner, msg);
  return static_cast<bool>(self);
}

// --- Tags ---

void DataTable::tagOnly(unsigned row) {
  std::map<unsigned int, bool> tags;
  const unsigned rows = rowCount();
  for (unsigned r = 0; r < rows; ++r) {
    if (r != row && supplier_->getTag(r)) tags[r] = false;
  }
  if (!supplier_->getTag(row)) tags[row] = true;
  if (tags.empty()) return;
  supplier_->setTags(tags);
  update();
  tellOwner(tagsChangedMsg);
}

void DataTable::toggleTag(unsigned row) {
  if (row >= rowCount()) return;
  supplier_->setTags({{row, !supplier_->getTag(row)}});
  update();
  tellOwner(tagsChangedMsg);
}

void DataTable::tagRange(unsigned from, unsigned to) {
  const unsigned rows = rowCount();
  if (rows == 0) return;
  from = std::min(from, rows - 1);
  to = std::min(to, rows - 1);
  std::map<unsigned int, bool> tags;
  for (unsigned r = std::min(from, to); r <= std::max(from, to); ++r) tags[r] = true;
  supplier_->setTags(tags);
  update();
  tellOwner(tagsChangedMsg);
}

// --- Editing ---

CellEditor* DataTable::editor() const {
  return editor_.get();
}

ChoiceList* DataTable::choiceList() const {
  return chooser_.get();
}

bool DataTable::isEditing() const {
  return editor_.alive() || chooser_.alive();
}

bool DataTable::beginEdit(XY<int> cell) {
  if (!supplier_ || cell.x < 0 || cell.x >= static_cast<int>(columns_.size()) || cell.y < 0 ||
      cell.y >= static_cast<int>(rowCount())) {
    return false;
  }
  if (columns_[static_cast<size_t>(cell.x)].isReadOnly() || supplier_->isReadOnly(cell)) {
    return false;
  }
  GlobHandle<> self(this);
  endEdit(true);
  if (!self) return false;
  setCurrentCell(cell);
  const Kw::Box<int> box = cellBox(cell);
  if (box.width() <= 0 || box.height() <= 0) return false;
  const WString text = supplier_->getFieldText(cell).getWString();

  std::vector<WString> choices;
  supplier_->getFieldChoices(cell, choices);
  editCell_ = cell;
  if (!choices.empty()) {
    const Kw::Box<int> inRoot(
        box.x0 + static_cast<int>(get_x()), box.y0 + static_cast<int>(get_y()),
        box.x1 + static_cast<int>(get_x()), box.y1 + static_cast<int>(get_y()));
    chooser_ = ChoiceList::open(*this, inRoot, choices, text);
    if (!chooser_) editCell_ = XY<int>(-1, -1);
    return chooser_.alive();
  }
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(static_cast<unsigned short>(box.width()),
                               static_cast<unsigned short>(box.height()), canvas(), box.x0, box.y0);
  args.text = text;
  args.font = supplier_->getFont(cell);
  args.alignment = columns_[static_cast<size_t>(cell.x)].getAlignment();
  args.leftMargin = args.rightMargin = DataColumn::textMargin - 1;
  auto* editor = new CellEditor(args, this);
  editor_ = editor;
  editor->set_kbd_focus();  // selects the whole text
  return true;
}

void DataTable::endEdit(bool keep) {
  const XY<int> cell = editCell_;
  editCell_ = XY<int>(-1, -1);
  String text;
  bool haveText = false;
  if (CellEditor* editor = editor_.get()) {
    text = Kw::toUtf8(editor->getText());
    haveText = true;
    const bool focused = get_kbd_focus(this) == editor;
    editor->dismiss();
    delete editor;
    if (focused) set_kbd_focus();
  }
  editor_.reset();
  if (ChoiceList* list = chooser_.get()) {
    const bool focused = get_kbd_focus(this) == list;
    list->dismiss();
    delete list;
    if (focused) set_kbd_focus();
  }
  chooser_.reset();
  update();
  if (keep && haveText && cell.y >= 0) store(cell, text);
}

void DataTable::store(XY<int> cell, const String& text) {
  if (!supplier_ || cell.x < 0 || cell.x >= static_cast<int>(columns_.size()) ||
      cell.y >= static_cast<int>(rowCount())) {
    return;
  }
  const auto row = static_cast<unsigned>(cell.y);
  std::vector<unsigned> rows{row};
  if (columns_[static_cast<size_t>(cell.x)].canEditTaggedItems() && supplier_->getTag(row)) {
    rows.clear();
    const unsigned count = rowCount();
    for (unsigned r = 0; r < count; ++r) {
      if (supplier_->getTag(r)) rows.push_back(r);
    }
  }
  for (unsigned r : rows) {
    const XY<int> target(cell.x, static_cast<int>(r));
    if (!supplier_->isReadOnly(target)) supplier_->storeFieldText(text.c_str(), target);
  }
  version_ = supplier_->getDataVersion();  // our own change
  update();
  tellOwner(cellEditedMsg);
}

bool DataTable::addRow() {
  if (!supplier_ || !supplier_->requestAddRow()) return false;
  version_ = supplier_->getDataVersion();
  syncWithSupplier();
  setCurrentCell(XY<int>(current_.x, static_cast<int>(rowCount()) - 1));
  update();
  return tellOwner(rowAddedMsg);
}

// --- Input ---

int DataTable::react(Event* e) {
  syncWithSupplier();
  if (message_event(e)) return handleMessage(e);
  if (mouse_event(e)) return handleMouseEvent(e);
  if (key_press_event(e) && hasKbdFocus()) {
    if (handleKey(e->keyCode())) return 1;
  }
  return rect::react(e);
}

int DataTable::handleMessage(Event* e) {
  const String& m = e->text();
  Glob* sender = event_to_sender_glob(e);
  if (sender && sender == bar_ && ScrollBar::isScrollBarMsg(m)) {
    GlobHandle<> self(this);
    endEdit(true);
    if (!self) return 1;
    const double total = totalRows();
    if (m == ScrollBar::upButtonPressedMsg) {
      showFrom(firstRow() > 0 ? firstRow() - 1 : 0);
    } else if (m == ScrollBar::downButtonPressedMsg) {
      showFrom(firstRow() + 1);
    } else if (m == ScrollBar::thumbMovedMsg || m == ScrollBar::thumbReleasedMsg) {
      showFrom(static_cast<unsigned>(std::max(0L, std::lround(bar_->getThumbPos() * total))));
    }
    return 1;
  }
  if (sender && editor_.refersTo(dynamic_cast<CellEditor*>(sender))) {
    endEdit(m == CellEditor::commitMsg);
    return 1;
  }
  if (sender && chooser_.refersTo(dynamic_cast<ChoiceList*>(sender))) {
    const XY<int> cell = editCell_;
    endEdit(false);
    if (m == ChoiceList::pickedMsg) store(cell, e->payload());
    return 1;
  }
  return rect::react(e);
}

int DataTable::handleMouseEvent(Event* e) {
  if (mouse_wheel_event(e)) return bar_->react(e);
  if (!mouse_left_event(e) || !isActive()) return rect::react(e);
  if (mouse_down_event(e)) return handleLeftPress(e);
  if (mouse_move_event(e)) {
    handleDrag(e);
    return 1;
  }
  if (mouse_up_event(e)) handleRelease();
  return 1;
}

int DataTable::handleLeftPress(Event* e) {
  GlobHandle<> self(this);
  endEdit(true);
  if (!self) return 1;
  drag_ = Drag::None;
  if (e->pos.y >= rowsTop()) {
    const int edge = layout().edgeAt(e->pos.x);
    if (edge >= 0 && columns_[static_cast<size_t>(edge)].isResizeable()) {
      drag_ = Drag::Resize;
      dragColumn_ = edge;
      resizeStartWidth_ = columns_[static_cast<size_t>(edge)].getWidth();
    }
    return 1;
  }
  set_kbd_focus();
  const XY<int> cell = cellAt(e->pos);
  if (cell.x < 0 || !supplier_) return 1;
  const auto row = static_cast<unsigned>(cell.y);
  if (row == rowCount()) {
    addRow();
    return 1;
  }
  const double now = clock();
  if (cell == lastPressCell_ && now - lastPressTime_ < kSecondClickMs) {
    lastPressTime_ = -1e18;
    beginEdit(cell);
    return 1;
  }
  lastPressTime_ = now;
  lastPressCell_ = cell;

  const bool moved = !(cell == current_);
  setCurrentCell(cell);
  if (moved && !tellOwner(currentCellMsg)) return 1;
  if (!supplier_ || row >= rowCount()) return 1;  // the owner changed the data
  if (modifierHeld(OSKeyboard::kCtrl)) {
    toggleTag(row);
  } else if (modifierHeld(OSKeyboard::kShift)) {
    tagRange(anchorRow_, row);
  } else {
    anchorRow_ = row;
    tagOnly(row);
  }
  if (!self) return 1;
  if (cell.x < static_cast<int>(columns_.size()) &&
      columns_[static_cast<size_t>(cell.x)].canSwapItems()) {
    drag_ = Drag::Row;
    dragRow_ = row;
    dragColumn_ = cell.x;
    dragSwapped_ = false;
  }
  return 1;
}

void DataTable::handleDrag(Event* e) {
  if (drag_ == Drag::Resize && dragColumn_ < static_cast<int>(columns_.size())) {
    const int w = std::clamp(resizeStartWidth_ + e->distance().x, 0, 0xFFFF);
    columns_[static_cast<size_t>(dragColumn_)].setWidth(static_cast<unsigned short>(w));
    offset_ = layout().offset();
    update();
    return;
  }
  if (drag_ != Drag::Row || !supplier_) return;
  const unsigned rows = rowCount();
  if (rows == 0 || dragRow_ >= rows) {
    drag_ = Drag::None;
    return;
  }
  const long fromTop =
      static_cast<long>(std::floor(double(rowsTop() - 1 - e->pos.y) / rowHeight()));
  const long target = std::clamp(static_cast<long>(firstRow()) + fromTop, 0L, long(rows) - 1);
  while (static_cast<long>(dragRow_) != target) {
    const unsigned next = static_cast<long>(dragRow_) < target ? dragRow_ + 1 : dragRow_ - 1;
    supplier_->swapFields(dragRow_, next, static_cast<unsigned>(dragColumn_));
    dragRow_ = next;
    dragSwapped_ = true;
  }
  version_ = supplier_->getDataVersion();  // our own swaps
  setCurrentCell(XY<int>(current_.x, static_cast<int>(dragRow_)));
  update();
}

void DataTable::handleRelease() {
  const Drag drag = drag_;
  drag_ = Drag::None;
  if (drag == Drag::Row && dragSwapped_) tellOwner(rowsSwappedMsg);
  if (drag == Drag::Resize) tellOwner(columnResizedMsg);
}

int DataTable::handleKey(unsigned key) {
  if (!supplier_ || columns_.empty()) return 0;
  const int page = std::max(1, visibleRows() - 1);
  switch (key) {
    case kKeyUp:
      moveCurrent(0, -1);
      return 1;
    case kKeyDown:
      moveCurrent(0, 1);
      return 1;
    case kKeyLeft:
      moveCurrent(-1, 0);
      return 1;
    case kKeyRight:
      moveCurrent(1, 0);
      return 1;
    case kKeyPageUp:
      moveCurrent(0, -page);
      return 1;
    case kKeyPageDown:
      moveCurrent(0, page);
      return 1;
    case kKeyHome:
      moveCurrent(0, -current_.y);
      return 1;
    case kKeyEnd:
      moveCurrent(0, static_cast<int>(totalRows()));
      return 1;
    case kKeyReturn:
      if (current_.y == static_cast<int>(rowCount()))
        addRow();
      else
        beginEdit(current_);
      return 1;
    case kKeySpace:
      toggleTag(static_cast<unsigned>(current_.y));
      return 1;
    default:
      return 0;
  }
}

void DataTable::moveCurrent(int dx, int dy) {
  const int last = static_cast<int>(totalRows()) - 1;
  if (last < 0) return;
  XY<int> cell(current_.x, std::clamp(current_.y + dy, 0, last));
  if (dx != 0) cell.x = layout().neighbour(current_.x, dx);
  const bool moved = !(cell == current_);
  setCurrentCell(cell);
  if (moved) tellOwner(currentCellMsg);
}

// --- Help under the pointer ---

String DataTable::contextString(const XY<int>& pos, CanvasClient* asker) {
  const XY<int> cell = cellAt(pos);
  if (supplier_ && cell.x >= 0 && cell.y < static_cast<int>(rowCount())) {
    const WString text = supplier_->contextString(cell);
    if (!text.empty()) return Kw::toUtf8(text);
  }
  return rect::contextString(pos, asker);
}

MouseCursorID DataTable::contextCursor(const XY<int>& pos) {
  if (pos.y >= rowsTop()) {
    const int edge = layout().edgeAt(pos.x);
    if (edge >= 0 && columns_[static_cast<size_t>(edge)].isResizeable()) {
      return kCursorResizeHorizontal;
    }
    return kCursorArrow;
  }
  const XY<int> cell = cellAt(pos);
  if (supplier_ && cell.x >= 0 && cell.y < static_cast<int>(rowCount())) {
    const Kw::Box<int> box = cellBox(cell);
    return supplier_->contextCursor(cell, XY<int>(pos.x - box.x0, pos.y - box.y0));
  }
  return rect::contextCursor(pos);
}

String DataTable::describeValue() const {
  return std::to_string(rowCount()) + " rows, current " + std::to_string(current_.x) + "," +
         std::to_string(current_.y);
}

// --- Drawing ---

void DataTable::draw() {
  Glib::Painter p(*canvas());
  const Glib::TableLook look(getPalette());
  const int view = viewWidth();
  look.well(p, Kw::Box<int>(0, 0, view, height()), isActive());
  if (columns_.empty()) return;
  const TableLayout l = layout();
  const auto standard = Glib::fonts().standard();
  const int top = rowsTop();

  for (const TableLayout::Span& s : l.spans()) {
    if (!s.visible()) continue;
    p.pushClip(Kw::Box<int>(s.clipX0, top, s.clipX1, height()));
    const char* name = supplier_ ? supplier_->getFieldName(static_cast<unsigned>(s.column)) : "";
    look.header(p, Kw::Box<int>(s.x0, top, s.x1, height()), Kw::toWide(name ? name : ""), *standard,
                columns_[static_cast<size_t>(s.column)].getAlignment(), isActive());
    p.popClip();
  }
  if (!supplier_) return;

  const int rh = rowHeight();
  const unsigned rows = rowCount();
  const unsigned first = firstRow();
  const bool focused = hasKbdFocus();
  DataSupplier::CellDrawContext ctx;
  for (int i = 0; top - i * rh > 0; ++i) {
    const unsigned row = first + static_cast<unsigned>(i);
    const int y1 = top - i * rh;
    const int y0 = y1 - rh;
    if (row >= rows) {
      if (showAddRow_ && row == rows) look.addRow(p, Kw::Box<int>(0, y0, view, y1), *standard);
      break;
    }
    const bool tagged = supplier_->getTag(row);
    for (const TableLayout::Span& s : l.spans()) {
      if (!s.visible()) continue;
      const DataColumn& column = columns_[static_cast<size_t>(s.column)];
      const Glib::TableLook columnLook(column.getPalette(getPalette()));
      const XY<int> cell(s.column, static_cast<int>(row));
      const Kw::Box<int> box(s.x0, y0, s.x1, y1);
      const bool readOnly = column.isReadOnly() || supplier_->isReadOnly(cell);
      const auto font = Glib::fonts().get(supplier_->getFont(cell));
      p.pushClip(Kw::Box<int>(s.clipX0, std::max(0, y0), s.clipX1, y1));
      columnLook.cell(p, box,
                      columnLook.cellFace(column.getCol(columnLook.defaultCell()),
                                          static_cast<int>(row), tagged));
      ctx.cell = cell;
      ctx.box = box;
      ctx.textBox =
          Kw::Box<int>(s.x0 + DataColumn::textMargin, y0, s.x1 - DataColumn::textMargin, y1);
      ctx.palette = &column.getPalette(getPalette());
      ctx.font = font.get();
      ctx.textColour = columnLook.cellText(tagged, readOnly, isActive());
      ctx.tagged = tagged;
      ctx.current = cell == current_;
      ctx.focused = focused;
      ctx.readOnly = readOnly;
      const Glib::TextStyles::TextStyle style = supplier_->getTextStyle(cell);
      CellRenderer renderer(p, ctx, column.getAlignment(), style);
      if (!supplier_->drawField(renderer, ctx)) {
        renderer.standardText(supplier_->getFieldText(cell).getWString());
      }
      columnLook.columnLine(p, s.x1 - 1, y0, y1);
      p.popClip();
    }
  }
  if (l.stickyWidth() > 0 && l.stickyWidth() < l.totalWidth()) {
    look.stickyEdge(p, std::min(view - 1, l.stickyWidth() - 1), 0, height());
  }
  const Kw::Box<int> current = cellBox(current_);
  if (current.width() > 0 && current_.y < static_cast<int>(rows)) {
    look.currentCell(p, current, focused);
  }
}
