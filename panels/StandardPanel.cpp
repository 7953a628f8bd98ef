#include "panels/StandardPanel.h"

#include <algorithm>
#include <climits>
#include <string>

#include "buttons/Button.h"
#include "buttons/PinButton.h"
#include "buttons/PootButton.h"
#include "buttons/SettingsButton.h"
#include "buttons/SizeButton.h"
#include "panels/ModalShade.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glob/RootGlob.h"
#include "platform/misc/Config.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/UIString.h"
#include "platform/misc/configb.h"
#include "text/PanelTitleTextBox.h"

const char* const StandardPanel::doItMsg = "do_it";
const char* const StandardPanel::titleChangedMsg = "StdPanelTitleChanged";

namespace {

constexpr int kShadeAlpha8 = 150;
constexpr unsigned short kTitleButtonSize = 20;
constexpr unsigned short kPinWidth = 16;
constexpr unsigned short kPinHeight = 20;
constexpr unsigned short kDoItWidth = 80;
constexpr unsigned short kDoItHeight = 22;
constexpr unsigned kDoItLabelId = 41;  // how much of the screen the modal shade hides, of 255

Canvas* screenCanvas() {
  RootGlob* r = RootGlob::current();
  return r ? r->canvas() : nullptr;
}

GlobCreationInfo makeInfo(unsigned short width, unsigned short height, const Palette* palette,
                          Canvas* parent) {
  GlobCreationInfo info(width, height, parent);
  if (palette) info.palette = *palette;
  return info;
}

unsigned short toDimension(int v) {
  return static_cast<unsigned short>(std::clamp(v, 0, 0xFFFF));
}

// A size from the record; one that is no 16-bit size is refused in favour of the default.
unsigned short dimensionFromConfig(const configb& config, const char* key, unsigned short def) {
  const int v = config_int(config, key, def);
  if (v >= 0 && v <= 0xFFFF) return static_cast<unsigned short>(v);
  if (config.firstReportOf(key, config.get(key))) {
    diagWarning(String("StandardPanel: ") + key + " " + std::to_string(v) +
                " is no panel size; using " + std::to_string(def) + "\n");
  }
  return def;
}

GlobCreationInfo infoFromConfig(const configb& config, unsigned short width, unsigned short height,
                                Canvas* parent) {
  GlobCreationInfo info(dimensionFromConfig(config, "width", width),
                        dimensionFromConfig(config, "height", height),
                        parent ? parent : screenCanvas());
  info.x = config_int(config, "x", 0);
  info.y = config_int(config, "y", 0);
  return info;
}

bool startsWith(const String& s, const char* prefix) {
  return s.rfind(prefix, 0) == 0;
}

}  // namespace

// The title widgets the panel owns, each present only while its flag is set.
struct StandardPanel::StandardWidgets {
  GlobHandle<PootButton> poot;
  GlobHandle<SettingsButton> settings;
  GlobHandle<SizeButton> size;
  GlobHandle<PinButton> pin;
  GlobHandle<Button> doIt;
  GlobHandle<PanelTitleTextBox> title;

  Glob* titleBoxGlob() const { return title.get(); }
};

// --- Construction ---

StandardPanel::StandardPanel(unsigned short width, unsigned short height)
    : rect(makeInfo(width, height, nullptr, screenCanvas())) {
  init();
}

StandardPanel::StandardPanel(unsigned short width, unsigned short height, const Palette& palette,
                             bool dismissable, Canvas* parent)
    : rect(makeInfo(width, height, &palette, parent)) {
  init();
  dismissable_ = dismissable;
}

StandardPanel::StandardPanel(XY<int> size)
    : StandardPanel(toDimension(size.x), toDimension(size.y)) {}

StandardPanel::StandardPanel(XY<int> size, const Palette& palette, bool dismissable, Canvas* parent)
    : StandardPanel(toDimension(size.x), toDimension(size.y), palette, dismissable, parent) {}

StandardPanel::StandardPanel(const configb& config, unsigned short width, unsigned short height,
                             Canvas* parent)
    : rect(infoFromConfig(config, width, height, parent)) {
  init();
  border_ = static_cast<UifTypeOfBorder>(config_int(config, "border", UifBorderNone));
  title_ = Kw::toWide(config.get("title"));
}

