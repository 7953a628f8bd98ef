#pragma once
// One child of a standard panel and the rule that places it.
#include "panels/PanelLayoutTypes.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/XY.h"

struct WidgetDetails {
  // The child; null once it has been deleted behind the panel's back.
  GlobHandle<> widget;
  // The child's address, kept for identity only (never dereferenced): a child that is gone
  // can still be named when it is removed, and reported when the panel is destroyed.
  const Glob* address = nullptr;
  WidgetSurround surround = SurroundNone;

  // Absolute placement: `pos` from `origin` (see PanelGeometry for the arithmetic).
  XY<int> pos;
  CoordinateOrigin origin = OriginInnerBottomLeft;

  // Relative placement, when `relative` is set: against `reference`, `gap` pixels apart.
  bool relative = false;
  GlobHandle<> reference;
  unsigned gap = 0;
  WidgetRelativity relativity = PlaceRightOf;
  WidgetAlignment alignment = AlignCentre;

  Glob* get() const { return widget.get(); }
};
