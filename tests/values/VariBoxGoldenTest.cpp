// The value box's look, one golden image per meaningful state: the three appearances with
// their thermometers, in both palettes, and the dragging, inactive and editing looks.
#include <gtest/gtest.h>

#include <memory>
#include <vector>

#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "values/DecimalDisplayer.h"
#include "values/VariBox.h"
#include "values/VariBoxParserBasic.h"
#include "values/VariFriendlyTextBox.h"

namespace {

// Three boxes, one per appearance, stacked from the top, at 0.4 of their ranges.
std::vector<VariBox*> appearances(Harness& h, DecimalDisplayer<double>& shown) {
  std::vector<VariBox*> boxes;
  int y = 88;
  for (VariBox::eAppearance a : {VariBox::Standard, VariBox::Compact, VariBox::Flat}) {
    y -= VariBox::getDefaultHeight(a) + 4;
    VariBoxInitArgs args(h.place(6, y, 150, 0));
    args.appearance = a;
    auto* box = new VariBox(args);
    box->setParser(new VariBoxParserBasic<double>(box, &shown, 0.0, 1.0, 0.01, 0.1, 0.4, 0), true);
    boxes.push_back(box);
  }
  return boxes;
}

}  // namespace

TEST(VariBoxLook, AppearancesInBothPalettes) {
  DecimalDisplayer<double> shown(2);
  {
    Harness h(162, 90);
    appearances(h, shown);
    EXPECT_TRUE(GoldenImage::check(h, Kw::Box<int>(0, 0, 162, 90), "varibox_appearances"));
  }
  {
    Harness h(162, 90);
    h.root().setPalette(Palette::light());
    appearances(h, shown);
    EXPECT_TRUE(GoldenImage::check(h, Kw::Box<int>(0, 0, 162, 90), "varibox_appearances_light"));
  }
}

TEST(VariBoxLook, DraggingInactiveAndEditing) {
  DecimalDisplayer<double> shown(2);
  Harness h(162, 90);
  std::vector<VariBox*> boxes = appearances(h, shown);
  h.clickOn(*boxes[2]->getTextBox());
  ASSERT_TRUE(boxes[2]->getTextBox()->hasKbdFocus());
  boxes[1]->setActive(false, true);
  const XY<int> grip(6 + 150 - VariBox::kGripWidth / 2 - 1, Harness::centreOf(*boxes[0]).y);
  h.move(grip);
  h.press(grip);
  h.move(grip + XY<int>(0, 3));  // 0.5, in the dragging look
  ASSERT_TRUE(boxes[0]->isDragging());
  EXPECT_TRUE(GoldenImage::check(h, Kw::Box<int>(0, 0, 162, 90), "varibox_states"));
  h.release(grip + XY<int>(0, 3));
}
