#include "panels/StandardPanel.h"

#include <algorithm>
#include <climits>
#include <string>

#include "buttons/Button.h"
#include "buttons/PinButton.h"
#include "menus/Menu.h"
#include "panels/ModalShade.h"
#include "panels/PanelStandardWidgets.h"
#include "platform/glib/look/PanelLook.h"
#include "platform/glob/RootGlob.h"
#include "platform/kw/CrossCast.h"
#include "platform/misc/Config.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/configb.h"
#include "text/PanelTitleTextBox.h"

const char* const StandardPanel::doItMsg = "do_it";
const char* const StandardPanel::titleChangedMsg = "StdPanelTitleChanged";

namespace {

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
                        dimensionFromConfig(config, "height", height), parent);
  info.x = config_int(config, "x", 0);
  info.y = config_int(config, "y", 0);
  return info;
}

bool startsWith(const String& s, const char* prefix) {
  return s.rfind(prefix, 0) == 0;
}

}  // namespace

// --- Construction ---

StandardPanel::StandardPanel(unsigned short width, unsigned short height)
    : rect(makeInfo(width, height, nullptr, nullptr)) {
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

// What a panel keeps while it is modal, to restore when it stops being so.
struct StandardPanel::ModalState {
  bool savedDismissable = false;
  bool savedPinActive = true;
  GlobHandle<> pin;
  GlobHandle<ModalShade> shade;
  GlobHandle<> screen;  // the screen whose input the panel holds
};

void StandardPanel::init() {
  fullHeight_ = height();
  canvas()->setOpaque(getcol().a >= 1.0);
}

StandardPanel::~StandardPanel() {
  while (modalDepth_ > 0) setModal(false);
  // Youngest first, like every Glob's children, so that each leaves the top of the stack and
  // of the tab order; the panel's own area is repainted as it goes.
  canvas()->beginTeardown();
  std::vector<WidgetDetails> list = widgets_.takeAll();
  for (auto it = list.rbegin(); it != list.rend(); ++it) {
    WidgetDetails& d = *it;
    if (Glob* g = d.get()) {
      if (widgets_.onPanel(g)) delete g;
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
  if (std_) std_->showTitle(title_);
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

bool StandardPanel::isMoveHandleAt(const XY<int>& pos) {
  if (!PanelGeometry::hasTitleStrip(std_->flags())) return true;
  return PanelGeometry::titleStrip(frame()).contains(pos);
}

XY<int> StandardPanel::minimumSize() const {
  const XY<int> own = rect::minimumSize();
  return XY<int>(std::max(own.x, minSize_.x), std::max(own.y, minSize_.y));
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
    if (Glob* doIt = std_ ? std_->doIt() : nullptr) hide.push_back(doIt);
    for (Glob* g : hide) {
      if (!g->isVisible()) continue;
      g->unmap_canvas();
      hiddenByMinimise_.emplace_back(g);
    }
    sizeState_ = state;
    setSizeState(state);
    const int h =
        2 * calcBorderSize(border_) + (PanelGeometry::hasTitleStrip(getStandardWidgetFlags())
                                           ? PanelGeometry::kTitleStripHeight
                                           : 0);
    reshape_canvas(r.x0, r.y1 - h, r.width(), h);
  } else {
    sizeState_ = state;
    setSizeState(state);
    reshape_canvas(r.x0, r.y1 - fullHeight_, r.width(), fullHeight_);
    for (const GlobHandle<>& h : hiddenByMinimise_) {
      if (Glob* g = h.get()) g->map_canvas();
    }
    hiddenByMinimise_.clear();
  }
  if (std_) std_->syncSizeButton();
  update();
}

// --- Layout queries ---

PanelFrame StandardPanel::frame() const {
  PanelFrame f;
  f.flags = getStandardWidgetFlags();
  f.size = XY<int>(width(), height());
  f.border = border_;
  f.extraLeft = innerInsets_.x;
  f.extraTop = innerInsets_.y;
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

bool StandardPanel::addWidget(Glob* widget, XY<int> pos, CoordinateOrigin origin,
                              WidgetSurround surround, Glob* insertAfter) {
  if (!widgets_.canAdopt(widget) || !PanelGeometry::isValidOrigin(origin)) return false;
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
  if (!widgets_.canAdopt(widget) || !widgets_.findLive(reference) || reference == widget) {
    return false;
  }
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
  const WidgetDetails added = widgets_.insert(details, insertAfter);
  positionStandardWidgets();
  joinTabOrder(details.widget.get(), insertAfter);
  // The newcomer was damaged as it joined; the ring the panel draws around it, if any, is new.
  if (added.surround != SurroundNone) update(widgets_.outerBoxOf(added));
  handleWidgetAdded(added);
}

void StandardPanel::joinTabOrder(Glob* widget, Glob* insertAfter) {
  auto* stop = Kw::crossCast<TabOrderable>(widget);
  if (!stop) {
    // A composite control takes part through the stops it hands out, in its own order.
    if (auto* host = Kw::crossCast<TabOrderableHost>(widget))
      tabOrder().addTabStops(*host, TabOrderManager::kAfterLast);
    return;
  }
  TabOrderManager& tabs = tabOrder();
  unsigned order = TabOrderManager::kAfterLast;
  if (auto* after =
          is_good_glob_ptr(insertAfter) ? Kw::crossCast<TabOrderable>(insertAfter) : nullptr) {
    for (unsigned i = 0; i < tabs.numTabStops(); ++i) {
      if (tabs.getTabStopObject(i) != after) continue;
      const unsigned afterOrder = tabs.getTabStopTabOrder(i);
      if (afterOrder + 1 < TabOrderManager::kFirstReservedOrder) order = afterOrder + 1;
      break;
    }
  }
  if (!tabs.addTabStop(*stop, order)) tabs.addTabStop(*stop, TabOrderManager::kAfterLast);
}

bool StandardPanel::removeWidget(Glob* widget, bool destroy) {
  Glob* live = nullptr;
  if (!widgets_.remove(widget, live)) return false;
  if (live && tabOrder_) {
    if (auto* stop = Kw::crossCast<TabOrderable>(live)) tabOrder_->removeTabStop(*stop);
    if (auto* host = Kw::crossCast<TabOrderableHost>(live)) {
      std::vector<TabOrderable*> stops;
      host->getTabOrderables(stops);
      for (TabOrderable* s : stops) tabOrder_->removeTabStop(s);
    }
  }
  if (live) {
    if (destroy) delete live;
  }
  update();
  return true;
}

bool StandardPanel::relayoutAfter(PanelWidgetList::Edit edit) {
  if (edit == PanelWidgetList::Edit::Changed) {
    recalculateWidgetPositions();
    update();
  }
  return edit != PanelWidgetList::Edit::Refused;
}

bool StandardPanel::setWidgetPos(Glob* widget, XY<int> pos) {
  CoordinateOrigin origin = OriginBottomLeft;
  if (!widgets_.currentOrigin(widget, origin)) return false;
  return setWidgetPos(widget, pos, origin);
}

bool StandardPanel::setWidgetPos(Glob* widget, XY<int> pos, CoordinateOrigin origin) {
  return relayoutAfter(widgets_.setPos(widget, pos, origin));
}

bool StandardPanel::translateWidgetPos(Glob* widget, int dx, int dy) {
  return relayoutAfter(widgets_.translate(widget, dx, dy));
}

bool StandardPanel::setWidgetBorderStyle(Glob* widget, WidgetSurround surround) {
  return relayoutAfter(widgets_.setSurround(widget, surround));
}

const WidgetDetails* StandardPanel::getWidget(const Glob* widget) const {
  return widgets_.findAny(widget);
}

const WidgetDetails* StandardPanel::getWidget(unsigned index) const {
  return widgets_.at(index);
}

bool StandardPanel::isChildWidget(const Glob* widget) const {
  return widgets_.findLive(widget) != nullptr;
}

void StandardPanel::getChildren(std::vector<Glob*>& out) const {
  for (const WidgetDetails& d : widgets_) {
    if (Glob* g = d.get()) out.push_back(g);
  }
}

Kw::Box<int> StandardPanel::outerBoxOf(const WidgetDetails& d) const {
  return widgets_.outerBoxOf(d);
}

void StandardPanel::recalculateWidgetPositions() {
  positionStandardWidgets();
  widgets_.placeAll();
}

// --- Tab order ---

TabOrderManager& StandardPanel::tabOrder() {
  if (!tabOrder_) tabOrder_ = std::make_unique<TabOrderManager>();
  return *tabOrder_;
}

bool StandardPanel::incrementTab() {
  if (!tabOrder_ || tabOrder_->numTabStops() == 0) return false;
  return tabOrder_->incrementTabStop() != TabOrderManager::kNone;
}

bool StandardPanel::decrementTab() {
  if (!tabOrder_ || tabOrder_->numTabStops() == 0) return false;
  return tabOrder_->decrementTabStop() != TabOrderManager::kNone;
}

// --- Standard widgets ---

PanelTitleTextBox* StandardPanel::titleBox() const {
  return std_ ? std_->titleBox() : nullptr;
}

Glob* StandardPanel::standardWidget(StandardWidgetFlag flag) const {
  return std_ ? std_->widget(flag) : nullptr;
}

int StandardPanel::getStandardWidgetFlags() const {
  return std_ ? std_->flags() : 0;
}

void StandardPanel::addStandardWidgets(int flags) {
  if (!std_) std_ = std::make_unique<PanelStandardWidgets>(*this);
  std_->add(flags);
  recalculateWidgetPositions();
  update();
}

void StandardPanel::removeStandardWidgets(int flags, bool redraw) {
  if (!std_ || !std_->remove(flags)) return;
  recalculateWidgetPositions();
  if (redraw) update();
}

int StandardPanel::titleButtonsLeft() const {
  return PanelStandardWidgets::titleButtonsLeft(*this, std_.get());
}

int StandardPanel::calcMaxTitleWidgetWidth() const {
  return PanelStandardWidgets::maxTitleWidth(*this, std_.get());
}

void StandardPanel::positionStandardWidgets() {
  if (std_) std_->position();
}

// --- Pinning and modal display ---

void StandardPanel::setDismissable(bool dismissable) {
  if (dismissable == dismissable_) return;
  dismissable_ = dismissable;
  if (std_) std_->syncPinButton();
}

Glob* StandardPanel::modalShade() const {
  return modal_ ? modal_->shade.get() : nullptr;
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
  if (!modal_) modal_ = std::make_unique<ModalState>();
  ModalState& m = *modal_;
  m.savedDismissable = dismissable_;
  Glob* pin = std_ ? std_->pin() : nullptr;
  m.pin = pin;
  if (pin) {
    m.savedPinActive = pin->isActive();
    pin->setActive(false, true);
  }
  setDismissable(false);
  if (RootGlob* screen = root(); screen && static_cast<Glob*>(screen) != this) {
    m.shade = new ModalShade(*screen, Glib::PanelLook(getPalette()).modalShadeColour());
    screen->followScreenSize(m.shade.get());
    // The shade is now on top of the screen; lift this panel's top-level ancestor above it.
    Glob* top = this;
    while (top->parent() && top->parent() != screen) top = top->parent();
    top->pop_to_top();
    // The shade stops the pointer; the scope stops keys, Tab included, reaching what lies
    // beneath it.
    screen->addInputScope(this);
    m.screen = screen;
  }
  refresh_on();
}

void StandardPanel::leaveModal() {
  if (!modal_) return;
  refresh_off();
  ModalState& m = *modal_;
  if (ModalShade* shade = m.shade.get()) delete shade;
  m.shade.reset();
  if (auto* screen = dynamic_cast<RootGlob*>(m.screen.get())) screen->removeInputScope(this);
  m.screen.reset();
  setDismissable(m.savedDismissable);
  if (Glob* pin = m.pin.get()) pin->setActive(m.savedPinActive, true);
  m.pin.reset();
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
  if (std_ && std_->pin() && (msg == "pin on" || msg == "pin off")) {
    setDismissable(msg == "pin off");
    return 1;
  }
  if (msg == titleChangedMsg && titleBox()) {
    setTitle(titleBox()->getText());
    if (self) handleTitleChange();
    return 1;
  }
  // The menu base's own messages: the pop-up's report of a choice and of its closing.
  if (msg == "screwdriver" || msg == Menu::pootMsg_ || msg == Menu::itemSelectedMsg_) {
    return rect::react(e);
  }
  const int handled = handleMessageEvent(msg, event_to_sender_glob(e));
  if (handled) return handled;
  return self ? rect::react(e) : 1;
}

void StandardPanel::setInnerInsets(int left, int top) {
  const XY<int> insets(left, top);
  if (insets == innerInsets_) return;
  innerInsets_ = insets;
  widgets_.placeAll();
  update();
}
