#pragma once
// One user move or resize of a Glob, from the press that starts it to the release. The screen
// makes it when a movable or resizeable Glob takes a left press and hands it the pointer until
// the release. The Glob may be deleted at any point: the session then ends quietly.
//
//   pointer       move                                  resize
//   moves         realPositionConstrain, then moved()   the edge follows, down to minimumSize,
//                                                       not beyond the screen
//   release       re-parent (set_reparent), drop()      a quickdraw Glob is laid out
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"

class GlobMoveSession {
 public:
  GlobMoveSession(Glob* target, GlobResizeEdge edge, XY<int> pressRoot);
  ~GlobMoveSession();
  GlobMoveSession(const GlobMoveSession&) = delete;
  GlobMoveSession& operator=(const GlobMoveSession&) = delete;

  Glob* target() const { return target_.get(); }
  GlobResizeEdge edge() const { return edge_; }
  // The pointer is at `pointerRoot` (root coordinates).
  void track(XY<int> pointerRoot, Event* e);
  // The button went up at `pointerRoot`.
  void finish(XY<int> pointerRoot, Event* e);

 private:
  void moveTo(XY<int> pointerRoot, Event* e);
  void resizeTo(XY<int> pointerRoot);
  void reparentAt(XY<int> pointerRoot);
  // Ends the holding back of a quickdraw Glob's layout and lays it out if a resize asked.
  void releaseLayout();

  GlobHandle<> target_;
  GlobResizeEdge edge_;
  XY<int> pressRoot_;
  Kw::Box<int> start_;  // the rectangle in the parent at the press
  bool moved_ = false;
};
