#include "buttons/Button.h"

#include "platform/glob/BoxRegion.h"
#include "platform/glob/KeyCodes.h"

#include <climits>
#include <cmath>
#include <utility>

#include "buttons/ImageSearchPath.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Image.h"
#include "platform/glib/Painter.h"
#include "platform/glib/UiScale.h"
#include "platform/glib/look/ButtonLook.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/RootGlob.h"
#include "platform/misc/Diagnostics.h"

int Button::dragThreshold_ = 3;

namespace {

bool validState(button_state s) {
  return s == kButtonUp || s == kButtonDown;
}

// Where a copy goes: the original's parent canvas, place, size and palette.
GlobCreationInfo placementOf(const Button& b) {
  const Kw::Box<int>& r = b.canvas()->rect();
  GlobCreationInfo info(static_cast<unsigned short>(r.width()),
                        static_cast<unsigned short>(r.height()), b.canvas()->parent(), r.x0, r.y0);
  info.palette = b.getPalette();
  return info;
}

}  // namespace

// --- Construction ---

Button::Button(WString l, const String& message, const GlobCreationInfo& info)
    : rect(info), GlobTabStop(this), label(std::move(l)) {
  set_message(message.c_str());
  init();
  post_init();
}

Button::Button(const WString& l, const char* message, unsigned short width, unsigned short height,
               int flag, Canvas* parent)
    : rect(width, height, flag, parent), GlobTabStop(this), label(l) {
  set_message(message);
  init();
  post_init();
}

Button::Button(const ButtonInitArgs& args) : rect(args), GlobTabStop(this), label(args.label) {
  set_message(args.message.c_str());
  init();
  applySettings(args);
  post_init();
  setPalette(args.palette);
}

Button::Button(const Button& other)
    : rect(placementOf(other)), ButtonWidget<WString>(), GlobTabStop(this), label(other.label) {
  init();
  copySettingsFrom(other);
  post_init();
  // The original's geometry is already in screen pixels: undo any rescaling of the copy.
  const Kw::Box<int>& r = other.canvas()->rect();
  reshape_canvas(r.x0, r.y0, r.width(), r.height());
}

Button& Button::operator=(const Button& other) {
  if (this == &other) return *this;
  copySettingsFrom(other);
  update();
  return *this;
}

Button::~Button() = default;

void Button::init() {
  settings_.reset();
  state = kButtonUp;
  tracking_ = false;
  ignoreMouseClicks = false;
  firstRepeat = false;
  lastRepeatTime = 0;
  mouseInside = false;
  reporter_.clearModifiers();
  const Palette& p = getPalette();
  upForeCol = downForeCol = p.get(Palette::ButtonText);
  upBackCol = downBackCol = p.get(Palette::Button);
  set_can_be_it(0);
}

void Button::post_init() {
  glib_rescalecanvas(canvas());
  ensure_canvas_is_mapped();
}

// Through the setters, so that the record's values are checked as any setting is; values at
// their defaults change nothing and the button keeps sharing the default record.
void Button::applySettings(const ButtonInitArgs& args) {
  const ButtonSettings& s = args.settings;
  setDownString(s.downLabel);
  set_up_icon(s.upIcon.c_str());
  set_down_icon(s.downIcon.c_str());
  set_style(s.style);
  set_bevel_width(s.bevelWidth);
  setTextAlignment(s.textAlignment);
  set_latching(s.latching != kNotLatching, s.latching == kLatchingWithLamp);
  set_pressure_button(s.pressure ? 1 : 0);
  set_brightening(s.brightening);
  setTextStyle(s.textStyle);
  if (args.repeatRate > 0) {
    set_repeating(args.repeatRate, args.repeatDelay);
  } else if (s.repeatInterval > 0) {
    settings_.edit().repeatInterval = s.repeatInterval;
    settings_.edit().repeatDelay = std::max(0, s.repeatDelay);
  }
  set_ignore_mouse_clicks(args.ignoreMouseClicks ? 1 : 0);
}

