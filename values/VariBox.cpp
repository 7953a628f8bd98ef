#include "values/VariBox.h"

#include <cmath>
#include <cstdlib>

#include "platform/glib/Painter.h"
#include "platform/glib/look/ValueBoxLook.h"
#include "platform/os/OS.h"
#include "values/VariFriendlyTextBox.h"

namespace {

GlobCreationInfo withDefaultHeight(const VariBoxInitArgs& args) {
  GlobCreationInfo info = args;
  if (info.height == 0) {
    const int a = args.appearance;
    const bool known = a >= VariBox::Standard && a <= VariBox::Flat;
    info.height = static_cast<unsigned short>(VariBox::getDefaultHeight(
        known ? static_cast<VariBox::eAppearance>(a) : VariBox::Standard));
  }
  return info;
}

VariBoxInitArgs argsFor(const WString& text, const Colour& colour, int width, Canvas* parent) {
  VariBoxInitArgs args(GlobCreationInfo(
      static_cast<unsigned short>(std::max(width, 0)),
      static_cast<unsigned short>(VariBox::getDefaultHeight(VariBox::Standard)), parent));
  args.text = text;
  args.thermCol = colour;
  return args;
}

}  // namespace

VariBox::VariBox(const WString& text, const Colour& colour, int width, Canvas* parent)
    : VariBox(argsFor(text, colour, width, parent)) {}

VariBox::VariBox(const VariBoxInitArgs& args) : rect(withDefaultHeight(args)) {
  init(args);
}

void VariBox::init(const VariBoxInitArgs& args) {
  if (args.appearance >= Standard && args.appearance <= Flat) {
    appearance = static_cast<eAppearance>(args.appearance);
  }
  thermCol = args.thermCol;
  textCol = args.textCol;
  draggingForeCol = args.draggingForeCol;
  setDefaultCursor(kCursorValueDrag);

  TextBox::InitArgs tb;
  tb.info = GlobCreationInfo(1, 1, canvas());
  tb.text = args.text;
  tb.alignment = args.alignment;
  tb.restriction = TextBoxBase::OnlyListed;
  textBox = new VariFriendlyTextBox(tb, this);
  textBoxHandle_ = GlobHandle<VariFriendlyTextBox>(textBox);
  textBox->requestCallback(kReturnPressedMsg, this, TextBoxBase::EnterPressed);
  textBox->requestCallback(kTextAbandonedMsg, this, TextBoxBase::FocusLostChanged);
  layout();
  if (args.parser) setParser(args.parser, args.ownsParser);
}

VariBox::~VariBox() {
  if (ownsParser) {
    delete parser;
  } else if (parser && parser->owner == this) {
    parser->owner = nullptr;
  }
  parser = nullptr;
  // The text box asks this box for its colours: it goes first.
  if (VariFriendlyTextBox* tb = textBoxHandle_.get()) delete tb;
  textBox = nullptr;
}

// --- Parser ---

void VariBox::setParser(VariBoxParserBase* p, bool own) {
  if (dragging) abandonDrag();
  if (p == parser) {
    ownsParser = own;
  } else {
    VariBoxParserBase* old = parser;
    const bool ownedOld = ownsParser;
    parser = p;
    ownsParser = own;
    if (ownedOld) {
      delete old;
    } else if (old && old->owner == this) {
      old->owner = nullptr;
    }
  }
  lastThermWidth = -1;
  if (!parser) {
    update();
    return;
  }
  parser->owner = this;
  GlobHandle<VariBox> self(this);
  parser->init();
  if (!self) return;
  showParserText();
  redrawTherm();
}

// --- Look ---

int VariBox::getDefaultHeight(eAppearance a) {
  switch (a) {
    case Standard:
      return 28;
    case Compact:
      return 22;
    case Flat:
      return 20;
  }
  return 28;
}

void VariBox::setAppearance(eAppearance a) {
  if (a < Standard || a > Flat) return;
  appearance = a;
  resize(width(), getDefaultHeight(a));
  update();
}

void VariBox::resize(double w, double h) {
  const int nw = std::max(0, static_cast<int>(w));
  const int nh = std::max(0, static_cast<int>(h));
  const Kw::Box<int>& r = canvas()->rect();
  if (nw == static_cast<int>(width()) && nh == static_cast<int>(height())) return;
  reshape_canvas(r.x0, r.y0, nw, nh);
}

void VariBox::reshape() {
  layout();
  lastThermWidth = -1;
  update();
}

