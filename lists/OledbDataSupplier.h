#pragma once
// A data supplier over a record set: rows, field names, texts, stores, field types and row
// swaps are forwarded to it; everything else keeps the supplier's defaults. The record set's
// one-letter type codes become field types: 'A' LongTextField (5), 'M' MemoField (7),
// 'a' TextField (2), 'l' and 'n' NumberField (4), 't' TimeField (6), any other UnknownField.
//
// The supplier keeps a reference: the record set must outlive it. Swapping a row with itself
// does not reach the record set at all.
#include "lists/DataSupplier.h"
#include "lists/oledb.h"

class OledbDataSupplier : public DataSupplier {
 public:
  explicit OledbDataSupplier(oledb& recordSet) : recordSet_(recordSet) {}

  static eFieldType typeFromCode(char code);
  oledb& recordSet() const { return recordSet_; }

  Text getFieldText(const XY<int>& cell) override;
  unsigned int getNumFields() const override { return recordSet_.fieldCount(); }
  unsigned int getSize() const override { return recordSet_.rowCount(); }
  unsigned long getDataVersion() const override { return recordSet_.version(); }
  eFieldType getFieldType(const XY<int>& cell) override;
  void storeFieldText(const char* text, const XY<int>& cell) override;
  const char* getFieldName(unsigned int column) override { return recordSet_.fieldName(column); }
  void swapFields(unsigned int rowA, unsigned int rowB, unsigned int column) override;

 private:
  oledb& recordSet_;
};
