#pragma once
// The single-line text entry: a text box with horizontal scrolling, selection by keyboard and
// mouse, the clipboard, word-wise undo and redo, a hidden-text (password) display and a ghost
// label, telling its owner of editing through the callback events of TextBoxBase.
//
// Where each decision lives (each is stated once, in the header named):
//   TextEditModel  text, caret, selection, filter, size limit, overwrite, undo grouping, the
//                  editing and caret keys, word moves and word selection, masked text
//   EditHistory    the undo and redo lists and their depth
//   TextBoxBase    callbacks, shortcuts (Ctrl+A among them), composed text, the character gate
//                  and caret path (isAllowed, updateCurrentPosition), the edit menu hook
//   TextBox        layout and scrolling, mouse, focus, obfuscated display, drawing
//   TextCursor     flashing and the block caret
//   TextRuler      measuring and the pieces that are drawn
//
// The mouse, on an active box (chords and presses with Ctrl or Alt are the owner's):
//
//   input               editable, no focus      editable, with focus       read-only
//   left press          takes the focus, which  caret to the pointer,      a second press within
//                       selects all; Shift:     anchored; Shift: extends   400 ms raises event 4;
//                       extends from the start  from the anchor            the press goes on
//   2nd press, there    -                       selects the word           as above
//   3rd press, there    -                       selects everything         as above
//   left drag           extends from the start  extends from the anchor    -
//   right press         openEditMenu            openEditMenu               openEditMenu
//
// Choices made here:
// - eCursorPos names the two ends of the text: CursorAtStart and CursorAtEnd.
// - InitArgs carries the creation record and every setting below; its defaults are those of
//   the (width, height, palette, canvas) constructor: editable, left-aligned, margins of
//   kDefaultMargin, the standard font, no limit, no filter, no ghost label, plain display.
// - A double click is a left press less than kSecondClickMs after the previous one and within
//   kClickSlop pixels of it; a third such press selects everything, and a fourth starts
//   again as a single click. The word is the one under the pointer (see TextEditModel).
// - Text that is wider than the visible stretch starts at the left margin whatever the
//   alignment, and scrolls; alignment applies only to text that fits. The scroll offset moves
//   only as far as needed to keep the caret in the stretch, and never further than shows the
//   end of the text at the right margin.
// - Shortcuts and Escape keep the selection they leave; the caret keys collapse or extend it.
// - Copy with nothing to copy leaves the clipboard alone. In obfuscated display the box puts
//   nothing on the clipboard: copy does nothing, and cut only erases. The model is masked
//   with the asterisk, so the overwrite caret, word moves and double clicks hide the text too.
// - A press on a box without the keyboard focus gives it the focus, which selects everything;
//   a drag from there selects from the start to the pointer.
// - The box registers nothing with a global service while it holds the focus.
// - Drawing: a sunken well in the base colour, the text clipped to the stretch between the
//   margins, the selection in the highlight colour, the ghost label in the ghost colour and
//   the standard font, and a one-pixel frame in the focus colour while the box holds the focus.
//   Only the pieces of text inside the stretch are drawn (see TextRuler).
#include <cstdint>

#include "platform/glib/TextAlignment.h"
#include "platform/kw/NumRange.h"
#include "text/TextBoxBase.h"
#include "text/TextRuler.h"

namespace Glib {
class Painter;
}

class TextBox : public TextBoxBase {
 public:
  enum eCursorPos : int { CursorAtStart = 0, CursorAtEnd = 1 };

  static constexpr double kSecondClickMs = 400.0;
  // How far apart, in pixels each way, two presses of a double click may be.
  static constexpr int kClickSlop = 3;
  static constexpr unsigned char kDefaultMargin = 4;
  static constexpr wchar_t kObfuscationChar = L'*';
  static constexpr const char* kObfuscationFace = "courier";

  struct InitArgs {
    GlobCreationInfo info;
    WString text;
    bool editable = true;
    TextAlignment alignment = TextAlignment::Left;
    unsigned char leftMargin = kDefaultMargin;
    unsigned char rightMargin = kDefaultMargin;
    Glib::FontDesc font;
    std::uint64_t sizeLimit = 0;
    WString characters;
    CharacterRestriction restriction = NoRestriction;
    WString ghostLabel;
    bool obfuscated = false;
  };

  explicit TextBox(const InitArgs& args);
  // The same, taking the text over rather than copying it.
  explicit TextBox(InitArgs&& args);
  TextBox(unsigned short width, unsigned short height, const Palette& palette, Canvas* parent);

