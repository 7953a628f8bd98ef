#include "text/TextBox.h"

#include <algorithm>
#include <climits>
#include <cstdlib>
#include <utility>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/TextFieldLook.h"
#include "platform/glob/RuntimeClock.h"
#include "platform/kw/CharClassifier.h"
#include "platform/misc/WindowsClipboard.h"
#include "platform/os/OS.h"

namespace {

// One previous-click time for every box that is not editable.
double gLastReadOnlyClick = -1e18;

double now() {
  return static_cast<double>(RuntimeClock::now());
}

int clampToInt(int64_t v) {
  return static_cast<int>(std::clamp<int64_t>(v, INT_MIN, INT_MAX));
}

}  // namespace

// --- Construction ---

TextBox::TextBox(const InitArgs& args) : TextBoxBase(args.info) {
  apply(args, args.text);
}

TextBox::TextBox(InitArgs&& args) : TextBoxBase(args.info) {
  WString text = std::move(args.text);
  apply(args, std::move(text));
}

TextBox::TextBox(unsigned short width, unsigned short height, const Palette& palette,
                 Canvas* parent)
    : TextBoxBase(width, height, palette, parent) {
  apply(InitArgs(), WString());
}

void TextBox::apply(const InitArgs& args, WString text) {
  leftMargin_ = args.leftMargin;
  rightMargin_ = args.rightMargin;
  alignment_ = args.alignment;
  obfuscated_ = args.obfuscated;
  model_.setMask(obfuscated_ ? kObfuscationChar : 0);
  if (!(args.font == getFontDesc())) TextBoxBase::setFont(args.font);
  setEditable(args.editable);
  setSizeLimit(args.sizeLimit);
  setCharacters(args.characters, args.restriction);
  setGhostLabel(args.ghostLabel);
  ruler_.setFont(displayFont());
  model_.setText(std::move(text), TextEditModel::SeekMethod::StartOfText);
  relayout();
}

double TextBox::lastReadOnlyClickTime() {
  return gLastReadOnlyClick;
}

// --- Contents ---

void TextBox::setText(const WString& text) {
  model_.setText(text, focused_ ? TextEditModel::SeekMethod::EndOfText
                                : TextEditModel::SeekMethod::StartOfText);
  scrollOffset_ = 0;
  changed();
}

void TextBox::setSelection(NumRange<int, true> range) {
  if (!model_.select(range.min(), range.max())) return;
  changed();
}

void TextBox::highlightAllText(bool on) {
  model_.highlightAll(on);
  changed();
}

void TextBox::setCursorPosition(eCursorPos pos) {
  model_.clearSelection();
  model_.moveCaret(pos == CursorAtStart ? TextEditModel::SeekMethod::StartOfText
                                        : TextEditModel::SeekMethod::EndOfText);
  changed();
}

void TextBox::setCursorPosition(unsigned short index) {
  model_.clearSelection();
  model_.setCaret(index);
  changed();
}

// --- Editing ---

bool TextBox::isAllowed(wchar_t ch) const {
  return model_.isAllowed(ch);
}

void TextBox::addCharacter(int ch) {
  if (ch < 0 || static_cast<unsigned>(ch) > kKeyCharacterMask) return;
  model_.addCharacter(static_cast<wchar_t>(ch));
  changed();
}

void TextBox::paste(const WString& s) {
  model_.paste(s);
  changed();
}

void TextBox::copy() {
  if (obfuscated_) return;
  const WString text = model_.copyText();
  if (!text.empty()) WindowsClipboard::setText(text);
}

void TextBox::cut() {
  const WString removed = model_.cut();
  if (!removed.empty() && !obfuscated_) WindowsClipboard::setText(removed);
  changed();
}

void TextBox::undo() {
  model_.undo();
  changed();
}

void TextBox::redo() {
  model_.redo();
  changed();
}

bool TextBox::erase(CharPos from, CharPos to, bool undoable) {
  if (!from.valid() || !to.valid()) return false;
  const bool done = model_.erase(from.column, to.column, undoable);
  changed();
  return done;
}

bool TextBox::eraseSelectedText(bool undoable) {
  const bool done = model_.eraseSelectedText(undoable);
  changed();
  return done;
}

WString TextBox::getText(CharPos from, CharPos to) const {
  if (!from.valid() || !to.valid() || from == to) return {};
  return model_.textRange(from.column, to.column);
}

