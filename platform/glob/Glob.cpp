#include "platform/glob/Glob.h"

#include <cmath>
#include <limits>

#include "platform/glob/GlobRegistry.h"
#include "platform/glob/RootGlob.h"
#include "platform/glob/RuntimeClock.h"
#include "platform/kw/CrossCast.h"
#include "platform/misc/Diagnostics.h"

namespace {

// Synchronous message nesting; deeper chains are refused rather than overflowing the stack.
int gCallDepth = 0;
constexpr int kMaxCallDepth = 64;

}  // namespace

bool is_good_glob_ptr(const void* p) {
  return GlobRegistry::isLiveAddress(p);
}

bool glob_serial_is_alive(const Glob* g, uint64_t serial) {
  return GlobRegistry::isLive(g, serial);
}

Glob::Glob(const GlobCreationInfo& info)
    : canvas_(info.canvas, this, Kw::Box<int>::fromSize(info.x, info.y, info.width, info.height)),
      serial_(GlobRegistry::enter(this)),
      palette_(info.palette) {
  if (info.flags & kGlobCreateUnmapped) canvas_.unmap();
}

Glob::Glob(unsigned short width, unsigned short height, int flag, Canvas* parent)
    : Glob(GlobCreationInfo::withFlags(width, height, flag, parent)) {}

Glob::Glob(CanvasHost* host, int width, int height)
    : canvas_(host, this, width, height), serial_(GlobRegistry::enter(this)) {}

Glob::~Glob() {
  while (isFrozen()) unfreeze();
  GlobRegistry::leave(this, serial_);
  canvas_.beginTeardown();
  deleteChildren();
}

Glob::Extras& Glob::extras() {
  if (!extras_) extras_ = std::make_unique<Extras>();
  return *extras_;
}

void Glob::set_name(const String& name) {
  if (name.empty() && !extras_) return;
  extras().name = name;
}

void Glob::setContextString(const String& text) {
  if (text.empty() && !extras_) return;
  extras().contextText = text;
}

void Glob::setDefaultCursor(MouseCursorID id) {
  cursor_ = static_cast<uint8_t>(id);
}

void Glob::deleteChildren() {
  // A teardown touches each child once, and a child is a few cache lines of its own: the
  // children a little further down the list are asked for ahead of their turn (their canvases
  // first, then, once those have come, the objects their canvases name).
  constexpr size_t kCanvasAhead = 8;
  constexpr size_t kClientAhead = 4;
  const std::vector<Canvas*>& kids = canvas_.children();
  while (!kids.empty()) {
    const size_t n = kids.size();
    if (n > kCanvasAhead) __builtin_prefetch(kids[n - 1 - kCanvasAhead]);
    if (n > kClientAhead) __builtin_prefetch(kids[n - 1 - kClientAhead]->client());
    Canvas* c = kids.back();
    if (Glob* g = globOf(c)) {
      delete g;
    } else {
      c->reparent(nullptr);
    }
  }
}

Glob* Glob::globOf(const Canvas* c) {
  // A canvas's client lives at least as long as the canvas; a Glob being destroyed has left
  // the registry and counts as gone.
  Glob* g = c && c->client() ? c->client()->asGlob() : nullptr;
  return g && GlobRegistry::isLive(g, g->serial_) ? g : nullptr;
}

unsigned short Glob::old_height() const {
  return extras_ && extras_->hasOldSize ? extras_->oldHeight : height();
}
unsigned short Glob::old_width() const {
  return extras_ && extras_->hasOldSize ? extras_->oldWidth : width();
}

Glob* Glob::parent() const {
  for (Canvas* c = canvas_.parent(); c; c = c->parent()) {
    if (Glob* g = globOf(c)) return g;
  }
  return nullptr;
}

unsigned short Glob::height() const {
  return static_cast<unsigned short>(canvas_.height());
}
unsigned short Glob::width() const {
  return static_cast<unsigned short>(canvas_.width());
}

void Glob::set_interest(int mask) {
  const bool newTicks = (mask & kInterestTicks) && !(interest_ & kInterestTicks);
  interest_ |= mask;
  if (newTicks) {
    if (RootGlob* r = root()) r->addTicker(this);
  }
}

