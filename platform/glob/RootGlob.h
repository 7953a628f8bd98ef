#pragma once
// The screen: the Glob at the top of the tree. It routes input (pointer with grab and
// containment, keys to the focus), keeps the message queue, fires ticks from the runtime
// clock, collects damage and runs repaint passes. Back ends and the test harness feed it.
#include <deque>
#include <functional>
#include <memory>
#include <vector>

#include "platform/glob/CanvasHost.h"
#include "platform/glob/DirtyRegion.h"
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/PaintSession.h"

class GlobDragSession;
class GlobMoveSession;
class RootPaintSession;

class RootGlob : public Glob, public CanvasHost {
 public:
  RootGlob(int width, int height);
  ~RootGlob() override;

  // --- Input, in root coordinates (bottom-left origin, y upward) ---
  // `type` is a mouse event code. Moves become drags while a button is held.
  void injectMouse(int type, XY<int> pos, int wheelSteps = 0);
  // `type` is kEventKeyPress or kEventKeyRelease; `keyCode` carries its modifier bits.
  void injectKey(int type, unsigned keyCode);

  // --- Placing Globs on the screen ---
  // Puts an unattached Glob on this screen with its bottom-left corner at `at`, above the
  // others; its Globs that asked for ticks get them from now on. False, with nothing changed,
  // for a null or deleted Glob, a screen, or a Glob that has a parent.
  bool adopt(Glob* g, XY<int> at);
  // Keeps `g`, a child of this screen, covering the whole screen whenever the screen changes
  // size, for as long as it lives. False for anything but a child of this screen.
  bool followScreenSize(Glob* g);

  // --- Input scopes ---
  // While a scope is set, input stays inside it: keys whose focus lies outside the scope go
  // to the scope itself, and input that nothing consumes stops bubbling at the scope. Scopes
  // nest: the newest live one applies, and removing it brings back the one before. False
  // when `g` is not on this screen or is a scope already.
  bool addInputScope(Glob* g);
  void removeInputScope(Glob* g);
  Glob* inputScope() const;
  // Where a key (or typed text) goes now: the focus, or the scope when the focus lies
  // outside it; the screen itself when there is neither.
  Glob* keyTarget() const;

  // --- Event filters ---
  // `filter` sees every pointer and key event of this screen before it is routed (before
  // grabs, moves and drags too), through fsFilterThis(e, context), newest filter first; an
  // answer of true consumes the event. The event's pos is in the filter's coordinates when it
  // is on this screen. A filter may delete itself or others while filtering. Adding a filter
  // again replaces its context. False for a null or deleted Glob.
  bool addEventFilter(Glob* filter, void* context = nullptr);
  void removeEventFilter(Glob* filter);
  size_t eventFilterCount() const;

  // --- Queued delivery ---
  void post(const Event& e);
  // Delivers queued events in order, including ones queued meanwhile, up to `limit`.
  size_t pumpQueue(size_t limit = 100000);
  size_t queuedCount() const { return queue_.size(); }

  // --- Time ---
  int tickPeriod() const { return tickPeriodMs_; }
  void setTickPeriod(int ms);
  // Delivers one tick to every Glob that asked for ticks.
  void runTicks();
  // Fires the ticks that are due by the runtime clock (for the real event loop).
  void processTimers();
  // Manual clock: moves time forward by `ms`, firing every tick on the way and pumping the
  // queue after each.
  void advanceClock(int ms);

  // --- Focus and pointer ---
  Glob* focus() const { return focus_.get(); }
  // Gives `g` the keyboard focus (null clears it). The old holder, then the new, get
  // handle_kbd_focus. Refused for a Glob of another screen.
  void setFocus(Glob* g);
  Glob* hovered() const { return hovered_.get(); }
  Glob* grabbed() const { return grab_.get(); }
  XY<int> pointer() const { return pointer_; }
  // The cursor to show at the pointer, from the hovered Glob.
  MouseCursorID cursorAtPointer();
  // The help text at the pointer, from the hovered Glob.
  String contextStringAtPointer();
  // The deepest Glob at a root position.
  Glob* globAt(XY<int> pos) const;

