#include "values/ScrollBar.h"

#include <algorithm>
#include <cmath>
#include <cstdio>

#include "platform/glib/Painter.h"
#include "platform/glib/Symbols.h"
#include "platform/glib/look/ScrollBarLook.h"
#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"
#include "values/ScrollBarArrow.h"

const String ScrollBar::thumbMovedMsg = "ScrollBar::thumbMoved";
const String ScrollBar::thumbReleasedMsg = "ScrollBar::thumbReleased";
const String ScrollBar::leftButtonPressedMsg = "ScrollBar::leftButtonPressed";
const String ScrollBar::rightButtonPressedMsg = "ScrollBar::rightButtonPressed";
const String ScrollBar::upButtonPressedMsg = "ScrollBar::upButtonPressed";
const String ScrollBar::downButtonPressedMsg = "ScrollBar::downButtonPressed";

namespace {

constexpr double kSame = 1e-6;
constexpr double kFirstRepeat = 0.3;  // seconds before paging repeats
constexpr double kNextRepeat = 0.1;   // seconds between later repeats

bool sizeIsWhole(double size) {
  return std::fabs(size - 1.0) < kSame;
}

GlobCreationInfo barPlacement(const GlobCreationInfo& info, Orientation o) {
  GlobCreationInfo out = info;
  const int t = ScrollBar::thickness();
  const int along = std::max(ScrollBar::minSizePixels(),
                             static_cast<int>(o == kVertical ? info.height : info.width));
  out.width = static_cast<unsigned short>(o == kVertical ? t : along);
  out.height = static_cast<unsigned short>(o == kVertical ? along : t);
  return out;
}

GlobCreationInfo barPlacement(Orientation o, unsigned int length, Canvas* parent) {
  const unsigned short l = static_cast<unsigned short>(std::min(length, 65535u));
  return barPlacement(GlobCreationInfo(o == kVertical ? 0 : l, o == kVertical ? l : 0, parent), o);
}

}  // namespace

bool ScrollBar::isScrollBarMsg(const String& msg) {
  return msg.rfind("ScrollBar::", 0) == 0;
}

// --- Construction ---

ScrollBar::ScrollBar(Orientation o, const Colour& thumbCol, const Colour& buttonCol,
                     unsigned int length, bool resizable, Canvas* parent)
    : rect(barPlacement(o, length, parent)) {
  thumbColour_ = thumbCol;
  hasThumbColour_ = true;
  buttonColour_ = buttonCol;
  hasButtonColour_ = true;
  init(o, resizable);
}

ScrollBar::ScrollBar(const ScrollBarInitArgs& args) : rect(barPlacement(args, args.orientation)) {
  hasThumbColour_ = args.hasThumbColour;
  thumbColour_ = args.thumbColour;
  hasButtonColour_ = args.hasButtonColour;
  buttonColour_ = args.buttonColour;
  init(args.orientation, args.resizableThumb);
}

void ScrollBar::init(Orientation o, bool resizable) {
  orientation = o == kHorizontal ? kHorizontal : kVertical;
  thumbPos = 0.0;
  thumbSize = 1.0;
  resizableThumb = resizable;
  moving = false;
  resizingEnd = 0;
  repeatInterval = kFirstRepeat;
  makeButtons();
}

void ScrollBar::makeButtons() {
  const bool v = orientation == kVertical;
  const auto side = static_cast<unsigned short>(thickness());
  decButton = new ScrollBarArrow(v ? Glib::kSymbolUp : Glib::kSymbolLeft, kDecMsg, side, canvas());
  incButton =
      new ScrollBarArrow(v ? Glib::kSymbolDown : Glib::kSymbolRight, kIncMsg, side, canvas());
  for (ScrollBarArrow* b : {decButton.get(), incButton.get()}) b->set_repeating(v ? 10 : 4, 0.5);
  applyButtonColours();
  placeButtons();
}

void ScrollBar::placeButtons() {
  const int t = thickness();
  if (ScrollBarArrow* d = decButton.get()) {
    if (orientation == kVertical) {
      d->reshape_canvas(0, height() - t, t, t);
    } else {
      d->reshape_canvas(0, 0, t, t);
    }
  }
  if (ScrollBarArrow* i = incButton.get()) {
    if (orientation == kVertical) {
      i->reshape_canvas(0, 0, t, t);
    } else {
      i->reshape_canvas(width() - t, 0, t, t);
    }
  }
}

