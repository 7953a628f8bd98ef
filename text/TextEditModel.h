#pragma once
// The editing engine of a single-line text box: text, caret, selection, character filter,
// size limit, edit mode, undo and redo, and the editing and caret keys. It knows nothing of
// canvases, fonts or the clipboard: the text box lays the text out, asks the clipboard, and
// raises its callbacks around it.
//
// Positions are character indices, 0 to length(). The selection is a pair (start, end), both
// -1 when there is none; start is the anchor and end follows the caret when the selection is
// extended. A selection whose ends are equal is empty, and empty counts as no selection for
// erasing, copying and cutting.
//
// Decisions where the text box leaves room:
//   - Printable means `CharClassifier::isPrintable`, a fixed table independent of the locale.
//   - The owner's say (`setOwner`): a text box decides which characters go in and carries out
//     every caret move itself. Every character that typing or a paste would insert is put to
//     the character hook; every caret move that an edit, a key, an undo or a selection makes is
//     put to the owner, once per change: a move that would leave the caret where it is is
//     not made. Whatever the owner does, the caret stays within the text.
//   - Paste removes the text it replaces (the selection) first, moving the caret to where it
//     stood, and then puts each of its characters to the filter against the text as it stands
//     then, before any of them is inserted; so a paste that starts short of the limit goes in
//     whole and may overrun it.
//   - Size limit (`isAllowed`): a character is refused when a limit is set and the text, less
//     the selection that the character replaces, is at or above it. In overwrite mode the limit
//     does not apply at all: typing over the text or at its end may grow it past the limit.
//   - Paste turns each line break (CR LF counts as one) into a space and drops line breaks at
//     the end of the pasted text; then every character passes the filter as typing does
//     (control characters and TAB are dropped). `pasteUtf8` decodes first: malformed bytes
//     become U+FFFD, which is kept unless the filter refuses it.
//   - A paste or erase that changes nothing records nothing and leaves `isModified` alone.
//   - Masked text (`setMask`, the password display) has no words: word moves and word erases
//     go to the ends of the text and a word selection takes all of it, and the overwrite
//     caret's character is the mask, so that nothing shows where the hidden words break.
//   - A word selection (double click) is the run of characters of one class, as word moves
//     see them, that holds the character at the given index (the last one at the end).
//   - `setText` is the owner setting the contents, so it clears the undo and redo lists (their
//     positions describe the old text) and places the caret at the end (or the start).
//   - Escape is undoable: it records only the stretch where the text and the saved text
//     differ. With nothing saved yet, Escape is not handled and travels on to the owner.
//   - After Escape everything stays selected; only the caret keys collapse or extend the
//     selection afterwards.
#include <cstdint>
#include <functional>
#include <memory>
#include <string_view>
#include <utility>

#include "platform/glob/KeyCodes.h"
#include "platform/kw/String.h"
#include "text/EditHistory.h"

class TextEditModel {
 public:
  enum class EditMode { Insert = 0, Overwrite = 1 };
  enum class CharacterRestriction { None = 0, OnlyListed = 1, AllButListed = 2 };
  // Caret moves, numbered as the font service's seek methods.
  enum class SeekMethod {
    PreviousChar = 0,
    NextChar = 1,
    NextWord = 2,
    PreviousWord = 3,
    StartOfText = 4,
    EndOfText = 5,
    ToIndex = 6,
  };

  // The key codes the model handles are those of platform/glob/KeyCodes.h (Shift and Ctrl
  // masked off).

  // The longest text the model holds; longer pastes are cut short.
  static constexpr std::size_t kMaxLength = 0x7FFFFFFF;

