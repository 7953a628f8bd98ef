// Glob: notifications, outline, flags, "it", identity and self-checks.
#include <algorithm>
#include <cstring>

#include "platform/glob/BoxRegion.h"
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/GlobRegistry.h"
#include "platform/glob/RootGlob.h"
#include "platform/misc/Diagnostics.h"

// --- Notifications ---

void Glob::notify(NotifyMsg) {
  update();
}

void Glob::destroy(NotifyMsg) {
  if (RootGlob* r = root(); r && r != this) {
    r->deleteLater(this);
    return;
  }
  delete this;
}

void Glob::bufNotify(NotifyMsg) {
  update();
}

// --- Outline ---

Kw::Ptr<iRegion> Glob::path() {
  return Kw::Ptr<iRegion>(new BoxRegion(canvas_.localBounds()));
}

Kw::Ptr<iRegion> Glob::shape() {
  Kw::Ptr<iRegion> own = path();
  if (!own) return own;
  const XY<int> o = canvas_.rootOrigin();
  return own->translated(o.x, o.y);
}

bool Glob::isOpaqueAt(const XY<int>& pos) {
  Kw::Ptr<iRegion> own = path();
  return own && own->contains(pos);
}

void Glob::drawUnbuffered(Kw::Ptr<iRegion> area) {
  const Kw::Box<int> local =
      area ? area->bounds().intersection(canvas_.localBounds()) : canvas_.localBounds();
  if (local.empty()) return;
  RootGlob* r = root();
  const XY<int> o = canvas_.rootOrigin();
  const Kw::Box<int> onScreen = local.translated(o.x, o.y).intersection(canvas_.visibleRootRect());
  if (onScreen.empty()) return;
  // The whole tree is painted in the area, so what lies above this Glob stays on top.
  if (r && !frozenHolder() && r->paintNow(onScreen)) return;
  update(local);
}

EventHandlerRc Glob::handleEvent(Event* e) {
  if (!e) return kEventNotConsumed;
  e->dest = this;
  e->canvas = &canvas_;
  return react(e);
}

void Glob::handleBaseWindowMove() {
  walk_children([](Glob* c) {
    c->handleBaseWindowMove();
    return false;
  });
}

void Glob::set_canvas() {
  update();
}

// --- Flags ---

void Glob::set_dumpable(int dumpable) {
  dumpable_ = dumpable != 0;
}
void Glob::set_dump_ifnot_subglob(int only) {
  dumpIfNotSubglob_ = only != 0;
}
void Glob::set_quickdraw(int quick) {
  quickdraw_ = quick != 0;
}

void Glob::make_dirty() {
  if (dirty_) return;
  dirty_ = true;
  update();
}

void Glob::make_clean() {
  if (!dirty_) return;
  dirty_ = false;
  update();
}

bool Glob::is_currently_trashable(int) {
  RootGlob* r = root();
  auto inside = [this](const Glob* g) {
    for (; g; g = g->parent()) {
      if (g == this) return true;
    }
    return false;
  };
  if (r && (inside(r->grabbed()) || inside(r->userMoveTarget()) || inside(r->dragSource()))) {
    return false;
  }
  return !walk_subtree([](Glob* g) { return g->isFrozen(); });
}

// --- "It" ---

void Glob::set_can_be_it(int canBeIt) {
  canBeIt_ = canBeIt != 0;
  if (!canBeIt_ && isIt()) root()->setIt(nullptr);
}

void Glob::handle_it() {
  update();
}

bool Glob::isIt() const {
  const RootGlob* r = root();
  return r && r->it() == this;
}

// --- Identity ---

bool Glob::m_is_same_type(Glob* other) const {
  return is_good_glob_ptr(other) && std::strcmp(other->idstring(), idstring()) == 0;
}

void Glob::getDataFiles(std::vector<String>& out) {
  walk_children([&out](Glob* c) {
    c->getDataFiles(out);
    return false;
  });
}

void Glob::asString(GrowString& out) {
  const Kw::Box<int> r = canvas_.rootRect();
  out << idstring();
  if (const String name = get_name(); !name.empty()) out << " \"" << name << "\"";
  out << " [" << r.x0 << " " << r.y0 << " " << r.width() << " " << r.height() << "]";
  if (!isActive()) out << " inactive";
  if (!isVisible()) out << " hidden";
}

bool Glob::validate() {
  bool ok = true;
  auto fault = [&ok, this](const char* what) {
    diagError("Glob::validate: " + get_id() + ": " + what + "\n");
    ok = false;
  };
  if (!GlobRegistry::isLive(this, serial_)) fault("not a live Glob");
  if (canvas_.client() != this) fault("its canvas belongs to something else");
  if (Canvas* pc = canvas_.parent()) {
    const auto& sib = pc->children();
    if (std::find(sib.begin(), sib.end(), &canvas_) == sib.end()) {
      fault("its parent does not list it");
    }
  }
  for (Canvas* c : canvas_.children()) {
    if (c->parent() != &canvas_) fault("a child names another parent");
  }
  if (canvas_.width() < 0 || canvas_.height() < 0) fault("negative size");
  if (extras_ && extras_->freezeCount < 0) fault("unbalanced freezing");
  return ok;
}

// --- Size state ---

void Glob::setSizeState(size_state state) {
  if (state != SizeFull && state != SizeMinimised) {
    diagWarning("setSizeState: unknown size state refused\n");
    return;
  }
  if (state == getSizeState()) return;
  extras().sizeState = state;
}

void Glob::set_size_flag(size_state state) {
  const size_state before = getSizeState();
  setSizeState(state);
  if (getSizeState() != before) reshape_and_draw();
}

// --- Drag and drop ---

void Glob::handleDropHover(bool hovering) {
  if (dropHover_ == hovering) return;
  dropHover_ = hovering;
  update();
}
