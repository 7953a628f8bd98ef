#pragma once
// A point or a size.

template <typename T>
struct XY {
  T x{};
  T y{};

  constexpr XY() = default;
  constexpr XY(T xv, T yv) : x(xv), y(yv) {}

  constexpr XY operator+(const XY& o) const {
    return {static_cast<T>(x + o.x), static_cast<T>(y + o.y)};
  }
  constexpr XY operator-(const XY& o) const {
    return {static_cast<T>(x - o.x), static_cast<T>(y - o.y)};
  }
  constexpr bool operator==(const XY& o) const = default;
};