void Button::copySettingsFrom(const Button& other) {
  label = other.label;
  settings_ = other.settings_;
  upForeCol = other.upForeCol;
  downForeCol = other.downForeCol;
  upBackCol = other.upBackCol;
  downBackCol = other.downBackCol;
  set_message(other.get_message().c_str());
  procedure_ = other.procedure_ ? std::make_unique<ButtonProcedure>(*other.procedure_) : nullptr;
  setActive(other.isActive(), false);
  ignoreMouseClicks = other.ignoreMouseClicks;
  applyStatePalette();
}

// --- State ---

void Button::setString(const WString& s) {
  if (s == label) return;
  label = s;
  update();
}

void Button::set_state(button_state newState, bool redraw) {
  if (!validState(newState)) {
    diagWarning("Button::set_state: no state " + std::to_string(static_cast<int>(newState)) +
                ", state kept\n");
    return;
  }
  const bool changed = newState != state;
  state = newState;
  if (state == kButtonDown && settings_->repeatInterval >= 1) {
    lastRepeatTime = clock();
    firstRepeat = true;
  }
  applyStatePalette();
  if (redraw && canvas() && canvas()->isMapped() && changed) update();
}

void Button::switch_state(button_state newState, bool silent) {
  if (!validState(newState)) {
    diagWarning("Button::switch_state: no state " + std::to_string(static_cast<int>(newState)) +
                ", nothing reported\n");
    return;
  }
  if (settings_->latching != kNotLatching) {
    set_state(newState, true);
    if (!silent)
      informParent(get_message() +
                   (state != kButtonUp ? latchingBtnDownSuffix_ : latchingBtnUpSuffix_));
    return;
  }
  if (!silent) {
    GlobHandle<Button> self(this);
    if (settings_->pressure) {
      informParent(get_message() +
                   (state == kButtonUp ? pressureBtnDownSuffix_ : pressureBtnUpSuffix_));
    } else {
      informParent("");
    }
    if (!self) return;
  }
  // The receiver may have made the button inactive: it does not go down then.
  set_state(isActive() ? newState : kButtonUp, true);
}

void Button::applyStatePalette() {
  Palette p = getPalette();
  const Colour fore = get_forecol();
  const Colour back = get_backcol();
  p.set(Palette::WindowText, fore);
  p.set(Palette::ButtonText, fore);
  p.set(Palette::Text, fore);
  p.set(Palette::Window, back);
  p.set(Palette::Button, back);
  setPalette(p);
}

void Button::informParent(const String& msg) {
  reporter_.report(*this, msg);
}

// --- Events ---
//
// The order matters: a tracked pressure press sees every event first, then ticks, then the
// left button, then keys and messages.
int Button::react(Event* e) {
  if (!e) return 0;
  if (tracking_) return reactWhileTracking(e);
  if (tick_event(e)) return reactToTick();
  if (mouse_left_event(e) && !ignoreMouseClicks) {
    if (mouse_down_event(e)) return reactToPress(e);
    if (mouse_up_event(e)) return reactToRelease(e);
  }
  if (mouse_event(e)) return rect::react(e);
  if (key_press_event(e)) {
    const unsigned k = e->keyCode();
    if (k == kKeyReturn || k == kKeySpace) return activateFromKeyboard();
    return rect::react(e);
  }
  if (message_event(e)) {
    GlobHandle<Button> self(this);
    if (messageReceived(e->text()) == kEventConsumed) return 1;
    return self ? rect::react(e) : 1;
  }
  return rect::react(e);
}

int Button::reactWhileTracking(Event* e) {
  if (!mouse_left_event(e)) return 1;
  GlobHandle<Button> self(this);
  if (mouse_up_event(e)) {
    switch_state(kButtonUp, false);
    if (!self) return 1;
    tracking_ = false;
    if (settings_->repeatInterval != 0) clear_interest(kInterestTicks);
    return 1;
  }
  if (mouse_move_event(e)) {
    const XY<int> d = e->distance();
    const double dx = d.x, dy = d.y;
    const int length = static_cast<int>(std::trunc(std::sqrt(dx * dx + dy * dy)));
    if (length > dragThreshold_) {
      informParent(get_message() + pressureBtnDragSuffix_);
      if (!self) return 1;
      tracking_ = false;
      set_state(kButtonUp, true);
    }
  }
  return 1;
}