StandardPanel::StandardPanel(const GlobCreationInfo& info) : rect(info) {
  init();
}

void StandardPanel::init() {
  std_ = std::make_unique<StandardWidgets>();
  fullHeight_ = height();
  canvas()->setOpaque(getcol().a >= 1.0);
}

StandardPanel::~StandardPanel() {
  while (modalDepth_ > 0) setModal(false);
  std::vector<WidgetDetails> list;
  list.swap(widgets_);
  for (WidgetDetails& d : list) {
    if (Glob* g = d.get()) {
      if (ownsCanvasOf(g)) delete g;
    } else {
      Diagnostics::print(kDoubleDeletionLevel, "glob double deletion(2)\n");
    }
  }
}

// --- Colour, border, title, size ---

void StandardPanel::setCol(const Colour& colour, bool redraw) {
  if (colour == getcol() && colour == getPalette().get(Palette::Window)) return;
  setcol(colour, false);
  rect::setCol(colour, redraw);
}

void StandardPanel::setcol(const Colour& colour, bool redraw) {
  rect::setcol(colour, redraw);
  // Only an opaque face lets the screen skip what lies beneath the panel.
  canvas()->setOpaque(colour.a >= 1.0);
}

void StandardPanel::setBorderStyle(UifTypeOfBorder border) {
  if (border == border_) return;
  border_ = border;
  recalculateWidgetPositions();
  update();
}

void StandardPanel::setTitle(const WString& title) {
  if (title == title_) return;
  title_ = title;
  if (PanelTitleTextBox* box = std_->title.get()) box->showTitle(title_);
  update();
}

void StandardPanel::setMinSize(unsigned width, unsigned height) {
  const XY<int> m(static_cast<int>(std::min(width, 0xFFFFu)),
                  static_cast<int>(std::min(height, 0xFFFFu)));
  if (m == minSize_) return;
  minSize_ = m;
  if (sizeState_ == SizeFull && (this->width() < m.x || this->height() < m.y)) {
    const Kw::Box<int>& r = canvas()->rect();
    reshape_canvas(r.x0, r.y0, r.width(), r.height());
  }
}

void StandardPanel::reshape_canvas(int x, int y, int width, int height) {
  if (sizeState_ == SizeFull) {
    width = std::max(width, minSize_.x);
    height = std::max(height, minSize_.y);
  }
  rect::reshape_canvas(x, y, width, height);
}

void StandardPanel::reshape() {
  recalculateWidgetPositions();
  update();
}

void StandardPanel::handleFlipSize() {
  set_size_flag(sizeState_ == SizeFull ? SizeMinimised : SizeFull);
}

void StandardPanel::set_size_flag(size_state state) {
  if (state != SizeFull && state != SizeMinimised) return;
  if (state == sizeState_) return;
  applySizeState(state);
}

void StandardPanel::applySizeState(size_state state) {
  const Kw::Box<int> r = canvas()->rect();
  if (state == SizeMinimised) {
    fullHeight_ = r.height();
    hiddenByMinimise_.clear();
    std::vector<Glob*> hide;
    getChildren(hide);
    if (Glob* doIt = std_->doIt.get()) hide.push_back(doIt);
    for (Glob* g : hide) {
      if (!g->isVisible()) continue;
      g->unmap_canvas();
      hiddenByMinimise_.emplace_back(g);
    }
    sizeState_ = state;
    const int h = 2 * calcBorderSize(border_) +
                  (PanelGeometry::hasTitleStrip(stdFlags_) ? PanelGeometry::kTitleStripHeight : 0);
    reshape_canvas(r.x0, r.y1 - h, r.width(), h);
  } else {
    sizeState_ = state;
    reshape_canvas(r.x0, r.y1 - fullHeight_, r.width(), fullHeight_);
    for (const GlobHandle<>& h : hiddenByMinimise_) {
      if (Glob* g = h.get()) g->map_canvas();
    }
    hiddenByMinimise_.clear();
  }
  syncSizeButton();
  update();
}

// --- Layout queries ---

PanelFrame StandardPanel::frame() const {
  PanelFrame f;
  f.flags = stdFlags_;
  f.size = XY<int>(width(), height());
  f.border = border_;
  return f;
}

XY<int> StandardPanel::getOriginXY(CoordinateOrigin origin) const {
  return PanelGeometry::originXY(origin, frame());
}

