#include <gtest/gtest.h>

#include "panels/StandardPanel.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"

namespace {

// A panel of each border style with a child in each kind of surround.
GoldenResult renderBorder(UifTypeOfBorder border, const char* name) {
  Harness h(120, 70);
  StandardPanel panel(h.place(0, 0, 120, 70));
  panel.setBorderStyle(border);
  const WidgetSurround surrounds[] = {SurroundRaised, SurroundSunken, SurroundFramed};
  int x = 6;
  for (WidgetSurround s : surrounds) {
    auto* child = new StandardPanel(GlobCreationInfo(20, 14, panel.canvas()));
    child->setcol(panel.getPalette().get(Palette::Base), false);
    panel.addWidget(child, XY<int>(x, 6), OriginInnerBottomLeft, s);
    x += 34;
  }
  return GoldenImage::check(h, panel, name);
}

}  // namespace

TEST(PanelGolden, EachBorderStyle) {
  auto none = renderBorder(UifBorderNone, "panel_border_none");
  EXPECT_TRUE(none) << none.message;
  auto raised = renderBorder(UifBorderRaised, "panel_border_raised");
  EXPECT_TRUE(raised) << raised.message;
  auto framed = renderBorder(UifBorderFramed, "panel_border_framed");
  EXPECT_TRUE(framed) << framed.message;
  auto sunken = renderBorder(UifBorderSunken, "panel_border_sunken");
  EXPECT_TRUE(sunken) << sunken.message;
}
