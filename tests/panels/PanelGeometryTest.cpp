#include <gtest/gtest.h>

#include "panels/PanelGeometry.h"

namespace {

using Box = Kw::Box<int>;

PanelFrame frameOf(int flags, int w, int h, UifTypeOfBorder border) {
  return PanelFrame{flags, XY<int>(w, h), border};
}

}  // namespace

TEST(PanelGeometry, BorderWidthsByStyleAndUnknownStylesHaveNone) {
  EXPECT_EQ(PanelGeometry::borderSize(UifBorderNone), 0);
  EXPECT_EQ(PanelGeometry::borderSize(UifBorderRaised), 5);
  EXPECT_EQ(PanelGeometry::borderSize(UifBorderFramed), 10);
  EXPECT_EQ(PanelGeometry::borderSize(UifBorderSunken), 6);
  EXPECT_EQ(PanelGeometry::borderSize(static_cast<UifTypeOfBorder>(4)), 0);
  EXPECT_EQ(PanelGeometry::borderSize(static_cast<UifTypeOfBorder>(-1)), 0);
}

TEST(PanelGeometry, EightOriginsWithAndWithoutStrips) {
  struct Case {
    int flags;
    CoordinateOrigin origin;
    XY<int> expected;
  };
  // Border 6 (sunken), panel 200 x 100.
  const Case cases[] = {
      {0, OriginBottomLeft, {0, 0}},
      {0, OriginTopLeft, {0, 100}},
      {0, OriginBottomRight, {200, 0}},
      {0, OriginTopRight, {200, 100}},
      {0, OriginInnerBottomLeft, {6, 6}},
      {0, OriginInnerTopLeft, {6, 94}},
      {0, OriginInnerBottomRight, {194, 6}},
      {0, OriginInnerTopRight, {194, 94}},
      // Outer corners ignore the strips; inner ones move past them.
      {StdPootButton | StdDoItButton, OriginTopRight, {200, 100}},
      {StdPootButton | StdDoItButton, OriginInnerBottomLeft, {6, 33}},
      {StdPootButton | StdDoItButton, OriginInnerTopLeft, {6, 68}},
      {StdPootButton | StdDoItButton, OriginInnerBottomRight, {194, 33}},
      {StdPootButton | StdDoItButton, OriginInnerTopRight, {194, 68}},
      // Every title flag makes the title strip; only the do-it flag the bottom one.
      {StdSettingsButton, OriginInnerTopLeft, {6, 68}},
      {StdEditableTitleBox, OriginInnerTopLeft, {6, 68}},
      {StdDoItButton, OriginInnerTopLeft, {6, 94}},
      {StdTitleBox, OriginInnerBottomLeft, {6, 6}},
  };
  for (const Case& c : cases) {
    const XY<int> got =
        PanelGeometry::originXY(c.origin, frameOf(c.flags, 200, 100, UifBorderSunken));
    EXPECT_EQ(got, c.expected) << "flags " << c.flags << " origin " << c.origin;
  }
  EXPECT_EQ(PanelGeometry::originXY(static_cast<CoordinateOrigin>(8),
                                    frameOf(0, 200, 100, UifBorderSunken)),
            XY<int>(0, 0));
}

TEST(PanelGeometry, FramedBorderWithCloseAndDoItLeavesInsetsOf10_36_37) {
  const Box area =
      PanelGeometry::userArea(frameOf(StdPootButton | StdDoItButton, 300, 200, UifBorderFramed));
  EXPECT_EQ(area, Box(10, 37, 290, 164));
  EXPECT_EQ(PanelGeometry::titleStrip(frameOf(StdPootButton, 300, 200, UifBorderFramed)),
            Box(10, 164, 290, 190));
  EXPECT_EQ(PanelGeometry::bottomStrip(frameOf(StdDoItButton, 300, 200, UifBorderFramed)),
            Box(10, 10, 290, 37));
  EXPECT_TRUE(PanelGeometry::titleStrip(frameOf(StdDoItButton, 300, 200, UifBorderFramed)).empty());
  // Too small for its frame: an empty area, not a negative one that looks usable.
  EXPECT_TRUE(
      PanelGeometry::userArea(frameOf(StdPootButton | StdDoItButton, 15, 40, UifBorderFramed))
          .empty());
}

TEST(PanelGeometry, RelativePlacementForEachRelationAndAlignment) {
  const Box ref(100, 50, 140, 70);  // 40 x 20
  const XY<int> size(10, 6);
  struct Case {
    WidgetRelativity rel;
    WidgetAlignment align;
    Box expected;
  };
  const Case cases[] = {
      {PlaceRightOf, AlignBottom, Box(145, 50, 155, 56)},
      {PlaceRightOf, AlignTop, Box(145, 64, 155, 70)},
      {PlaceRightOf, AlignCentre, Box(145, 57, 155, 63)},
      {PlaceLeftOf, AlignBottom, Box(85, 50, 95, 56)},
      {PlaceLeftOf, AlignCentre, Box(85, 57, 95, 63)},
      {PlaceAbove, AlignLeft, Box(100, 75, 110, 81)},
      {PlaceAbove, AlignRight, Box(130, 75, 140, 81)},
      {PlaceAbove, AlignCentre, Box(115, 75, 125, 81)},
      {PlaceBelow, AlignLeft, Box(100, 39, 110, 45)},
      {PlaceBelow, AlignCentre, Box(115, 39, 125, 45)},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(PanelGeometry::placeRelative(ref, size, 5, c.rel, c.align), c.expected)
        << c.rel << "/" << c.align;
  }
  // Centring a wider widget rounds the odd pixel down (leftward) on either side of zero.
  EXPECT_EQ(PanelGeometry::placeRelative(ref, {43, 6}, 0, PlaceAbove, AlignCentre).x0, 98);
  EXPECT_EQ(PanelGeometry::placeRelative(ref, {37, 6}, 0, PlaceAbove, AlignCentre).x0, 101);
  // A huge gap is clamped, not wrapped round to a negative one.
  EXPECT_GT(PanelGeometry::placeRelative(ref, size, 0xFFFFFFFFu, PlaceRightOf, AlignTop).x0, 140);
}
