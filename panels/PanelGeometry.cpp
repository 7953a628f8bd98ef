#include "panels/PanelGeometry.h"

#include <climits>

namespace {

// Floor division by 2, so that centring rounds the same way on both sides of zero.
int halfDown(int v) {
  return v >= 0 ? v / 2 : -((-v + 1) / 2);
}

// Gaps beyond the coordinate range are clamped rather than wrapped.
int clampGap(unsigned gap) {
  return gap > static_cast<unsigned>(INT_MAX / 4) ? INT_MAX / 4 : static_cast<int>(gap);
}

}  // namespace

int PanelGeometry::borderSize(UifTypeOfBorder border) {
  switch (border) {
    case UifBorderRaised:
      return 5;
    case UifBorderFramed:
      return 10;
    case UifBorderSunken:
      return 6;
    default:
      return 0;
  }
}

bool PanelGeometry::isRightOrigin(CoordinateOrigin o) {
  return o == OriginBottomRight || o == OriginTopRight || o == OriginInnerBottomRight ||
         o == OriginInnerTopRight;
}

bool PanelGeometry::isTopOrigin(CoordinateOrigin o) {
  return o == OriginTopLeft || o == OriginTopRight || o == OriginInnerTopLeft ||
         o == OriginInnerTopRight;
}

XY<int> PanelGeometry::originXY(CoordinateOrigin origin, const PanelFrame& frame) {
  const int b = borderSize(frame.border);
  const int w = frame.size.x;
  const int h = frame.size.y;
  const int bottomRaise = hasBottomStrip(frame.flags) ? kBottomStripHeight : 0;
  const int topDrop = (hasTitleStrip(frame.flags) ? kTitleStripHeight : 0) + frame.extraTop;
  const int left = b + frame.extraLeft;
  switch (origin) {
    case OriginBottomLeft:
      return {0, 0};
    case OriginTopLeft:
      return {0, h};
    case OriginBottomRight:
      return {w, 0};
    case OriginTopRight:
      return {w, h};
    case OriginInnerBottomLeft:
      return {left, b + bottomRaise};
    case OriginInnerTopLeft:
      return {left, h - b - topDrop};
    case OriginInnerBottomRight:
      return {w - b, b + bottomRaise};
    case OriginInnerTopRight:
      return {w - b, h - b - topDrop};
  }
  return {0, 0};
}

Kw::Box<int> PanelGeometry::userArea(const PanelFrame& frame) {
  const XY<int> bl = originXY(OriginInnerBottomLeft, frame);
  const XY<int> tr = originXY(OriginInnerTopRight, frame);
  return Kw::Box<int>(bl.x, bl.y, tr.x, tr.y);
}

Kw::Box<int> PanelGeometry::titleStrip(const PanelFrame& frame) {
  if (!hasTitleStrip(frame.flags)) return Kw::Box<int>();
  const int b = borderSize(frame.border);
  const int top = frame.size.y - b;
  return Kw::Box<int>(b, top - kTitleStripHeight, frame.size.x - b, top);
}

Kw::Box<int> PanelGeometry::bottomStrip(const PanelFrame& frame) {
  if (!hasBottomStrip(frame.flags)) return Kw::Box<int>();
  const int b = borderSize(frame.border);
  return Kw::Box<int>(b, b, frame.size.x - b, b + kBottomStripHeight);
}

XY<int> PanelGeometry::placeFromOrigin(CoordinateOrigin origin, XY<int> pos, XY<int> widgetSize,
                                       const PanelFrame& frame) {
  const XY<int> o = originXY(origin, frame);
  const int x = isRightOrigin(origin) ? o.x - pos.x - widgetSize.x : o.x + pos.x;
  const int y = isTopOrigin(origin) ? o.y - pos.y - widgetSize.y : o.y + pos.y;
  return {x, y};
}

XY<int> PanelGeometry::translateOffset(CoordinateOrigin origin, XY<int> pos, int dx, int dy) {
  return {isRightOrigin(origin) ? pos.x - dx : pos.x + dx,
          isTopOrigin(origin) ? pos.y - dy : pos.y + dy};
}

bool PanelGeometry::alignmentFits(WidgetRelativity relativity, WidgetAlignment alignment) {
  if (alignment == AlignCentre) return true;
  const bool vertical = relativity == PlaceAbove || relativity == PlaceBelow;
  if (vertical) return alignment == AlignLeft || alignment == AlignRight;
  return alignment == AlignTop || alignment == AlignBottom;
}

Kw::Box<int> PanelGeometry::placeRelative(const Kw::Box<int>& ref, XY<int> outerSize, unsigned gap,
                                          WidgetRelativity relativity, WidgetAlignment alignment) {
  const int g = clampGap(gap);
  const int w = outerSize.x;
  const int h = outerSize.y;
  if (!alignmentFits(relativity, alignment)) alignment = AlignCentre;
  int x = ref.x0;
  int y = ref.y0;
  switch (relativity) {
    case PlaceAbove:
      y = ref.y1 + g;
      break;
    case PlaceBelow:
      y = ref.y0 - g - h;
      break;
    case PlaceLeftOf:
      x = ref.x0 - g - w;
      break;
    case PlaceRightOf:
      x = ref.x1 + g;
      break;
  }
  if (relativity == PlaceAbove || relativity == PlaceBelow) {
    if (alignment == AlignLeft) x = ref.x0;
    if (alignment == AlignRight) x = ref.x1 - w;
    if (alignment == AlignCentre) x = ref.x0 + halfDown(ref.width() - w);
  } else {
    if (alignment == AlignBottom) y = ref.y0;
    if (alignment == AlignTop) y = ref.y1 - h;
    if (alignment == AlignCentre) y = ref.y0 + halfDown(ref.height() - h);
  }
  return Kw::Box<int>::fromSize(x, y, w, h);
}
