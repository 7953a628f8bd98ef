// The gallery's colour chips dragged onto its well with the mouse.
#include <gtest/gtest.h>

#include "gallery/ColourChip.h"
#include "gallery/ColourWell.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

TEST(ColourDrag, AChipDroppedOnTheWellColoursItAndReports) {
  Harness h(300, 200);
  auto* probe = new MessageProbe(h.place(0, 0, 300, 200));
  auto* chip = new ColourChip(GlobCreationInfo(30, 30, probe->canvas(), 10, 10), 0x5CB85C);
  auto* well = new ColourWell(GlobCreationInfo(50, 40, probe->canvas(), 200, 10), 0x808080);
  auto wellPixels = [&h] {
    std::vector<uint32_t> px;
    for (int y = 10; y < 50; ++y) {
      for (int x = 200; x < 250; ++x) px.push_back(h.pixelAt(x, y));
    }
    return px;
  };
  h.render();
  const std::vector<uint32_t> before = wellPixels();
  h.press(Harness::centreOf(*chip));
  h.move(XY<int>(120, 30));
  h.move(Harness::centreOf(*well));
  EXPECT_TRUE(well->isDropHovered());
  h.render();
  EXPECT_NE(wellPixels(), before);  // the look's ring says it would take it
  h.release(Harness::centreOf(*well));
  EXPECT_EQ(well->rgb(), 0x5CB85Cu);
  EXPECT_FALSE(well->isDropHovered());
  ASSERT_FALSE(probe->texts().empty());
  EXPECT_EQ(probe->texts().back(), "colour dropped #5CB85C");
}

}  // namespace
