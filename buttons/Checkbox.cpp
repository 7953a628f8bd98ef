#include "buttons/Checkbox.h"

#include "platform/glob/KeyCodes.h"

#include <algorithm>
#include <utility>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/MarkLook.h"
#include "platform/glib/look/PanelLook.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/CrossCast.h"

namespace {

// Where a copy goes: the original's parent canvas, place, size and palette.
GlobCreationInfo placementOf(const Checkbox& b) {
  const Kw::Box<int>& r = b.canvas()->rect();
  GlobCreationInfo info(static_cast<unsigned short>(r.width()),
                        static_cast<unsigned short>(r.height()), b.canvas()->parent(), r.x0, r.y0);
  info.palette = b.getPalette();
  return info;
}

// The colour a box takes from what it is put on.
Colour backgroundFrom(const Glob& box) {
  Glob* p = box.parent();
  if (!p) return box.getPalette().windowShade(3);
  if (const auto* r = Kw::crossCast<const rect>(p)) return r->getcol();
  return p->getPalette().get(Palette::Window);
}

Kw::Box<int> inset(const Kw::Box<int>& b, int dx, int dy) {
  return Kw::Box<int>(b.x0 + dx, b.y0 + dy, b.x1 - dx, b.y1 - dy);
}

}  // namespace

// --- Construction ---

Checkbox::Checkbox(unsigned short width, unsigned short height, bool tick, int flag, Canvas* parent)
    : StandardPanel(GlobCreationInfo::withFlags(width, height, flag, parent)), GlobTabStop(this) {
  init(tick);
}

Checkbox::Checkbox(const GlobCreationInfo& info, bool tick)
    : StandardPanel(info), GlobTabStop(this) {
  init(tick);
}

Checkbox::Checkbox(const CheckboxInitArgs& args)
    : StandardPanel(static_cast<const GlobCreationInfo&>(args)), GlobTabStop(this) {
  init(args.ticked);
  applyArgs(args);
}

Checkbox::Checkbox(const Checkbox& other)
    : StandardPanel(placementOf(other)), ValWidget<bool>(), GlobTabStop(this) {
  init(other.ticked);
  copySettingsFrom(other);
}

Checkbox::~Checkbox() = default;

void Checkbox::init(bool initialTicked) {
  ticked = initialTicked;
  settings_.reset();
  // A box's place is its panel's business: saved layouts leave it out.
  set_dumpable(0);
  clicksEnabled = true;
  userFunction = nullptr;
  userData = nullptr;
  textColourWhenTicked = getPalette().get(Palette::WindowText);
  textColour = getPalette().get(Palette::WindowText);
  mouseInside = false;
  if (getBorderStyle() != UifBorderNone) settings_.edit().borderStyle = getBorderStyle();
  setcol(backgroundFrom(*this), false);
  setDefaultCursor(kCursorHand);
}

void Checkbox::applyArgs(const CheckboxInitArgs& args) {
  Settings s = args.settings;
  // Numbers outside the enumerations fall back to the defaults.
  if (s.msgGeneration != GenerateOnRelease) s.msgGeneration = GenerateOnPress;
  if (s.appearance < BoxLeft || s.appearance > FlatToggle) s.appearance = BoxLeft;
  if (!(s == *settings_)) settings_.edit() = s;
  label_ = args.label;
  StandardPanel::setBorderStyle(s.borderStyle);
  clicksEnabled = args.clicksEnabled;
}

void Checkbox::copySettingsFrom(const Checkbox& other) {
  settings_ = other.settings_;
  label_ = other.label_;
  StandardPanel::setBorderStyle(settings_->borderStyle);
  clicksEnabled = other.clicksEnabled;
  textColourWhenTicked = other.textColourWhenTicked;
  textColour = other.textColour;
  setcol(other.getcol(), false);
  setActive(other.isActive(), false);
}

Checkbox* Checkbox::make(unsigned short width, unsigned short height, const WString& text,
                         bool tick, const Colour& colour, Canvas* parent, int flag1, int flag2) {
  auto* box = new Checkbox(width, height, tick, 0, parent);
  box->setLabel(text);
  box->setcol(colour, false);
  if (flag1) box->settings_.edit().font.style = Glib::FontDesc::Bold;
  if (flag2) box->settings_.edit().appearance = FlatToggle;
  return box;
}

int Checkbox::indicatorWidth(Appearance a) {
  return a == FlatToggle ? kToggleWidth : kBoxSize;
}

