#pragma once
// The gallery's clip table: the record-set supplier over the sample database, with what an
// application adds on top: tags kept in memory, a tooltip on the name, the tag column's
// choices, and the order column's swaps offered in the name column.
#include <set>

#include "lists/OledbDataSupplier.h"

class ClipSupplier : public OledbDataSupplier {
 public:
  using OledbDataSupplier::OledbDataSupplier;

  bool getTag(unsigned int row) const override { return tags_.count(row) != 0; }
  void setTags(const std::map<unsigned int, bool>& tags) override;
  WString contextString(const XY<int>& cell) override;
  void getFieldChoices(const XY<int>& cell, std::vector<WString>& choices) override;
  size_t tagCount() const { return tags_.size(); }

 private:
  std::set<unsigned> tags_;
};
