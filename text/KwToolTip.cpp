#include "text/KwToolTip.h"

#include <algorithm>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/ToolTipLook.h"
#include "platform/glob/RootGlob.h"
#include "platform/glob/RuntimeClock.h"
#include "platform/glob/WindowPlacement.h"
#include "text/ToolTipDetector.h"

bool KwToolTip::enabled_ = true;
GlobHandle<KwToolTip> KwToolTip::theToolTip_;

// --- Class-wide control ---

ToolTipDetector* KwToolTip::registerTypes(RootGlob& screen) {
  for (Glob* g : screen.children()) {
    if (auto* d = dynamic_cast<ToolTipDetector*>(g)) return d;
  }
  return new ToolTipDetector(screen);
}

void KwToolTip::enable(bool on) {
  enabled_ = on;
  if (!on) hide();
}

void KwToolTip::hide() {
  if (KwToolTip* t = theToolTip_.get()) delete t;
  theToolTip_.reset();
}

WString KwToolTip::getTooltipText(RootGlob& screen, XY<int> pos) {
  for (Glob* g = screen.globAt(pos); g; g = g->parent()) {
    if (dynamic_cast<KwToolTip*>(g)) continue;
    const String s = g->contextString(pos - g->canvas()->rootOrigin(), nullptr);
    if (!s.empty()) return Kw::toWide(s);
  }
  return WString();
}

bool KwToolTip::screenReady(const RootGlob& screen) {
  const XY<int> p = screen.pointer();
  return !screen.grabbed() && p.x >= 0 && p.y >= 0 && p.x < screen.width() && p.y < screen.height();
}

void KwToolTip::handleTimerTick(ToolTipDetector& d) {
  RootGlob* screen = d.root();
  if (!screen) return;
  const XY<int> pos = screen->pointer();
  const int64_t now = RuntimeClock::now();
  const bool moved = !(pos == d.lastPointer);
  d.lastPointer = pos;

  KwToolTip* shown = d.shown.get();
  if (!shown && d.hadTooltip) {
    // Taken away by someone else: it stays away until the pointer moves.
    d.hadTooltip = false;
    d.dismissed = true;
    d.source.reset();
  }
  if (!enabled_) {
    if (moved) d.restSince = now;
    return;
  }

  if (shown) {
    Glob* under = screen->globAt(pos);
    const bool sourceThere = d.source.alive() && (under == shown || under == d.source.get());
    if (!sourceThere) {
      // Its control went (deleted, hidden, covered): the next control gets its own rest.
      remove(d);
      d.restSince = now;
    } else if (moved) {
      remove(d);
      d.restSince = now;
    } else if (now - d.shownAt > kShowMs) {
      remove(d);
      d.dismissed = true;
    }
    return;
  }

  if (!moved && screenReady(*screen) && !d.dismissed && now - d.restSince > kRestMs) {
    const WString text = getTooltipText(*screen, pos);
    if (ToolTipLayout::hasSomethingToShow(text)) show(d, *screen, text, screen->globAt(pos), pos);
  }
  if (moved) {
    d.dismissed = false;
    d.restSince = now;
  }
}

void KwToolTip::show(ToolTipDetector& d, RootGlob& screen, const WString& text, Glob* source,
                     XY<int> at) {
  hide();
  auto* tip =
      new KwToolTip(text, screen.getPalette(), std::min(kMaxLineWidth, screen.width() - kMarginX));
  const XY<int> size(tip->width(), tip->height());
  // Its top kPointerGap below the pointer's hot spot, its left edge at the pointer.
  XY<int> where =
      WindowPlacement::keepOnScreen(screen, size, XY<int>(at.x, at.y - size.y - kPointerGap));
  if (Kw::Box<int>::fromSize(where.x, where.y, size.x, size.y).contains(at)) {
    where = WindowPlacement::keepOnScreen(screen, size, XY<int>(where.x, at.y + kPointerGap));
  }
  screen.adopt(tip, where);
  theToolTip_ = tip;
  d.shown = tip;
  d.hadTooltip = true;
  d.source = source;
  d.shownAt = RuntimeClock::now();
}

void KwToolTip::remove(ToolTipDetector& d) {
  if (KwToolTip* t = d.shown.get()) delete t;
  d.shown.reset();
  d.hadTooltip = false;
  d.source.reset();
}

// --- The tooltip ---

KwToolTip::KwToolTip(const WString& text, const Palette& palette, int maxLineWidth)
    : StandardPanel(XY<int>(1, 1), palette, true, nullptr), text_(text) {
  font_ = Glib::fonts().standard();
  lines_ = ToolTipLayout::lines(text_, *font_, maxLineWidth);
  const int w = ToolTipLayout::widest(lines_, *font_) + kMarginX;
  const int h = static_cast<int>(lines_.size()) * font_->height() + kMarginY;
  reshape_canvas(0, 0, std::max(w, kMarginX + 1), std::max(h, kMarginY + 1));
  set_name("tooltip");
}

KwToolTip::~KwToolTip() {
  if (theToolTip_.refersTo(this)) theToolTip_.reset();
}

void KwToolTip::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::ToolTipLook look(getPalette());
  look.frame(p);
  const Kw::Box<int> inner(kMarginX / 2, kMarginY / 2, width() - kMarginX / 2,
                           height() - kMarginY / 2);
  look.lines(p, lines_, inner, *font_);
}
