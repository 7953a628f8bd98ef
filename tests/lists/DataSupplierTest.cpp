#include <gtest/gtest.h>

#include <map>

#include "lists/DataColumn.h"
#include "lists/OledbDataSupplier.h"
#include "platform/misc/Diagnostics.h"

namespace {

// A supplier that writes only what it must.
class PureSupplier : public DataSupplier {
 public:
  Text getFieldText(const XY<int>& cell) override { return Text(L"cell"); }
  unsigned int getNumFields() const override { return 2; }
  unsigned int getSize() const override { return 3; }
  unsigned long getDataVersion() const override { return 0; }
};

// A record set in memory that counts what reaches it.
class MemoryRecordSet : public oledb {
 public:
  std::vector<std::vector<String>> rows{{"a", "1"}, {"b", "2"}, {"c", "3"}};
  String codes = "al";
  int swaps = 0;
  int stores = 0;

  unsigned int rowCount() const override { return static_cast<unsigned>(rows.size()); }
  unsigned int fieldCount() const override { return 2; }
  const char* fieldName(unsigned int c) const override { return c == 0 ? "name" : "count"; }
  char fieldTypeCode(unsigned int c) const override { return c < codes.size() ? codes[c] : '?'; }
  const char* text(unsigned int r, unsigned int c) override {
    return r < rows.size() && c < 2 ? rows[r][c].c_str() : "";
  }
  bool storeText(unsigned int r, unsigned int c, const char* t) override {
    ++stores;
    if (r >= rows.size() || c >= 2) return false;
    rows[r][c] = t;
    return true;
  }
  bool swapRows(unsigned int a, unsigned int b) override {
    ++swaps;
    if (a >= rows.size() || b >= rows.size()) return false;
    std::swap(rows[a], rows[b]);
    return true;
  }
  unsigned long version() const override { return static_cast<unsigned long>(swaps); }
};

}  // namespace

TEST(DataSupplier, OnlyThePureOperationsGiveEditablePlainCells) {
  PureSupplier s;
  const XY<int> cell(1, 2);
  EXPECT_EQ(s.getFieldType(cell), DataSupplier::UnknownField);
  EXPECT_FALSE(s.requestAddRow());
  EXPECT_STREQ(s.getFieldName(0), "");
  EXPECT_FALSE(s.getTag(2));
  EXPECT_FALSE(s.isReadOnly(cell));
  EXPECT_EQ(s.getFont(cell), Glib::FontDesc());
  EXPECT_EQ(s.getFont(cell).size, Glib::kDefaultFontSize);
  EXPECT_TRUE(s.getFont(cell).face.empty());
  EXPECT_EQ(s.getFont(cell).style, Glib::FontDesc::Plain);
  EXPECT_TRUE(s.contextString(cell).empty());
  EXPECT_EQ(s.contextCursor(cell, XY<int>(3, 3)), kCursorArrow);
  EXPECT_EQ(static_cast<int>(s.getTextStyle(cell)), 1);
  std::vector<WString> choices;
  s.getFieldChoices(cell, choices);
  EXPECT_TRUE(choices.empty());
  // The defaults that take input change nothing and do not fail.
  s.storeFieldText("x", cell);
  s.setTags({{0, true}});
  s.swapFields(0, 1, 0);
  EXPECT_FALSE(s.getTag(0));
}

TEST(DataSupplier, TextInBothForms) {
  const DataSupplier::Text wide(L"\u00e9t\u00e9");
  EXPECT_TRUE(wide.isWide());
  EXPECT_EQ(wide.getString(), "\xc3\xa9t\xc3\xa9");
  EXPECT_STREQ(static_cast<const char*>(wide), "\xc3\xa9t\xc3\xa9");
  EXPECT_EQ(wide.getWString(), L"\u00e9t\u00e9");

  const char* kept = "caf\xc3\xa9";
  const DataSupplier::Text borrowed(kept);
  EXPECT_FALSE(borrowed.isWide());
  EXPECT_EQ(static_cast<const char*>(borrowed), kept);  // the supplier's own characters
  EXPECT_EQ(borrowed.getWString(), L"caf\u00e9");

  const DataSupplier::Text owned(String("own"));
  EXPECT_EQ(owned.getString(), "own");
  EXPECT_STREQ(static_cast<const char*>(DataSupplier::Text(static_cast<const char*>(nullptr))), "");
  EXPECT_EQ(DataSupplier::Text().getWString(), L"");
}

