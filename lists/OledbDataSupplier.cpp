#include "lists/OledbDataSupplier.h"

DataSupplier::eFieldType OledbDataSupplier::typeFromCode(char code) {
  switch (code) {
    case 'A':
      return LongTextField;
    case 'M':
      return MemoField;
    case 'a':
      return TextField;
    case 'l':
    case 'n':
      return NumberField;
    case 't':
      return TimeField;
    default:
      return UnknownField;
  }
}

DataSupplier::Text OledbDataSupplier::getFieldText(const XY<int>& cell) {
  if (cell.x < 0 || cell.y < 0) return Text(String());
  const char* text = recordSet_.text(static_cast<unsigned>(cell.y), static_cast<unsigned>(cell.x));
  return Text(String(text ? text : ""));
}

DataSupplier::eFieldType OledbDataSupplier::getFieldType(const XY<int>& cell) {
  if (cell.x < 0) return UnknownField;
  return typeFromCode(recordSet_.fieldTypeCode(static_cast<unsigned>(cell.x)));
}

void OledbDataSupplier::storeFieldText(const char* text, const XY<int>& cell) {
  if (!text || cell.x < 0 || cell.y < 0) return;
  recordSet_.storeText(static_cast<unsigned>(cell.y), static_cast<unsigned>(cell.x), text);
}

void OledbDataSupplier::swapFields(unsigned int rowA, unsigned int rowB, unsigned int) {
  if (rowA == rowB) return;
  recordSet_.swapRows(rowA, rowB);
}
