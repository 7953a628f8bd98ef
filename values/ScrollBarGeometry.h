#pragma once
// Where the parts of a scroll bar lie along it, kept apart from the widget so that it can be
// checked alone. Distances run along the bar from its decreasing end (the left of a horizontal
// bar, the top of a vertical one) toward its increasing end, in pixels:
//
//   [dec button][ trough: ... [thumb] ... ][inc button]
//    thickness    troughLength()             thickness
//
// The thumb is thumbSize of the trough long, but never shorter than the minimum thumb length
// (nor longer than the trough). Its start moves over what the trough leaves beside it;
// rangePixels() is how many pixels the whole 0..1 span of positions would cover at that rate,
// so that a pointer moved d pixels moves the thumb by d / rangePixels().
struct ScrollBarGeometry {
  int length = 0;     // along the bar
  int thickness = 0;  // across; also the side of each square arrow button
  double thumbPos = 0.0;
  double thumbSize = 1.0;
  int minThumb = 20;

  int troughStart() const { return thickness; }
  int troughLength() const;
  int thumbLength() const;
  double rangePixels() const;
  // The thumb's first pixel along the bar.
  int thumbStart() const;
  // One past its last pixel.
  int thumbEnd() const { return thumbStart() + thumbLength(); }

  bool inTrough(int along) const {
    return along >= troughStart() && along < troughStart() + troughLength();
  }
  bool inThumb(int along) const { return along >= thumbStart() && along < thumbEnd(); }
};