void ScrollBar::applyButtonColours() {
  const Palette& p = getPalette();
  const Colour face = hasButtonColour_ ? buttonColour_ : p.get(Palette::Button);
  for (ScrollBarArrow* b : {decButton.get(), incButton.get()}) {
    if (b) b->setcols(p.get(Palette::ButtonText), face);
  }
}

Button* ScrollBar::decrementButton() const {
  return decButton.get();
}

Button* ScrollBar::incrementButton() const {
  return incButton.get();
}

// --- Geometry ---

ScrollBarGeometry ScrollBar::geometry() const {
  ScrollBarGeometry g;
  g.length = orientation == kVertical ? height() : width();
  g.thickness = thickness();
  g.thumbPos = thumbPos;
  g.thumbSize = thumbSize;
  g.minThumb = minThumbSize_;
  return g;
}

int ScrollBar::alongOf(const XY<int>& p) const {
  return orientation == kVertical ? height() - 1 - p.y : p.x;
}

Kw::Box<int> ScrollBar::troughBox() const {
  const ScrollBarGeometry g = geometry();
  const int a0 = g.troughStart(), a1 = g.troughStart() + g.troughLength();
  if (orientation == kVertical) return Kw::Box<int>(0, height() - a1, width(), height() - a0);
  return Kw::Box<int>(a0, 0, a1, height());
}

Kw::Box<int> ScrollBar::thumbBox() const {
  const ScrollBarGeometry g = geometry();
  const int s = g.thumbStart(), e = g.thumbEnd();
  if (orientation == kVertical) return Kw::Box<int>(1, height() - e, width() - 1, height() - s);
  return Kw::Box<int>(s, 1, e, height() - 1);
}

NumRange<int, true> ScrollBar::getThumbPixelExtents() const {
  const ScrollBarGeometry g = geometry();
  if (orientation == kVertical) {
    return NumRange<int, true>(height() - 1 - g.thumbStart(), height() - g.thumbEnd());
  }
  return NumRange<int, true>(g.thumbStart(), g.thumbEnd() - 1);
}

int ScrollBar::inResizingArea(const XY<int>& point) const {
  if (!resizableThumb) return 0;
  const ScrollBarGeometry g = geometry();
  const int a = alongOf(point);
  if (!g.inThumb(a)) return 0;
  if (a >= g.thumbEnd() - resizeHandleSize_) return increaseEnd_;
  if (a < g.thumbStart() + resizeHandleSize_) return decreaseEnd_;
  return 0;
}

void ScrollBar::resize(double w, double h) {
  if (!std::isfinite(w) || !std::isfinite(h)) {
    diagWarning("ScrollBar::resize: the size must be finite, size kept\n");
    return;
  }
  const double along =
      std::clamp(orientation == kVertical ? h : w, static_cast<double>(minSizePixels()), 65535.0);
  const int t = thickness(), l = static_cast<int>(along);
  const Kw::Box<int>& r = canvas()->rect();
  reshape_canvas(r.x0, r.y0, orientation == kVertical ? t : l, orientation == kVertical ? l : t);
}

void ScrollBar::reshape() {
  placeButtons();
  update();
}

// --- The thumb ---

bool ScrollBar::setThumbPos(double v) {
  if (!std::isfinite(v)) {
    diagWarning("ScrollBar::setThumbPos: not a finite number, thumb kept\n");
    return false;
  }
  if (std::fabs(v - thumbPos) < kSame) return false;
  // The upper bound first, so that 0 wins when the size exceeds 1.
  thumbPos = std::max(0.0, std::min(v, 1.0 - thumbSize));
  redrawThumb();
  return true;
}

bool ScrollBar::setThumbSize(double s) {
  if (!std::isfinite(s) || s < 0.0) {
    diagWarning("ScrollBar::setThumbSize: the size must be a fraction from 0 to 1, thumb kept\n");
    return false;
  }
  if (std::fabs(s - thumbSize) < kSame) return false;
  thumbSize = std::min(s, 1.0);
  if (thumbSize == 0.0) thumbSize = 1.0;
  thumbPos = std::max(0.0, std::min(thumbPos, 1.0 - thumbSize));
  redrawThumb();
  return true;
}

