#pragma once
// A record set of the application's database layer: rows of named, typed fields read and
// written as text. OledbDataSupplier shows one in a table; SqliteRecordSet is the library's
// own, over a table of an SQLite database file.
//
// Rules every record set keeps:
// - Rows and columns are counted from 0. Asking for a cell beyond the rows or columns gives
//   empty text; storing there or swapping such a row is refused (false, nothing changed).
// - A store or swap that fails leaves the records as they were and returns false.
// - `version` changes whenever rows come, go or change order.
//
// Field type codes: 'A' text of any length, 'M' memo, 'a' short text, 'l' integer, 'n'
// number, 't' date or time; other codes for anything else ('b' binary, '?' unknown).
class oledb {
 public:
  virtual ~oledb() = default;

  virtual unsigned int rowCount() const = 0;
  virtual unsigned int fieldCount() const = 0;
  // "" beyond the fields.
  virtual const char* fieldName(unsigned int column) const = 0;
  virtual char fieldTypeCode(unsigned int column) const = 0;
  // The text of one field; valid until the next call on the record set.
  virtual const char* text(unsigned int row, unsigned int column) = 0;
  virtual bool storeText(unsigned int row, unsigned int column, const char* text) = 0;
  virtual bool swapRows(unsigned int rowA, unsigned int rowB) = 0;
  virtual unsigned long version() const = 0;
};
