#include "values/Slider.h"

#include <algorithm>
#include <cmath>
#include <cstdio>

#include "platform/glib/Painter.h"
#include "platform/glib/look/SliderLook.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/KeyCodes.h"
#include "platform/misc/Diagnostics.h"
#include "values/SliderMapping.h"

const char* const Slider::thumbPickedMsg = "slider_thumb_picked";
const char* const Slider::sliderMsg = "slider";
const char* const Slider::sliderReleasedMsg = "slider_released";

namespace {

constexpr double kSamePosition = 1e-6;
constexpr double kKeyStep = 0.01;  // of the range, per arrow key
constexpr double kPageStep = 0.1;  // of the range, per Page Up or Page Down
constexpr int kPickMargin = 2;     // pixels either side of the thumb that still pick it up
// The pending change type before the first pick-up: no drag has started.
constexpr DataChangeType kNoDragYet = static_cast<DataChangeType>(4);

// A pixel coordinate as a short, whatever the (unclamped) position maps to.
short toShort(double v) {
  return static_cast<short>(std::clamp(std::trunc(v), -32768.0, 32767.0));
}

}  // namespace

// --- Construction ---

Slider::Slider(unsigned short width, unsigned short height, bool isVertical, Canvas* parent)
    : Glob(width, height, 0, parent), GlobTabStop(this) {
  init(isVertical);
}

Slider::Slider(const SliderInitArgs& args) : Glob(args), GlobTabStop(this) {
  init(args.vertical);
  applySettings(args);
}

void Slider::init(bool isVertical) {
  synchronousMessages = false;
  minValue = 0.0;
  maxValue = 1.0;
  position = 0.0;
  pointOfInterest = 0.0;
  hasPointOfInterest = false;
  thumbColour = Colour(1.0, 0.0, 0.0);
  thumbHalfSize = 6;
  grabOffset = 0;
  thumbVisible = true;
  pendingChangeType = kNoDragYet;
  vertical = isVertical;
  thumbPicked = false;
  recalculateStartAndEnd();
}

void Slider::applySettings(const SliderInitArgs& args) {
  setValueRange(args.minValue, args.maxValue);
  movePosition(args.position, false);
  if (args.hasPointOfInterest) setPointOfInterest(args.pointOfInterest);
  synchronousMessages = args.synchronousMessages;
  thumbVisible = args.thumbVisible;
  if (args.hasThumbColour) thumbColour = args.thumbColour;
}

void Slider::recalculateStartAndEnd() {
  startPixel = thumbHalfSize + 1;
  endPixel = trackLength() - startPixel;
}

// --- Mapping ---

double Slider::x2v(double pixel) const {
  return SliderMapping{minValue, maxValue, startPixel, endPixel}.x2v(pixel);
}

double Slider::v2x(double value) const {
  return SliderMapping{minValue, maxValue, startPixel, endPixel}.v2x(value);
}

Kw::Box<int> Slider::oriented(int along0, int across0, int along1, int across1) const {
  return vertical ? Kw::Box<int>(across0, along0, across1, along1)
                  : Kw::Box<int>(along0, across0, along1, across1);
}

Kw::Box<short> Slider::getThumbArea() const {
  const short p = toShort(std::fabs(v2x(position)));
  const short across = static_cast<short>(acrossExtent() / 2);
  const short a0 = static_cast<short>(p - thumbHalfSize);
  const short a1 = static_cast<short>(p + thumbHalfSize + 1);
  return vertical ? Kw::Box<short>(1, a0, across, a1) : Kw::Box<short>(a0, 1, a1, across);
}

bool Slider::isWithinThumb(const XY<int>& point) const {
  const int c = along(point);
  return x2v(c - thumbHalfSize - kPickMargin) <= position &&
         position <= x2v(c + thumbHalfSize + kPickMargin);
}

// --- Settings ---

bool Slider::setValueRange(double min, double max) {
  if (!std::isfinite(min) || !std::isfinite(max) || !(min < max)) {
    diagWarning("Slider::setValueRange: the range must run upward between finite bounds, kept\n");
    return false;
  }
  if (min == minValue && max == maxValue) return true;
  minValue = min;
  maxValue = max;
  update();
  return true;
}

bool Slider::setPosition(double v) {
  return movePosition(v, true);
}

bool Slider::movePosition(double v, bool repaint) {
  if (!std::isfinite(v)) {
    diagWarning("Slider::setPosition: not a finite number, position kept\n");
    return false;
  }
  if (std::fabs(position - v) < kSamePosition) return false;
  const double old = position;
  position = v;
  if (repaint) redrawThumbMove(old, position);
  return true;
}