Kw::Box<int> StandardPanel::getUserArea() const {
  return PanelGeometry::userArea(frame());
}

XY<int> StandardPanel::getOriginXY(CoordinateOrigin origin, int flags, XY<int> size,
                                   UifTypeOfBorder border) {
  return PanelGeometry::originXY(origin, PanelFrame{flags, size, border});
}

Kw::Box<int> StandardPanel::getUserArea(int flags, XY<int> size, UifTypeOfBorder border) {
  return PanelGeometry::userArea(PanelFrame{flags, size, border});
}

// --- Children ---

WidgetDetails* StandardPanel::findLive(const Glob* widget) {
  if (!widget) return nullptr;
  for (WidgetDetails& d : widgets_) {
    if (d.get() == widget) return &d;
  }
  return nullptr;
}

const WidgetDetails* StandardPanel::findLive(const Glob* widget) const {
  return const_cast<StandardPanel*>(this)->findLive(widget);
}

WidgetDetails* StandardPanel::findAny(const Glob* widget) {
  if (WidgetDetails* d = findLive(widget)) return d;
  if (!widget) return nullptr;
  for (WidgetDetails& d : widgets_) {
    if (!d.get() && d.address == widget) return &d;
  }
  return nullptr;
}

bool StandardPanel::ownsCanvasOf(const Glob* widget) const {
  return widget->canvas()->parent() == canvas();
}

bool StandardPanel::isAncestorOrSelf(const Glob* g) const {
  for (const Glob* p = this; p; p = p->parent()) {
    if (p == g) return true;
  }
  return false;
}

bool StandardPanel::canAdopt(Glob* widget) const {
  return is_good_glob_ptr(widget) && !isAncestorOrSelf(widget) && !widget->canvas()->isRoot() &&
         !findLive(widget);
}

WidgetDetails& StandardPanel::insertDetails(const WidgetDetails& d, Glob* insertAfter) {
  Glob* widget = d.get();
  if (!ownsCanvasOf(widget)) widget->canvas()->reparent(canvas());
  auto at = widgets_.end();
  if (const WidgetDetails* after =
          is_good_glob_ptr(insertAfter) ? findLive(insertAfter) : nullptr) {
    at = widgets_.begin() + (after - widgets_.data()) + 1;
  }
  return *widgets_.insert(at, d);
}

bool StandardPanel::addWidget(Glob* widget, XY<int> pos, CoordinateOrigin origin,
                              WidgetSurround surround, Glob* insertAfter) {
  if (!canAdopt(widget) || !PanelGeometry::isValidOrigin(origin)) return false;
  WidgetDetails d;
  d.widget = widget;
  d.address = widget;
  d.pos = pos;
  d.origin = origin;
  d.surround = surround;
  adopt(d, insertAfter);
  return true;
}

bool StandardPanel::addWidget(Glob* widget, int x, int y, CoordinateOrigin origin,
                              WidgetSurround surround, Glob* insertAfter) {
  return addWidget(widget, XY<int>(x, y), origin, surround, insertAfter);
}

bool StandardPanel::addWidgetRelative(Glob* widget, Glob* reference, unsigned gap,
                                      WidgetRelativity relativity, WidgetSurround surround,
                                      WidgetAlignment alignment) {
  if (!canAdopt(widget) || !findLive(reference) || reference == widget) return false;
  if (relativity < PlaceAbove || relativity > PlaceRightOf) return false;
  if (!PanelGeometry::alignmentFits(relativity, alignment)) return false;
  WidgetDetails d;
  d.widget = widget;
  d.address = widget;
  d.surround = surround;
  d.relative = true;
  d.reference = reference;
  d.gap = gap;
  d.relativity = relativity;
  d.alignment = alignment;
  // Appended, so that every widget comes after the widget it is placed against.
  adopt(d, nullptr);
  return true;
}

void StandardPanel::adopt(const WidgetDetails& details, Glob* insertAfter) {
  const WidgetDetails added = insertDetails(details, insertAfter);
  recalculateWidgetPositions();
  joinTabOrder(details.widget.get(), insertAfter);
  update();
  handleWidgetAdded(added);
}