  // --- Contents ---
  const WString& text() const { return text_; }
  int length() const { return static_cast<int>(text_.size()); }
  bool isEmpty() const { return text_.empty(); }
  // Text between two positions in either order; empty for a negative position or an empty
  // range. Positions past the end are taken as the end.
  WString textRange(int from, int to) const;
  // Replaces the contents and the saved text, caret to `caretTo` (the end or the start), no
  // selection, not modified, no undo or redo. Returns false (and changes nothing) when the
  // text, the saved text and the unmodified state are already so.
  // The text is taken over (moved in) when given a temporary.
  bool setText(WString text, SeekMethod caretTo = SeekMethod::EndOfText);
  // Counts every change of the text, so that a caller can tell whether a key changed it
  // without keeping a copy.
  std::uint64_t revision() const { return revision_; }

  // --- Saved text (Escape restores it) ---
  void saveText();
  bool hasSavedText() const { return hasSaved_; }
  const WString& savedText() const { return savedIsText_ ? text_ : saved_; }
  // True when the text differs from the saved text (with nothing saved: when it is not empty).
  bool getChanged() const;
  // Set by every edit; cleared by `setText`, Escape and `clearModified`.
  bool isModified() const { return modified_; }
  void clearModified() { modified_ = false; }

  // --- Caret and selection ---
  int caret() const { return caret_; }
  int selectionStart() const { return selStart_; }
  int selectionEnd() const { return selEnd_; }
  // True when the selection exists and is not empty.
  bool hasSelection() const { return selStart_ >= 0 && selEnd_ >= 0 && selStart_ != selEnd_; }
  int selectionLow() const { return selStart_ < selEnd_ ? selStart_ : selEnd_; }
  int selectionHigh() const { return selStart_ < selEnd_ ? selEnd_ : selStart_; }
  WString selectedText() const;

  // Where a seek from `from` lands; `index` is used by ToIndex only. Always within the text.
  int seek(SeekMethod method, int from, int index = 0) const;
  // Moves the caret through the caret hook (see the decisions above); the selection is left
  // alone.
  void moveCaret(SeekMethod method, int index = 0);
  void setCaret(int index) { moveCaret(SeekMethod::ToIndex, index); }
  // Carries a caret move out: where the caret hook ends up. Nothing else calls it.
  void applyCaretMove(SeekMethod method, int index = 0);
  // Selects from `anchor` to `caret` (clamped to the text) and puts the caret at `caret`.
  // Refused (false, nothing changes) for a negative position.
  bool select(int anchor, int caret);
  // Shift and a click: from the selection's anchor (the caret when there is none) to `index`.
  void extendSelectionTo(int index);
  // A double click: selects the word that holds the character at `index` (see the decisions
  // above), the caret at its end. Nothing is selected in an empty text.
  void selectWordAt(int index);
  // An empty selection at the caret, from which a drag or Shift extends.
  void anchorSelection() { selStart_ = selEnd_ = caret_; }
  void clearSelection() { selStart_ = selEnd_ = -1; }
  // A drag: while the caret is at the selection's end, moves both to `index`.
  void dragTo(int index);
  // With true: caret to the end and, when there is text, everything selected. With false:
  // the selection is cleared.
  void highlightAll(bool on);
  // The character under the caret for the overwrite caret: a space at the end of the text,
  // the mask over masked text.
  wchar_t characterAtCaret() const;

  // --- Settings ---
  void setEditMode(EditMode mode) { mode_ = mode; }
  EditMode editMode() const { return mode_; }
  void setCharacters(const WString& set, CharacterRestriction restriction);
  const WString& characterSet() const;
  CharacterRestriction restriction() const { return restriction_; }
  // 0 means unlimited.
  void setSizeLimit(std::uint64_t limit) { sizeLimit_ = limit; }
  std::uint64_t sizeLimit() const { return sizeLimit_; }

  // The character that stands for every character of the text on screen; 0 for none.
  void setMask(wchar_t mask) { mask_ = mask; }
  wchar_t mask() const { return mask_; }
  bool isMasked() const { return mask_ != 0; }

  // True when the filter refuses the character.
  bool isRestricted(wchar_t ch) const;
  // True when typing the character now would be accepted: printable, not TAB, not restricted,
  // and the size limit leaves room (see the decisions above).
  bool isAllowed(wchar_t ch) const;

