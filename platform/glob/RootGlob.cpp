#include "platform/glob/RootGlob.h"

#include <algorithm>

#include "platform/glob/GlobDragSession.h"
#include "platform/glob/GlobMoveSession.h"
#include "platform/glob/RuntimeClock.h"
#include "platform/misc/Diagnostics.h"

RootGlob::RootGlob(int width, int height) : Glob(this, width, height) {
  nextTick_ = RuntimeClock::now() + tickPeriodMs_;
  canvasDamaged(canvas()->rootRect());
}

RootGlob::~RootGlob() {
  // The children go while the screen's own state still exists: their canvases report their
  // removal to it on the way out (damage no longer matters).
  canvas()->beginTeardown();
  deleteChildren();
  queue_.clear();
  tickers_.clear();
  move_.reset();
  drag_.reset();
}

// --- Input ---

bool RootGlob::isInside(const Canvas* c, const Canvas* ancestor) {
  for (; c; c = c->parent()) {
    if (c == ancestor) return true;
  }
  return false;
}

Glob* RootGlob::globAt(XY<int> pos) const {
  for (Canvas* c = canvas()->hit(pos); c; c = c->parent()) {
    if (Glob* g = globOf(c)) return g;
  }
  return nullptr;
}

void RootGlob::updateHover(Glob* under) {
  if (hovered_.refersTo(under) && hovered_.alive()) return;
  Glob* old = hovered_.get();
  hovered_ = GlobHandle<>(under);
  if (old) old->handleMouseContainment(false);
  // The old Glob may have changed the tree; the new one must still be there and hovered.
  if (under && hovered_.refersTo(under) && hovered_.alive()) under->handleMouseContainment(true);
}

int RootGlob::dragTypeFor(int moveType) const {
  if (moveType != kEventMouseMove) return moveType;
  if ((buttonsDown_ & 0x20) && (buttonsDown_ & 0x40)) return kEventChordMove;
  if (buttonsDown_ & 0x20) return kEventLeftMove;
  if (buttonsDown_ & 0x40) return kEventRightMove;
  if (buttonsDown_ & 0x10) return kEventMiddleMove;
  return kEventMouseMove;
}

void RootGlob::injectMouse(int type, XY<int> pos, int wheelSteps) {
  Event probe(type);
  if (!mouse_event(&probe)) {
    diagWarning("injectMouse: not a mouse event code, ignored\n");
    return;
  }
  pointer_ = pos;
  Glob* under = globAt(pos);
  updateHover(under);
  under = hovered_.get();  // containment handlers may have deleted it

  Event e(dragTypeFor(type));
  e.screenPos = pos;
  e.word2 = static_cast<uint32_t>(wheelSteps);
  const int button = type & 0xF0;
  const int buttonBits = button == 0x80 ? 0x60 : button;
  // The buttons held are tracked even for events a filter keeps, so that later events read
  // right; the grab only follows presses that are routed.
  if (mouse_down_event(&probe)) {
    buttonsDown_ |= buttonBits;
    pressPos_ = pos;
    dragAsked_ = false;
  } else if (mouse_up_event(&probe)) {
    buttonsDown_ &= ~buttonBits;
  }
  e.pressPos = pressPos_;
  if (offerToFilters(e)) {
    if (buttonsDown_ == 0) grab_.reset();
    return;
  }
  under = hovered_.get();  // a filter may have deleted it
  Glob* target = nullptr;
  if (mouse_down_event(&probe)) {
    target = grab_.get() ? grab_.get() : under;
    if (!grab_.get()) grab_ = GlobHandle<>(under);
  } else if (mouse_up_event(&probe)) {
    target = grab_.get() ? grab_.get() : under;
    if (buttonsDown_ == 0) grab_.reset();
  } else if (mouse_wheel_event(&probe)) {
    target = under;
  } else {
    target = grab_.get() ? grab_.get() : under;
  }
  if (routeToSessions(probe, pos, e)) return;
  if (!target) return;
  const XY<int> o = target->canvas()->rootOrigin();
  e.pos = pos - o;
  deliver(e, target, true);
}

void RootGlob::injectKey(int type, unsigned keyCode) {
  Event e(type);
  e.word2 = keyCode;
  e.screenPos = pointer_;
  if (offerToFilters(e)) return;
  deliver(e, keyTarget(), true);
}

