#pragma once
// A drawing surface in the tree of canvases. Its position is its bottom-left corner in its
// parent's coordinates, y upward. Children are kept in stacking order, the last on top, and
// are clipped to their parent.
#include <memory>
#include <vector>

#include "platform/kw/Box.h"

class CanvasClient;
class ChildIndex;
class CanvasHost;
class PaintSession;

class Canvas {
 public:
  // A canvas inside `parent` (null for an unattached one).
  Canvas(Canvas* parent, CanvasClient* client, const Kw::Box<int>& rectInParent);
  // A root canvas of the given size, reporting to `host`.
  Canvas(CanvasHost* host, CanvasClient* client, int width, int height);
  ~Canvas();
  Canvas(const Canvas&) = delete;
  Canvas& operator=(const Canvas&) = delete;

  Canvas* parent() const { return parent_; }
  CanvasClient* client() const { return client_; }
  const std::vector<Canvas*>& children() const { return children_; }

  // Geometry.
  const Kw::Box<int>& rect() const { return rect_; }  // in the parent
  int width() const { return rect_.width(); }
  int height() const { return rect_.height(); }
  Kw::Box<int> localBounds() const { return Kw::Box<int>(0, 0, width(), height()); }
  XY<int> rootOrigin() const;
  Kw::Box<int> rootRect() const;
  // The part of the canvas that can be seen: its root rectangle clipped by every ancestor.
  Kw::Box<int> visibleRootRect() const;
  void reshape(const Kw::Box<int>& rectInParent);
  void translate(int dx, int dy);
  // Takes the new rectangle without reporting damage: for an owner that repaints the old and
  // new places itself, later (a frozen Glob).
  void reshapeQuietly(const Kw::Box<int>& rectInParent);

  // Mapping. A canvas shows only when it and all its ancestors are mapped up to a root.
  void map();
  void unmap();
  bool isMapped() const { return mapped_; }
  bool isMappedToRoot() const;

  // An opaque canvas promises that its client's draw() covers every pixel of it with opaque
  // paint. Repaints then skip what lies beneath it (its parent's background, the screen's
  // clear). Off by default.
  void setOpaque(bool opaque) { opaque_ = opaque; }
  bool isOpaque() const { return opaque_; }

  // Stacking among siblings.
  void raise();
  void lower();
  size_t stackIndex() const;

  // Moves this canvas (and its subtree) to another parent, keeping its position numbers.
  void reparent(Canvas* newParent);

  // The canvas is going away with its whole subtree: children leaving it from now on report
  // no damage of their own, since the area of the canvas is damaged when it goes.
  void beginTeardown() { tearingDown_ = true; }

  // The deepest mapped canvas at `p` (this canvas's coordinates), this one included; null when
  // `p` is outside or the canvas is unmapped.
  Canvas* hit(XY<int> p);
  // Children (stacking order) whose rectangles meet `area` (this canvas's coordinates).
  void childrenIn(const Kw::Box<int>& area, std::vector<Canvas*>& out) const;

  // The root canvas above this one, or null when the canvas is unattached.
  Canvas* root();
  bool isRoot() const { return rare_ && rare_->host; }
  CanvasHost* host() const;
  PaintSession* paintSession() const;

  // Reports the whole canvas, or a local area of it, as needing a repaint.
  void damage();
  void damage(const Kw::Box<int>& localArea);

 private:
  void attachTo(Canvas* parent);
  void detachFromParent();
  void childrenChanged();
  void forgetSubtree();
  void damageRoot(const Kw::Box<int>& rootArea) const;
  // The index of the children, brought up to date; made when first needed.
  const ChildIndex& index() const;

  // What few canvases need: the screen's host, and the index of a crowded parent. Kept apart so
  // that the many canvases without either pay one pointer.
  struct Rare {
    CanvasHost* host = nullptr;
    std::unique_ptr<ChildIndex> index;
  };

  Canvas* parent_ = nullptr;
  CanvasClient* client_ = nullptr;
  Kw::Box<int> rect_;
  bool mapped_ = true;
  bool opaque_ = false;
  bool tearingDown_ = false;
  mutable bool indexDirty_ = true;
  std::vector<Canvas*> children_;
  mutable std::unique_ptr<Rare> rare_;
};
