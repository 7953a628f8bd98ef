#include "text/TextBoxBase.h"

#include "platform/glib/FontCache.h"
#include "platform/glib/look/TextFieldLook.h"
#include "platform/glob/RootGlob.h"
#include "platform/glob/RuntimeClock.h"
#include "platform/kw/CharClassifier.h"
#include "platform/kw/String.h"
#include "platform/misc/WindowsClipboard.h"

const char* const TextBoxBase::copyMsg = "Copy";
const char* const TextBoxBase::cutMsg = "Cut";
const char* const TextBoxBase::pasteMsg = "Paste";
const char* const TextBoxBase::compoundTextInputMsg = "CompoundTextInput";

namespace {

double now() {
  return static_cast<double>(RuntimeClock::now());
}

// The model's caret moves are the font's seek methods, number for number.
using Seek = TextEditModel::SeekMethod;
static_assert(static_cast<int>(Seek::PreviousChar) == Glib::iFont::PrevChar);
static_assert(static_cast<int>(Seek::NextChar) == Glib::iFont::NextChar);
static_assert(static_cast<int>(Seek::NextWord) == Glib::iFont::NextWord);
static_assert(static_cast<int>(Seek::PreviousWord) == Glib::iFont::PrevWord);
static_assert(static_cast<int>(Seek::StartOfText) == Glib::iFont::Start);
static_assert(static_cast<int>(Seek::EndOfText) == Glib::iFont::End);
static_assert(static_cast<int>(Seek::ToIndex) == Glib::iFont::ToIndex);

}  // namespace

TextBoxBase::TextBoxBase(unsigned short width, unsigned short height, const Palette& palette,
                         Canvas* parent)
    : StandardPanel(width, height, palette, false, parent), GlobTabStop(this) {
  init();
}

TextBoxBase::TextBoxBase(const GlobCreationInfo& info) : StandardPanel(info), GlobTabStop(this) {
  init();
}

TextBoxBase::~TextBoxBase() = default;

void TextBoxBase::init() {
  font_ = Glib::FontPtr(Glib::fonts().get(fontDesc_));
  // The model asks only once the box is built, from user input or the owner's calls.
  model_.setOwner(this);
}

bool TextBoxBase::ownerAllows(wchar_t ch) {
  return isAllowed(ch);
}

void TextBoxBase::ownerMovesCaret(TextEditModel::SeekMethod method, int index) {
  updateCurrentPosition(static_cast<Glib::iFont::eCharSeekMethod>(method), index);
}

// --- Settings ---

void TextBoxBase::setEditable(bool editable) {
  if (editable == editable_) return;
  editable_ = editable;
  if (!editable_) handleTabStopFocusLoss();
  update();
}

void TextBoxBase::setSizeLimit(std::uint64_t limit) {
  model_.setSizeLimit(limit);
}

void TextBoxBase::setEditMode(eEditMode mode) {
  if (mode != EditInsert && mode != EditOverwrite) return;
  model_.setEditMode(mode == EditOverwrite ? TextEditModel::EditMode::Overwrite
                                           : TextEditModel::EditMode::Insert);
  if (TextCursor* c = caret()) {
    c->setCursorStyle(mode == EditOverwrite ? TextCursor::StyleBlock : TextCursor::StyleInsert);
    if (mode == EditOverwrite) c->setCurrentChar(model_.characterAtCaret());
  }
}

TextBoxBase::eEditMode TextBoxBase::getEditMode() const {
  return model_.editMode() == TextEditModel::EditMode::Overwrite ? EditOverwrite : EditInsert;
}

void TextBoxBase::setCharacters(const WString& set, CharacterRestriction restriction) {
  if (restriction < NoRestriction || restriction > AllButListed) return;
  model_.setCharacters(set, static_cast<TextEditModel::CharacterRestriction>(restriction));
}

const WString& TextBoxBase::getGhostLabel() const {
  static const WString none;
  return rare_ ? rare_->ghostLabel : none;
}

void TextBoxBase::setGhostLabel(const WString& label) {
  if (label == getGhostLabel()) return;
  if (!rare_) rare_ = std::make_unique<Rare>();
  rare_->ghostLabel = label;
  update();
}

void TextBoxBase::setCaretColour(const Colour& colour) {
  if (caretColourSet_ && colour == caretColour_) return;
  caretColour_ = colour;
  caretColourSet_ = true;
  if (TextCursor* c = caret()) c->setColours(colour, getPalette().get(Palette::Base));
}

Colour TextBoxBase::getCaretColour() const {
  return caretColourSet_ ? caretColour_ : getPalette().get(Palette::Caret);
}

Colour TextBoxBase::getTextColour() const {
  return Glib::TextFieldLook(getPalette()).text(isActive());
}

void TextBoxBase::clearChanged() {
  model_.saveText();
  model_.clearModified();
}

void TextBoxBase::setFont(const Glib::FontDesc& font) {
  if (font == fontDesc_) return;
  fontDesc_ = font;
  font_ = Glib::FontPtr(Glib::fonts().get(font));
  fontChanged();
  update();
}

// --- Owner callbacks ---

void TextBoxBase::requestCallback(const String& message, Glob* handler, CallbackEvent event) {
  if (!rare_) rare_ = std::make_unique<Rare>();
  rare_->callbacks.push_back(Callback{event, message, GlobHandle<>(handler), handler == nullptr});
}