int Button::reactToTick() {
  if (!isActive()) {
    clear_interest(kInterestTicks);
    return 1;
  }
  if (settings_->repeatInterval > 0 && state == kButtonDown) {
    const int now = clock();
    const int wait = firstRepeat ? settings_->repeatDelay : settings_->repeatInterval;
    if (now - lastRepeatTime > wait) {
      firstRepeat = false;
      lastRepeatTime = now;
      informParent("");  // the receiver may delete the button: nothing of it is touched after
    }
  }
  return 1;
}

int Button::reactToPress(Event*) {
  GlobHandle<Button> self(this);
  reporter_.captureModifiers();
  switch_state(state == kButtonUp ? kButtonDown : kButtonUp, false);
  if (!self) return 1;
  widgetLeftClicked();
  if (!self) return 1;
  // Made inactive by a receiver: no press to track and nothing to repeat.
  if (!isActive()) return 1;
  if (settings_->pressure) tracking_ = true;
  if (settings_->repeatInterval != 0) set_interest(kInterestTicks);
  return 1;
}

int Button::reactToRelease(Event* e) {
  if (settings_->latching == kNotLatching) set_state(kButtonUp, true);
  if (settings_->repeatInterval != 0) clear_interest(kInterestTicks);
  return rect::react(e);
}

int Button::activateFromKeyboard() {
  if (sendCentreEvent(kEventLeftDown)) sendCentreEvent(kEventLeftUp);
  return 1;
}

bool Button::sendCentreEvent(int type) {
  GlobHandle<Button> self(this);
  const XY<int> centre(width() / 2, height() / 2);
  Event ev(type);
  ev.pos = centre;
  ev.screenPos = centre + XY<int>(static_cast<int>(std::trunc(get_x() + 0.5)),
                                  static_cast<int>(std::trunc(get_y() + 0.5)));
  ev.pressPos = ev.screenPos;
  ev.canvas = canvas();
  event_send(&ev, false);
  return self.alive();
}

void Button::handle_kbd_focus() {
  update();  // the focus mark comes or goes
}

void Button::setActive(bool active, bool redraw) {
  if (active == isActive()) return;
  if (!active) {
    if (settings_->latching == kNotLatching && state == kButtonDown) set_state(kButtonUp, redraw);
    tracking_ = false;
    if (settings_->repeatInterval != 0) clear_interest(kInterestTicks);
    if (glib_getCurrentMouseCanvas(this) == canvas()) handleMouseContainment(false);
  }
  rect::setActive(active, false);
  ignoreMouseClicks = !active;
  if (redraw) update();
}

MouseCursorID Button::contextCursor(const XY<int>& pos) {
  setDefaultCursor(ignoreMouseClicks ? kCursorArrow : kCursorHand);
  return rect::contextCursor(pos);
}

void Button::handleMouseContainment(bool inside) {
  if (inside == mouseInside) return;
  mouseInside = inside;
  if (isActive() && !ignoreMouseClicks) update();
}

String Button::describeValue() const {
  return label.empty() ? settings_->upIcon : Kw::toUtf8(label);
}

void Button::setNewWidgetValue(WString& value) {
  setString(value);
  update();
}

// --- Settings ---

void Button::setDownString(const WString& s) {
  if (s == settings_->downLabel) return;
  settings_.edit().downLabel = s;
  update();
}

void Button::set_up_icon(const char* name) {
  if (!name || !*name || settings_->upIcon == name) return;
  settings_.edit().upIcon = name;
  update();
}

void Button::set_down_icon(const char* name) {
  if (!name || !*name || settings_->downIcon == name) return;
  settings_.edit().downIcon = name;
  update();
}

void Button::set_latching(bool latch, bool option) {
  const button_latching mode = latch ? (option ? kLatchingWithLamp : kLatching) : kNotLatching;
  if (mode == settings_->latching) return;
  settings_.edit().latching = mode;
  update();
}

