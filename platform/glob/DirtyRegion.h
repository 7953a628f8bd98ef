#pragma once
// The damaged part of the root as a short list of rectangles. Overlapping damage is merged;
// past a limit everything collapses into one bounding box, which keeps bookkeeping constant
// when a frame touches very many small areas.
#include <vector>

#include "platform/kw/Box.h"

class DirtyRegion {
 public:
  explicit DirtyRegion(size_t maxRects = 32) : maxRects_(maxRects) {}

  void add(const Kw::Box<int>& area);
  bool empty() const { return rects_.empty(); }
  const std::vector<Kw::Box<int>>& rects() const { return rects_; }
  Kw::Box<int> bounds() const;
  // Hands over the rectangles and leaves the region empty.
  std::vector<Kw::Box<int>> take();
  void clear() { rects_.clear(); }

 private:
  size_t maxRects_;
  std::vector<Kw::Box<int>> rects_;
};