void VariBox::layout() {
  if (!textBox) return;
  const int w = std::max(1, static_cast<int>(width()) - kGripWidth - 1);
  const int h = std::max(1, static_cast<int>(height()) - 2);
  textBox->reshape_canvas(1, 1, w, h);
}

void VariBox::setTextCol(const Colour& active, Colour inactive) {
  textCol = active;
  inactiveTextCol_ = inactive;
  if (textBox) textBox->update();
}

void VariBox::setDraggingForeCol(const Colour& colour) {
  draggingForeCol = colour;
  if (dragging && textBox) textBox->update();
}

void VariBox::setThermCol(const Colour& colour) {
  thermCol = colour;
  update();
}

Colour VariBox::getThermCol() const {
  return thermCol ? *thermCol : Glib::ValueBoxLook(getPalette()).thermometer();
}

Colour VariBox::currentTextColour() const {
  const Glib::ValueBoxLook look(getPalette());
  if (dragging) return draggingForeCol ? *draggingForeCol : look.draggingText();
  if (isActive()) return textCol ? *textCol : look.text(true);
  return inactiveTextCol_ ? *inactiveTextCol_ : look.text(false);
}

// --- State ---

void VariBox::setActive(bool active, bool redraw) {
  if (!active && dragging) abandonDrag();
  if (textBox) textBox->setActive(active, false);
  rect::setActive(active, false);
  if (redraw) update();
}

int VariBox::wantedThermometerWidth() const {
  if (!parser) return 0;
  double p = parser->getPositionWithinRange();
  if (!(p > 0.0)) p = 0.0;  // NaN too
  if (p > 1.0) p = 1.0;
  return static_cast<int>(std::trunc(p * width()));
}

void VariBox::redrawTherm() {
  if (!parser) return;
  const int w = wantedThermometerWidth();
  if (w == lastThermWidth) return;
  lastThermWidth = w;
  update();
}

// --- Messages ---

const String& VariBox::message(eMessageType type) {
  static const String valueChanged = "varibox_ValueChanged";
  static const String changeComplete = "varibox_ChangeComplete";
  static const String invalid = "varibox_<INVALID>";
  switch (type) {
    case ValueChanged:
      return valueChanged;
    case ChangeComplete:
      return changeComplete;
  }
  return invalid;
}

void VariBox::sendMessageToParent(eMessageType type) {
  if (Glob* p = parent()) send_msg(p, message(type).c_str());
}

void VariBox::showParserText() {
  if (!parser || !textBox) return;
  textBox->setText(parser->getText());
  textBox->setCursorPosition(static_cast<unsigned short>(0));
  textBox->update();
}

void VariBox::parser_TextChanged(bool sendMessage) {
  showParserText();
  redrawTherm();
  if (sendMessage) sendMessageToParent(ValueChanged);
}

void VariBox::parser_SetAllowedCharacters(const String& characters) {
  if (textBox) textBox->setCharacters(Kw::toWide(characters), TextBoxBase::OnlyListed);
}

void VariBox::parser_SetMaxNumChars(std::uint64_t count) {
  if (textBox) textBox->setSizeLimit(count);
  showParserText();
}

// --- Events ---

int VariBox::react(Event* e) {
  GlobHandle<> self(this);
  if (mouse_event(e)) {
    if (handleMouseEvent(e)) return 1;
    return self ? rect::react(e) : 1;
  }
  if (key_press_event(e)) {
    if (handleKeyboardEvent(static_cast<int>(e->keyCode()))) return 1;
    return rect::react(e);
  }
  if (message_event(e)) {
    if (handleMessageEvent(e->text(), event_to_sender_glob(e))) return 1;
    return self ? rect::react(e) : 1;
  }
  return rect::react(e);
}

int VariBox::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg == kReturnPressedMsg) {
    Drawable::disableRedraws();
    GlobHandle<VariBox> self(this);
    if (parser && textBox) {
      parser->setDataChangeType(kChangeDirect);
      // The parse may publish, and the model may delete this box.
      parser->setText(textBox->getText());
    }
    if (self) redrawTherm();
    Drawable::enableRedraws();
    return 1;
  }
  if (msg == kTextAbandonedMsg) {
    if (parser && textBox && textBox->getText() != parser->getText()) showParserText();
    return 1;
  }
  return 0;
}

bool VariBox::fineAdjustHeld() {
  return OS()->keyboard().isKeyDown(kFineAdjustKey);
}

