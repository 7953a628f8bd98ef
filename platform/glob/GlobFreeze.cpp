// Glob: freezing and the layout requests it holds back. While a Glob is frozen, repaints and
// layouts asked of it or of any Glob inside it are only noted; the last unfreeze pays them once.
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/RootGlob.h"
#include "platform/misc/Diagnostics.h"

namespace {

// How many Globs are frozen now. Nearly always none: then a repaint request does not look at
// its ancestors at all.
int gFrozenGlobs = 0;

}  // namespace

Glob* Glob::frozenHolder() const {
  if (gFrozenGlobs == 0) return nullptr;
  for (const Glob* g = this; g; g = g->parent()) {
    if (g->isFrozen()) return const_cast<Glob*>(g);
  }
  return nullptr;
}

void Glob::placeCanvas(const Kw::Box<int>& rectInParent) {
  Glob* holder = frozenHolder();
  if (!holder) {
    canvas_.reshape(rectInParent);
    return;
  }
  if (rectInParent == canvas_.rect()) return;
  Extras& ex = holder->extras();
  ex.owedArea = ex.owedArea.united(canvas_.visibleRootRect());
  canvas_.reshapeQuietly(rectInParent);
  ex.owedArea = ex.owedArea.united(canvas_.visibleRootRect());
  holder->redrawOwed_ = true;
}

void Glob::freeze() {
  if (extras().freezeCount++ == 0) ++gFrozenGlobs;
}

void Glob::unfreeze() {
  if (!isFrozen()) {
    diagWarning("unfreeze without a matching freeze ignored: " + get_id() + "\n");
    return;
  }
  if (--extras_->freezeCount > 0) return;
  --gFrozenGlobs;
  if (frozenHolder()) return;  // a frozen parent pays for us when it thaws

  // Layouts first, parents before children, then one repaint of the whole area. A reshape may
  // delete Globs of the subtree: walk_subtree skips those.
  GlobHandle<> self(this);
  bool repaint = redrawOwed_;
  Kw::Box<int> owed;
  walk_subtree([&repaint, &owed](Glob* g) {
    repaint = repaint || g->redrawOwed_ || g->layoutOwed_;
    g->redrawOwed_ = false;
    if (g->extras_ && !g->extras_->owedArea.empty()) {
      owed = owed.united(g->extras_->owedArea);
      g->extras_->owedArea = Kw::Box<int>();
    }
    if (g->layoutOwed_ && !g->layoutHeld_ && !g->frozenHolder()) {
      g->layoutOwed_ = false;
      g->reshape();
    }
    return false;
  });
  if (self && repaint) {
    redrawOwed_ = false;
    canvas_.damage();
    // Places left by moves while frozen; the area is in the screen's coordinates.
    if (RootGlob* r = root(); r && !owed.empty()) r->canvasDamaged(owed);
  }
}

void Glob::reshape_myself() {
  if (frozenHolder()) {
    layoutOwed_ = true;
    return;
  }
  reshape();
}

void Glob::reshape_and_draw() {
  GlobHandle<> self(this);
  reshape_myself();
  if (self) update();
}