int RootGlob::deliver(Event& e, Glob* target, bool bubble) {
  GlobHandle<> h(target);
  while (target) {
    e.dest = target;
    e.canvas = target->canvas();
    const int result = target->react(&e);
    if (result != 0 || !bubble) return result;
    // The handler may have deleted its Glob; then the event stops here.
    if (!h.alive()) return 0;
    // Nothing leaves the input scope (read again: the handler may have changed it).
    if (target == inputScope()) return 0;
    Glob* up = target->parent();
    if (up && mouse_event(&e)) {
      const Kw::Box<int>& r = target->canvas()->rect();
      e.pos = e.pos + XY<int>(r.x0, r.y0);
    }
    target = up;
    h = GlobHandle<>(target);
  }
  return 0;
}

// --- User moves, resizes and drags ---

bool RootGlob::routeToSessions(const Event& probe, XY<int> pos, Event& e) {
  const bool leftUp = mouse_up_event(&probe) && mouse_left_event(&probe);
  const bool move =
      !mouse_down_event(&probe) && !mouse_up_event(&probe) && !mouse_wheel_event(&probe);
  if (move_) {
    // The session owns the pointer until the release; the Glob may go at any time.
    if (leftUp) {
      std::unique_ptr<GlobMoveSession> s = std::move(move_);
      e.pos = pos;
      s->finish(pos, &e);
    } else if (move && move_->target()) {
      move_->track(pos, &e);
    }
    if (move_ && !move_->target()) move_.reset();
    return true;
  }
  if (drag_) {
    if (leftUp) {
      std::unique_ptr<GlobDragSession> s = std::move(drag_);
      s->finish(pos);
    } else if (move) {
      drag_->track(pos);
    }
    return true;
  }
  return move && (buttonsDown_ & 0x20) && maybeStartDrag(pos);
}

bool RootGlob::maybeStartDrag(XY<int> pos) {
  Glob* source = grab_.get();
  if (dragAsked_ || !source || source == this) return false;
  // A drag starts when the pointer leaves the Glob it was pressed on.
  if (source->canvas()->visibleRootRect().contains(pos)) return false;
  dragAsked_ = true;
  DragPayload payload;
  GlobHandle<> at(source);
  while (Glob* g = at.get()) {
    if (g == this) return false;
    GlobHandle<> up(g->parent());
    if (g->dragPayload(pressPos_ - g->canvas()->rootOrigin(), payload) && at.alive() &&
        !payload.empty()) {
      drag_ = std::make_unique<GlobDragSession>(*this, at.get(), payload);
      drag_->track(pos);
      return true;
    }
    at = up;
  }
  return false;
}

bool RootGlob::beginUserMove(Glob* g, XY<int> pos) {
  if (!is_good_glob_ptr(g) || g == this || g->root() != this || move_ || drag_) return false;
  const GlobResizeEdge edge = g->resizeEdgeAt(pos);
  if (edge == GlobResizeEdge::None) {
    if (!g->get_movable() || !g->isMoveHandleAt(pos)) return false;
    GlobHandle<> h(g);
    if (!g->pick() || !h.alive()) return false;
  }
  move_ = std::make_unique<GlobMoveSession>(g, edge, pos + g->canvas()->rootOrigin());
  return true;
}

Glob* RootGlob::userMoveTarget() const {
  return move_ ? move_->target() : nullptr;
}

Glob* RootGlob::dragSource() const {
  return drag_ ? drag_->source() : nullptr;
}

Glob* RootGlob::dropTarget() const {
  return drag_ ? drag_->target() : nullptr;
}

namespace {

Canvas* hitExcept(Canvas* c, XY<int> p, const Canvas* skip) {
  if (c == skip || !c->isMapped() || !c->localBounds().contains(p)) return nullptr;
  const auto& kids = c->children();
  for (auto it = kids.rbegin(); it != kids.rend(); ++it) {
    const Kw::Box<int>& r = (*it)->rect();
    if (Canvas* h = hitExcept(*it, p - XY<int>(r.x0, r.y0), skip)) return h;
  }
  return c;
}

}  // namespace

