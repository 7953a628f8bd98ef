#pragma once
// The slider's straight-line mapping between pixels along its track and values, kept apart from
// the widget so that it can be checked alone. The value `minValue` sits at `startPixel` and
// `maxValue` at `endPixel`; pixels and values beyond the ends extrapolate along the same line.
//
// A track too short to have two distinct ends (endPixel <= startPixel, which the smallest slider
// has) maps every pixel up to startPixel to the minimum and every pixel beyond it to the
// maximum, and every value to startPixel, rather than dividing by zero.
struct SliderMapping {
  double minValue = 0.0;
  double maxValue = 1.0;
  double startPixel = 0.0;
  double endPixel = 0.0;

  double x2v(double pixel) const;
  double v2x(double value) const;
  bool degenerate() const { return !(endPixel > startPixel); }
};
