#pragma once
// A closed numeric range. With Unordered set, the two ends may be given in either order and
// the range is taken between them; otherwise min must not exceed max.
#include <algorithm>

template <typename T, bool Unordered = false>
class NumRange {
 public:
  constexpr NumRange() = default;
  constexpr NumRange(T a, T b)
      : min_(Unordered ? std::min(a, b) : a), max_(Unordered ? std::max(a, b) : b) {}

  constexpr T min() const { return min_; }
  constexpr T max() const { return max_; }
  constexpr T span() const { return max_ - min_; }
  constexpr bool valid() const { return !(max_ < min_); }
  constexpr bool contains(T v) const { return !(v < min_) && !(max_ < v); }
  constexpr T clamp(T v) const { return v < min_ ? min_ : (max_ < v ? max_ : v); }
  constexpr bool operator==(const NumRange& o) const = default;

 private:
  T min_{};
  T max_{};
};
