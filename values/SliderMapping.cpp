#include "values/SliderMapping.h"

double SliderMapping::x2v(double pixel) const {
  if (degenerate()) return pixel <= startPixel ? minValue : maxValue;
  return (maxValue - minValue) * ((pixel - startPixel) / (endPixel - startPixel)) + minValue;
}

double SliderMapping::v2x(double value) const {
  if (degenerate() || !(maxValue > minValue)) return startPixel;
  return (endPixel - startPixel) * ((value - minValue) / (maxValue - minValue)) + startPixel;
}