void Glob::clear_interest(int mask) {
  interest_ &= ~mask;
}

void Glob::pop_to_top() {
  canvas_.raise();
}
void Glob::push_to_bottom() {
  canvas_.lower();
}
void Glob::map_canvas() {
  canvas_.map();
}
void Glob::unmap_canvas() {
  canvas_.unmap();
}

void Glob::reshape_canvas(int x, int y, int width, int height) {
  const bool resized = width != canvas_.width() || height != canvas_.height();
  if (resized) {
    Extras& ex = extras();
    ex.oldWidth = this->width();
    ex.oldHeight = this->height();
    ex.hasOldSize = true;
  }
  placeCanvas(Kw::Box<int>::fromSize(x, y, std::max(0, width), std::max(0, height)));
  if (!resized) return;
  if (frozenHolder() || layoutHeld_) {
    layoutOwed_ = true;
    return;
  }
  reshape();
}

void Glob::translate_canvas(int dx, int dy) {
  placeCanvas(canvas_.rect().translated(dx, dy));
}

void Glob::set_kbd_focus() {
  if (RootGlob* r = root()) r->setFocus(this);
}

int Glob::call_msg(Glob* target, const char* msg) {
  if (!is_good_glob_ptr(target)) {
    diagWarning("call_msg to a deleted Glob dropped: " + String(msg ? msg : "") + "\n");
    return -1;
  }
  if (gCallDepth >= kMaxCallDepth) {
    diagError("call_msg nested too deeply, message dropped: " + String(msg ? msg : "") + "\n");
    return -1;
  }
  Event e = make_message_event(this, target, msg ? msg : "");
  ++gCallDepth;
  const int result = target->react(&e);
  --gCallDepth;
  return result;
}

String Glob::get_id() const {
  return extras_ && !extras_->name.empty() ? extras_->name : String(idstring());
}

void Glob::setActive(bool active, bool redraw) {
  if (active == active_) return;
  active_ = active;
  if (redraw) update();
}

void Glob::setVisible(bool visible) {
  if (visible) {
    canvas_.map();
  } else {
    canvas_.unmap();
  }
}

void Glob::setPalette(const Palette& palette) {
  if (palette == palette_) return;
  palette_ = palette;
  update();
}

void Glob::setCol(const Colour& colour, bool redraw) {
  palette_.set(Palette::Window, colour);
  if (redraw) update();
}

void Glob::detachFromParent() {
  if (!canvas_.parent()) return;
  canvas_.reparent(nullptr);
  set_canvas();
}

bool Glob::m_is_type(const char* type) const {
  return type && String(type) == idstring();
}

String Glob::contextString(const XY<int>&, CanvasClient*) {
  return extras_ ? extras_->contextText : String();
}

void Glob::update() {
  if (Glob* holder = frozenHolder()) {
    holder->redrawOwed_ = true;
    return;
  }
  canvas_.damage();
}

void Glob::update(const Kw::Box<int>& localArea) {
  if (Glob* holder = frozenHolder()) {
    holder->redrawOwed_ = true;
    return;
  }
  canvas_.damage(localArea);
}

bool Glob::canDraw() {
  return canvas_.isMappedToRoot() && !canvas_.visibleRootRect().empty();
}

double Glob::get_x() const {
  return canvas_.rootOrigin().x;
}
double Glob::get_y() const {
  return canvas_.rootOrigin().y;
}

std::vector<Glob*> Glob::children() const {
  std::vector<Glob*> out;
  for (Canvas* c : canvas_.children()) {
    if (Glob* g = globOf(c)) out.push_back(g);
  }
  return out;
}

RootGlob* Glob::root() const {
  return Kw::crossCast<RootGlob>(canvas_.host());
}

bool Glob::hasKbdFocus() const {
  const RootGlob* r = root();
  return r && r->focus() == this;
}

void Glob::send_msg(Glob* target, const char* msg) {
  if (!is_good_glob_ptr(target)) {
    diagWarning("send_msg to a deleted Glob dropped: " + String(msg ? msg : "") + "\n");
    return;
  }
  RootGlob* r = target->root();
  if (!r) {
    diagWarning("send_msg to a Glob on no screen dropped: " + String(msg ? msg : "") + "\n");
    return;
  }
  r->post(make_message_event(this, target, msg ? msg : ""));
}