void StandardPanel::joinTabOrder(Glob* widget, Glob* insertAfter) {
  auto* stop = dynamic_cast<TabOrderable*>(widget);
  if (!stop) return;
  unsigned order = TabOrderManager::kAfterLast;
  if (auto* after =
          is_good_glob_ptr(insertAfter) ? dynamic_cast<TabOrderable*>(insertAfter) : nullptr) {
    for (unsigned i = 0; i < tabOrder_.numTabStops(); ++i) {
      if (tabOrder_.getTabStopObject(i) != after) continue;
      const unsigned afterOrder = tabOrder_.getTabStopTabOrder(i);
      if (afterOrder + 1 < TabOrderManager::kFirstReservedOrder) order = afterOrder + 1;
      break;
    }
  }
  if (!tabOrder_.addTabStop(*stop, order)) tabOrder_.addTabStop(*stop, TabOrderManager::kAfterLast);
}

bool StandardPanel::removeWidget(Glob* widget, bool destroy) {
  WidgetDetails* d = findAny(widget);
  if (!d) return false;
  Glob* live = d->get();
  const size_t index = static_cast<size_t>(d - widgets_.data());
  for (WidgetDetails& other : widgets_) {
    if (other.relative && other.reference.refersTo(live)) makeAbsolute(other);
  }
  widgets_.erase(widgets_.begin() + static_cast<std::ptrdiff_t>(index));
  if (live) {
    if (auto* stop = dynamic_cast<TabOrderable*>(live)) tabOrder_.removeTabStop(*stop);
    if (destroy) delete live;
  }
  update();
  return true;
}

void StandardPanel::makeAbsolute(WidgetDetails& d) {
  d.relative = false;
  d.reference.reset();
  d.origin = OriginBottomLeft;
  if (Glob* g = d.get()) {
    d.pos = XY<int>(g->canvas()->rect().x0, g->canvas()->rect().y0);
  }
}

bool StandardPanel::setWidgetPos(Glob* widget, XY<int> pos) {
  WidgetDetails* d = findLive(widget);
  if (!d) return false;
  return setWidgetPos(widget, pos, d->relative ? OriginBottomLeft : d->origin);
}

bool StandardPanel::setWidgetPos(Glob* widget, XY<int> pos, CoordinateOrigin origin) {
  WidgetDetails* d = findLive(widget);
  if (!d || !PanelGeometry::isValidOrigin(origin)) return false;
  if (!d->relative && d->pos == pos && d->origin == origin) return true;
  d->relative = false;
  d->reference.reset();
  d->pos = pos;
  d->origin = origin;
  recalculateWidgetPositions();
  update();
  return true;
}

bool StandardPanel::translateWidgetPos(Glob* widget, int dx, int dy) {
  WidgetDetails* d = findLive(widget);
  if (!d) return false;
  if (dx == 0 && dy == 0) return true;
  if (d->relative) makeAbsolute(*d);
  d->pos = PanelGeometry::translateOffset(d->origin, d->pos, dx, dy);
  recalculateWidgetPositions();
  update();
  return true;
}

bool StandardPanel::setWidgetBorderStyle(Glob* widget, WidgetSurround surround) {
  WidgetDetails* d = findLive(widget);
  if (!d) return false;
  if (d->surround == surround) return true;
  d->surround = surround;
  recalculateWidgetPositions();
  update();
  return true;
}

const WidgetDetails* StandardPanel::getWidget(const Glob* widget) const {
  return const_cast<StandardPanel*>(this)->findAny(widget);
}

const WidgetDetails* StandardPanel::getWidget(unsigned index) const {
  return index < widgets_.size() ? &widgets_[index] : nullptr;
}

bool StandardPanel::isChildWidget(const Glob* widget) const {
  return findLive(widget) != nullptr;
}

void StandardPanel::getChildren(std::vector<Glob*>& out) const {
  for (const WidgetDetails& d : widgets_) {
    if (Glob* g = d.get()) out.push_back(g);
  }
}

Kw::Box<int> StandardPanel::outerBoxOf(const WidgetDetails& d) const {
  const Glob* g = d.get();
  if (!g) return Kw::Box<int>();
  const int s = PanelGeometry::surroundWidth(d.surround);
  const Kw::Box<int>& r = g->canvas()->rect();
  return Kw::Box<int>(r.x0 - s, r.y0 - s, r.x1 + s, r.y1 + s);
}