void Slider::setOrientation(Orientation o) {
  const bool v = o == kVertical;
  if (v == vertical) return;
  vertical = v;
  recalculateStartAndEnd();
  update();
}

void Slider::setThumbVisibility(bool visible) {
  if (visible == thumbVisible) return;
  thumbVisible = visible;
  if (!visible) {
    thumbPicked = false;
    buttonHeld_ = false;
  }
  redrawThumbMove(position, position);
}

void Slider::setThumbColour(const Colour& c) {
  if (c == thumbColour) return;
  thumbColour = c;
  redrawThumbMove(position, position);
}

double Slider::setPointOfInterest(double v) {
  if (!std::isfinite(v)) {
    diagWarning("Slider::setPointOfInterest: not a finite number, point kept\n");
    return v2x(pointOfInterest);
  }
  pointOfInterest = v;
  hasPointOfInterest = true;
  update();
  return v2x(pointOfInterest);
}

void Slider::removePointOfInterest() {
  if (!hasPointOfInterest) return;
  hasPointOfInterest = false;
  update();
}

void Slider::resize(double w, double h) {
  if (!std::isfinite(w) || !std::isfinite(h)) {
    diagWarning("Slider::resize: the size must be finite, size kept\n");
    return;
  }
  const double minAlong = 2.0 * thumbHalfSize + 2.0;
  const double maxAlong = vertical ? kMaxVerticalLength : kMaxHorizontalLength;
  // The lower bound wins when a request is below it.
  auto clampLowWins = [](double v, double lo, double hi) { return std::max(lo, std::min(v, hi)); };
  double along = clampLowWins(vertical ? h : w, minAlong, maxAlong);
  double across = clampLowWins(vertical ? w : h, kMinAcross, kMaxAcross);
  const int nw = static_cast<int>(vertical ? across : along);
  const int nh = static_cast<int>(vertical ? along : across);
  const Kw::Box<int>& r = canvas()->rect();
  reshape_canvas(r.x0, r.y0, nw, nh);
  recalculateStartAndEnd();
}

void Slider::reshape() {
  recalculateStartAndEnd();
  update();
}

// --- Reporting ---

void Slider::informParent(int changeType) {
  Glob* p = parent();
  if (!p) return;
  char text[400];
  std::snprintf(text, sizeof text, "%s %lf",
                changeType == kChangeDragRelease ? sliderReleasedMsg : sliderMsg, position);
  if (synchronousMessages) {
    call_msg(p, text);
  } else {
    send_msg(p, text);
  }
}

bool Slider::publish(double value, DataChangeType why) {
  GlobHandle<Slider> self(this);
  requestSetNewDataValue(value, why);
  return self.alive();
}

bool Slider::reportChange(DataChangeType why) {
  GlobHandle<Slider> self(this);
  informParent(kChangeDragStep);
  if (!self) return false;
  informParent(kChangeDragRelease);
  if (!self) return false;
  return publish(position, why);
}

// --- Events ---

int Slider::react(Event* e) {
  if (!e) return 0;
  if (isActive()) {
    if (mouse_event(e)) {
      if (const int r = handleMouseEvent(e)) return r;
    } else if (key_press_event(e)) {
      if (const int r = handleKey(e->keyCode())) return r;
    }
  }
  return Glob::react(e);
}

void Slider::pickUpThumb(Event* e) {
  grabOffset = static_cast<int>(std::trunc(v2x(position))) - along(e->pos);
  thumbPicked = true;
  pendingChangeType = kChangeDragStart;
}

bool Slider::setSliderFromPixelPos(Event* e) {
  double pixel = along(e->pos) + grabOffset;
  // The upper bound first, so that the start wins on a track too short for both.
  pixel = std::min(pixel, std::trunc(endPixel));
  pixel = std::max(pixel, std::trunc(startPixel));
  return setPosition(x2v(pixel));
}