void Button::set_pressure_button(int on) {
  if (settings_->pressure == (on != 0)) return;
  settings_.edit().pressure = on != 0;
  if (on == 0) tracking_ = false;
}

void Button::set_repeating(int rate, double delay) {
  if (rate <= 0) {
    if (settings_->repeatInterval != 0) settings_.edit().repeatInterval = 0;
    return;
  }
  if (!std::isfinite(delay) || delay < 0.0) {
    diagWarning("Button::set_repeating: the delay must be a finite number of seconds, 0 used\n");
    delay = 0.0;
  }
  // Both halvings are deliberate.
  const double delayMs = std::trunc(delay * 0.5 * 1000.0);
  ButtonSettings& s = settings_.edit();
  s.repeatDelay = delayMs >= INT_MAX ? INT_MAX : static_cast<int>(delayMs);
  // A rate above 1000 per second would give no interval at all: the fastest repeat is kept.
  s.repeatInterval = std::max(1, (1000 / rate) / 2);
}

void Button::set_ignore_mouse_clicks(int ignore) {
  if ((ignore != 0) == ignoreMouseClicks) return;
  ignoreMouseClicks = ignore != 0;
  update();
}

void Button::set_style(button_style s) {
  if (s == settings_->style) return;
  settings_.edit().style = s;
  update();
}

void Button::set_bevel_width(int w) {
  if (w < 0 || w == settings_->bevelWidth) return;
  settings_.edit().bevelWidth = w;
  update();
}

void Button::set_brightening(int b) {
  if (b == settings_->brightening) return;
  settings_.edit().brightening = b;
  update();
}

void Button::set_ranged_left(int left) {
  setTextAlignment(left != 0 ? TextAlignment::Left : TextAlignment::Centred);
}

void Button::setTextAlignment(TextAlignment a) {
  const int v = static_cast<int>(a);
  if (v < 0 || v > 2 || a == settings_->textAlignment) return;
  settings_.edit().textAlignment = a;
  update();
}

void Button::setTextStyle(Glib::TextStyles::TextStyle s) {
  if (s < Glib::TextStyles::Plain || s > Glib::TextStyles::Shadowed || s == settings_->textStyle)
    return;
  settings_.edit().textStyle = s;
  update();
}

bool Button::setDragThreshold(int pixels) {
  if (pixels < 0) return false;
  dragThreshold_ = pixels;
  return true;
}

// --- Colours ---

const Colour& Button::get_forecol() const {
  return state == kButtonDown ? downForeCol : upForeCol;
}

Colour Button::get_backcol() const {
  const Colour& c = state == kButtonDown ? downBackCol : upBackCol;
  if (isActive() && mouseInside && settings_->brightening != 0) return Glib::ButtonLook::hovered(c);
  return c;
}

void Button::setcols(const Colour& fore, const Colour& back) {
  if (fore == upForeCol && fore == downForeCol && back == upBackCol && back == downBackCol) return;
  upForeCol = downForeCol = fore;
  upBackCol = downBackCol = back;
  applyStatePalette();
  update();
}

void Button::set_upcols(const Colour& fore, const Colour& back) {
  if (fore == upForeCol && back == upBackCol) return;
  upForeCol = fore;
  upBackCol = back;
  applyStatePalette();
  update();
}

void Button::set_downcols(const Colour& fore, const Colour& back) {
  if (fore == downForeCol && back == downBackCol) return;
  downForeCol = fore;
  downBackCol = back;
  applyStatePalette();
  update();
}

void Button::setCol(const Colour& colour, bool redraw) {
  if (colour == upBackCol && colour == downBackCol) return;
  upBackCol = downBackCol = colour;
  applyStatePalette();
  if (redraw) update();
}

// --- Drawing: the state read here, the look in Glib::ButtonLook ---