void StandardPanel::placeWidget(WidgetDetails& d) {
  Glob* g = d.get();
  if (!g || !ownsCanvasOf(g)) return;
  const XY<int> size(g->width(), g->height());
  XY<int> corner;
  if (d.relative) {
    const WidgetDetails* ref = findLive(d.reference.get());
    if (!ref || !ownsCanvasOf(ref->get())) {
      makeAbsolute(d);
      return;
    }
    const int s = PanelGeometry::surroundWidth(d.surround);
    const Kw::Box<int> outer =
        PanelGeometry::placeRelative(outerBoxOf(*ref), XY<int>(size.x + 2 * s, size.y + 2 * s),
                                     d.gap, d.relativity, d.alignment);
    corner = XY<int>(outer.x0 + s, outer.y0 + s);
  } else {
    corner = PanelGeometry::placeFromOrigin(d.origin, d.pos, size, frame());
  }
  const Kw::Box<int>& r = g->canvas()->rect();
  if (r.x0 != corner.x || r.y0 != corner.y) g->translate_canvas(corner.x - r.x0, corner.y - r.y0);
}

void StandardPanel::recalculateWidgetPositions() {
  positionStandardWidgets();
  // Index loop: a child may be deleted while it is being moved, never added.
  for (size_t i = 0; i < widgets_.size(); ++i) placeWidget(widgets_[i]);
}

// --- Tab order ---

bool StandardPanel::incrementTab() {
  if (tabOrder_.numTabStops() == 0) return false;
  return tabOrder_.incrementTabStop() != TabOrderManager::kNone;
}

bool StandardPanel::decrementTab() {
  if (tabOrder_.numTabStops() == 0) return false;
  return tabOrder_.decrementTabStop() != TabOrderManager::kNone;
}

// --- Standard widgets ---

PanelTitleTextBox* StandardPanel::titleBox() const {
  return std_->title.get();
}

Glob* StandardPanel::standardWidget(StandardWidgetFlag flag) const {
  switch (flag) {
    case StdPootButton:
      return std_->poot.get();
    case StdSettingsButton:
      return std_->settings.get();
    case StdSizeButton:
      return std_->size.get();
    case StdDoItButton:
      return std_->doIt.get();
    case StdPinButton:
      return std_->pin.get();
    case StdTitleBox:
    case StdEditableTitleBox:
      return std_->titleBoxGlob();
  }
  return nullptr;
}

void StandardPanel::addStandardWidgets(int flags) {
  flags &= kStdAllFlags;
  stdFlags_ |= flags;
  createStandardButtons(stdFlags_);
  syncTitleBox();
  recalculateWidgetPositions();
  update();
}

void StandardPanel::createStandardButtons(int flags) {
  Canvas* c = canvas();
  const Palette& pal = getPalette();
  // Title buttons take the panel's colours, so that they sit in its title strip.
  auto restyle = [&pal](Button* b) {
    b->setPalette(pal);
    b->setcols(pal.get(Palette::WindowText), pal.windowShade(4));
  };
  if ((flags & StdPootButton) && !std_->poot) {
    auto* b = new PootButton(kTitleButtonSize, 0, c);
    restyle(b);
    std_->poot = b;
  }
  if ((flags & StdSizeButton) && !std_->size) {
    auto* b = new SizeButton(sizeState_ == SizeMinimised, kTitleButtonSize, 0, c);
    restyle(b);
    std_->size = b;
  }
  if ((flags & StdPinButton) && !std_->pin) {
    auto* b = new PinButton(kPinWidth, kPinHeight, c);
    restyle(b);
    b->setTransparentBackground(true);
    // A latching button reports its message + " on" / " off": "pin on" pins the panel.
    b->set_message("pin");
    b->set_state(isPinned() ? kButtonDown : kButtonUp, false);
    std_->pin = b;
  }
  if ((flags & StdSettingsButton) && !std_->settings) {
    auto* b = new SettingsButton(kTitleButtonSize, 0, c);
    restyle(b);
    b->setTransparentBackground(true);
    std_->settings = b;
  }
  if ((flags & StdDoItButton) && !std_->doIt) {
    std_->doIt =
        new Button(UIString(kDoItLabelId).toWString(), doItMsg, kDoItWidth, kDoItHeight, 0, c);
  }
}

