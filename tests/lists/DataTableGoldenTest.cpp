#include <gtest/gtest.h>

#include "lists/DataTable.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "tests/lists/TableTestSupport.h"

namespace {

// A supplier whose third column draws a bar of its own and whose first row is bold.
class StyledSupplier : public MemorySupplier {
 public:
  using MemorySupplier::MemorySupplier;
  Glib::FontDesc getFont(const XY<int>& cell) override {
    Glib::FontDesc f;
    if (cell.y == 0) f.style = Glib::FontDesc::Bold;
    return f;
  }
  bool drawField(iCellRenderer& r, CellDrawContext& c) override {
    if (c.cell.x != 2) return false;
    const int w = (c.box.width() - 8) * (c.cell.y % 5 + 1) / 5;
    r.fill(Kw::Box<int>(c.box.x0 + 4, c.box.y0 + 5, c.box.x0 + 4 + w, c.box.y1 - 5),
           Colour::fromHex(0x3C9A5F));
    return true;
  }
};

struct TableLook : ::testing::TestWithParam<bool> {
  TableLook() {
    if (GetParam()) {
      h.root().setPalette(Palette::light());
      parent.setPalette(Palette::light());
    }
  }
  Harness h{300, 160};
  MessageProbe parent{GlobCreationInfo(300, 160, h.canvas(), 0, 0)};
};

}  // namespace

// A sticky name column, a read-only right-aligned column, a custom column, two tagged rows,
// the focused current cell, a column of its own colour and the "add" row at the end.
TEST_P(TableLook, TableStates) {
  StyledSupplier s(5);
  auto* t = new DataTable(GlobCreationInfo(292, 152, parent.canvas(), 4, 4), &s);
  DataColumn name(80);
  name.setSticky(true);
  DataColumn length(70, TextAlignment::Right);
  length.setReadOnly(DataColumn::ReadOnly);
  DataColumn bar(90);
  DataColumn tinted(60);
  tinted.setColour(Colour::fromHex(0xA07C3C));
  t->setColumns({name, length, bar, tinted});
  t->setShowAddRow(true);
  s.tags = {1, 2};
  t->setCurrentCell(XY<int>(1, 3));
  t->set_kbd_focus();
  const GoldenResult r = GoldenImage::check(h, Kw::Box<int>(0, 0, 300, 160),
                                            String("table_states") + (GetParam() ? "_light" : ""));
  EXPECT_TRUE(r.ok) << r.message;
}

INSTANTIATE_TEST_SUITE_P(Palettes, TableLook, ::testing::Values(false, true),
                         [](const auto& info) { return info.param ? "light" : "dark"; });
