#pragma once
// A record set over one table of an SQLite database file.
//
// - Opening reads the schema and the row count; rows are read a page (kPageRows rows) at a
//   time when asked for, and the last kCachedPages pages are kept.
// - Rows are shown in the order of the order column (given at opening, "position" unless
//   said otherwise) when the table has it, else in the order they were inserted. The order
//   column itself is not shown. When it holds whole numbers from 0 under a unique index and
//   no NULLs, the rows are counted and found by their key: opening and reading the end of a
//   million rows cost what they cost for a hundred. A page read that way that finds a gap in
//   the numbers switches to counting the rows and finding pages by counting from the start
//   (the version changes, and the row count may shrink).
// - Every statement binds its values; table and column names are checked against the schema
//   before they are put into a statement, and quoted.
// - A store checks the text against the column's type (an integer column takes only whole
//   numbers, a number column only finite numbers; empty text stores NULL in either), then
//   writes it in a transaction: if anything fails (a constraint, a trigger, a read-only
//   file), the transaction is rolled back, the failure is reported as a diagnostic and
//   `lastError()`, and the store returns false.
// - Swapping two rows exchanges their order values in one transaction; it needs the order
//   column. Swapping a row with itself changes nothing and succeeds.
// - A missing, unreadable or corrupt file, or a missing table, gives an empty record set that
//   refuses every change, with a diagnostic. A file that cannot be written is opened for
//   reading only: its stores and swaps are refused.
#include <sqlite3.h>

#include <list>
#include <vector>

#include "lists/oledb.h"
#include "platform/kw/String.h"

class SqliteRecordSet : public oledb {
 public:
  static constexpr unsigned kPageRows = 128;
  static constexpr unsigned kCachedPages = 8;
  static constexpr const char* kDefaultOrderColumn = "position";

  SqliteRecordSet(const String& path, const String& table,
                  const String& orderColumn = kDefaultOrderColumn);
  ~SqliteRecordSet() override;
  SqliteRecordSet(const SqliteRecordSet&) = delete;
  SqliteRecordSet& operator=(const SqliteRecordSet&) = delete;

  bool isOpen() const { return db_ != nullptr; }
  bool isWritable() const { return writable_; }
  bool hasOrderColumn() const { return hasOrder_; }
  // Whether pages are found by their key (see above).
  bool readsByKey() const { return dense_; }
  // The last failure, or "" when there was none.
  const String& lastError() const { return error_; }
  // Forgets the cached pages and counts the rows again (after changes made elsewhere).
  void refresh();
  // How many pages have been read from the file since opening; for tests and measurements.
  unsigned long pagesRead() const { return pagesRead_; }

  // --- oledb ---
  unsigned int rowCount() const override { return rowCount_; }
  unsigned int fieldCount() const override { return static_cast<unsigned>(fields_.size()); }
  const char* fieldName(unsigned int column) const override;
  char fieldTypeCode(unsigned int column) const override;
  const char* text(unsigned int row, unsigned int column) override;
  bool storeText(unsigned int row, unsigned int column, const char* text) override;
  bool swapRows(unsigned int rowA, unsigned int rowB) override;
  unsigned long version() const override { return version_; }

  // The one-letter code for a declared column type.
  static char typeCodeOf(const String& declaredType);
  // An identifier quoted for a statement.
  static String quoted(const String& identifier);

 private:
  struct Field {
    String name;
    char code = '?';
    sqlite3_stmt* update = nullptr;  // prepared on the first store
  };
  struct Page {
    unsigned first = 0;
    std::vector<sqlite3_int64> rowids;
    std::vector<sqlite3_int64> order;  // the order values, when there is an order column
    std::vector<String> cells;         // row-major, fieldCount() per row
  };

  bool open(const String& path);
  bool readSchema();
  bool countRows();
  bool uniqueOrder();
  bool countByKey();
  bool pageIsDense(const Page& page) const;
  bool prepareSelect();
  void fail(const String& what);
  void close();
  const Page* pageOf(unsigned row);
  bool loadPage(unsigned first, Page& page);
  void forgetRows(unsigned rowA, unsigned rowB);
  bool exec(const char* sql);
  bool bindForField(sqlite3_stmt* st, int index, const Field& field, const char* text);
  bool runInTransaction(const std::vector<sqlite3_stmt*>& statements);

  sqlite3* db_ = nullptr;
  String table_;
  String orderColumn_;
  bool hasOrder_ = false;
  bool dense_ = false;
  bool orderHasGaps_ = false;  // found by a page read: count instead
  bool writable_ = false;
  std::vector<Field> fields_;
  unsigned rowCount_ = 0;
  unsigned long version_ = 0;
  unsigned long pagesRead_ = 0;
  sqlite3_stmt* select_ = nullptr;
  sqlite3_stmt* setOrder_ = nullptr;  // order = ?1 where rowid = ?2
  sqlite3_stmt* minOrder_ = nullptr;
  std::list<Page> pages_;  // most recently used first
  String error_;
};