  // --- The owner's say ---
  // One pointer rather than two callbacks: every text box has a model.
  class Owner {
   public:
    // Whether a character may go in (without an owner: isAllowed).
    virtual bool ownerAllows(wchar_t ch) = 0;
    // Carries out a caret move; it should end in applyCaretMove (without an owner: just that).
    virtual void ownerMovesCaret(SeekMethod method, int index) = 0;

   protected:
    ~Owner() = default;
  };
  void setOwner(Owner* owner) { owner_ = owner; }

  // --- Editing ---
  // Types one character: in overwrite mode with no selection it replaces the character after
  // the caret. Returns true when the text changed.
  bool addCharacter(wchar_t ch);
  // Replaces the selection by the allowed characters of `s`. Returns true when the text
  // changed.
  bool paste(const WString& s);
  bool pasteUtf8(std::string_view bytes);
  // Removes [from, to) in either order (clamped), caret to the start, selection cleared.
  // Returns true when something was removed. An erase that is not undoable clears the undo
  // and redo lists, which could no longer describe the text.
  bool erase(int from, int to, bool undoable);
  bool eraseSelectedText(bool undoable);
  // The text for the clipboard: the selection, or the whole text when there is none.
  WString copyText() const;
  // Removes the selection (everything, when there is none) with an undo item and returns it
  // for the clipboard.
  WString cut();
  bool undo();
  bool redo();
  // Records an edit made elsewhere (it clears the redo list, as every new edit does).
  void addUndoItem(EditHistory::Item item) { history_.record(std::move(item)); }
  bool canUndo() const { return history_.canUndo(); }
  bool canRedo() const { return history_.canRedo(); }
  // Restores the saved text with everything selected. False with nothing saved.
  bool revertToSaved();

  // --- Keys ---
  // Typing, Backspace, Delete, Escape, Home, Left, Right and End, with Ctrl for words and Shift
  // extending the selection. Returns true when the key is consumed. Not consumed: Tab, Enter,
  // shortcuts, a character refused only by the size limit, Escape with nothing saved, and
  // every other key. A printable character that the filter refuses is consumed and dropped.
  bool handleKey(unsigned key);

 private:
  // Decoded key code: the character or scan code with the Shift and Ctrl flags.
  bool handleCaretKey(unsigned code, bool ctrl, bool shift);
  bool eraseKey(bool forward, bool ctrl);

  bool allows(wchar_t ch) const { return owner_ ? owner_->ownerAllows(ch) : isAllowed(ch); }
  // Replaces [from, to) by the characters of `s` that the filter and the limit keep, with an
  // undo item; the caret and selection at the call are the item's state before.
  bool replaceRange(int from, int to, const WString& s);
  // The characters of `s` that go in, judged against the text as it stands.
  WString keptCharacters(const WString& s) const;
  void applyReplace(std::size_t pos, std::size_t removeCount, const WString& insert);
  // Gives the saved text a copy of its own before the text changes.
  void detachSaved();
  void revertGroup(std::span<const EditHistory::Item> items);
  void replayGroup(std::span<const EditHistory::Item> items);
  static bool isContiguousTyping(std::span<const EditHistory::Item> items);
  int clampIndex(int index) const;

  WString text_;
  // Until the first edit after a save the saved text is the text itself (`savedIsText_`) and
  // `saved_` stays empty: most boxes are never edited and so never hold their text twice.
  WString saved_;
  bool savedIsText_ = false;
  bool hasSaved_ = false;
  bool modified_ = false;
  std::uint64_t revision_ = 0;

  int caret_ = 0;
  int selStart_ = -1;
  int selEnd_ = -1;

  EditMode mode_ = EditMode::Insert;
  std::unique_ptr<WString> charSet_;  // made when a set is given: most boxes take anything
  CharacterRestriction restriction_ = CharacterRestriction::None;
  std::uint64_t sizeLimit_ = 0;
  wchar_t mask_ = 0;

  EditHistory history_;
  Owner* owner_ = nullptr;
};
