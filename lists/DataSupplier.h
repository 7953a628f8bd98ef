#pragma once
// Where a table's cells come from. A table never owns its data: it asks its supplier for the
// number of rows and columns and for each cell's text, type, font, style, read-only state,
// tooltip and cursor, and hands edits, tag changes and row swaps back to it. Cells are
// addressed by an XY<int> whose x is the column (field) and whose y is the row.
//
// Only the four pure operations must be written; every other one has a default that gives
// editable, untagged, unstyled cells with the arrow cursor and no choices.
//
// Decisions where the behaviour was left open:
// - The second pure operation is `getNumFields()`, the number of columns the supplier has;
//   the fourth is `getDataVersion()`, a number the supplier changes whenever rows come, go or
//   move other than through the table. A table that sees it change re-reads its row count and
//   drops an edit in progress, whose row may now hold something else.
// - `swapFields`' third argument is the column in which the user dragged the row.
// - A supplier may be asked for cells beyond its rows (a table showing the end while rows are
//   taken away); it answers with empty text.
// - The field types name what the text holds; a table does not interpret them.
#include <map>
#include <utility>
#include <vector>

#include "platform/glib/FontDesc.h"
#include "platform/glib/TextAlignment.h"
#include "platform/glib/TextStyles.h"
#include "platform/glob/Colour.h"
#include "platform/glob/MouseCursorID.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"
#include "platform/kw/XY.h"

class Palette;

namespace Glib {
class iFont;
}

class DataSupplier {
 public:
  enum eFieldType : int {
    UnknownField = 0,  // anything else; shown as text
    BoolField = 1,
    TextField = 2,  // short text
    IntegerField = 3,
    NumberField = 4,    // integers and reals, right-aligned
    LongTextField = 5,  // text of any length
    TimeField = 6,      // dates and times
    MemoField = 7,      // text of several lines
  };

  // A cell's text, either wide or narrow (UTF-8). A narrow text points at characters owned
  // either by the Text itself or, for suppliers that keep their strings alive, by the supplier.
  class Text {
   public:
    Text() = default;
    Text(WString wide) : wide_(std::move(wide)), isWide_(true) {}
    Text(const wchar_t* wide) : wide_(wide ? wide : L""), isWide_(true) {}
    // Keeps its own copy.
    Text(String narrow) : narrowCopy_(std::move(narrow)) {}
    // Points at characters the supplier keeps alive at least until the next call.
    Text(const char* narrow) : narrow_(narrow) {}

    bool isWide() const { return isWide_; }
    // The text as a narrow string, whatever its form.
    String getString() const;
    // The narrow characters; a wide text gives its UTF-8 form.
    operator const char*() const;
    // The wide text; a narrow text is converted on first use.
    const WString& getWString() const;

   private:
    mutable WString wide_;  // a narrow text's wide form is made when asked
    bool isWide_ = false;
    String narrowCopy_;
    const char* narrow_ = nullptr;
    mutable String converted_;           // a wide text's UTF-8 form, made when asked
    mutable bool hasConverted_ = false;  // the other form has been made
  };

  // What a supplier may draw a custom cell with. Boxes are in the table's coordinates.
  class iCellRenderer {
   public:
    virtual ~iCellRenderer() = default;
    virtual void fill(const Kw::Box<int>& box, const Colour& colour) = 0;
    virtual void outline(const Kw::Box<int>& box, const Colour& colour) = 0;
    // One line of text, centred vertically in `box` and clipped to it.
    virtual void text(const WString& s, const Kw::Box<int>& box, const Glib::iFont& font,
                      const Colour& colour, TextAlignment align) = 0;
    // The table's standard drawing of the cell's text, for suppliers that add to it.
    virtual void standardText(const WString& s) = 0;
  };

  // The cell being drawn and how the table shows it.
  struct CellDrawContext {
    XY<int> cell;          // column, row
    Kw::Box<int> box;      // the cell's box in the table
    Kw::Box<int> textBox;  // the box inside the text margins
    const Palette* palette = nullptr;
    const Glib::iFont* font = nullptr;
    Colour textColour;
    bool tagged = false;
    bool current = false;  // the keyboard's current cell
    bool focused = false;  // the table holds the keyboard focus
    bool readOnly = false;
  };

  virtual ~DataSupplier() = default;

  // --- The operations, in slot order ---
  virtual Text getFieldText(const XY<int>& cell) = 0;
  virtual unsigned int getNumFields() const = 0;
  virtual unsigned int getSize() const = 0;
  virtual unsigned long getDataVersion() const = 0;
  virtual eFieldType getFieldType(const XY<int>& cell) { return UnknownField; }
  virtual void storeFieldText(const char* text, const XY<int>& cell) {}
  virtual bool requestAddRow() { return false; }
  virtual const char* getFieldName(unsigned int column) { return ""; }
  virtual bool getTag(unsigned int row) const { return false; }
  virtual void setTags(const std::map<unsigned int, bool>& tags) {}
  virtual void swapFields(unsigned int rowA, unsigned int rowB, unsigned int column) {}
  virtual bool isReadOnly(const XY<int>& cell) const { return false; }
  virtual Glib::FontDesc getFont(const XY<int>& cell) { return Glib::FontDesc(); }
  virtual WString contextString(const XY<int>& cell) { return WString(); }
  virtual MouseCursorID contextCursor(const XY<int>& cell, const XY<int>& point) {
    return kCursorArrow;
  }
  virtual Glib::TextStyles::TextStyle getTextStyle(const XY<int>& cell) {
    return Glib::TextStyles::Normal;
  }
  virtual bool drawField(iCellRenderer& renderer, CellDrawContext& context) { return false; }
  virtual void getFieldChoices(const XY<int>& cell, std::vector<WString>& choices) {}
};
