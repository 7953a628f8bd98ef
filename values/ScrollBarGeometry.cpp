#include "values/ScrollBarGeometry.h"

#include <algorithm>
#include <cmath>

int ScrollBarGeometry::troughLength() const {
  return std::max(0, length - 2 * thickness);
}

int ScrollBarGeometry::thumbLength() const {
  const int trough = troughLength();
  const double size = std::clamp(thumbSize, 0.0, 1.0);
  const int wanted = static_cast<int>(std::lround(size * trough));
  return std::clamp(wanted, std::min(minThumb, trough), trough);
}

double ScrollBarGeometry::rangePixels() const {
  const int trough = troughLength();
  if (!(thumbSize < 1.0)) return std::max(1, trough);
  const double range = (trough - thumbLength()) / (1.0 - thumbSize);
  return range >= 1.0 ? range : 1.0;
}

int ScrollBarGeometry::thumbStart() const {
  const int free = troughLength() - thumbLength();
  const double pos = std::isfinite(thumbPos) ? thumbPos : 0.0;
  const int offset = static_cast<int>(std::lround(std::clamp(pos * rangePixels(), 0.0, 1e9)));
  return troughStart() + std::clamp(offset, 0, std::max(0, free));
}
