#pragma once
// A spatial index over a canvas's children: a uniform grid of buckets, so that hit tests and
// damage queries on a parent with thousands of children look at a handful of them.
#include <cstdint>
#include <vector>

#include "platform/kw/Box.h"

class Canvas;

class ChildIndex {
 public:
  // Rebuilds the grid for `children` (stacking order, bottom first) inside `bounds`.
  void rebuild(const std::vector<Canvas*>& children, const Kw::Box<int>& bounds);

  // Indices of children whose boxes may contain `p`, in ascending stacking order.
  const std::vector<uint32_t>& candidatesAt(XY<int> p) const;

  // Indices of children whose boxes may meet `area`, ascending and without repeats.
  void candidatesIn(const Kw::Box<int>& area, std::vector<uint32_t>& out) const;

 private:
  int cellOf(int v, int origin, int size, int count) const;

  Kw::Box<int> bounds_;
  int cellW_ = 1, cellH_ = 1, cols_ = 0, rows_ = 0;
  std::vector<std::vector<uint32_t>> cells_;
  std::vector<uint32_t> outside_;  // children reaching beyond the bounds
  std::vector<Kw::Box<int>> boxes_;
  mutable std::vector<uint32_t> scratch_;
};
