#include "platform/glob/Canvas.h"

#include <algorithm>
#include <iterator>

#include "platform/glob/CanvasHost.h"
#include "platform/glob/ChildIndex.h"

namespace {
// Below this many children a linear scan beats the grid.
constexpr size_t kIndexThreshold = 16;
}  // namespace

Canvas::Canvas(Canvas* parent, CanvasClient* client, const Kw::Box<int>& rectInParent)
    : client_(client), rect_(rectInParent) {
  if (parent) attachTo(parent);
}

Canvas::Canvas(CanvasHost* host, CanvasClient* client, int width, int height)
    : client_(client), rect_(0, 0, width, height), rare_(std::make_unique<Rare>()) {
  rare_->host = host;
}

Canvas::~Canvas() {
  // Children still attached belong to someone else; they become unattached.
  for (Canvas* c : children_) c->parent_ = nullptr;
  children_.clear();
  // A root canvas outlives nothing it could report to: its host is being destroyed. Under a
  // parent that is being torn down the Globs are already out of the registry (nothing of them
  // is called any more) and the parent reports its whole subtree once, when it goes itself.
  if (!isRoot() && !(parent_ && parent_->tearingDown_)) forgetSubtree();
  detachFromParent();
}

void Canvas::attachTo(Canvas* parent) {
  parent_ = parent;
  parent_->children_.push_back(this);
  parent_->childrenChanged();
  damage();
}

void Canvas::detachFromParent() {
  if (!parent_) return;
  if (!parent_->tearingDown_) damage();
  // Searched from the top: children are deleted youngest first, so a teardown finds each at
  // the end and the whole subtree goes in linear time.
  auto& sib = parent_->children_;
  auto it = std::find(sib.rbegin(), sib.rend(), this);
  if (it != sib.rend()) sib.erase(std::next(it).base());
  parent_->childrenChanged();
  parent_ = nullptr;
}

void Canvas::forgetSubtree() {
  if (CanvasHost* h = host()) h->canvasRemoved(this);
}

const ChildIndex& Canvas::index() const {
  if (!rare_) rare_ = std::make_unique<Rare>();
  if (!rare_->index) rare_->index = std::make_unique<ChildIndex>();
  if (indexDirty_) {
    rare_->index->rebuild(children_, localBounds());
    indexDirty_ = false;
  }
  return *rare_->index;
}

void Canvas::childrenChanged() {
  indexDirty_ = true;
}

XY<int> Canvas::rootOrigin() const {
  XY<int> o(rect_.x0, rect_.y0);
  if (isRoot()) return XY<int>(0, 0);
  for (const Canvas* p = parent_; p && !p->isRoot(); p = p->parent_) {
    o = o + XY<int>(p->rect_.x0, p->rect_.y0);
  }
  return o;
}

Kw::Box<int> Canvas::rootRect() const {
  const XY<int> o = rootOrigin();
  return Kw::Box<int>::fromSize(o.x, o.y, width(), height());
}

Kw::Box<int> Canvas::visibleRootRect() const {
  Kw::Box<int> r = rootRect();
  for (const Canvas* p = parent_; p; p = p->parent_) r = r.intersection(p->rootRect());
  return r;
}

void Canvas::reshape(const Kw::Box<int>& rectInParent) {
  if (rectInParent == rect_) return;
  damage();
  reshapeQuietly(rectInParent);
  damage();
}

void Canvas::reshapeQuietly(const Kw::Box<int>& rectInParent) {
  if (rectInParent == rect_) return;
  rect_ = rectInParent;
  if (parent_) parent_->childrenChanged();
  childrenChanged();
}

void Canvas::translate(int dx, int dy) {
  reshape(rect_.translated(dx, dy));
}

void Canvas::map() {
  if (mapped_) return;
  mapped_ = true;
  damage();
}

void Canvas::unmap() {
  if (!mapped_) return;
  damage();
  mapped_ = false;
  if (CanvasHost* h = host()) h->canvasRemoved(this);
}

bool Canvas::isMappedToRoot() const {
  const Canvas* c = this;
  for (; c; c = c->parent_) {
    if (!c->mapped_) return false;
    if (c->isRoot()) return true;
  }
  return false;
}

