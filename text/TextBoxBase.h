#pragma once
// The editing base of the text boxes: a framed panel that holds the editing model (text,
// caret, selection, filter, size limit, edit mode, undo history), the editable flag, the
// caret Glob while it has the keyboard focus, the owner callbacks and the clipboard and undo
// shortcuts. Concrete boxes lay the text out, place the caret and decide what keys mean.
//
// Choices made here:
// - A callback's handler is the Glob whose react receives the message (the framework's event
//   entry); a null handler stands for the box's parent at the time the event is raised.
//   Immediate delivery calls the handler's react at once; dispatched delivery queues the
//   message, so it arrives after the current event has been handled, in order.
// - The message event of a callback carries the box as its sender and, for event 2, the key
//   code in its second word (0 for other events).
// - Printable means the model's fixed table (`CharClassifier::isPrintable`), the same on every
//   machine whatever the locale, so a box never accepts a character it cannot show.
// - `HistoryItem` is the model's edit record (EditHistory::Item); `addUndoItem` records it as
//   a new edit, which clears the redo list. The history keeps EditHistory::kDepth items.
// - Text composed by an input method ("CompoundTextInput", UTF-8 in the event's payload) is
//   pasted only into an editable, active box; it raises event 2 with key code 0 when it
//   changes the text. The message is consumed either way.
// - One gate for characters, one path for the caret: the editing model puts every character
//   that typing, a paste or composed text would insert to `isAllowed`, and every caret move it
//   makes (keys, clicks, edits, undo, selections, setText) to `updateCurrentPosition` (the
//   model's hooks say when). A subclass that overrides either sees everything.
// - Ctrl+A (kKeySelectAll) is a shortcut beside those of the clipboard and undo: it selects
//   everything (`highlightAllText(true)`).
// - The context menu offers "Cut", "Copy" and "Paste" by message: reviewMenu agrees to show a
//   menu for an active box. A right-button press on an active box, editable or not, calls
//   `openEditMenu` with the press position in the box, which opens the pop-up at the pointer.
//   An entry is inactive when it cannot apply: Cut and Paste in a read-only box, Cut and Copy
//   with no text (with no selection they take the whole text, as the shortcuts do), Copy when
//   canCopyText says no, Paste with an empty clipboard. Chosen entries come back as the
//   messages the box handles.
#include <cstdint>
#include <memory>
#include <vector>

#include "foundation/GlobTabStop.h"
#include "panels/StandardPanel.h"
#include "platform/glib/FontDesc.h"
#include "platform/glib/iFont.h"
#include "platform/glob/GlobHandle.h"
#include "text/EditHistory.h"
#include "text/TextCursor.h"
#include "text/TextEditModel.h"

class TextBoxBase : public StandardPanel, public GlobTabStop, private TextEditModel::Owner {
 public:
  enum CallbackEvent : int32_t {
    FocusGained = 0,
    FocusLostChanged = 1,
    TextChangedByKey = 2,
    EnterPressed = 3,
    SecondClick = 4,
  };
  enum CharacterRestriction : int32_t {
    NoRestriction = 0,  // every printable character but TAB
    OnlyListed = 1,     // only the characters of the set
    AllButListed = 2,   // every character but those of the set
  };
  enum eEditMode : int32_t { EditInsert = 0, EditOverwrite = 1 };

  // A text position; the single-line box uses line 0. A negative component means none.
  struct CharPos {
    int32_t line = -1;
    int32_t column = -1;
    CharPos() = default;
    CharPos(int32_t l, int32_t c) : line(l), column(c) {}
    bool valid() const { return line >= 0 && column >= 0; }
    bool operator==(const CharPos& o) const = default;
  };

  using HistoryItem = EditHistory::Item;

  // Shortcut key codes.
  static constexpr unsigned kKeyCopy = 0x22000043;
  static constexpr unsigned kKeyCut = 0x22000058;
  static constexpr unsigned kKeyPaste = 0x22000056;
  static constexpr unsigned kKeyUndo = 0x0200005A;
  static constexpr unsigned kKeyAltBackspace = 0x04000008;
  static constexpr unsigned kKeyRedo = 0x02000059;
  static constexpr unsigned kKeySelectAll = kKeyCtrl | 'A';

  // How long after the last key the caret starts flashing again.
  static constexpr double kFlashPauseMs = 500.0;

  static const char* const copyMsg;               // "Copy"
  static const char* const cutMsg;                // "Cut"
  static const char* const pasteMsg;              // "Paste"
  static const char* const compoundTextInputMsg;  // "CompoundTextInput"

  TextBoxBase(unsigned short width, unsigned short height, const Palette& palette, Canvas* parent);
  explicit TextBoxBase(const GlobCreationInfo& info);
  ~TextBoxBase() override;