bool VariBox::isDragButton(const Event* e) const {
  if (mouse_chord_event(e)) return true;
  return dragWithLeft ? mouse_left_event(e) : mouse_right_event(e);
}

int VariBox::handleMouseEvent(Event* e) {
  if (!isActive() || !parser) return 0;
  if (mouse_wheel_event(e)) {
    parser->setDataChangeType(kChangeDirect);
    const bool fine = fineAdjustHeld();
    GlobHandle<VariBox> self(this);
    bool changed = false;
    if (e->wheelSteps() >= 1) {
      changed = fine ? parser->handleMinorInc() : parser->handleMajorInc();
    } else {
      changed = fine ? parser->handleMinorDec() : parser->handleMajorDec();
    }
    if (!self || !changed) return 1;
    showParserText();
    sendMessageToParent(ValueChanged);
    redrawTherm();
    return 1;
  }
  if (!dragging) {
    if (!mouse_down_event(e)) return 0;
    if (mouse_right_event(e)) {
      startDrag(false, e->screenPos);
      return 1;
    }
    if (mouse_left_event(e)) {
      startDrag(true, e->screenPos);
      return 1;
    }
    return 0;
  }
  if (mouse_move_event(e)) return isDragButton(e) ? dragStep(e) : 1;
  if (mouse_up_event(e) && isDragButton(e)) return endDrag();
  return 1;  // the other button going down or up belongs to the drag
}

void VariBox::startDrag(bool withLeft, XY<int> at) {
  parser->setDataChangeType(kChangeDragStart);
  dragging = true;
  dragWithLeft = withLeft;
  dragX = at.x;
  dragY = at.y;
  setDraggingLook(true);
  redrawTherm();
}

int VariBox::dragStep(Event* e) {
  const int dx = dragX - e->screenPos.x;
  const int dy = dragY - e->screenPos.y;
  const int d = std::abs(dx) > std::abs(dy) ? dx : dy;
  const double s = d / static_cast<double>(kDragPixelsPerStep);
  if (std::fabs(s) < 1.0) return 1;  // slow movement accumulates against the anchor
  const bool minor = mouse_chord_event(e) || fineAdjustHeld();
  GlobHandle<VariBox> self(this);
  bool changed = false;
  if (s < 0) {
    changed = minor ? parser->handleMinorInc() : parser->handleMajorInc();
  } else {
    changed = minor ? parser->handleMinorDec() : parser->handleMajorDec();
  }
  if (!self) return 1;
  if (changed && parser) {
    parser->setDataChangeType(kChangeDragStep);
    showParserText();
    sendMessageToParent(ValueChanged);
    redrawTherm();
  }
  dragX = e->screenPos.x;
  dragY = e->screenPos.y;
  return 1;
}

int VariBox::endDrag() {
  dragging = false;
  GlobHandle<VariBox> self(this);
  if (parser) {
    parser->setDataChangeType(kChangeDragRelease);
    parser->handleNoChange();
    if (!self) return 1;
  }
  setDraggingLook(false);
  lastThermWidth = -1;
  redrawTherm();
  update();
  sendMessageToParent(ChangeComplete);
  return 1;
}

void VariBox::abandonDrag() {
  dragging = false;
  setDraggingLook(false);
  update();
}

void VariBox::setDraggingLook(bool on) {
  if (!textBox) return;
  if (TextCursor* c = textBox->caret()) {
    if (on) {
      c->hide();
    } else {
      c->show();
    }
  }
  textBox->update();
  update();  // the grip lights while dragging
}

// --- Drawing ---

void VariBox::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::ValueBoxLook look(getPalette());
  const Kw::Box<int> box = p.bounds();
  look.well(p, box, appearance == Flat, isActive());
  look.thermometer(p, Glib::ValueBoxLook::inside(box), wantedThermometerWidth() - 1, getThermCol(),
                   isActive());
  const Kw::Box<int> grip(box.x1 - kGripWidth - 1, box.y0 + 1, box.x1 - 1, box.y1 - 1);
  look.grip(p, grip, dragging, isActive());
}

MouseCursorID VariBox::contextCursor(const XY<int>&) {
  return isActive() || dragging ? kCursorValueDrag : kCursorArrow;
}

String VariBox::describeValue() const {
  return textBox ? Kw::toUtf8(textBox->getText()) : String();
}

void VariBox::getTabOrderables(std::vector<TabOrderable*>& out) {
  if (textBox) out.push_back(textBox);
}