Glob* RootGlob::globAtExcept(XY<int> pos, const Glob* skip) const {
  const Canvas* skipCanvas = skip ? skip->canvas() : nullptr;
  for (Canvas* c = hitExcept(canvas(), pos, skipCanvas); c; c = c->parent()) {
    if (Glob* g = globOf(c)) return g;
  }
  return nullptr;
}

void RootGlob::setIt(Glob* g) {
  if (g && (g->root() != this || !g->can_be_it())) return;
  if (it_.refersTo(g) && it_.alive()) return;
  Glob* old = it_.get();
  it_ = GlobHandle<>(g);
  if (old) old->handle_it();
  if (g && it_.refersTo(g) && it_.alive()) g->handle_it();
}

void RootGlob::deleteLater(Glob* g) {
  if (!is_good_glob_ptr(g) || g == this) return;
  doomed_.emplace_back(g);
}

// --- Placing Globs on the screen ---

bool RootGlob::adopt(Glob* g, XY<int> at) {
  if (!is_good_glob_ptr(g) || g->canvas()->isRoot() || g->canvas()->parent()) return false;
  g->canvas()->reparent(canvas());
  const Kw::Box<int>& r = g->canvas()->rect();
  g->translate_canvas(at.x - r.x0, at.y - r.y0);
  // Globs made off-screen could not sign up for ticks; the screen takes them on now.
  std::vector<Glob*> pending{g};
  while (!pending.empty()) {
    Glob* x = pending.back();
    pending.pop_back();
    if (x->interest() & kInterestTicks) addTicker(x);
    for (Glob* c : x->children()) pending.push_back(c);
  }
  return true;
}

bool RootGlob::followScreenSize(Glob* g) {
  if (!is_good_glob_ptr(g) || g->parent() != this) return false;
  for (const auto& h : screenSized_) {
    if (h.refersTo(g) && h.alive()) return true;
  }
  screenSized_.emplace_back(g);
  return true;
}

void RootGlob::reshape() {
  std::erase_if(screenSized_, [this](const GlobHandle<>& h) {
    Glob* g = h.get();
    return !g || g->parent() != this;
  });
  // A copy: a Glob's reshape may sign up others, or delete some.
  const std::vector<GlobHandle<>> now = screenSized_;
  for (const auto& h : now) {
    if (Glob* g = h.get()) g->reshape_canvas(0, 0, width(), height());
  }
}

// --- Event filters ---

bool RootGlob::addEventFilter(Glob* filter, void* context) {
  if (!is_good_glob_ptr(filter)) return false;
  for (auto& f : filters_) {
    if (f.glob.refersTo(filter) && f.glob.alive()) {
      f.context = context;
      return true;
    }
  }
  filters_.push_back({GlobHandle<>(filter), context});
  return true;
}

void RootGlob::removeEventFilter(Glob* filter) {
  std::erase_if(filters_, [filter](const EventFilter& f) {
    return f.glob.refersTo(filter) || !f.glob.alive();
  });
}

size_t RootGlob::eventFilterCount() const {
  return static_cast<size_t>(std::count_if(filters_.begin(), filters_.end(),
                                           [](const EventFilter& f) { return f.glob.alive(); }));
}

bool RootGlob::offerToFilters(Event& e) {
  if (filters_.empty()) return false;
  std::erase_if(filters_, [](const EventFilter& f) { return !f.glob.alive(); });
  // A copy: a filter may add, remove or delete filters, itself included.
  const std::vector<EventFilter> now = filters_;
  for (auto it = now.rbegin(); it != now.rend(); ++it) {
    Glob* g = it->glob.get();
    if (!g) continue;
    Event seen = e;
    seen.dest = g;
    seen.canvas = g->canvas();
    if (mouse_event(&e)) {
      seen.pos = g->root() == this ? e.screenPos - g->canvas()->rootOrigin() : e.screenPos;
    }
    if (g->fsFilterThis(&seen, it->context)) return true;
  }
  return false;
}

// --- Input scopes ---

bool RootGlob::addInputScope(Glob* g) {
  if (!is_good_glob_ptr(g) || g->root() != this) return false;
  for (const auto& h : inputScopes_) {
    if (h.refersTo(g) && h.alive()) return false;
  }
  inputScopes_.emplace_back(g);
  return true;
}

