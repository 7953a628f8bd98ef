#pragma once
// An axis-aligned rectangle whose y grows upward: (x0, y0) is the bottom-left corner and
// (x1, y1) the top-right one, exclusive. A box with x1 <= x0 or y1 <= y0 is empty.
#include <algorithm>

#include "platform/kw/XY.h"

namespace Kw {

template <typename T>
struct Box {
  T x0{}, y0{}, x1{}, y1{};

  constexpr Box() = default;
  constexpr Box(T ax0, T ay0, T ax1, T ay1) : x0(ax0), y0(ay0), x1(ax1), y1(ay1) {}
  static constexpr Box fromSize(T x, T y, T w, T h) { return Box(x, y, x + w, y + h); }

  constexpr T width() const { return x1 - x0; }
  constexpr T height() const { return y1 - y0; }
  constexpr bool empty() const { return !(x1 > x0) || !(y1 > y0); }
  constexpr bool contains(XY<T> p) const { return p.x >= x0 && p.x < x1 && p.y >= y0 && p.y < y1; }
  constexpr bool contains(const Box& b) const {
    return b.x0 >= x0 && b.x1 <= x1 && b.y0 >= y0 && b.y1 <= y1;
  }
  constexpr bool intersects(const Box& b) const {
    return b.x0 < x1 && b.x1 > x0 && b.y0 < y1 && b.y1 > y0;
  }
  constexpr Box intersection(const Box& b) const {
    return Box(std::max(x0, b.x0), std::max(y0, b.y0), std::min(x1, b.x1), std::min(y1, b.y1));
  }
  // Union of two boxes; an empty box contributes nothing.
  constexpr Box united(const Box& b) const {
    if (empty()) return b;
    if (b.empty()) return *this;
    return Box(std::min(x0, b.x0), std::min(y0, b.y0), std::max(x1, b.x1), std::max(y1, b.y1));
  }
  constexpr Box translated(T dx, T dy) const { return Box(x0 + dx, y0 + dy, x1 + dx, y1 + dy); }
  constexpr T area() const { return empty() ? T{} : width() * height(); }
  constexpr bool operator==(const Box& o) const = default;
};

}  // namespace Kw