void StandardPanel::syncTitleBox() {
  // One box serves both title flags: editable while 0x40 is set, read-only with 0x20 alone,
  // gone with neither.
  const bool wanted = (stdFlags_ & (StdTitleBox | StdEditableTitleBox)) != 0;
  const bool editable = (stdFlags_ & StdEditableTitleBox) != 0;
  PanelTitleTextBox* box = std_->title.get();
  if (!wanted) {
    if (box) delete box;
    std_->title.reset();
  } else if (!box) {
    std_->title = new PanelTitleTextBox(*this, toDimension(calcMaxTitleWidgetWidth()),
                                        kTitleBoxHeight, editable);
  } else if (box->isEditable() != editable) {
    box->setEditable(editable);
  }
}

void StandardPanel::removeStandardWidgets(int flags, bool redraw) {
  flags &= stdFlags_;
  if (!flags) return;
  stdFlags_ &= ~flags;
  auto drop = [](auto& h) {
    if (Glob* g = h.get()) delete g;
    h.reset();
  };
  if (flags & StdPootButton) drop(std_->poot);
  if (flags & StdSettingsButton) drop(std_->settings);
  if (flags & StdSizeButton) drop(std_->size);
  if (flags & StdDoItButton) drop(std_->doIt);
  if (flags & StdPinButton) drop(std_->pin);
  syncTitleBox();
  recalculateWidgetPositions();
  if (redraw) update();
}

int StandardPanel::titleButtonsLeft() const {
  const int right = width() - calcBorderSize(border_) - kTitleMargin;
  int left = right;
  const Glob* buttons[] = {std_->poot.get(), std_->size.get(), std_->pin.get(),
                           std_->settings.get()};
  for (const Glob* g : buttons) {
    if (g && ownsCanvasOf(g)) left = std::min(left, g->canvas()->rect().x0 - kTitleGap);
  }
  return left;
}

int StandardPanel::calcMaxTitleWidgetWidth() const {
  const int left = calcBorderSize(border_) + kTitleMargin;
  return std::max(0, titleButtonsLeft() - left);
}

void StandardPanel::positionStandardWidgets() {
  const Kw::Box<int> strip = PanelGeometry::titleStrip(frame());
  auto centreY = [&strip](const Glob* g) { return strip.y0 + (strip.height() - g->height()) / 2; };
  auto moveTo = [this](Glob* g, int x, int y) {
    const Kw::Box<int>& r = g->canvas()->rect();
    if (ownsCanvasOf(g) && (r.x0 != x || r.y0 != y)) g->translate_canvas(x - r.x0, y - r.y0);
  };

  // From the top-right corner leftwards: close, size, pin, settings, each against the nearest
  // earlier one (the size button against the close button only while that shows).
  const int corner = strip.x1 - kTitleMargin;
  Glob* poot = std_->poot.get();
  Glob* size = std_->size.get();
  Glob* pin = std_->pin.get();
  Glob* settings = std_->settings.get();
  auto leftOf = [corner](const Glob* anchor) {
    return anchor ? anchor->canvas()->rect().x0 - kTitleGap : corner;
  };
  if (poot) moveTo(poot, corner - poot->width(), centreY(poot));
  if (size) {
    const Glob* anchor = poot && poot->isVisible() ? poot : nullptr;
    moveTo(size, leftOf(anchor) - size->width(), centreY(size));
  }
  if (pin) {
    const Glob* anchor = size ? size : poot;
    moveTo(pin, leftOf(anchor) - pin->width(), centreY(pin));
  }
  if (settings) {
    const Glob* anchor = pin ? pin : size ? size : poot;
    moveTo(settings, leftOf(anchor) - settings->width(), centreY(settings));
  }
  if (Glob* box = std_->titleBoxGlob()) {
    const int w = calcMaxTitleWidgetWidth();
    const int x = calcBorderSize(border_) + kTitleMargin;
    const Kw::Box<int>& r = box->canvas()->rect();
    if (r.x0 != x || r.y0 != centreY(box) || r.width() != w) {
      box->reshape_canvas(x, centreY(box), w, box->height());
    }
  }
  if (Glob* doIt = std_->doIt.get()) {
    const Kw::Box<int> bottom = PanelGeometry::bottomStrip(frame());
    moveTo(doIt, bottom.x1 - kTitleMargin - doIt->width(),
           bottom.y0 + (bottom.height() - doIt->height()) / 2);
  }
}