void RootGlob::removeInputScope(Glob* g) {
  std::erase_if(inputScopes_, [g](const GlobHandle<>& h) { return h.refersTo(g) || !h.alive(); });
}

Glob* RootGlob::inputScope() const {
  for (auto it = inputScopes_.rbegin(); it != inputScopes_.rend(); ++it) {
    Glob* g = it->get();
    if (g && g->root() == this) return g;
  }
  return nullptr;
}

Glob* RootGlob::keyTarget() const {
  Glob* target = focus_.get();
  if (!target || !target->canvas()->isMappedToRoot()) target = nullptr;
  if (Glob* scope = inputScope();
      scope && (!target || !isInside(target->canvas(), scope->canvas()))) {
    return scope;
  }
  return target ? target : const_cast<RootGlob*>(this);
}

// --- Queue ---

void RootGlob::post(const Event& e) {
  queue_.push_back(e);
}

size_t RootGlob::pumpQueue(size_t limit) {
  size_t n = 0;
  while (!queue_.empty() && n < limit) {
    Event e = std::move(queue_.front());
    queue_.pop_front();
    ++n;
    // A destination deleted since the event was queued gets nothing.
    if (!is_good_glob_ptr(e.dest)) continue;
    event_send(&e, false);
  }
  if (!queue_.empty()) diagWarning("pumpQueue: delivery limit reached, the rest waits\n");
  // Globs that asked to go, now that nothing is handling them. A destructor may ask for more.
  while (!doomed_.empty()) {
    GlobHandle<> h = doomed_.back();
    doomed_.pop_back();
    delete h.get();
  }
  return n;
}

// --- Time ---

void RootGlob::setTickPeriod(int ms) {
  if (ms <= 0) {
    diagWarning("setTickPeriod: period must be positive, kept " + std::to_string(tickPeriodMs_) +
                "\n");
    return;
  }
  tickPeriodMs_ = ms;
  nextTick_ = RuntimeClock::now() + ms;
}

void RootGlob::addTicker(Glob* g) {
  for (const auto& t : tickers_) {
    if (t.refersTo(g) && t.alive()) return;
  }
  tickers_.emplace_back(g);
}

void RootGlob::runTicks() {
  // Drop the dead and the uninterested first; handlers may subscribe others meanwhile.
  tickers_.erase(std::remove_if(tickers_.begin(), tickers_.end(),
                                [](const GlobHandle<>& h) {
                                  Glob* g = h.get();
                                  return !g || !(g->interest() & kInterestTicks);
                                }),
                 tickers_.end());
  const std::vector<GlobHandle<>> now = tickers_;
  for (const auto& h : now) {
    Glob* g = h.get();
    if (!g || !(g->interest() & kInterestTicks)) continue;
    Event e(kEventTick);
    e.screenPos = pointer_;
    e.dest = g;
    e.canvas = g->canvas();
    g->react(&e);
  }
}

void RootGlob::processTimers() {
  const int64_t t = RuntimeClock::now();
  if (t < nextTick_) return;
  runTicks();
  nextTick_ = std::max(nextTick_ + tickPeriodMs_, t + 1);
}

void RootGlob::advanceClock(int ms) {
  if (ms < 0) {
    diagWarning("advanceClock: time does not go backwards, ignored\n");
    return;
  }
  const int64_t target = RuntimeClock::now() + ms;
  while (nextTick_ <= target) {
    RuntimeClock::setManualTime(nextTick_);
    nextTick_ += tickPeriodMs_;
    runTicks();
    pumpQueue();
  }
  RuntimeClock::setManualTime(target);
  pumpQueue();
}

// --- Focus ---

void RootGlob::setFocus(Glob* g) {
  if (g && g->root() != this) {
    diagWarning("setFocus: the Glob is not on this screen, focus kept\n");
    return;
  }
  if (focus_.refersTo(g) && focus_.alive()) return;
  Glob* old = focus_.get();
  // A Glob that was given the focus but not yet told (its predecessor is still handling the
  // loss and moved the focus on) hears nothing at all.
  const bool oldWasTold = !unannouncedFocus_.refersTo(old);
  focus_ = GlobHandle<>(g);
  unannouncedFocus_ = GlobHandle<>(g);
  if (old && oldWasTold) old->handle_kbd_focus();
  if (g && focus_.refersTo(g) && focus_.alive()) {
    unannouncedFocus_.reset();
    g->handle_kbd_focus();
  }
}

