#include "panels/PanelWidgetList.h"

#include "panels/StandardPanel.h"

bool PanelWidgetList::mayHold(const Glob* widget) const {
  return addresses_ && addresses_->contains(widget);
}

WidgetDetails* PanelWidgetList::findLiveEntry(const Glob* widget) {
  if (!widget || !mayHold(widget)) return nullptr;
  for (WidgetDetails& d : list_) {
    if (d.get() == widget) return &d;
  }
  return nullptr;
}

const WidgetDetails* PanelWidgetList::findLive(const Glob* widget) const {
  return const_cast<PanelWidgetList*>(this)->findLiveEntry(widget);
}

const WidgetDetails* PanelWidgetList::findAny(const Glob* widget) const {
  if (const WidgetDetails* d = findLive(widget)) return d;
  if (!widget || !mayHold(widget)) return nullptr;
  for (const WidgetDetails& d : list_) {
    if (!d.get() && d.address == widget) return &d;
  }
  return nullptr;
}

bool PanelWidgetList::onPanel(const Glob* widget) const {
  return widget->canvas()->parent() == panel_.canvas();
}

bool PanelWidgetList::canAdopt(Glob* widget) const {
  if (!is_good_glob_ptr(widget) || widget->canvas()->isRoot() || findLive(widget)) return false;
  // The panel and its ancestors are the Globs whose canvases hold the panel's.
  for (const Canvas* c = panel_.canvas(); c; c = c->parent()) {
    if (c == widget->canvas()) return false;
  }
  return true;
}

const WidgetDetails& PanelWidgetList::insert(const WidgetDetails& d, Glob* insertAfter) {
  Glob* widget = d.get();
  // A widget that stands nowhere yet is put in its place before it joins the panel, so that it
  // shows (and asks for a repaint) once, where it belongs.
  const bool loose = !widget->canvas()->parent();
  auto at = list_.end();
  if (const WidgetDetails* after =
          is_good_glob_ptr(insertAfter) ? findLive(insertAfter) : nullptr) {
    at = list_.begin() + (after - list_.data()) + 1;
  }
  if (!addresses_) addresses_ = std::make_unique<Kw::AddressCounts>();
  addresses_->add(d.address);
  WidgetDetails& added = *list_.insert(at, d);
  if (loose) {
    XY<int> corner;
    if (cornerOf(added, corner)) moveTo(*widget, corner);
  }
  if (!onPanel(widget)) widget->canvas()->reparent(panel_.canvas());
  if (!loose) place(added);
  return added;
}

bool PanelWidgetList::remove(const Glob* widget, Glob*& live) {
  const WidgetDetails* d = findAny(widget);
  if (!d) return false;
  live = d->get();
  const size_t index = static_cast<size_t>(d - list_.data());
  for (WidgetDetails& other : list_) {
    if (other.relative && other.reference.refersTo(live)) makeAbsolute(other);
  }
  const Glob* address = list_[index].address;
  list_.erase(list_.begin() + static_cast<std::ptrdiff_t>(index));
  addresses_->remove(address);
  return true;
}

void PanelWidgetList::makeAbsolute(WidgetDetails& d) {
  d.relative = false;
  d.reference.reset();
  d.origin = OriginBottomLeft;
  if (Glob* g = d.get()) {
    d.pos = XY<int>(g->canvas()->rect().x0, g->canvas()->rect().y0);
  }
}

bool PanelWidgetList::currentOrigin(const Glob* widget, CoordinateOrigin& origin) const {
  const WidgetDetails* d = findLive(widget);
  if (!d) return false;
  origin = d->relative ? OriginBottomLeft : d->origin;
  return true;
}

PanelWidgetList::Edit PanelWidgetList::setPos(const Glob* widget, XY<int> pos,
                                              CoordinateOrigin origin) {
  WidgetDetails* d = findLiveEntry(widget);
  if (!d || !PanelGeometry::isValidOrigin(origin)) return Edit::Refused;
  if (!d->relative && d->pos == pos && d->origin == origin) return Edit::Unchanged;
  d->relative = false;
  d->reference.reset();
  d->pos = pos;
  d->origin = origin;
  return Edit::Changed;
}

PanelWidgetList::Edit PanelWidgetList::translate(const Glob* widget, int dx, int dy) {
  WidgetDetails* d = findLiveEntry(widget);
  if (!d) return Edit::Refused;
  if (dx == 0 && dy == 0) return Edit::Unchanged;
  if (d->relative) makeAbsolute(*d);
  d->pos = PanelGeometry::translateOffset(d->origin, d->pos, dx, dy);
  return Edit::Changed;
}

PanelWidgetList::Edit PanelWidgetList::setSurround(const Glob* widget, WidgetSurround surround) {
  WidgetDetails* d = findLiveEntry(widget);
  if (!d) return Edit::Refused;
  if (d->surround == surround) return Edit::Unchanged;
  d->surround = surround;
  return Edit::Changed;
}

Kw::Box<int> PanelWidgetList::outerBoxOf(const WidgetDetails& d) const {
  const Glob* g = d.get();
  if (!g) return Kw::Box<int>();
  const int s = PanelGeometry::surroundWidth(d.surround);
  const Kw::Box<int>& r = g->canvas()->rect();
  return Kw::Box<int>(r.x0 - s, r.y0 - s, r.x1 + s, r.y1 + s);
}

bool PanelWidgetList::cornerOf(WidgetDetails& d, XY<int>& corner) {
  const Glob* g = d.get();
  const XY<int> size(g->width(), g->height());
  if (d.relative) {
    const WidgetDetails* ref = findLive(d.reference.get());
    if (!ref || !onPanel(ref->get())) {
      makeAbsolute(d);
      return false;
    }
    const int s = PanelGeometry::surroundWidth(d.surround);
    const Kw::Box<int> outer =
        PanelGeometry::placeRelative(outerBoxOf(*ref), XY<int>(size.x + 2 * s, size.y + 2 * s),
                                     d.gap, d.relativity, d.alignment);
    corner = XY<int>(outer.x0 + s, outer.y0 + s);
  } else {
    corner = PanelGeometry::placeFromOrigin(d.origin, d.pos, size, panel_.frame());
  }
  return true;
}

void PanelWidgetList::moveTo(Glob& g, XY<int> corner) {
  const Kw::Box<int>& r = g.canvas()->rect();
  if (r.x0 != corner.x || r.y0 != corner.y) g.translate_canvas(corner.x - r.x0, corner.y - r.y0);
}

void PanelWidgetList::place(WidgetDetails& d) {
  Glob* g = d.get();
  if (!g || !onPanel(g)) return;
  XY<int> corner;
  if (cornerOf(d, corner)) moveTo(*g, corner);
}

void PanelWidgetList::placeAll() {
  // Index loop: a child may be deleted while it is being moved, never added.
  for (size_t i = 0; i < list_.size(); ++i) place(list_[i]);
}

std::vector<WidgetDetails> PanelWidgetList::takeAll() {
  std::vector<WidgetDetails> out;
  out.swap(list_);
  addresses_.reset();
  return out;
}