  // --- Settings ---
  void setEditable(bool editable);
  bool isEditable() const { return editable_; }
  void setSizeLimit(std::uint64_t limit);
  std::uint64_t getSizeLimit() const { return model_.sizeLimit(); }
  void setEditMode(eEditMode mode);
  eEditMode getEditMode() const;
  void setCharacters(const WString& set, CharacterRestriction restriction);
  void setGhostLabel(const WString& label);
  const WString& getGhostLabel() const;
  void setCaretColour(const Colour& colour);
  Colour getCaretColour() const;
  // Virtual so that a box inside another control can show its owner's text colour.
  virtual Colour getTextColour() const;
  // The current text becomes the unchanged state.
  void clearChanged();

  // --- Owner callbacks ---
  void requestCallback(const String& message, Glob* handler, CallbackEvent event);
  void informOwner(CallbackEvent event, bool immediate, int keyCode);
  std::size_t callbackCount() const { return rare_ ? rare_->callbacks.size() : 0; }

  bool isRestricted(wchar_t ch) const { return model_.isRestricted(ch); }
  static bool sameCharType(wchar_t a, wchar_t b);
  // Creates the caret (if there is none) with its bottom-left corner at `pos`.
  void makeCaret(XY<int> pos);
  TextCursor* caret() const { return caret_.get(); }
  Glib::FontPtr getFontPtr() const { return font_; }
  const Glib::FontDesc& getFontDesc() const { return fontDesc_; }
  void addUndoItem(const HistoryItem& item);
  // Read access to the editing state, for owners and tests.
  const TextEditModel& model() const { return model_; }

  // --- Virtual operations, in slot order ---
  int handleMessageEvent(const String& msg, Glob* sender) override;
  int handleKeyboardEvent(int keyCode) override;
  int handleMouseEvent(Event* e) override { return 0; }
  int handleTimerEvent() override;
  virtual bool isAllowed(wchar_t ch) const;
  virtual bool isEditingKeyAllowed(unsigned keyCode) const { return true; }
  virtual bool getChanged() const = 0;
  virtual WString getString() const = 0;
  virtual void setString(const WString& s) = 0;
  virtual WString getSelectedText() const = 0;
  virtual bool isEmpty() const = 0;
  virtual void paste(const WString& s) = 0;
  virtual void copy() = 0;
  virtual void cut() = 0;
  virtual void undo() = 0;
  virtual void redo() = 0;
  virtual WString getText(CharPos from, CharPos to) const = 0;
  virtual void highlightAllText(bool on) = 0;
  virtual void addCharacter(int ch) = 0;
  virtual void updateCurrentPosition(Glib::iFont::eCharSeekMethod method, int index) = 0;
  // The font of the text (a new virtual of the text boxes).
  virtual void setFont(const Glib::FontDesc& font);
  // Offers Cut, Copy and Paste at `pos` (the box's coordinates) after a right-button press;
  // true when a menu showed, which consumes the press.
  virtual bool openEditMenu(XY<int> pos);
  // Whether the box's text may go to the clipboard.
  virtual bool canCopyText() const { return !isEmpty(); }

  // --- Glob ---
  int react(Event* e) override;
  void setActive(bool active, bool redraw) override;
  // The text cursor over an editable box, the arrow over a read-only one.
  MouseCursorID contextCursor(const XY<int>& pos) override;
  bool reviewMenu(Event* e) override;
  const char* idstring() const override { return "textboxbase"; }

  // --- Tab order: a stop while editable and shown, whether active or not ---
  bool isTabStopActive() override;

  using GlobTabStop::hasKeyboardFocus;
  double lastKeyTime() const { return lastKeyTime_; }

 protected:
  // Every handled key: keeps the caret solid until the keys pause.
  void noteKeyTime();
  // After every caret placement: the caret stops flashing and the box waits for a pause.
  void holdCaretSteady();
  void destroyCaret();
  // Called after setFont changed the font.
  virtual void fontChanged() {}

  TextEditModel model_;

 private:
  struct Callback {
    CallbackEvent event;
    String message;
    GlobHandle<> handler;  // empty: the parent
    bool toParent;
  };

  void init();
  // The model's owner: the box's own character filter and caret moves.
  bool ownerAllows(wchar_t ch) override;
  void ownerMovesCaret(TextEditModel::SeekMethod method, int index) override;

  bool editable_ = true;
  double lastKeyTime_ = -1e18;
  // What few boxes have: owners to call back and a ghost label. Made when first set.
  struct Rare {
    std::vector<Callback> callbacks;
    WString ghostLabel;
  };
  std::unique_ptr<Rare> rare_;
  GlobHandle<TextCursor> caret_;
  Colour caretColour_;
  bool caretColourSet_ = false;
  Glib::FontDesc fontDesc_;
  Glib::FontPtr font_;
};