unsigned short Checkbox::calcWidth(const WString& text, UifTypeOfBorder border,
                                   Appearance appearance, bool bold) {
  Glib::FontDesc desc;
  if (bold) desc.style = Glib::FontDesc::Bold;
  const int textWidth = text.empty() ? 0 : Glib::fonts().get(desc)->textWidth(text) + kLabelGap;
  // One spare pixel on each side of the label keeps the focus mark off the text.
  const int w = 2 * calcBorderSize(border) + 2 * kDefaultMargin + indicatorWidth(appearance) +
                textWidth + (text.empty() ? 0 : 2);
  return static_cast<unsigned short>(std::clamp(w, 0, 0xFFFF));
}

// --- State ---

void Checkbox::setStateInternal(bool value) {
  ticked = value;
}

void Checkbox::setState(bool value) {
  if (value == ticked) return;
  setStateInternal(value);
  update();
  if (getDataAdaptor() && getDataValue() != value) requestSetNewDataValue(value, kToggleChange);
}

void Checkbox::setState(bool value, bool notify) {
  if (notify) {
    setState(value);
  } else {
    setStateInternal(value);
  }
}

void Checkbox::requestToggleState() {
  if (userFunction) {
    userFunction(this, userData);
    return;
  }
  GlobHandle<Checkbox> self(this);
  const bool wanted = !ticked;
  setState(wanted);
  // The model's answer may have deleted the box.
  if (!self) return;
  // A model that refused the toggle keeps its value: the box shows that and reports nothing.
  if (getDataAdaptor()) {
    const bool held = getDataValue();
    if (held != wanted) {
      if (held != ticked) {
        setStateInternal(held);
        update();
      }
      return;
    }
  }
  sendToggleMessage(settings_->appendState);
}

String Checkbox::toggleMessage(bool withState) const {
  if (!withState) return settings_->msgPrefix;
  return settings_->msgPrefix + (ticked ? kTickedWord : kClearWord);
}

bool Checkbox::sendToggleMessage(bool withState) {
  Glob* to = parent();
  if (!to) return false;
  send_message_event(this, to, toggleMessage(withState));
  return true;
}

void Checkbox::setMsgPrefix(const String& prefix, bool append) {
  if (prefix == settings_->msgPrefix && append == settings_->appendState) return;
  Settings& s = settings_.edit();
  s.msgPrefix = prefix;
  s.appendState = append;
}

void Checkbox::setMessageGeneration(eMsgGeneration generation) {
  if (generation != settings_->msgGeneration) settings_.edit().msgGeneration = generation;
}

void Checkbox::setBrighten(bool b) {
  if (b != settings_->brighten) settings_.edit().brighten = b;
}

void Checkbox::setUserFunction(UserFunction fn, void* data) {
  userFunction = fn;
  userData = data;
}

// --- Events ---

int Checkbox::react(Event* e) {
  if (!e) return 0;
  if (clicksEnabled && mouse_left_event(e) && isActive()) return reactToLeftButton(e);
  if (e->type == kEventKeyPress && (e->keyCode() == kKeyReturn || e->keyCode() == kKeySpace)) {
    // Deliberately not gated on isActive(): a focused inactive box still toggles from the keys.
    requestToggleState();
    return 1;
  }
  return StandardPanel::react(e);
}

int Checkbox::reactToLeftButton(Event* e) {
  const bool press = mouse_down_event(e);
  const bool release = mouse_up_event(e);
  if ((settings_->msgGeneration == GenerateOnPress && press) ||
      (settings_->msgGeneration == GenerateOnRelease && release)) {
    requestToggleState();
  }
  return 1;
}

void Checkbox::setActive(bool active, bool redraw) {
  if (active == isActive()) return;
  StandardPanel::setActive(active, false);
  if (redraw) update();
}

void Checkbox::handle_kbd_focus() {
  update();
}

void Checkbox::handleMouseContainment(bool inside) {
  mouseInside = inside;
  update();
}

void Checkbox::setBorderStyle(UifTypeOfBorder border) {
  if (border != settings_->borderStyle) settings_.edit().borderStyle = border;
  StandardPanel::setBorderStyle(border);
}

String Checkbox::describeValue() const {
  return Kw::toUtf8(label_) + (ticked ? " [ticked]" : " [clear]");
}

// --- Look ---

void Checkbox::setLabel(WString text) {
  if (text == label_) return;
  label_ = std::move(text);
  update();
}

void Checkbox::setFont(const Glib::FontDesc& desc) {
  if (desc == settings_->font) return;
  settings_.edit().font = desc;
  update();
}

void Checkbox::setTextColourWhenTicked(const Colour& c) {
  if (c == textColourWhenTicked) return;
  textColourWhenTicked = c;
  if (ticked) update();
}

void Checkbox::setTextColour(const Colour& c) {
  if (c == textColour) return;
  textColour = c;
  if (!ticked) update();
}

void Checkbox::setAppearance(Appearance a) {
  if (a == settings_->appearance || a < BoxLeft || a > FlatToggle) return;
  settings_.edit().appearance = a;
  update();
}