void StandardPanel::syncSizeButton() {
  SizeButton* b = std_->size.get();
  const bool minimised = sizeState_ == SizeMinimised;
  if (b && b->get_size() != minimised) b->set_size(minimised);
}

// --- Pinning and modal display ---

void StandardPanel::setDismissable(bool dismissable) {
  if (dismissable == dismissable_) return;
  dismissable_ = dismissable;
  syncPinButton();
}

void StandardPanel::syncPinButton() {
  PinButton* b = std_->pin.get();
  const button_state shown = isPinned() ? kButtonDown : kButtonUp;
  if (b && b->get_state() != shown) b->set_state(shown, true);
}

Glob* StandardPanel::modalShade() const {
  return shade_.get();
}

int StandardPanel::setModal(bool modal) {
  if (modal) {
    if (modalDepth_ == INT_MAX) return modalDepth_;
    if (++modalDepth_ == 1) enterModal();
  } else if (modalDepth_ > 0) {
    if (--modalDepth_ == 0) leaveModal();
  }
  return modalDepth_;
}

void StandardPanel::enterModal() {
  refresh_off();
  savedDismissable_ = dismissable_;
  Glob* pin = std_->pin.get();
  modalPin_ = pin;
  if (pin) {
    savedPinActive_ = pin->isActive();
    pin->setActive(false, true);
  }
  setDismissable(false);
  if (RootGlob* screen = root(); screen && static_cast<Glob*>(screen) != this) {
    Colour shade = getPalette().windowShade(0);
    shade.a = kShadeAlpha8 / 255.0;
    shade_ = new ModalShade(*screen, shade);
    // The shade is now on top of the screen; lift this panel's top-level ancestor above it.
    Glob* top = this;
    while (top->parent() && top->parent() != screen) top = top->parent();
    top->pop_to_top();
  }
  refresh_on();
}

void StandardPanel::leaveModal() {
  refresh_off();
  if (ModalShade* shade = shade_.get()) delete shade;
  shade_.reset();
  setDismissable(savedDismissable_);
  if (Glob* pin = modalPin_.get()) pin->setActive(savedPinActive_, true);
  modalPin_.reset();
  refresh_on();
}

// --- Events ---

int StandardPanel::react(Event* e) {
  GlobHandle<> self(this);
  if (key_press_event(e)) {
    const unsigned code = e->keyCode();
    if (code == kTabKey && incrementTab()) return 1;
    if (code == (kKeyShift | kTabKey) && decrementTab()) return 1;
    if (handleKeyboardEvent(static_cast<int>(code))) return 1;
    return self ? rect::react(e) : 1;
  }
  if (tick_event(e)) {
    if (handleTimerEvent()) return 1;
    return self ? rect::react(e) : 1;
  }
  if (mouse_event(e)) {
    if (handleMouseEvent(e)) return 1;
    return self ? rect::react(e) : 1;
  }
  if (message_event(e)) return reactToMessage(e);
  return rect::react(e);
}

int StandardPanel::reactToMessage(Event* e) {
  GlobHandle<> self(this);
  const String msg = e->text();
  if (msg == "poot") {
    const bool passOn = handlePoot();
    if (!passOn || !self) return 1;
    return rect::react(e);
  }
  if (startsWith(msg, "minify")) {
    handleFlipSize();
    return 1;
  }
  if (std_->pin.alive() && (msg == "pin on" || msg == "pin off")) {
    setDismissable(msg == "pin off");
    return 1;
  }
  if (msg == titleChangedMsg && titleBox()) {
    setTitle(titleBox()->getText());
    if (self) handleTitleChange();
    return 1;
  }
  if (msg == "screwdriver") return rect::react(e);
  const int handled = handleMessageEvent(msg, event_to_sender_glob(e));
  if (handled) return handled;
  return self ? rect::react(e) : 1;
}

// --- Drawing ---

void StandardPanel::draw() {
  drawBackground();
  drawBorder();
  drawWidgets();
}