TEST(DataColumn, WidthsLineHeightAndFlags) {
  DataColumn c;
  EXPECT_EQ(c.getWidth(), DataColumn::kDefaultWidth);
  EXPECT_EQ(DataColumn::textMargin, 4);
  c.setWidth(5);  // below the minimum
  EXPECT_EQ(c.getWidth(), c.getMinWidth());
  c.setMinWidth(150);  // widens the column
  EXPECT_EQ(c.getWidth(), 150);
  c.setMinWidth(0);  // never narrower than its margins
  EXPECT_EQ(c.getMinWidth(), 2 * DataColumn::textMargin + 1);

  Diagnostics::Capture diag;
  EXPECT_FALSE(c.setLineHeight(0));
  EXPECT_FALSE(c.setLineHeight(1000));
  EXPECT_EQ(c.getLineHeight(), DataColumn::kDefaultLineHeight);
  EXPECT_EQ(diag.lines().size(), 2u);
  EXPECT_TRUE(c.setLineHeight(30));
  EXPECT_EQ(c.getLineHeight(), 30);

  EXPECT_FALSE(c.hasColour());
  EXPECT_EQ(c.getCol(Colour::fromHex(0x102030)), Colour::fromHex(0x102030));
  c.setColour(Colour::fromHex(0xABCDEF));
  EXPECT_EQ(c.getCol(Colour::fromHex(0x102030)), Colour::fromHex(0xABCDEF));
  EXPECT_EQ(c.getPalette(Palette::light()), Palette::light());
  c.setPalette(Palette::dark());
  EXPECT_EQ(c.getPalette(Palette::light()), Palette::dark());

  EXPECT_FALSE(c.isReadOnly());
  c.setReadOnly(DataColumn::ReadOnly);
  EXPECT_TRUE(c.isReadOnly());
  EXPECT_FALSE(c.isSticky());
  EXPECT_TRUE(c.isResizeable());
  EXPECT_FALSE(c.canSwapItems());
  EXPECT_FALSE(c.canEditTaggedItems());
}

TEST(OledbDataSupplier, TypeCodesTranslate) {
  const std::map<char, DataSupplier::eFieldType> table = {
      {'A', DataSupplier::eFieldType(5)}, {'M', DataSupplier::eFieldType(7)},
      {'a', DataSupplier::eFieldType(2)}, {'l', DataSupplier::eFieldType(4)},
      {'n', DataSupplier::eFieldType(4)}, {'t', DataSupplier::eFieldType(6)},
      {'x', DataSupplier::eFieldType(0)}, {'\0', DataSupplier::eFieldType(0)},
      {'L', DataSupplier::eFieldType(0)}, {'b', DataSupplier::eFieldType(0)}};
  for (const auto& [code, type] : table) {
    EXPECT_EQ(OledbDataSupplier::typeFromCode(code), type) << "code " << int(code);
  }
  MemoryRecordSet rs;
  OledbDataSupplier s(rs);
  EXPECT_EQ(s.getFieldType(XY<int>(0, 0)), DataSupplier::TextField);
  EXPECT_EQ(s.getFieldType(XY<int>(1, 0)), DataSupplier::NumberField);
  EXPECT_EQ(s.getFieldType(XY<int>(7, 0)), DataSupplier::UnknownField);  // an unknown code
}

TEST(OledbDataSupplier, ForwardsToTheRecordSet) {
  MemoryRecordSet rs;
  OledbDataSupplier s(rs);
  EXPECT_EQ(s.getSize(), 3u);
  EXPECT_EQ(s.getNumFields(), 2u);
  EXPECT_STREQ(s.getFieldName(1), "count");
  EXPECT_EQ(s.getFieldText(XY<int>(0, 1)).getString(), "b");
  EXPECT_FALSE(s.getFieldText(XY<int>(0, 1)).isWide());
  EXPECT_EQ(s.getFieldText(XY<int>(0, 99)).getString(), "");  // beyond the rows
  EXPECT_EQ(s.getFieldText(XY<int>(-1, -1)).getString(), "");

  s.storeFieldText("it's; DROP TABLE x; --", XY<int>(0, 2));
  EXPECT_EQ(rs.rows[2][0], "it's; DROP TABLE x; --");

  s.swapFields(0, 2, 1);
  EXPECT_EQ(rs.swaps, 1);
  EXPECT_EQ(rs.rows[0][0], "it's; DROP TABLE x; --");
  EXPECT_EQ(s.getDataVersion(), 1u);
}

TEST(OledbDataSupplier, EqualRowsAreNeverSwapped) {
  MemoryRecordSet rs;
  OledbDataSupplier s(rs);
  s.swapFields(1, 1, 0);
  s.swapFields(0, 0, 5);
  EXPECT_EQ(rs.swaps, 0);
  EXPECT_EQ(rs.rows[1][0], "b");
}