void Checkbox::setTextAlignment(TextAlignment a) {
  if (a == settings_->textAlignment) return;
  settings_.edit().textAlignment = a;
  update();
}

void Checkbox::setMargin(uint16_t m) {
  if (m == settings_->margin) return;
  settings_.edit().margin = m;
  update();
}

void Checkbox::setBoldWhenTicked(bool b) {
  if (b == settings_->boldWhenTicked) return;
  settings_.edit().boldWhenTicked = b;
  if (ticked) update();
}

void Checkbox::setTickCharacter(char c) {
  if (c == settings_->tickCharacter) return;
  settings_.edit().tickCharacter = c;
  if (ticked) update();
}

Colour Checkbox::textColourFor(bool enabled) const {
  return Glib::MarkLook(getPalette()).label(ticked ? textColourWhenTicked : textColour, enabled);
}

Colour Checkbox::getTextColour() {
  return textColourFor(isActive());
}

// --- Layout ---

Kw::Box<int> Checkbox::indicatorBox() const {
  const int b = calcBorderSize(settings_->borderStyle);
  const Kw::Box<int> inner(b, b, width() - b, height() - b);
  const int iw = indicatorWidth(settings_->appearance);
  const int ih =
      std::min(settings_->appearance == FlatToggle ? kToggleHeight : kBoxSize, inner.height());
  const int y0 = inner.y0 + (inner.height() - ih) / 2;
  const int x0 = settings_->appearance == BoxRight ? inner.x1 - settings_->margin - iw
                                                   : inner.x0 + settings_->margin;
  return Kw::Box<int>(x0, y0, x0 + iw, y0 + ih);
}

Kw::Box<int> Checkbox::labelBox() const {
  const int b = calcBorderSize(settings_->borderStyle);
  const Kw::Box<int> ind = indicatorBox();
  if (settings_->appearance == BoxRight)
    return Kw::Box<int>(b + settings_->margin + 1, b, ind.x0 - kLabelGap, height() - b);
  return Kw::Box<int>(ind.x1 + kLabelGap, b, width() - b - settings_->margin, height() - b);
}

// --- Drawing ---

void Checkbox::draw() {
  drawBackground();
  drawBorder();
  drawWidgets();
  drawTickBox();
  if (ticked) drawTick(true);
  drawLabel();
}

void Checkbox::drawBackground() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::PanelLook(getPalette()).face(p, getcol());
}

void Checkbox::paintIndicatorWell() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::MarkLook(getPalette())
      .well(p, indicatorBox(), getcol(), mouseInside && isActive() && settings_->brighten,
            isActive(), settings_->appearance == FlatToggle);
}

void Checkbox::drawTickBox() {
  paintIndicatorWell();
  if (settings_->appearance != FlatToggle || ticked) return;
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  Glib::MarkLook(getPalette()).switchOff(p, indicatorBox(), isActive());
}

void Checkbox::drawTick(bool full) {
  paintIndicatorWell();
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::MarkLook look(getPalette());
  const Kw::Box<int> box = indicatorBox();
  if (settings_->appearance == FlatToggle) {
    if (full) {
      look.switchOn(p, box, isActive());
    } else {
      look.switchMixed(p, box, getcol(), isActive());
    }
  } else if (full) {
    look.tick(p, box, settings_->tickCharacter, isActive());
  } else {
    look.mixedBar(p, box, isActive());
  }
}

Glib::FontDesc Checkbox::labelFont() const {
  Glib::FontDesc desc = settings_->font;
  if (settings_->boldWhenTicked && ticked) desc.style = Glib::FontDesc::Bold;
  return desc;
}

void Checkbox::drawLabel() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Kw::Box<int> box = labelBox();
  if (!label_.empty() && !box.empty()) {
    p.text(label_, box, *Glib::fonts().get(labelFont()), getTextColour(), settings_->textAlignment,
           Glib::TextStyles::Plain);
  }
  if (hasKeyboardFocus()) {
    const Kw::Box<int> ind = indicatorBox();
    // Round the indicator and the label's text, not the whole label box.
    Kw::Box<int> text = box;
    if (!label_.empty() && settings_->textAlignment == TextAlignment::Left)
      text.x1 = std::min(box.x1, box.x0 + Glib::fonts().get(labelFont())->textWidth(label_) + 2);
    const Kw::Box<int> mark = label_.empty()
                                  ? inset(ind, -2, -2)
                                  : Kw::Box<int>(std::min(ind.x0, text.x0) - 2, ind.y0 - 2,
                                                 std::max(ind.x1, text.x1) + 1, ind.y1 + 2);
    Glib::MarkLook(getPalette()).focusMark(p, mark);
  }
}
