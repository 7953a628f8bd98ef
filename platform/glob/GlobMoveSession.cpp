#include "platform/glob/GlobMoveSession.h"

#include <algorithm>

#include "platform/glob/RootGlob.h"

GlobMoveSession::GlobMoveSession(Glob* target, GlobResizeEdge edge, XY<int> pressRoot)
    : target_(target), edge_(edge), pressRoot_(pressRoot) {
  if (!target) return;
  start_ = target->canvas()->rect();
  if (edge_ != GlobResizeEdge::None && target->get_quickdraw()) target->layoutHeld_ = true;
}

GlobMoveSession::~GlobMoveSession() {
  releaseLayout();
}

void GlobMoveSession::releaseLayout() {
  Glob* g = target_.get();
  if (!g || !g->layoutHeld_) return;
  g->layoutHeld_ = false;
  if (!g->layoutOwed_) return;
  g->layoutOwed_ = false;
  // A freeze around the resize still holds the layout back until its thaw.
  g->reshape_myself();
}

void GlobMoveSession::track(XY<int> pointerRoot, Event* e) {
  if (!target_) return;
  if (edge_ == GlobResizeEdge::None) {
    moveTo(pointerRoot, e);
  } else {
    resizeTo(pointerRoot);
  }
}

void GlobMoveSession::finish(XY<int> pointerRoot, Event* e) {
  track(pointerRoot, e);
  releaseLayout();
  Glob* g = target_.get();
  if (!g || edge_ != GlobResizeEdge::None) return;
  if (moved_ && g->get_reparent()) reparentAt(pointerRoot);
  if (Glob* still = target_.get()) still->drop();
}

void GlobMoveSession::moveTo(XY<int> pointerRoot, Event* e) {
  Glob* g = target_.get();
  const XY<int> d = pointerRoot - pressRoot_;
  const XY<double> proposed(start_.x0 + d.x, start_.y0 + d.y);
  const XY<double> to = g->realPositionConstrain(proposed, e);
  if (!(g = target_.get())) return;  // the constraint may have deleted it
  const Kw::Box<int>& r = g->canvas()->rect();
  const int dx = static_cast<int>(to.x) - r.x0, dy = static_cast<int>(to.y) - r.y0;
  if (dx == 0 && dy == 0) return;
  g->translate_canvas(dx, dy);
  if (!target_) return;
  moved_ = true;
  if (g->becomesItIfMoved() && g->can_be_it()) {
    if (RootGlob* screen = g->root()) screen->setIt(g);
    if (!target_) return;
  }
  g->moved();
}

void GlobMoveSession::resizeTo(XY<int> pointerRoot) {
  Glob* g = target_.get();
  RootGlob* screen = g->root();
  if (!screen) return;
  const XY<int> d = pointerRoot - pressRoot_;
  const XY<int> least = g->minimumSize();
  const XY<int> po = g->canvas()->parent() ? g->canvas()->parent()->rootOrigin() : XY<int>(0, 0);
  Kw::Box<int> r = start_;
  if (edge_ == GlobResizeEdge::Right || edge_ == GlobResizeEdge::Corner) {
    // The right edge follows the pointer, no further left than the minimum and not off screen.
    const int most = std::max(least.x, screen->canvas()->width() - (po.x + r.x0));
    r.x1 = r.x0 + std::clamp(start_.width() + d.x, least.x, std::max(least.x, most));
  }
  if (edge_ == GlobResizeEdge::Bottom || edge_ == GlobResizeEdge::Corner) {
    // The bottom edge follows and the top stays: y grows upward, so the origin moves.
    const int most = std::max(least.y, po.y + r.y1);
    const int h = std::clamp(start_.height() - d.y, least.y, std::max(least.y, most));
    r.y0 = r.y1 - h;
  }
  g->reshape_canvas(r.x0, r.y0, r.width(), r.height());
}

void GlobMoveSession::reparentAt(XY<int> pointerRoot) {
  Glob* g = target_.get();
  RootGlob* screen = g->root();
  if (!screen) return;
  Glob* into = screen->globAtExcept(pointerRoot, g);
  while (into && into != screen && !into->get_reparent()) into = into->parent();
  if (!into || into == g->parent()) return;
  const XY<int> at = g->canvas()->rootOrigin() - into->canvas()->rootOrigin();
  g->canvas()->reparent(into->canvas());
  const Kw::Box<int>& r = g->canvas()->rect();
  g->translate_canvas(at.x - r.x0, at.y - r.y0);
  if (!target_) return;
  g->set_canvas();
}