void TextBox::updateCurrentPosition(Glib::iFont::eCharSeekMethod method, int index) {
  if (method < Glib::iFont::PrevChar || method > Glib::iFont::ToIndex) return;
  model_.applyCaretMove(static_cast<TextEditModel::SeekMethod>(method), index);
  changed();
}

// --- Keys ---

TextBox::EditState TextBox::editState() const {
  return {model_.revision(), model_.caret(), model_.selectionStart(), model_.selectionEnd(),
          model_.isModified()};
}

int TextBox::handleKeyboardEvent(int keyCode) {
  if (!isEditable() || !isActive()) return 0;
  const auto key = static_cast<unsigned>(keyCode);
  GlobHandle<> self(this);
  const EditState before = editState();
  noteKeyTime();

  int consumed = 0;
  if (const wchar_t ch = typedCharacter(key)) {
    if (isAllowed(ch)) {
      addCharacter(ch);
      consumed = 1;
    } else {
      // A character the filter refuses is swallowed; one refused for want of room travels on.
      consumed = isRestricted(ch) ? 1 : 0;
    }
  } else if (isEditingKeyAllowed(key)) {
    consumed = TextBoxBase::handleKeyboardEvent(keyCode);
    if (!self) return consumed;
    if (!consumed) consumed = handleEditingKey(key);
  }
  if (!self) return consumed;

  const EditState after = editState();
  if (after == before) return consumed;
  relayout();
  invalidateTextSelection();
  if (after.revision != before.revision) informOwner(TextChangedByKey, true, keyCode);
  return consumed;
}

int TextBox::handleEditingKey(unsigned key) {
  const unsigned code = key & ~(kKeyShift | kKeyCtrl);
  switch (code) {
    case kKeyTab:
      return 0;  // the tab order takes it
    case kKeyReturn: {
      GlobHandle<> self(this);
      informOwner(EnterPressed, false, 0);
      if (self) handleTabStopFocusLoss();
      return 1;
    }
    default:
      return model_.handleKey(key) ? 1 : 0;
  }
}

// --- Mouse ---

int TextBox::handleMouseEvent(Event* e) {
  if (!isActive() || mouse_chord_event(e)) return 0;
  const OSKeyboard& keys = OS()->keyboard();
  if (keys.isKeyDown(OSKeyboard::kCtrl) || keys.isKeyDown(OSKeyboard::kAlt)) return 0;

  if (!isEditable() && mouse_down_event(e)) {
    const double t = now();
    // A clock that went back (a new manual clock) never makes a second click.
    const double since = t - gLastReadOnlyClick;
    const bool second = since >= 0.0 && since < kSecondClickMs;
    gLastReadOnlyClick = t;
    if (second) informOwner(SecondClick, false, 0);
  }
  if (mouse_right_event(e)) {
    if (!mouse_down_event(e)) return 0;
    GlobHandle<> self(this);
    const bool shown = openEditMenu(e->pos);
    return shown || !self ? 1 : 0;
  }
  if (!isEditable()) return 0;  // the click itself goes on to the owner
  if (!mouse_left_event(e)) return 0;

  if (mouse_down_event(e)) return handleLeftPress(*e, keys.isKeyDown(OSKeyboard::kShift));
  if (mouse_move_event(e)) {
    model_.dragTo(caretIndexAt(e->pos.x));
  } else if (mouse_up_event(e)) {
    if (!model_.hasSelection()) model_.clearSelection();
  }
  changed();
  return 1;
}

int TextBox::handleLeftPress(const Event& e, bool shift) {
  const int clicks = countClick(e.screenPos);
  if (!focused_) {
    // Taking the focus selects everything; a Shift press then extends from the start.
    model_.clearSelection();
    GlobHandle<> self(this);
    set_kbd_focus();
    if (!self) return 1;
    if (shift && focused_) model_.extendSelectionTo(caretIndexAt(e.pos.x));
  } else if (shift) {
    model_.extendSelectionTo(caretIndexAt(e.pos.x));
  } else if (clicks == 2) {
    model_.selectWordAt(characterIndexAt(e.pos.x));
  } else if (clicks == 3) {
    model_.highlightAll(true);
  } else {
    model_.setCaret(caretIndexAt(e.pos.x));
    model_.anchorSelection();
  }
  changed();
  return 1;
}