  // --- User moves, resizes and drags ---
  // Starts a user move or resize of `g` for a left press at `pos` (g's coordinates): a resize
  // on a resize handle of a resizeable Glob, otherwise a move of a movable Glob pressed on
  // its move handle whose pick() agrees. The pointer then belongs to the session until the
  // release. False, with nothing started, otherwise.
  bool beginUserMove(Glob* g, XY<int> pos);
  // The Glob being moved or resized by the user, or null.
  Glob* userMoveTarget() const;
  // The source of the drag and drop going on, and the target that would take it, or null.
  Glob* dragSource() const;
  Glob* dropTarget() const;
  // The deepest Glob at a root position with `skip` and everything inside it left out.
  Glob* globAtExcept(XY<int> pos, const Glob* skip) const;

  // --- "It": the Glob the user last picked up ---
  Glob* it() const { return it_.get(); }
  // Makes `g` "it" (null for none); the old and the new one get handle_it. Refused for a Glob
  // of another screen or one that cannot be it.
  void setIt(Glob* g);

  // --- Deferred deletion ---
  // Deletes `g` once the events being handled are over (at the end of the next pumpQueue).
  void deleteLater(Glob* g);

  // --- Painting ---
  bool needsPaint() const { return !dirty_.empty(); }
  const DirtyRegion& dirty() const { return dirty_; }
  // Repaints what is damaged, in stacking order, each mapped canvas with a visible damaged
  // part drawn once; false when nothing was painted (nothing damaged, or redraws held back by
  // disableRedraws/refresh_off).
  bool paint(PaintSession& session);
  // Repaints `areas` (root coordinates) with `session` now, whether damaged or not; what
  // paint() does with the damaged areas. False when nothing was painted (redraws held back, a
  // repaint going on, nothing of the areas on the screen).
  bool paintAreas(PaintSession& session, const std::vector<Kw::Box<int>>& areas);
  // The keeper of the screen's image paints a root area into it at once when asked, and
  // answers whether it did (null: there is no image).
  void setUnbufferedPainter(std::function<bool(const Kw::Box<int>&)> painter) {
    unbufferedPainter_ = std::move(painter);
  }
  // Paints `rootArea` into the screen's image now (drawUnbuffered); false when it could not.
  bool paintNow(const Kw::Box<int>& rootArea);
  // Called for each Glob asked to draw during paint().
  void setDrawObserver(std::function<void(Glob*)> observer) { drawObserver_ = std::move(observer); }

  // --- Delivery used by the free functions ---
  // Delivers to `target`, bubbling unconsumed input to the parents. Returns the react result.
  int deliver(Event& e, Glob* target, bool bubble);
  void addTicker(Glob* g);

  // --- CanvasHost ---
  void canvasDamaged(const Kw::Box<int>& rootArea) override;
  void canvasRemoved(Canvas* canvas) override;
  PaintSession* activePaintSession() const override { return painting_; }

  const char* idstring() const override { return "root"; }
  void reshape() override;

 private:
  void updateHover(Glob* under);
  // Offers `e` to the filters; true when one consumed it.
  bool offerToFilters(Event& e);
  // Gives a pointer event to the move or drag going on, or starts a drag; true when taken.
  bool routeToSessions(const Event& probe, XY<int> pos, Event& e);
  bool maybeStartDrag(XY<int> pos);
  int dragTypeFor(int moveType) const;
  void paintTree(PaintSession& s, Canvas* c, const Kw::Box<int>& parentVisible,
                 const std::vector<Kw::Box<int>>& areas);
  static bool isInside(const Canvas* c, const Canvas* ancestor);

  std::deque<Event> queue_;
  std::vector<GlobHandle<>> tickers_;
  GlobHandle<> focus_;
  GlobHandle<> unannouncedFocus_;
  GlobHandle<> hovered_;
  GlobHandle<> grab_;
  XY<int> pointer_;
  XY<int> pressPos_;
  int buttonsDown_ = 0;  // button bits of the mouse codes (0x10, 0x20, 0x40)
  int tickPeriodMs_ = 10;
  int64_t nextTick_ = 0;
  DirtyRegion dirty_;
  PaintSession* painting_ = nullptr;
  std::function<void(Glob*)> drawObserver_;
  std::function<bool(const Kw::Box<int>&)> unbufferedPainter_;
  struct EventFilter {
    GlobHandle<> glob;
    void* context;
  };
  std::vector<EventFilter> filters_;       // oldest first
  std::vector<GlobHandle<>> inputScopes_;  // oldest first
  std::vector<GlobHandle<>> screenSized_;
  std::unique_ptr<GlobMoveSession> move_;
  std::unique_ptr<GlobDragSession> drag_;
  bool dragAsked_ = false;  // whether this press's Glob was asked for a drag payload
  GlobHandle<> it_;
  std::vector<GlobHandle<>> doomed_;
};