int Glob::clock() {
  return static_cast<int>(RuntimeClock::now());
}

// --- Free functions ---

int event_send(Event* e, bool queued) {
  if (!e) return 0;
  Glob* dest = e->dest;
  if (!dest && e->canvas && e->canvas->client()) dest = e->canvas->client()->asGlob();
  if (!is_good_glob_ptr(dest)) return 0;
  e->dest = dest;
  if (!e->canvas) e->canvas = dest->canvas();
  RootGlob* r = dest->root();
  if (queued) {
    if (!r) {
      diagWarning("queued event for a Glob on no screen dropped\n");
      return 0;
    }
    r->post(*e);
    return 0;
  }
  if (message_event(e) || tick_event(e)) {
    if (gCallDepth >= kMaxCallDepth) {
      diagError("event_send nested too deeply, message dropped: " + e->text() + "\n");
      return -1;
    }
    ++gCallDepth;
    const int result = dest->react(e);
    --gCallDepth;
    return result;
  }
  if (r) return r->deliver(*e, dest, true);
  return dest->react(e);
}

Event make_message_event(Glob* from, Glob* to, const String& text, uint32_t modifiers) {
  Event e(kEventMessage);
  e.word2 = modifiers;
  e.message(text);
  e.setSender(from);
  e.dest = to;
  e.canvas = is_good_glob_ptr(to) ? to->canvas() : nullptr;
  return e;
}

int send_message_event(Glob* from, Glob* to, const String& text, uint32_t modifiers) {
  if (!is_good_glob_ptr(to)) return 0;
  Event e = make_message_event(from, to, text, modifiers);
  return event_send(&e, false);
}

Glob* get_kbd_focus(const Glob* g) {
  RootGlob* r = is_good_glob_ptr(g) ? g->root() : nullptr;
  return r ? r->focus() : nullptr;
}

bool canvas_is_mapped_to_root(const Canvas* c) {
  return c && c->isMappedToRoot();
}

Canvas* glib_getCurrentMouseCanvas(const Glob* on) {
  RootGlob* r = is_good_glob_ptr(on) ? on->root() : nullptr;
  Glob* g = r ? r->hovered() : nullptr;
  return g ? g->canvas() : nullptr;
}

namespace {

XY<double> centreOf(const Glob* g) {
  const Kw::Box<int> b = g->canvas()->rootRect();
  return XY<double>((b.x0 + b.x1) / 2.0, (b.y0 + b.y1) / 2.0);
}

}  // namespace

Glob* find_nearest_glob(Glob* g, Glob* exclude) {
  if (!is_good_glob_ptr(g)) return nullptr;
  RootGlob* r = g->root();
  if (!r) return nullptr;
  const XY<double> c = centreOf(g);
  Glob* found = r->globAt(XY<int>(static_cast<int>(c.x), static_cast<int>(c.y)));
  // Climb out of g's own subtree and past the excluded Glob.
  auto inSubtree = [g](Glob* x) {
    for (Glob* p = x; p; p = p->parent()) {
      if (p == g) return true;
    }
    return false;
  };
  while (found && (inSubtree(found) || found == exclude)) found = found->parent();
  return found;
}

double glob_pseudo_distance(Glob* a, Glob* b) {
  constexpr double kFar = std::numeric_limits<double>::max();
  if (!is_good_glob_ptr(a) || !is_good_glob_ptr(b)) return kFar;
  if (!b->canvas()->isMappedToRoot()) return kFar;
  const XY<double> c = centreOf(a);
  const Kw::Box<int> r = b->canvas()->visibleRootRect();
  if (r.empty()) return kFar;
  const double dx = std::max({r.x0 - c.x, 0.0, c.x - r.x1});
  const double dy = std::max({r.y0 - c.y, 0.0, c.y - r.y1});
  if (dx == 0.0 && dy == 0.0) {
    const double edge = std::min({c.x - r.x0, r.x1 - c.x, c.y - r.y0, r.y1 - c.y});
    return -std::max(edge, 1e-3);
  }
  return std::sqrt(dx * dx + dy * dy);
}