int TextBox::countClick(XY<int> rootPos) {
  const double t = now();
  const double since = t - lastClickTime_;
  const bool samePlace = std::abs(rootPos.x - lastClickPos_.x) <= kClickSlop &&
                         std::abs(rootPos.y - lastClickPos_.y) <= kClickSlop;
  const bool again =
      clicks_ > 0 && clicks_ < 3 && since >= 0.0 && since < kSecondClickMs && samePlace;
  clicks_ = again ? clicks_ + 1 : 1;
  lastClickTime_ = t;
  lastClickPos_ = rootPos;
  return clicks_;
}

int TextBox::caretIndexAt(int x) const {
  return ruler().indexAt(std::max<int64_t>(displayXToTextX(x), 0));
}

int TextBox::characterIndexAt(int x) const {
  const int64_t textX = std::max<int64_t>(displayXToTextX(x), 0);
  const int index = ruler().indexAt(textX);
  return index > 0 && textX < ruler().xOf(index) ? index - 1 : index;
}

// --- Focus ---

void TextBox::handle_kbd_focus() {
  if (hasKeyboardFocus()) {
    if (!focused_) gainFocus();
  } else if (focused_) {
    loseFocus();
  }
}

void TextBox::gainFocus() {
  focused_ = true;
  GlobHandle<> self(this);
  model_.highlightAll(true);
  relayout();
  makeCaret(XY<int>(caretDisplayX(), caretY()));
  placeCaret();
  update();
  model_.saveText();
  if (!isTabStopFocus()) requestTabStopFocus();
  if (!self) return;
  informOwner(FocusGained, false, 0);
}

void TextBox::loseFocus() {
  focused_ = false;
  destroyCaret();
  model_.setCaret(0);
  clear_interest(kInterestTicks);
  model_.clearSelection();
  scrollOffset_ = 0;
  relayout();
  // The focus frame goes, and the ghost label may come back: repaint in any case.
  update();
  if (getChanged()) informOwner(FocusLostChanged, false, 0);
}

// --- Layout ---

Glib::FontPtr TextBox::displayFont() const {
  if (!obfuscated_) return getFontPtr();
  return Glib::FontPtr(
      Glib::fonts().get(Glib::FontDesc(kObfuscationFace, getFontDesc().size, getFontDesc().style)));
}

void TextBox::fontChanged() {
  ruler_.setFont(displayFont());
  rulerRevision_ = ~std::uint64_t{0};
  if (TextCursor* c = caret()) c->setFont(displayFont()->desc());
  relayout();
}

void TextBox::setAlignment(TextAlignment alignment) {
  if (alignment == alignment_) return;
  alignment_ = alignment;
  relayout();
  update();
}

void TextBox::setMargins(unsigned char left, unsigned char right) {
  if (left == leftMargin_ && right == rightMargin_) return;
  leftMargin_ = left;
  rightMargin_ = right;
  relayout();
  update();
}

void TextBox::setObfuscatedDisplay(bool on) {
  if (on == obfuscated_) return;
  obfuscated_ = on;
  model_.setMask(on ? kObfuscationChar : 0);
  fontChanged();
  update();
}

WString TextBox::getDisplayText() const {
  if (obfuscated_) return WString(model_.text().size(), kObfuscationChar);
  return model_.text();
}

String TextBox::describeValue() const {
  return Kw::toUtf8(isGhostLabelVisible() ? getGhostLabel() : getDisplayText());
}

bool TextBox::isGhostLabelVisible() const {
  return model_.isEmpty() && !focused_;
}

int TextBox::stretchWidth() const {
  return std::max(0, static_cast<int>(width()) - leftMargin_ - rightMargin_);
}

int TextBox::caretY() const {
  return (static_cast<int>(height()) - displayFont()->height()) / 2;
}

int TextBox::textXToDisplayX(int64_t x) const {
  updateVisibleWindow();
  return clampToInt(textX_ + x - scrollOffset_);
}

int64_t TextBox::displayXToTextX(int x) const {
  updateVisibleWindow();
  return int64_t{x} - textX_ + scrollOffset_;
}

int TextBox::caretDisplayX() const {
  return textXToDisplayX(ruler().xOf(model_.caret()));
}

const TextRuler& TextBox::ruler() const {
  if (obfuscated_) {
    if (!ruler_.isMasked() || ruler_.length() != model_.length()) {
      ruler_.setMasked(kObfuscationChar, model_.length());
    }
  } else if (rulerRevision_ != model_.revision() || ruler_.isMasked()) {
    ruler_.setText(model_.text());
  }
  rulerRevision_ = model_.revision();
  return ruler_;
}