namespace {

// Fills the band between `outer` and the box `width` pixels inside it.
void fillRing(Glib::Painter& p, const Kw::Box<int>& outer, int width, const Colour& c) {
  const Kw::Box<int> inner(outer.x0 + width, outer.y0 + width, outer.x1 - width, outer.y1 - width);
  p.fillRect(Kw::Box<int>(outer.x0, inner.y1, outer.x1, outer.y1), c);
  p.fillRect(Kw::Box<int>(outer.x0, outer.y0, outer.x1, inner.y0), c);
  p.fillRect(Kw::Box<int>(outer.x0, inner.y0, inner.x0, inner.y1), c);
  p.fillRect(Kw::Box<int>(inner.x1, inner.y0, outer.x1, inner.y1), c);
}

Kw::Box<int> inset(const Kw::Box<int>& b, int d) {
  return Kw::Box<int>(b.x0 + d, b.y0 + d, b.x1 - d, b.y1 - d);
}

}  // namespace

void StandardPanel::drawBackground() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Palette& pal = getPalette();
  p.fillRect(p.bounds(), getcol());
  const PanelFrame f = frame();
  const Kw::Box<int> title = PanelGeometry::titleStrip(f);
  if (!title.empty()) {
    // A slightly lighter band, lit from above, with an etched line under it.
    p.verticalGradient(title, pal.windowShade(3), pal.windowShade(4));
    p.fillRect(Kw::Box<int>(title.x0, title.y0, title.x1, title.y0 + 1), pal.get(Palette::Shadow));
    p.fillRect(Kw::Box<int>(title.x0, title.y0 - 1, title.x1, title.y0), pal.windowShade(4));
    if (!std_->titleBoxGlob() && !title_.empty()) {
      const Kw::Box<int> textBox(title.x0 + kTitleMargin, title.y0 + 1, titleButtonsLeft(),
                                 title.y1);
      auto font =
          Glib::fonts().get(Glib::FontDesc(String(), Glib::kDefaultFontSize, Glib::FontDesc::Bold));
      p.text(title_, textBox, *font, pal.get(Palette::WindowText), TextAlignment::Left);
    }
  }
  const Kw::Box<int> bottom = PanelGeometry::bottomStrip(f);
  if (!bottom.empty()) {
    p.fillRect(bottom, pal.windowShade(2));
    p.fillRect(Kw::Box<int>(bottom.x0, bottom.y1 - 1, bottom.x1, bottom.y1),
               pal.get(Palette::Shadow));
  }
}

void StandardPanel::drawBorder() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Palette& pal = getPalette();
  const Colour& light = pal.get(Palette::Light);
  const Colour& shadow = pal.get(Palette::Shadow);
  const Colour& edge = pal.get(Palette::Border);
  const Kw::Box<int> all = p.bounds();
  switch (border_) {
    case UifBorderRaised:  // dark outline, 4-pixel raised bevel
      p.outlineRect(all, edge);
      p.depthBox(inset(all, 1), Glib::Bevel::Raised, 4, light, shadow);
      break;
    case UifBorderFramed:  // outline, raised bevel, flat band, sunken groove
      p.outlineRect(all, edge);
      p.depthBox(inset(all, 1), Glib::Bevel::Raised, 3, light, shadow);
      fillRing(p, inset(all, 4), 4, pal.windowShade(2));
      p.depthBox(inset(all, 8), Glib::Bevel::Sunken, 2, light, shadow);
      break;
    case UifBorderSunken:  // 5-pixel sunken well edged inside by a dark line
      p.depthBox(all, Glib::Bevel::Sunken, 5, light, shadow);
      p.outlineRect(inset(all, 5), edge);
      break;
    default:
      break;
  }
}

void StandardPanel::drawWidgets() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Palette& pal = getPalette();
  for (const WidgetDetails& d : widgets_) {
    if (d.surround == SurroundNone || !d.get() || !d.get()->isVisible()) continue;
    const Kw::Box<int> outer = outerBoxOf(d);
    const int w = PanelGeometry::kSurroundWidth;
    switch (d.surround) {
      case SurroundRaised:
        p.depthBox(outer, Glib::Bevel::Raised, w, pal.get(Palette::Light),
                   pal.get(Palette::Shadow));
        break;
      case SurroundSunken:
        p.depthBox(outer, Glib::Bevel::Sunken, w, pal.get(Palette::Light),
                   pal.get(Palette::Shadow));
        break;
      default:  // framed: a dark line round a light one
        p.outlineRect(outer, pal.get(Palette::Border));
        p.outlineRect(inset(outer, 1), pal.windowShade(5));
        break;
    }
  }
}
