#pragma once
// The scroll bar's thumb as a model value: where it starts and how much it covers, both as
// fractions of the track. Positions closer than 1e-6 count as equal, so a model that round-trips
// through arithmetic does not cause redundant updates.
#include <cmath>

struct ThumbSettings {
  double position = 0.0;
  double size = 0.0;

  friend bool operator==(const ThumbSettings& a, const ThumbSettings& b) {
    return std::fabs(a.position - b.position) <= 1e-6 && std::fabs(a.size - b.size) <= 1e-6;
  }
};