void Canvas::raise() {
  if (!parent_) return;
  auto& sib = parent_->children_;
  auto it = std::find(sib.begin(), sib.end(), this);
  if (it == sib.end() || it + 1 == sib.end()) return;
  sib.erase(it);
  sib.push_back(this);
  parent_->childrenChanged();
  damage();
}

void Canvas::lower() {
  if (!parent_) return;
  auto& sib = parent_->children_;
  auto it = std::find(sib.begin(), sib.end(), this);
  if (it == sib.end() || it == sib.begin()) return;
  sib.erase(it);
  sib.insert(sib.begin(), this);
  parent_->childrenChanged();
  damage();
}

size_t Canvas::stackIndex() const {
  if (!parent_) return 0;
  const auto& sib = parent_->children_;
  return static_cast<size_t>(std::find(sib.begin(), sib.end(), this) - sib.begin());
}

void Canvas::reparent(Canvas* newParent) {
  if (newParent == parent_) return;
  for (Canvas* p = newParent; p; p = p->parent_) {
    if (p == this) return;  // would make a cycle
  }
  forgetSubtree();
  detachFromParent();
  if (newParent) attachTo(newParent);
}

Canvas* Canvas::hit(XY<int> p) {
  if (!mapped_ || !localBounds().contains(p)) return nullptr;
  if (children_.size() >= kIndexThreshold) {
    const auto& cands = index().candidatesAt(p);
    for (auto it = cands.rbegin(); it != cands.rend(); ++it) {
      Canvas* c = children_[*it];
      if (Canvas* h = c->hit(p - XY<int>(c->rect_.x0, c->rect_.y0))) return h;
    }
    return this;
  }
  for (auto it = children_.rbegin(); it != children_.rend(); ++it) {
    Canvas* c = *it;
    if (Canvas* h = c->hit(p - XY<int>(c->rect_.x0, c->rect_.y0))) return h;
  }
  return this;
}

void Canvas::childrenIn(const Kw::Box<int>& area, std::vector<Canvas*>& out) const {
  out.clear();
  if (children_.size() >= kIndexThreshold) {
    std::vector<uint32_t> idx;
    index().candidatesIn(area, idx);
    for (uint32_t i : idx) out.push_back(children_[i]);
    return;
  }
  for (Canvas* c : children_) {
    if (c->rect_.intersects(area)) out.push_back(c);
  }
}

Canvas* Canvas::root() {
  Canvas* c = this;
  while (c->parent_) c = c->parent_;
  return c->isRoot() ? c : nullptr;
}

CanvasHost* Canvas::host() const {
  const Canvas* c = this;
  while (c->parent_) c = c->parent_;
  return c->rare_ ? c->rare_->host : nullptr;
}

PaintSession* Canvas::paintSession() const {
  CanvasHost* h = host();
  return h ? h->activePaintSession() : nullptr;
}

void Canvas::damage() {
  damage(localBounds());
}

void Canvas::damage(const Kw::Box<int>& localArea) {
  // One walk to the root: the area moves into each parent's coordinates and is clipped by each
  // canvas on the way, and an unmapped canvas on the way means nothing shows. Kept in four
  // plain integers: this runs for every control made, moved or changed.
  int x0 = localArea.x0, y0 = localArea.y0, x1 = localArea.x1, y1 = localArea.y1;
  for (const Canvas* c = this; c; c = c->parent_) {
    if (!c->mapped_) return;
    x0 = std::max(x0, 0);
    y0 = std::max(y0, 0);
    x1 = std::min(x1, c->rect_.width());
    y1 = std::min(y1, c->rect_.height());
    if (x1 <= x0 || y1 <= y0) return;
    if (c->isRoot()) {
      if (CanvasHost* h = c->rare_->host) h->canvasDamaged(Kw::Box<int>(x0, y0, x1, y1));
      return;
    }
    x0 += c->rect_.x0;
    x1 += c->rect_.x0;
    y0 += c->rect_.y0;
    y1 += c->rect_.y0;
  }
}

void Canvas::damageRoot(const Kw::Box<int>& rootArea) const {
  if (rootArea.empty()) return;
  if (CanvasHost* h = host()) h->canvasDamaged(rootArea);
}