void TextBoxBase::informOwner(CallbackEvent event, bool immediate, int keyCode) {
  if (!rare_ || rare_->callbacks.empty()) return;
  GlobHandle<> self(this);
  Event e(kEventMessage);
  e.setSender(this);
  e.word2 = static_cast<uint32_t>(keyCode);
  // A handler may add registrations or delete this box: walk a copy.
  const std::vector<Callback> registrations = rare_->callbacks;
  for (const Callback& c : registrations) {
    if (c.event != event) continue;
    Glob* target = c.toParent ? (self ? parent() : nullptr) : c.handler.get();
    if (!target) continue;
    e.message(c.message);
    e.dest = target;
    e.canvas = target->canvas();
    if (immediate) {
      target->react(&e);
    } else {
      event_send(&e, true);
    }
  }
}

bool TextBoxBase::sameCharType(wchar_t a, wchar_t b) {
  return CharClassifier::sameCharType(a, b);
}

// --- Caret ---

void TextBoxBase::makeCaret(XY<int> pos) {
  TextCursor* c = caret();
  if (!c) {
    c = new TextCursor(font_, canvas());
    caret_ = GlobHandle<TextCursor>(c);
    c->setColours(getCaretColour(), getPalette().get(Palette::Base));
    if (getEditMode() == EditOverwrite) {
      c->setCursorStyle(TextCursor::StyleBlock);
      c->setCurrentChar(model_.characterAtCaret());
    }
  }
  c->placeAt(pos);
}

void TextBoxBase::destroyCaret() {
  if (TextCursor* c = caret()) delete c;
  caret_.reset();
}

void TextBoxBase::noteKeyTime() {
  lastKeyTime_ = now();
}

void TextBoxBase::holdCaretSteady() {
  TextCursor* c = caret();
  if (!c) return;
  c->deactivateFlash();
  set_interest(kInterestTicks);
}

int TextBoxBase::handleTimerEvent() {
  TextCursor* c = caret();
  if (!c) {
    clear_interest(kInterestTicks);
    return 1;
  }
  if (now() - lastKeyTime_ > kFlashPauseMs) {
    clear_interest(kInterestTicks);
    c->activateFlash();
  }
  return 1;
}

// --- Keys and messages ---

bool TextBoxBase::isAllowed(wchar_t ch) const {
  return CharClassifier::isPrintable(ch) && ch != L'\t' && !isRestricted(ch);
}

int TextBoxBase::handleKeyboardEvent(int keyCode) {
  if (!editable_ || !isActive()) return 0;
  const auto key = static_cast<unsigned>(keyCode);
  switch (key) {
    case kKeyCopy:
    case kKeyCut:
    case kKeyPaste:
    case kKeyUndo:
    case kKeyAltBackspace:
    case kKeyRedo:
    case kKeySelectAll:
      break;
    default:
      return 0;
  }
  if (!isEditingKeyAllowed(key)) return 0;
  switch (key) {
    case kKeyCopy:
      copy();
      break;
    case kKeyCut:
      cut();
      break;
    case kKeyPaste:
      paste(WindowsClipboard::getText());
      break;
    case kKeyUndo:
    case kKeyAltBackspace:
      undo();
      break;
    case kKeySelectAll:
      highlightAllText(true);
      break;
    default:
      redo();
      break;
  }
  return 1;
}

int TextBoxBase::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg == copyMsg) {
    copy();
    return 1;
  }
  // The context menu's items act as their shortcuts would; consumed even when the box
  // refuses them.
  if (msg == cutMsg) {
    handleKeyboardEvent(static_cast<int>(kKeyCut));
    return 1;
  }
  if (msg == pasteMsg) {
    handleKeyboardEvent(static_cast<int>(kKeyPaste));
    return 1;
  }
  return 0;
}

int TextBoxBase::react(Event* e) {
  if (message_event(e) && e->text() == compoundTextInputMsg) {
    if (!editable_ || !isActive()) return 1;
    GlobHandle<> self(this);
    const auto revision = model_.revision();
    noteKeyTime();
    paste(Kw::toWide(e->payload()));
    if (self && model_.revision() != revision) informOwner(TextChangedByKey, true, 0);
    return 1;
  }
  return StandardPanel::react(e);
}

void TextBoxBase::setActive(bool active, bool redraw) {
  if (active == isActive()) return;
  StandardPanel::setActive(active, redraw);
}

MouseCursorID TextBoxBase::contextCursor(const XY<int>&) {
  return editable_ ? kCursorText : kCursorArrow;
}

bool TextBoxBase::reviewMenu(Event*) {
  return isActive();
}

bool TextBoxBase::openEditMenu(XY<int>) {
  const bool editable = editable_ && isActive();
  clearMenu();
  addMenuItem(L"Cut", cutMsg, editable && !isEmpty());
  addMenuItem(L"Copy", copyMsg, canCopyText());
  addMenuItem(L"Paste", pasteMsg, editable && WindowsClipboard::hasText());
  return makeMenu(nullptr, true) != nullptr;
}

void TextBoxBase::addUndoItem(const HistoryItem& item) {
  model_.addUndoItem(item);
}

// --- Tab order ---

bool TextBoxBase::isTabStopActive() {
  return editable_ && canvas_is_mapped_to_root(canvas());
}
