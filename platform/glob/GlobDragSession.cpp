#include "platform/glob/GlobDragSession.h"

#include "platform/glob/RootGlob.h"

GlobDragSession::GlobDragSession(RootGlob& screen, Glob* source, DragPayload payload)
    : screen_(screen), source_(source), payload_(std::move(payload)) {}

GlobDragSession::~GlobDragSession() {
  setTarget(nullptr);
}

Glob* GlobDragSession::acceptorAt(XY<int> pointerRoot) {
  // The deepest Glob under the pointer that takes the payload, asked from the inside out. An
  // answer may change the tree: the climb goes on from a handle.
  GlobHandle<> at(screen_.globAt(pointerRoot));
  while (Glob* g = at.get()) {
    if (g == &screen_) return nullptr;
    Glob* up = g->parent();
    GlobHandle<> upHandle(up);
    if (g->acceptsDrop(payload_) && at.alive()) return at.get();
    at = upHandle;
  }
  return nullptr;
}

void GlobDragSession::setTarget(Glob* g) {
  if (target_.refersTo(g) && target_.alive()) return;
  Glob* old = target_.get();
  target_ = GlobHandle<>(g);
  if (old) old->handleDropHover(false);
  if (g && target_.refersTo(g) && target_.alive()) g->handleDropHover(true);
}

void GlobDragSession::track(XY<int> pointerRoot) {
  setTarget(acceptorAt(pointerRoot));
}

bool GlobDragSession::finish(XY<int> pointerRoot) {
  track(pointerRoot);
  GlobHandle<> target = target_;
  setTarget(nullptr);
  Glob* g = target.get();
  if (!g) return false;
  return g->receiveDrop(payload_, pointerRoot - g->canvas()->rootOrigin());
}
