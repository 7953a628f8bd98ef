#pragma once
// A supplier in memory for table tests: numbered rows, tags, read-only cells, choices and a
// record of what the table asked and stored.
#include <algorithm>
#include <map>
#include <set>
#include <vector>

#include "lists/DataSupplier.h"

class MemorySupplier : public DataSupplier {
 public:
  explicit MemorySupplier(unsigned rows, unsigned columns = 3) : rows_(rows), columns_(columns) {}

  // The text of an unchanged cell.
  static String textOf(XY<int> cell) {
    return "r" + std::to_string(cell.y) + "c" + std::to_string(cell.x);
  }

  Text getFieldText(const XY<int>& cell) override {
    ++textAsks;
    highestRowAsked = std::max(highestRowAsked, cell.y);
    if (cell.y < 0 || cell.y >= static_cast<int>(rows_)) return Text(String());
    const auto it = edits.find({cell.x, order(cell.y)});
    return Text(it != edits.end() ? it->second : textOf(XY<int>(cell.x, order(cell.y))));
  }
  unsigned int getNumFields() const override { return columns_; }
  unsigned int getSize() const override { return rows_; }
  unsigned long getDataVersion() const override { return version; }
  void storeFieldText(const char* text, const XY<int>& cell) override {
    stores.push_back({cell, text});
    edits[{cell.x, order(cell.y)}] = text;
  }
  bool requestAddRow() override {
    if (!agreeToAdd) return false;
    ++rows_;
    return true;
  }
  const char* getFieldName(unsigned int column) override {
    static const char* names[] = {"Name", "Length", "Kind", "Extra"};
    return column < 4 ? names[column] : "";
  }
  bool getTag(unsigned int row) const override { return tags.count(row) != 0; }
  void setTags(const std::map<unsigned int, bool>& t) override {
    ++setTagCalls;
    for (const auto& [row, on] : t) {
      if (on)
        tags.insert(row);
      else
        tags.erase(row);
    }
  }
  void swapFields(unsigned int a, unsigned int b, unsigned int column) override {
    swaps.push_back({a, b, column});
    while (order_.size() < rows_) order_.push_back(static_cast<int>(order_.size()));
    if (a < rows_ && b < rows_) std::swap(order_[a], order_[b]);
  }
  bool isReadOnly(const XY<int>& cell) const override {
    return readOnlyCells.count({cell.x, cell.y});
  }
  WString contextString(const XY<int>& cell) override {
    return cell.x == 0 ? L"row " + std::to_wstring(cell.y) : WString();
  }
  MouseCursorID contextCursor(const XY<int>& cell, const XY<int>&) override {
    return cell.x == 1 ? kCursorHand : kCursorArrow;
  }
  void getFieldChoices(const XY<int>& cell, std::vector<WString>& out) override {
    if (cell.x == 2) out = {L"audio", L"video", L"still"};
  }

  void setRows(unsigned rows) { rows_ = rows; }

  int textAsks = 0;
  int highestRowAsked = -1;
  int setTagCalls = 0;
  unsigned long version = 1;
  bool agreeToAdd = false;
  std::set<unsigned> tags;
  std::set<std::pair<int, int>> readOnlyCells;
  std::vector<std::pair<XY<int>, String>> stores;
  struct Swap {
    unsigned a, b, column;
  };
  std::vector<Swap> swaps;
  std::map<std::pair<int, int>, String> edits;

 private:
  int order(int row) const {
    return row >= 0 && row < static_cast<int>(order_.size()) ? order_[static_cast<size_t>(row)]
                                                             : row;
  }

  unsigned rows_;
  unsigned columns_;
  std::vector<int> order_;
};