// The order of the checks is the slider's contract (see the table in the header).
int Slider::handleMouseEvent(Event* e) {
  GlobHandle<Slider> self(this);
  if (thumbVisible && mouse_down_event(e) && isWithinThumb(e->pos)) {
    set_kbd_focus();
    pickUpThumb(e);
    buttonHeld_ = true;
    redrawThumbMove(position, position);
    return 1;
  }
  if (thumbVisible && mouse_chord_event(e)) {
    if (setSliderFromPixelPos(e)) reportChange(kChangeDirect);
    return 1;
  }
  if (thumbPicked && mouse_move_event(e)) {
    if (setSliderFromPixelPos(e)) {
      GlobHandle<Slider> alive(this);
      informParent(kChangeDragStep);
      if (!alive) return 1;
      informParent(kChangeDragRelease);
      if (!alive || !publish(position, pendingChangeType)) return 1;
      pendingChangeType = kChangeDragStep;
    }
    return 1;
  }
  if (thumbVisible && thumbPicked && mouse_up_event(e)) {
    // thumbPicked stays set: later moves go on dragging with the same offset.
    buttonHeld_ = false;
    redrawThumbMove(position, position);
    informParent(kChangeDragRelease);
    if (!self) return 1;
    if (pendingChangeType != kChangeDragStart) publish(position, kChangeDragRelease);
    return 1;
  }
  if (thumbVisible && mouse_left_event(e) && mouse_down_event(e)) {
    set_kbd_focus();
    if (!hasPointOfInterest || !setPosition(pointOfInterest)) return 1;
    informParent(kChangeDragStep);
    if (!self) return 1;
    informParent(kChangeDragRelease);
    if (!self) return 1;
    thumbPicked = false;
    publish(pointOfInterest, kChangeDirect);
    return 1;
  }
  return 0;
}

int Slider::handleKey(unsigned key) {
  if (!thumbVisible) return 0;
  const double range = maxValue - minValue;
  double target = position;
  switch (key) {
    case kKeyRight:
    case kKeyUp:
      target = position + kKeyStep * range;
      break;
    case kKeyLeft:
    case kKeyDown:
      target = position - kKeyStep * range;
      break;
    case kKeyPageUp:
      target = position + kPageStep * range;
      break;
    case kKeyPageDown:
      target = position - kPageStep * range;
      break;
    case kKeyHome:
      target = minValue;
      break;
    case kKeyEnd:
      target = maxValue;
      break;
    default:
      return 0;
  }
  if (setPosition(std::clamp(target, minValue, maxValue))) reportChange(kChangeDirect);
  return 1;
}

// --- Value ---

void Slider::setNewWidgetValue(double& value) {
  if (std::isnan(value)) {
    diagWarning("Slider::setNewWidgetValue: not a number, position kept\n");
    return;
  }
  setPosition(std::clamp(value, minValue, maxValue));
}

void Slider::setActive(bool active, bool redraw) {
  if (active == isActive()) return;
  if (!active) buttonHeld_ = false;
  Glob::setActive(active, redraw);
}

// --- Pointer ---

MouseCursorID Slider::contextCursor(const XY<int>& pos) {
  if (thumbVisible && isWithinThumb(pos))
    return vertical ? kCursorVerticalMove : kCursorHorizontalMove;
  return Glob::contextCursor(pos);
}

void Slider::handleMouseContainment(bool inside) {
  if (inside == mouseInside_) return;
  mouseInside_ = inside;
  if (thumbVisible) redrawThumbMove(position, position);
}

String Slider::describeValue() const {
  char text[400];
  std::snprintf(text, sizeof text, "%lf", position);
  return text;
}

// --- Drawing ---

Kw::Box<int> Slider::thumbBand(double value) const {
  const int p = toShort(std::fabs(v2x(value)));
  return oriented(p - thumbHalfSize - 1, 0, p + thumbHalfSize + 2, acrossExtent());
}

void Slider::redrawThumbMove(double from, double to) {
  update(thumbBand(from));
  update(thumbBand(to));
}

void Slider::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::SliderLook look(getPalette());
  const int across = acrossExtent();
  const int length = trackLength();
  const int half = across / 2;
  // The groove in the middle of the half across from the thumb area.
  const int g = Glib::SliderLook::kGrooveThickness;
  const int grooveMid = half + (across - half) / 2;
  const int groove0 = grooveMid - g / 2;
  const int start = static_cast<int>(startPixel), end = static_cast<int>(endPixel);
  look.groove(p, oriented(start - 1, groove0, end + 2, groove0 + g), isActive());
  if (hasPointOfInterest) {
    const int x = static_cast<int>(std::trunc(v2x(pointOfInterest)));
    look.pointOfInterest(p, oriented(x - 1, groove0 - 1, x + 2, across - 1), isActive());
  }
  if (thumbVisible) {
    const Kw::Box<short> a = getThumbArea();
    const Kw::Box<int> block(a.x0, a.y0, a.x1, a.y1);
    const int c = toShort(std::fabs(v2x(position)));
    const Kw::Box<int> needle = oriented(c - 1, half - 1, c + 2, groove0 + g + 1);
    look.thumb(p, block, needle, thumbColour, mouseInside_, buttonHeld_, isActive());
  }
  if (hasKbdFocus()) look.focusMark(p, oriented(0, 0, length, across));
}
