// Glob: where a Glob may stand and how the user moves and resizes it. Positions are bottom-left
// corners in the parent, y upward; "on screen" means inside the root the Glob is on.
#include <cmath>

#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/RootGlob.h"

namespace {

// How far in from the right and bottom edges a press resizes rather than moves.
constexpr int kResizeBand = 5;

// The place nearest to `pos` (in g's parent) at which g lies inside its screen; a Glob larger
// than the screen keeps its left and top edges on it.
XY<double> keptOnScreen(const Glob* g, XY<double> pos) {
  RootGlob* r = g->root();
  if (!r || g == r) return pos;
  const Canvas* pc = g->canvas()->parent();
  const XY<int> po = pc ? pc->rootOrigin() : XY<int>(0, 0);
  const double w = g->canvas()->width(), h = g->canvas()->height();
  const double sw = r->canvas()->width(), sh = r->canvas()->height();
  double x = po.x + pos.x, y = po.y + pos.y;
  x = std::max(0.0, std::min(x, sw - w));
  y = std::min(sh - h, std::max(y, 0.0));
  return XY<double>(x - po.x, y - po.y);
}

}  // namespace

bool Glob::position_constrain(double x, double y, double* allowedX, double* allowedY) {
  if (allowedX) *allowedX = x;
  if (allowedY) *allowedY = y;
  return true;
}

XY<double> Glob::realPositionConstrain(const XY<double>& proposed, Event* e) {
  const Kw::Box<int>& r = canvas_.rect();
  const XY<double> here(r.x0, r.y0);
  double x = here.x, y = here.y;
  if (!position_constrain(proposed.x, proposed.y, &x, &y)) return here;
  if (!std::isfinite(x) || !std::isfinite(y)) return here;
  return keptOnScreen(this, XY<double>(std::round(x), std::round(y)));
}

void Glob::constrain_within_screen() {
  const Kw::Box<int>& r = canvas_.rect();
  const XY<double> to = keptOnScreen(this, XY<double>(r.x0, r.y0));
  translate_canvas(static_cast<int>(to.x) - r.x0, static_cast<int>(to.y) - r.y0);
}

void Glob::glob_tidy() {
  const Kw::Box<int> inside = canvas_.localBounds();
  walk_children([&inside](Glob* c) {
    if (!c->get_movable()) return false;
    const Kw::Box<int>& r = c->canvas()->rect();
    if (inside.contains(r)) return false;
    const int x = std::max(inside.x0, std::min(r.x0, inside.x1 - r.width()));
    const int y = std::max(inside.y0, std::min(r.y0, inside.y1 - r.height()));
    c->translate_canvas(x - r.x0, y - r.y0);
    return false;
  });
}

void Glob::translate_canvtree(int dx, int dy) {
  if (dx == 0 && dy == 0) return;
  walk_children([dx, dy](Glob* c) {
    c->translate_canvas(dx, dy);
    return false;
  });
}

void Glob::resize(double width, double height) {
  if (!std::isfinite(width) || !std::isfinite(height)) return;
  const Kw::Box<int>& r = canvas_.rect();
  reshape_canvas(r.x0, r.y0, static_cast<int>(std::clamp(width, 0.0, 65535.0)),
                 static_cast<int>(std::clamp(height, 0.0, 65535.0)));
}

void Glob::set_movable(int movable) {
  movable_ = movable != 0;
}
void Glob::set_reparent(int reparent) {
  reparent_ = reparent != 0;
}
void Glob::set_resizeable(int resizeable) {
  resizeable_ = resizeable != 0;
}
void Glob::set_becomes_it_if_moved(int becomes) {
  becomesItIfMoved_ = becomes != 0;
}

XY<int> Glob::minimumSize() const {
  return extras_ ? extras_->minSize : Extras().minSize;
}

void Glob::setMinimumSize(XY<int> size) {
  extras().minSize = XY<int>(std::clamp(size.x, 1, 65535), std::clamp(size.y, 1, 65535));
}

GlobResizeEdge Glob::resizeEdgeAt(const XY<int>& pos) const {
  if (!resizeable_ || !canvas_.localBounds().contains(pos)) return GlobResizeEdge::None;
  const bool right = pos.x >= canvas_.width() - kResizeBand;
  const bool bottom = pos.y < kResizeBand;
  if (right && bottom) return GlobResizeEdge::Corner;
  if (right) return GlobResizeEdge::Right;
  if (bottom) return GlobResizeEdge::Bottom;
  return GlobResizeEdge::None;
}

MouseCursorID Glob::contextCursor(const XY<int>& pos) {
  switch (resizeEdgeAt(pos)) {
    case GlobResizeEdge::Right:
      return kCursorResizeHorizontal;
    case GlobResizeEdge::Bottom:
      return kCursorResizeVertical;
    case GlobResizeEdge::Corner:
      return kCursorResizeCorner;
    case GlobResizeEdge::None:
      break;
  }
  return defaultCursor();
}

int Glob::react(Event* e) {
  if (!e || !mouse_left_event(e) || !mouse_down_event(e) || mouse_chord_event(e)) return 0;
  if (!movable_ && !resizeable_) return 0;
  RootGlob* r = root();
  return r && r->beginUserMove(this, e->pos) ? 1 : 0;
}