void TextBox::relayout() {
  windowStale_ = true;
  placeCaret();
}

void TextBox::changed() {
  relayout();
  invalidateTextSelection();
}

void TextBox::updateVisibleWindow() const {
  if (!windowStale_) return;
  windowStale_ = false;
  const int stretch = stretchWidth();
  const int64_t textWidth = ruler().width();
  if (textWidth <= stretch) {
    scrollOffset_ = 0;
    const int w = static_cast<int>(textWidth);
    switch (alignment_) {
      case TextAlignment::Right:
        textX_ = static_cast<int>(width()) - rightMargin_ - w;
        break;
      case TextAlignment::Centred:
        textX_ = (static_cast<int>(width()) - w) / 2;
        break;
      default:
        textX_ = leftMargin_;
        break;
    }
    return;
  }
  // Too wide: from the left margin, scrolled by the least that keeps the caret in view.
  textX_ = leftMargin_;
  const int64_t caretX = ruler().xOf(model_.caret());
  int64_t offset = scrollOffset_;
  if (caretX - offset < 0) offset = caretX;
  if (caretX - offset > stretch) offset = caretX - stretch;
  offset = std::clamp<int64_t>(offset, 0, textWidth - stretch);
  scrollOffset_ = clampToInt(offset);
}

void TextBox::placeCaret() {
  TextCursor* c = caret();
  if (!c) return;
  const Glib::FontPtr font = displayFont();
  if (c->font() != font) c->setFont(font->desc());
  c->placeAt(XY<int>(caretDisplayX(), caretY()));
  if (getEditMode() == EditOverwrite) c->setCurrentChar(model_.characterAtCaret());
  holdCaretSteady();
}

void TextBox::invalidateTextSelection() {
  update();
}

void TextBox::reshape() {
  StandardPanel::reshape();
  relayout();
}

void TextBox::resize(double width, double height) {
  const Kw::Box<int>& r = canvas()->rect();
  // NaN and negative sizes become 0; canvases are at most 16-bit.
  auto size = [](double v) { return static_cast<int>(std::max(0.0, std::min(v, 65535.0))); };
  reshape_canvas(r.x0, r.y0, size(width), size(height));
}

// --- Drawing ---

void TextBox::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::TextFieldLook look(getPalette());
  look.well(p, p.bounds(), isActive());
  drawText(p);
  if (focused_) look.focusOutline(p, p.bounds());
}

void TextBox::drawText(Glib::Painter& p) {
  const Glib::TextFieldLook look(getPalette());
  const int w = static_cast<int>(width());
  const int h = static_cast<int>(height());
  const Kw::Box<int> stretch(leftMargin_, 0, w - rightMargin_, h);
  if (stretch.empty()) return;
  p.pushClip(stretch);

  if (isGhostLabelVisible()) {
    const WString& ghost = getGhostLabel();
    if (!ghost.empty()) {
      const Glib::FontPtr font = getFontPtr();
      const int gw = font->textWidth(ghost);
      int x = leftMargin_;
      if (gw <= stretch.width()) {
        if (alignment_ == TextAlignment::Right) x = w - rightMargin_ - gw;
        if (alignment_ == TextAlignment::Centred) x = (w - gw) / 2;
      }
      p.textAt(ghost, XY<int>(x, (h - font->height()) / 2), *font, look.ghost());
    }
    p.popClip();
    return;
  }

  const Glib::FontPtr font = displayFont();
  const int y = caretY();
  const int64_t from = displayXToTextX(stretch.x0);
  const int64_t to = displayXToTextX(stretch.x1);
  auto drawPieces = [&](const Colour& colour) {
    ruler().forEachPiece(from, to, [&](const WString& text, int, int64_t x) {
      p.textAt(text, XY<int>(textXToDisplayX(x), y), *font, colour);
    });
  };

  Kw::Box<int> selection;
  if (model_.hasSelection()) {
    const int x0 = textXToDisplayX(ruler().xOf(model_.selectionLow()));
    const int x1 = textXToDisplayX(ruler().xOf(model_.selectionHigh()));
    selection = Kw::Box<int>(x0, std::max(1, y - 1), x1, std::min(h - 1, y + font->height() + 1))
                    .intersection(stretch);
  }
  if (!selection.empty()) {
    look.selection(p, selection, focused_);
  }
  drawPieces(getTextColour());
  if (!selection.empty()) {
    p.pushClip(selection);
    drawPieces(look.selectedText());
    p.popClip();
  }
  p.popClip();
}