namespace {

// Labels are one line: control characters show as spaces, and text far longer than any button
// could show is cut before it reaches the font (the painter clips the rest).
constexpr size_t kMaxShownChars = 512;

WString displayText(const WString& s) {
  WString out = s.substr(0, kMaxShownChars);
  for (wchar_t& c : out) {
    if (c < 0x20 || c == 0x7F) c = L' ';
  }
  return out;
}

}  // namespace

Kw::Box<int> Button::contentBox() const {
  const int inset = settings_->style == kButtonStyleFlat ? 1 : settings_->bevelWidth;
  const int w = width(), h = height();
  const int ix = std::min(inset, w / 2), iy = std::min(inset, h / 2);
  return Kw::Box<int>(ix, iy, w - ix, h - iy);
}

const WString& Button::shownLabel() const {
  return state == kButtonDown && !settings_->downLabel.empty() ? settings_->downLabel : label;
}

Kw::Box<int> Button::symbolBox() const {
  const Kw::Box<int> c = contentBox();
  const int side = std::min(c.width(), c.height());
  return Glib::ButtonLook::pressed(
      Kw::Box<int>::fromSize(c.x0 + (c.width() - side) / 2, c.y0 + (c.height() - side) / 2, side,
                             side),
      state == kButtonDown, settings_->style == kButtonStyleFlat);
}

Colour Button::faceColour() const {
  return Glib::ButtonLook(getPalette()).face(get_backcol(), isActive());
}

Colour Button::labelColour() const {
  return Glib::ButtonLook(getPalette()).label(get_forecol(), isActive());
}

void Button::draw() {
  drawBackground();
  drawEdge();
  drawText();
  if (procedure_ && *procedure_) (*procedure_)(facepath(), state);
}

void Button::drawBackground() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::ButtonLook(getPalette())
      .background(p, faceColour(), state == kButtonDown, settings_->style == kButtonStyleFlat);
}

void Button::drawEdge() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::ButtonLook look(getPalette());
  look.edge(p, edgeColour(), faceColour(), state == kButtonDown,
            settings_->style == kButtonStyleFlat, isActive(), settings_->bevelWidth);
  const Kw::Box<int> content = contentBox();
  if (settings_->latching == kLatchingWithLamp && state == kButtonDown) look.latchLamp(p, content);
  if (hasKeyboardFocus()) look.focusMark(p, content);
}

void Button::drawText() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const int w = width(), h = height();
  // Labels may use the bevel's height (small buttons) but keep clear of its sides.
  const int side =
      std::min(w / 2, (settings_->style == kButtonStyleFlat ? 1 : settings_->bevelWidth) + 2);
  Kw::Box<int> box =
      Glib::ButtonLook::pressed(Kw::Box<int>(side, 1, w - side, h - 1), state == kButtonDown,
                                settings_->style == kButtonStyleFlat);
  const WString text = displayText(shownLabel());

  const String& icon = state == kButtonDown && !settings_->downIcon.empty() ? settings_->downIcon
                                                                            : settings_->upIcon;
  if (!icon.empty()) {
    const Kw::Ptr<Glib::Image> img = Glib::Image::load(imageSearchPath().resolve(icon));
    if (img) box.x0 = drawIcon(p, *img, text.empty()) + 4;
  }
  if (text.empty() || box.empty()) return;
  p.text(text, box, *Glib::fonts().standard(), labelColour(), settings_->textAlignment,
         settings_->textStyle);
}

int Button::drawIcon(Glib::Painter& p, const Glib::Image& img, bool alone) {
  return Glib::ButtonLook::picture(
      p, img, contentBox(), p.bounds(), alone,
      Glib::ButtonLook::pressShift(state == kButtonDown, settings_->style == kButtonStyleFlat),
      isActive());
}

Colour Button::edgeColour() {
  return Glib::ButtonLook(getPalette()).edge(hasKeyboardFocus());
}

Kw::Ptr<iRegion> Button::path() {
  auto* outline = new BoxRegion(facepath());
  outline->add(addpath());
  return Kw::Ptr<iRegion>(outline);
}

void Button::set_procedure(ButtonProcedure procedure) {
  procedure_ = procedure ? std::make_unique<ButtonProcedure>(std::move(procedure)) : nullptr;
}