  // --- Contents ---
  void setText(const WString& text);
  const WString& getText() const { return model_.text(); }
  WString getString() const override { return model_.text(); }
  void setString(const WString& text) override { setText(text); }
  bool isEmpty() const override { return model_.isEmpty(); }
  bool getChanged() const override { return model_.getChanged(); }
  WString getSelectedText() const override { return model_.selectedText(); }

  // --- Caret and selection ---
  void setSelection(NumRange<int, true> range);
  void highlightAllText(bool on) override;
  void setCursorPosition(eCursorPos pos);
  void setCursorPosition(unsigned short index);

  // --- Display ---
  void setAlignment(TextAlignment alignment);
  TextAlignment getAlignment() const { return alignment_; }
  void setMargins(unsigned char left, unsigned char right);
  void setObfuscatedDisplay(bool on);
  bool isObfuscatedDisplay() const { return obfuscated_; }
  // Hidden text never goes to the clipboard.
  bool canCopyText() const override { return !obfuscated_ && !isEmpty(); }
  // Where the text starts (alignment), and how far it is scrolled left, in pixels.
  int textX() const {
    updateVisibleWindow();
    return textX_;
  }
  int scrollOffset() const {
    updateVisibleWindow();
    return scrollOffset_;
  }
  // The caret's x in the box (text x plus caret x less the scroll offset).
  int caretDisplayX() const;
  // The ruler brought up to date with the text: a box measures nothing until asked.
  const TextRuler& ruler() const;
  // The font the text is shown in (the obfuscation face in obfuscated display).
  Glib::FontPtr displayFont() const;
  bool isGhostLabelVisible() const;
  WString getDisplayText() const;

  // --- Glob ---
  void draw() override;
  void reshape() override;
  void resize(double width, double height);
  void handle_kbd_focus() override;
  int handleKeyboardEvent(int keyCode) override;
  int handleMouseEvent(Event* e) override;
  bool isAllowed(wchar_t ch) const override;
  const char* idstring() const override { return "textbox"; }
  // What the box shows: its text, asterisks in obfuscated display, else the ghost label.
  String describeValue() const override;

  // The time of the last click on any box that is not editable; shared by all text boxes.
  static double lastReadOnlyClickTime();

 protected:
  void addCharacter(int ch) override;
  void paste(const WString& s) override;
  void copy() override;
  void cut() override;
  void undo() override;
  void redo() override;
  bool erase(CharPos from, CharPos to, bool undoable);
  bool eraseSelectedText(bool undoable);
  WString getText(CharPos from, CharPos to) const override;
  void updateCurrentPosition(Glib::iFont::eCharSeekMethod method, int index) override;
  // Places the text in the box (textX_, scrollOffset_) when something changed since the last
  // time; asked by every reader, so that a box nobody looks at measures nothing.
  void updateVisibleWindow() const;
  void placeCaret();
  void drawText(Glib::Painter& p);
  int textXToDisplayX(int64_t x) const;
  int64_t displayXToTextX(int x) const;
  // Marks the text area for repainting after the text, caret or selection changed.
  void invalidateTextSelection();
  void fontChanged() override;

 private:
  struct EditState {
    std::uint64_t revision;
    int caret, selectionStart, selectionEnd;
    bool modified;
    bool operator==(const EditState& o) const = default;
  };

  void apply(const InitArgs& args, WString text);
  EditState editState() const;
  // Brings the ruler, the scroll offset and the caret up to date with the model.
  void relayout();
  // Lays the text out again and repaints after a change of the model.
  void changed();
  int handleEditingKey(unsigned key);
  int handleLeftPress(const Event& e, bool shift);
  // Counts a left press as the first, second or third of a multiple click.
  int countClick(XY<int> rootPos);
  // The character under display x (the boundary nearest to it for caret placement is
  // caretIndexAt).
  int characterIndexAt(int x) const;
  int caretIndexAt(int x) const;
  void gainFocus();
  void loseFocus();
  int stretchWidth() const;
  int caretY() const;

  mutable TextRuler ruler_;
  mutable std::uint64_t rulerRevision_ = ~std::uint64_t{0};
  // Where the text sits: worked out from the text, caret and margins when first needed.
  mutable int scrollOffset_ = 0;
  mutable int textX_ = kDefaultMargin;
  mutable bool windowStale_ = false;
  unsigned char leftMargin_ = kDefaultMargin;
  unsigned char rightMargin_ = kDefaultMargin;
  TextAlignment alignment_ = TextAlignment::Left;
  bool obfuscated_ = false;
  bool focused_ = false;
  int clicks_ = 0;
  double lastClickTime_ = 0.0;
  XY<int> lastClickPos_;
};