void ScrollBar::setNewWidgetValue(ThumbSettings& value) {
  setThumbSize(value.size);
  setThumbPos(value.position);
}

void ScrollBar::setResizableThumb(bool resizable) {
  if (resizable == resizableThumb) return;
  resizableThumb = resizable;
  if (!resizable) resizingEnd = 0;
  redrawThumb();
}

void ScrollBar::setThumbCol(const Colour& c) {
  if (hasThumbColour_ && c == thumbColour_) return;
  thumbColour_ = c;
  hasThumbColour_ = true;
  redrawThumb();
}

void ScrollBar::setButtonCol(const Colour& c) {
  buttonColour_ = c;
  hasButtonColour_ = true;
  applyButtonColours();
}

String ScrollBar::describeValue() const {
  char text[96];
  std::snprintf(text, sizeof text, "%.3f+%.3f", thumbPos, thumbSize);
  return text;
}

// --- Reporting ---

bool ScrollBar::informParent(const String& msg, bool positionMatters) {
  Glob* p = parent();
  if (!p) return true;
  GlobHandle<ScrollBar> self(this);
  const double oldPos = thumbPos, oldSize = thumbSize;
  Drawable::disableRedraws();
  call_msg(p, msg.c_str());
  Drawable::enableRedraws();
  if (!self) return false;
  const bool posChanged = std::fabs(thumbPos - oldPos) >= kSame;
  const bool sizeChanged = std::fabs(thumbSize - oldSize) >= kSame;
  if ((positionMatters && posChanged) || sizeChanged) redrawThumb();
  return true;
}

bool ScrollBar::publish(DataChangeType why) {
  GlobHandle<ScrollBar> self(this);
  requestSetNewDataValue(ThumbSettings{thumbPos, thumbSize}, why);
  return self.alive();
}

// --- Events ---

int ScrollBar::react(Event* e) {
  if (!e) return 0;
  if (message_event(e)) {
    if (handleMessageEvent(e->text(), event_to_sender_glob(e))) return 1;
    return rect::react(e);
  }
  if (tick_event(e)) {
    handleTimerEvent();
    return 1;
  }
  if (mouse_event(e) && handleMouseEvent(e)) return 1;
  return rect::react(e);
}

bool ScrollBar::handleMessageEvent(const String& msg, Glob*) {
  const bool v = orientation == kVertical;
  if (msg == kDecMsg) {
    informParent(v ? upButtonPressedMsg : leftButtonPressedMsg, true);
    return true;
  }
  if (msg == kIncMsg) {
    informParent(v ? downButtonPressedMsg : rightButtonPressedMsg, true);
    return true;
  }
  return false;
}

int ScrollBar::handleMouseEvent(Event* e) {
  pointer_ = e->pos;
  if (mouse_wheel_event(e)) {
    if (!isActive()) return 0;
    const int steps = e->wheelSteps();
    const String& msg = steps < 1 ? downButtonPressedMsg : upButtonPressedMsg;
    Drawable::disableRedraws();
    for (int i = 0, n = std::abs(steps); i < n; ++i) {
      if (!informParent(msg, true)) break;
    }
    Drawable::enableRedraws();
    return 1;
  }
  const bool press = mouse_down_event(e) && (mouse_left_event(e) || mouse_right_event(e));
  if (press) {
    const ScrollBarGeometry g = geometry();
    const int a = alongOf(e->pos);
    if (!isActive() || sizeIsWhole(thumbSize) || !g.inTrough(a)) return 0;
    if (g.inThumb(a)) {
      resizingEnd = inResizingArea(e->pos);
      moving = resizingEnd == 0;
      dragPublished_ = false;
      lastX = e->screenPos.x;
      lastY = e->screenPos.y;
      redrawThumb();
      return 1;
    }
    if (!mouse_left_event(e)) return 0;
    pageDelta = a < g.thumbStart() ? -thumbSize : thumbSize;
    paging_ = true;
    if (!pageOnce()) return 1;
    timerStart = clock();
    repeatInterval = kFirstRepeat;
    set_interest(kInterestTicks);
    return 1;
  }
  if (mouse_move_event(e) && isActive() && (moving || resizingEnd != 0)) {
    dragTo(e);
    return 1;
  }
  if (mouse_up_event(e)) {
    const bool wasTracking = paging_ || moving || resizingEnd != 0;
    paging_ = false;
    clear_interest(kInterestTicks);
    if (moving || resizingEnd != 0) {
      if (!informParent(thumbReleasedMsg, true)) return 1;
      moving = false;
      resizingEnd = 0;
      redrawThumb();
      if (dragPublished_) publish(kChangeDragRelease);
      return 1;
    }
    return wasTracking ? 1 : 0;
  }
  return 0;
}

