#pragma once
// One drag and drop between Globs: the payload a source offered when the pointer left it, the
// target under the pointer that would take it, and the release that hands it over. Targets
// come and go as the pointer moves; any of them, or the source, may be deleted meanwhile.
#include "platform/glob/DragPayload.h"
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"

class RootGlob;

class GlobDragSession {
 public:
  GlobDragSession(RootGlob& screen, Glob* source, DragPayload payload);
  ~GlobDragSession();
  GlobDragSession(const GlobDragSession&) = delete;
  GlobDragSession& operator=(const GlobDragSession&) = delete;

  const DragPayload& payload() const { return payload_; }
  Glob* source() const { return source_.get(); }
  // The target that would take the payload now, or null.
  Glob* target() const { return target_.get(); }
  void track(XY<int> pointerRoot);
  // Hands the payload to the target under `pointerRoot`; true when it was taken.
  bool finish(XY<int> pointerRoot);

 private:
  Glob* acceptorAt(XY<int> pointerRoot);
  void setTarget(Glob* g);

  RootGlob& screen_;
  GlobHandle<> source_;
  GlobHandle<> target_;
  DragPayload payload_;
};
