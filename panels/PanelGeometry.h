#pragma once
// The arithmetic of a standard panel's layout, apart from any canvas so that it can be used
// (and tested) on its own: border widths, strips, the eight origins, the user area, placement
// from an origin and placement relative to another widget. Coordinates are the panel's own,
// origin at its bottom-left corner and y upward.
//
// Placement from an origin: a position is the offset from the origin to the widget's nearest
// corner, measured into the panel. From a left origin x counts rightward to the widget's left
// edge; from a right origin it counts leftward to its right edge. From a bottom origin y counts
// upward to its bottom edge; from a top origin downward to its top edge. So (5, 5) from
// OriginInnerTopRight puts the widget's top-right corner 5 pixels in from that corner, and a
// widget anchored at a top or right origin follows that corner when the panel is resized.
//
// Relative placement works on outer boxes (the widget grown by its surround ring). The gap
// lies between the two outer boxes: PlaceRightOf puts the outer left edge at the reference's
// outer right edge + gap, PlaceLeftOf the outer right edge at its outer left edge - gap,
// PlaceAbove the outer bottom at its outer top + gap, PlaceBelow the outer top at its outer
// bottom - gap. Across the relation, AlignLeft/AlignRight/AlignTop/AlignBottom line up that
// outer edge with the reference's, and AlignCentre centres the outer boxes, rounding the odd
// pixel towards the left or the bottom.
#include "panels/PanelLayoutTypes.h"
#include "platform/kw/Box.h"
#include "platform/kw/XY.h"

// What the layout of a panel depends on.
struct PanelFrame {
  int flags = 0;  // standard-widget flags
  XY<int> size;
  UifTypeOfBorder border = UifBorderNone;
  // Further room a subclass keeps inside the border and strips (a group's title, say): the
  // inner left origins move right by `extraLeft`, the inner top origins down by `extraTop`.
  int extraLeft = 0;
  int extraTop = 0;
};

class PanelGeometry {
 public:
  static constexpr int kTitleStripHeight = 26;
  static constexpr int kBottomStripHeight = 27;
  static constexpr int kSurroundWidth = 2;
  // In the title strip: from the border to the outermost title widget, and between
  // neighbouring title widgets.
  static constexpr int kTitleMargin = 5;
  static constexpr int kTitleGap = 2;

  // 1 → 5, 2 → 10, 3 → 6, anything else → 0.
  static int borderSize(UifTypeOfBorder border);
  static bool hasTitleStrip(int flags) { return (flags & kStdTitleStripFlags) != 0; }
  static bool hasBottomStrip(int flags) { return (flags & kStdBottomStripFlags) != 0; }
  static int surroundWidth(WidgetSurround surround) {
    return surround == SurroundNone ? 0 : kSurroundWidth;
  }
  static bool isValidOrigin(int origin) {
    return origin >= OriginBottomLeft && origin <= OriginInnerTopRight;
  }
  static bool isRightOrigin(CoordinateOrigin o);
  static bool isTopOrigin(CoordinateOrigin o);

  // The origin's point; (0, 0) for a value outside the eight.
  static XY<int> originXY(CoordinateOrigin origin, const PanelFrame& frame);
  // The box between the inner corners (empty when the panel is too small for its frame).
  static Kw::Box<int> userArea(const PanelFrame& frame);
  // The title strip and the bottom strip, inside the border; empty when absent.
  static Kw::Box<int> titleStrip(const PanelFrame& frame);
  static Kw::Box<int> bottomStrip(const PanelFrame& frame);

  // The bottom-left corner of a widget of `widgetSize` placed at `pos` from `origin`.
  static XY<int> placeFromOrigin(CoordinateOrigin origin, XY<int> pos, XY<int> widgetSize,
                                 const PanelFrame& frame);
  // A move by (dx, dy) in panel axes, as a change of the position from `origin`.
  static XY<int> translateOffset(CoordinateOrigin origin, XY<int> pos, int dx, int dy);

  static bool alignmentFits(WidgetRelativity relativity, WidgetAlignment alignment);
  // The outer box of a widget whose outer size is `outerSize`, placed against the outer box
  // of its reference. The alignment must fit the relation (alignmentFits); one that does not
  // is treated as AlignCentre.
  static Kw::Box<int> placeRelative(const Kw::Box<int>& referenceOuter, XY<int> outerSize,
                                    unsigned gap, WidgetRelativity relativity,
                                    WidgetAlignment alignment);
};
