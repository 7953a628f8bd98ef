#include "platform/glob/ChildIndex.h"

#include <algorithm>

#include "platform/glob/Canvas.h"

namespace {
constexpr int kTargetCells = 64;  // per side, at most
constexpr int kMinCell = 16;
}  // namespace

int ChildIndex::cellOf(int v, int origin, int size, int count) const {
  return std::clamp((v - origin) / size, 0, count - 1);
}

void ChildIndex::rebuild(const std::vector<Canvas*>& children, const Kw::Box<int>& bounds) {
  bounds_ = bounds;
  cellW_ = std::max(kMinCell, (bounds.width() + kTargetCells - 1) / kTargetCells);
  cellH_ = std::max(kMinCell, (bounds.height() + kTargetCells - 1) / kTargetCells);
  cols_ = std::max(1, (bounds.width() + cellW_ - 1) / cellW_);
  rows_ = std::max(1, (bounds.height() + cellH_ - 1) / cellH_);
  cells_.assign(static_cast<size_t>(cols_ * rows_), {});
  outside_.clear();
  boxes_.resize(children.size());
  for (uint32_t i = 0; i < children.size(); ++i) {
    const Kw::Box<int> b = children[i]->rect();
    boxes_[i] = b;
    if (b.empty()) continue;
    if (!bounds.contains(b)) {
      outside_.push_back(i);
      continue;
    }
    const int cx0 = cellOf(b.x0, bounds.x0, cellW_, cols_);
    const int cx1 = cellOf(b.x1 - 1, bounds.x0, cellW_, cols_);
    const int cy0 = cellOf(b.y0, bounds.y0, cellH_, rows_);
    const int cy1 = cellOf(b.y1 - 1, bounds.y0, cellH_, rows_);
    for (int cy = cy0; cy <= cy1; ++cy) {
      for (int cx = cx0; cx <= cx1; ++cx) cells_[static_cast<size_t>(cy * cols_ + cx)].push_back(i);
    }
  }
}

const std::vector<uint32_t>& ChildIndex::candidatesAt(XY<int> p) const {
  if (outside_.empty() && bounds_.contains(p)) {
    const int cx = cellOf(p.x, bounds_.x0, cellW_, cols_);
    const int cy = cellOf(p.y, bounds_.y0, cellH_, rows_);
    return cells_[static_cast<size_t>(cy * cols_ + cx)];
  }
  scratch_.clear();
  if (bounds_.contains(p)) {
    const int cx = cellOf(p.x, bounds_.x0, cellW_, cols_);
    const int cy = cellOf(p.y, bounds_.y0, cellH_, rows_);
    scratch_ = cells_[static_cast<size_t>(cy * cols_ + cx)];
  }
  for (uint32_t i : outside_) {
    if (boxes_[i].contains(p)) scratch_.push_back(i);
  }
  std::sort(scratch_.begin(), scratch_.end());
  return scratch_;
}

void ChildIndex::candidatesIn(const Kw::Box<int>& area, std::vector<uint32_t>& out) const {
  out.clear();
  const Kw::Box<int> a = area.intersection(bounds_);
  if (!a.empty()) {
    const int cx0 = cellOf(a.x0, bounds_.x0, cellW_, cols_);
    const int cx1 = cellOf(a.x1 - 1, bounds_.x0, cellW_, cols_);
    const int cy0 = cellOf(a.y0, bounds_.y0, cellH_, rows_);
    const int cy1 = cellOf(a.y1 - 1, bounds_.y0, cellH_, rows_);
    for (int cy = cy0; cy <= cy1; ++cy) {
      for (int cx = cx0; cx <= cx1; ++cx) {
        for (uint32_t i : cells_[static_cast<size_t>(cy * cols_ + cx)]) {
          if (boxes_[i].intersects(area)) out.push_back(i);
        }
      }
    }
  }
  for (uint32_t i : outside_) {
    if (boxes_[i].intersects(area)) out.push_back(i);
  }
  std::sort(out.begin(), out.end());
  out.erase(std::unique(out.begin(), out.end()), out.end());
}