MouseCursorID RootGlob::cursorAtPointer() {
  Glob* g = hovered_.get();
  if (!g) return kCursorArrow;
  return g->contextCursor(pointer_ - g->canvas()->rootOrigin());
}

String RootGlob::contextStringAtPointer() {
  for (Glob* g = hovered_.get(); g; g = g->parent()) {
    String s = g->contextString(pointer_ - g->canvas()->rootOrigin(), nullptr);
    if (!s.empty()) return s;
  }
  return String();
}

// --- CanvasHost ---

void RootGlob::canvasDamaged(const Kw::Box<int>& rootArea) {
  dirty_.add(rootArea.intersection(canvas()->rootRect()));
}

void RootGlob::canvasRemoved(Canvas* c) {
  // A Glob being deleted is no longer registered: it gets no calls, its handle just clears.
  if (Glob* g = grab_.get(); g && isInside(g->canvas(), c)) grab_.reset();
  if (Glob* g = hovered_.get(); g && isInside(g->canvas(), c)) {
    hovered_.reset();
    g->handleMouseContainment(false);
  }
  if (Glob* g = focus_.get(); g && isInside(g->canvas(), c)) {
    focus_.reset();
    g->handle_kbd_focus();
  }
}

// --- Painting ---

bool RootGlob::paint(PaintSession& session) {
  if (!Drawable::redrawsEnabled() || dirty_.empty() || painting_) return false;
  return paintAreas(session, dirty_.take());
}

bool RootGlob::paintNow(const Kw::Box<int>& rootArea) {
  return unbufferedPainter_ && unbufferedPainter_(rootArea);
}

bool RootGlob::paintAreas(PaintSession& session, const std::vector<Kw::Box<int>>& given) {
  // A draw() asking for an unbuffered paint must not start a repaint inside the repaint.
  if (!Drawable::redrawsEnabled() || painting_) return false;
  std::vector<Kw::Box<int>> areas;
  for (const auto& a : given) {
    const Kw::Box<int> on = a.intersection(canvas()->rootRect());
    if (!on.empty()) areas.push_back(on);
  }
  if (areas.empty()) return false;
  painting_ = &session;
  session.beginFrame(areas);
  paintTree(session, canvas(), canvas()->rootRect(), areas);
  session.endFrame(areas);
  painting_ = nullptr;
  return true;
}

void RootGlob::paintTree(PaintSession& s, Canvas* c, const Kw::Box<int>& parentVisible,
                         const std::vector<Kw::Box<int>>& areas) {
  if (!c->isMapped()) return;
  const Kw::Box<int> visible = c->rootRect().intersection(parentVisible);
  if (visible.empty()) return;
  // Each canvas draws once per frame, clipped to the bounding box of its damaged parts; the
  // session's frame clip keeps it within the damaged areas themselves.
  Kw::Box<int> damaged;
  for (const auto& a : areas) damaged = damaged.united(a.intersection(visible));
  if (damaged.empty()) return;
  const XY<int> o = c->rootOrigin();
  std::vector<Canvas*> kids;
  c->childrenIn(damaged.translated(-o.x, -o.y), kids);
  // What opaque children will paint anyway is left out of this canvas's clip.
  std::vector<Kw::Box<int>> covered;
  for (Canvas* k : kids) {
    if (!k->isOpaque() || !k->isMapped()) continue;
    const Kw::Box<int> r = k->rect().translated(o.x, o.y).intersection(damaged);
    if (!r.empty()) covered.push_back(r);
  }
  Glob* g = globOf(c);
  if (g == this) {
    s.beginCanvas(*c, damaged, covered);
    s.fillCanvas(getPalette().get(Palette::Window));
    s.endCanvas(*c);
  } else if (g) {
    s.beginCanvas(*c, damaged, covered);
    g->draw();
    s.endCanvas(*c);
    if (drawObserver_) drawObserver_(g);
  }
  for (Canvas* k : kids) paintTree(s, k, visible, areas);
}
