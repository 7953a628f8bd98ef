#pragma once
// A region made of boxes: the outline of rectangular Globs and of faces with cut corners.
#include <vector>

#include "platform/glob/iRegion.h"

class BoxRegion : public iRegion {
 public:
  BoxRegion() = default;
  explicit BoxRegion(const Kw::Box<int>& box) { add(box); }

  void add(const Kw::Box<int>& box) {
    if (!box.empty()) boxes_.push_back(box);
  }
  const std::vector<Kw::Box<int>>& boxes() const { return boxes_; }

  bool contains(XY<int> p) const override;
  Kw::Box<int> bounds() const override;
  Kw::Ptr<iRegion> translated(int dx, int dy) const override;

 private:
  std::vector<Kw::Box<int>> boxes_;
};