bool ScrollBar::pageOnce() {
  setThumbPos(thumbPos + pageDelta);
  if (!informParent(thumbMovedMsg, false)) return false;
  redrawThumb();
  return publish(kChangeDirect);
}

void ScrollBar::dragTo(const Event* e) {
  const double x = e->screenPos.x, y = e->screenPos.y;
  const int d = static_cast<int>(std::trunc(orientation == kVertical ? lastY - y : x - lastX));
  lastX = x;
  lastY = y;
  if (d == 0) return;
  const double f = d / getThumbRangePixels();
  if (moving) {
    setThumbPos(thumbPos + f);
  } else {
    // The thumb grows or shrinks at both ends about its centre while there is room, and only
    // while the dragged end stays on its own side of the old centre.
    const double end = resizingEnd;
    const double newPos = thumbPos - f * end;
    double newSize;
    if (newPos < 0.0) {
      newSize = thumbSize + f * end;
    } else if (thumbSize + newPos + 2.0 * f * end > 1.0) {
      newSize = thumbSize + f * end;
    } else {
      newSize = thumbSize + 2.0 * f * end;
    }
    const double centre = thumbPos + thumbSize / 2.0;
    const bool keepsSide = end < 0 ? centre > newPos : newPos + newSize > centre;
    if (keepsSide) {
      setThumbSize(newSize);
      setThumbPos(newPos);
    }
  }
  if (!informParent(thumbMovedMsg, false)) return;
  redrawThumb();
  if (publish(dragPublished_ ? kChangeDragStep : kChangeDragStart)) dragPublished_ = true;
}

bool ScrollBar::pointerBeyondThumb() const {
  const ScrollBarGeometry g = geometry();
  const int a = alongOf(pointer_);
  return pageDelta > 0.0 ? a >= g.thumbEnd() : a < g.thumbStart();
}

void ScrollBar::handleTimerEvent() {
  if (!paging_ || !isActive()) {
    clear_interest(kInterestTicks);
    return;
  }
  const int now = clock();
  if (now - timerStart <= repeatInterval * 1000.0) return;
  timerStart = now;
  repeatInterval = kNextRepeat;
  if (pointerBeyondThumb()) pageOnce();
}

void ScrollBar::stopTracking() {
  moving = false;
  resizingEnd = 0;
  paging_ = false;
  clear_interest(kInterestTicks);
}

void ScrollBar::setActive(bool active, bool redraw) {
  if (active == isActive()) return;
  if (!active) stopTracking();
  rect::setActive(active, redraw);
  for (ScrollBarArrow* b : {decButton.get(), incButton.get()}) {
    if (b) b->setActive(active, redraw);
  }
}

void ScrollBar::setPalette(const Palette& palette) {
  rect::setPalette(palette);
  for (ScrollBarArrow* b : {decButton.get(), incButton.get()}) {
    if (b) b->setPalette(palette);
  }
  applyButtonColours();
}

MouseCursorID ScrollBar::contextCursor(const XY<int>& pos) {
  const bool v = orientation == kVertical;
  if (!isActive()) return kCursorArrow;
  if (resizingEnd != 0 || inResizingArea(pos) != 0)
    return v ? kCursorResizeVertical : kCursorResizeHorizontal;
  if (sizeIsWhole(thumbSize)) return kCursorArrow;
  const ScrollBarGeometry g = geometry();
  const int a = alongOf(pos);
  if (moving || (g.inTrough(a) && g.inThumb(a)))
    return v ? kCursorVerticalMove : kCursorHorizontalMove;
  return kCursorArrow;
}

// --- Drawing ---

void ScrollBar::drawBackground() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::ScrollBarLook look(getPalette());
  look.trough(p, troughBox(), isActive());
  const Colour thumb = hasThumbColour_ ? thumbColour_ : look.defaultThumb();
  look.thumb(p, thumbBox(), thumb, orientation == kVertical, moving || resizingEnd != 0,
             resizableThumb ? resizeHandleSize_ : 0, isActive());
}
