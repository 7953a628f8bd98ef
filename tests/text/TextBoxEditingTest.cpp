// The text box driven through the harness: typing, the filter and the limit, the shortcuts and
// the clipboard, undo, Escape and Enter, and the callback events they raise.
#include "tests/text/TextBoxTestSupport.h"

using Strings = std::vector<String>;

TEST_F(TextBoxFixture, RestrictionsFilterTypedCharactersAndTabIsNeverInserted) {
  TextBox::InitArgs digits;
  digits.characters = L"0123456789";
  digits.restriction = TextBoxBase::OnlyListed;
  TextBox* box = focusedBox(L"", digits);
  h.type(L"1a2\t");
  EXPECT_EQ(box->getText(), L"12");
  // The refused letter is swallowed; TAB is not a character and goes on to the owner.
  EXPECT_EQ(owner->keysReceived, std::vector<unsigned>{kTab});

  box->setCharacters(L"0123456789", TextBoxBase::AllButListed);
  h.type(L"5a\t");
  EXPECT_EQ(box->getText(), L"12a");

  box->setCharacters(L"", TextBoxBase::NoRestriction);
  h.type(L"\t");
  EXPECT_EQ(box->getText(), L"12a");
  EXPECT_FALSE(box->isAllowed(L'\t'));
}

TEST_F(TextBoxFixture, EveryKeyThatChangesTheTextRaisesEventTwoAtOnceWithItsCode) {
  TextBox* box = focusedBox(L"");
  h.type(L"ab");
  // Immediate: delivered before the key returns, no pumping needed.
  ASSERT_EQ(owner->texts(), (Strings{"event 2", "event 2"}));
  EXPECT_EQ(owner->last()->modifiers, unsigned{'b'});
  EXPECT_EQ(owner->last()->sender, box);
  owner->clear();
  h.key(kLeft);
  h.key(kLeft);  // the caret is at 0: nothing moves
  h.key(kEnd | kKeyShift);
  EXPECT_TRUE(owner->texts().empty());
  h.key(kBackspace);  // erases the selection
  EXPECT_EQ(box->getText(), L"");
  EXPECT_EQ(owner->texts(), Strings{"event 2"});
}

TEST_F(TextBoxFixture, CallbackRegistrationsAllFireInOrderAndANullHandlerMeansTheParent) {
  TextBox* box = focusedBox(L"");
  auto* other = new MessageProbe(h.place(300, 100, 10, 10));
  box->requestCallback("second", other, TextBoxBase::TextChangedByKey);
  box->requestCallback("third", nullptr, TextBoxBase::TextChangedByKey);
  h.type(L"x");
  EXPECT_EQ(owner->texts(), (Strings{"event 2", "third"}));
  EXPECT_EQ(other->texts(), Strings{"second"});
  delete other;  // a handler that is gone is skipped
  h.type(L"y");
  EXPECT_EQ(owner->count("third"), 2);
}

namespace {

// Deletes the Glob that sent the message it receives, as an owner closing a dialogue might.
class Deleter : public Glob {
 public:
  using Glob::Glob;
  int react(Event* e) override {
    if (message_event(e)) delete event_to_sender_glob(e);
    return 1;
  }
};

}  // namespace

TEST_F(TextBoxFixture, AnOwnerMayDeleteTheBoxFromAnyCallback) {
  auto* deleter = new Deleter(h.place(300, 100, 10, 10));
  for (auto event :
       {TextBoxBase::TextChangedByKey, TextBoxBase::EnterPressed, TextBoxBase::FocusLostChanged}) {
    TextBox* box = focusedBox(L"");
    GlobHandle<> alive(box);
    box->requestCallback("bye", deleter, event);
    h.type(L"ab");
    h.key(kEnter);
    h.pump();
    EXPECT_FALSE(alive) << event;
    EXPECT_EQ(h.root().focus(), event == TextBoxBase::TextChangedByKey ? nullptr : owner);
  }
}

TEST_F(TextBoxFixture, SizeLimitLetsAPasteOverrunThenRefusesTypingWithoutConsumingIt) {
  TextBox::InitArgs args;
  args.sizeLimit = 3;
  TextBox* box = focusedBox(L"ab", args);
  box->setCursorPosition(TextBox::CursorAtEnd);
  clipboard.setText(L"cde");
  h.key(kCtrlV);
  EXPECT_EQ(box->getText(), L"abcde");
  h.type(L"f");
  EXPECT_EQ(box->getText(), L"abcde");
  EXPECT_EQ(owner->keysReceived, std::vector<unsigned>{'f'});
}

TEST_F(TextBoxFixture, OverwriteModeLiftsTheSizeLimitEvenAtTheEnd) {
  TextBox::InitArgs args;
  args.sizeLimit = 3;
  TextBox* box = focusedBox(L"abc", args);
  box->setEditMode(TextBoxBase::EditOverwrite);
  h.key(kHome);
  h.type(L"XY");
  EXPECT_EQ(box->getText(), L"XYc");
  h.key(kEnd);
  h.type(L"de");
  EXPECT_EQ(box->getText(), L"XYcde");
  clipboard.setText(L"fg");
  h.key(kCtrlV);
  EXPECT_EQ(box->getText(), L"XYcdefg");
  EXPECT_TRUE(owner->keysReceived.empty());
  // Back in insert mode the limit holds again.
  box->setEditMode(TextBoxBase::EditInsert);
  h.type(L"h");
  EXPECT_EQ(box->getText(), L"XYcdefg");
  EXPECT_EQ(owner->keysReceived, std::vector<unsigned>{'h'});
}

TEST_F(TextBoxFixture, CopyAndCutWithoutSelectionTakeTheWholeText) {
  TextBox* box = focusedBox(L"hello world");
  h.key(kEnd);  // collapses the select-all of the focus gain
  ASSERT_TRUE(box->getSelectedText().empty());
  h.key(kCtrlC);
  EXPECT_EQ(clipboard.getText(), L"hello world");
  EXPECT_EQ(box->getText(), L"hello world");

  clipboard.setText(L"old");
  h.key(kCtrlX);
  EXPECT_EQ(clipboard.getText(), L"hello world");
  EXPECT_TRUE(box->isEmpty());
  // Cut is undoable; copying an empty box leaves the clipboard alone.
  h.key(kCtrlC);
  EXPECT_EQ(clipboard.getText(), L"hello world");
  h.key(kCtrlZ);
  EXPECT_EQ(box->getText(), L"hello world");

  // With a selection only the selection goes.
  h.key(kHome);
  for (int i = 0; i < 5; ++i) h.key(kRight | kKeyShift);
  h.key(kCtrlX);
  EXPECT_EQ(clipboard.getText(), L"hello");
  EXPECT_EQ(box->getText(), L" world");
}

TEST_F(TextBoxFixture, ContextMenuMessagesActAsShortcutsAndCutOnAReadOnlyBoxDoesNothing) {
  TextBox* box = focusedBox(L"abc");
  h.key(kEnd);
  clipboard.setText(L"XY");
  EXPECT_EQ(box->call_msg(box, "Paste"), 1);
  EXPECT_EQ(box->getText(), L"abcXY");
  EXPECT_EQ(box->call_msg(box, "Copy"), 1);
  EXPECT_EQ(clipboard.getText(), L"abcXY");

  box->setEditable(false);
  clipboard.setText(L"kept");
  EXPECT_EQ(box->call_msg(box, "Cut"), 1);
  EXPECT_EQ(box->getText(), L"abcXY");
  EXPECT_EQ(clipboard.getText(), L"kept");
  // Copy still works on a read-only box; other messages are not the box's.
  EXPECT_EQ(box->call_msg(box, "Copy"), 1);
  EXPECT_EQ(clipboard.getText(), L"abcXY");
  EXPECT_EQ(box->call_msg(box, "Frobnicate"), 0);
}

TEST_F(TextBoxFixture, UndoTakesTypingBackWordByWordAndRedoReplaysIt) {
  TextBox* box = focusedBox(L"");
  h.type(L"ab cd");
  h.key(kCtrlZ);
  EXPECT_EQ(box->getText(), L"ab ");
  h.key(kCtrlZ);
  EXPECT_EQ(box->getText(), L"ab");
  h.key(TextBoxBase::kKeyAltBackspace);  // Alt+Backspace undoes too
  EXPECT_EQ(box->getText(), L"");
  h.key(kCtrlZ);  // nothing left
  EXPECT_EQ(box->getText(), L"");
  h.key(kCtrlY);
  h.key(kCtrlY);
  EXPECT_EQ(box->getText(), L"ab ");
  // A new edit clears what could be redone.
  h.type(L"x");
  h.key(kCtrlY);
  EXPECT_EQ(box->getText(), L"ab x");
}

TEST_F(TextBoxFixture, UndoAfterSetTextHasNothingToTakeBack) {
  TextBox* box = focusedBox(L"");
  h.type(L"typed");
  box->setText(L"set by the owner");
  h.key(kCtrlZ);
  EXPECT_EQ(box->getText(), L"set by the owner");
  EXPECT_FALSE(box->getChanged());
  // setText on a focused box leaves the caret at the end with nothing selected.
  EXPECT_EQ(box->model().caret(), 16);
  EXPECT_TRUE(box->getSelectedText().empty());
}

TEST_F(TextBoxFixture, EscapeRestoresTheTextOfTheFocusGainAndSelectsIt) {
  TextBox* box = focusedBox(L"start");
  h.type(L"new");
  EXPECT_EQ(box->getText(), L"new");
  h.key(kEscape);
  EXPECT_EQ(box->getText(), L"start");
  EXPECT_EQ(box->getSelectedText(), L"start");
  EXPECT_FALSE(box->getChanged());
  EXPECT_FALSE(box->model().isModified());
  // Escape with nothing changed only selects; it is still consumed.
  h.key(kEnd);
  h.key(kEscape);
  EXPECT_EQ(box->getSelectedText(), L"start");
  EXPECT_TRUE(owner->keysReceived.empty());
}

TEST_F(TextBoxFixture, EnterRaisesThreeThenOneAndHandsTheFocusToTheParent) {
  TextBox* box = focusedBox(L"old");
  h.type(L"new");
  owner->clear();
  h.key(kEnter);
  EXPECT_EQ(events(), (Strings{"event 3", "event 1"}));
  EXPECT_EQ(h.root().focus(), owner);
  EXPECT_EQ(box->caret(), nullptr);

  // Unchanged text: Enter raises 3 only.
  box->set_kbd_focus();
  h.pump();
  owner->clear();
  h.key(kEnter);
  EXPECT_EQ(events(), Strings{"event 3"});
}

TEST_F(TextBoxFixture, FocusGainSelectsAllAndRaisesZeroAndLossClearsTheSelection) {
  TextBox* box = makeBox();
  box->setText(L"some text");
  box->set_kbd_focus();
  EXPECT_EQ(events(), Strings{"event 0"});
  EXPECT_EQ(box->getSelectedText(), L"some text");
  ASSERT_NE(box->caret(), nullptr);
  EXPECT_EQ(box->caret()->getCursorStyle(), TextCursor::StyleInsert);

  owner->set_kbd_focus();
  EXPECT_TRUE(events() == Strings{"event 0"});  // unchanged: no event 1
  EXPECT_EQ(box->caret(), nullptr);
  EXPECT_TRUE(box->getSelectedText().empty());
  EXPECT_EQ(box->model().caret(), 0);
}

TEST_F(TextBoxFixture, KeysOnAReadOnlyOrInactiveBoxTravelToTheOwner) {
  TextBox* box = focusedBox(L"text");
  box->setActive(false, true);
  h.type(L"a");
  box->setActive(true, true);
  box->setEditable(false);  // drops the focus to the parent at once
  EXPECT_EQ(h.root().focus(), owner);
  EXPECT_EQ(box->getText(), L"text");
  EXPECT_EQ(owner->keysReceived, std::vector<unsigned>{'a'});
  EXPECT_FALSE(box->isTabStopActive());
}

TEST_F(TextBoxFixture, OverwriteModeReplacesTheCharacterUnderTheBlockCaret) {
  TextBox* box = focusedBox(L"abc");
  box->setEditMode(TextBoxBase::EditOverwrite);
  EXPECT_EQ(box->caret()->getCursorStyle(), TextCursor::StyleBlock);
  h.key(kHome);
  EXPECT_EQ(box->caret()->currentChar(), L'a');
  h.type(L"XY");
  EXPECT_EQ(box->getText(), L"XYc");
  EXPECT_EQ(box->caret()->currentChar(), L'c');
  h.type(L"Z!");
  EXPECT_EQ(box->getText(), L"XYZ!");
  EXPECT_EQ(box->caret()->currentChar(), L' ');
  box->setEditMode(TextBoxBase::EditInsert);
  EXPECT_EQ(box->caret()->getCursorStyle(), TextCursor::StyleInsert);
}

TEST_F(TextBoxFixture, ComposedTextIsPastedThroughTheFilterAndBadBytesBecomeReplacements) {
  TextBox::InitArgs args;
  args.characters = L"0123456789";
  args.restriction = TextBoxBase::OnlyListed;
  TextBox* box = focusedBox(L"", args);
  Event e(kEventMessage);
  e.message("CompoundTextInput");
  e.setPayload(
      "4\xE2\x82\xAC"
      "2");  // 4, a euro sign, 2
  e.dest = box;
  EXPECT_EQ(event_send(&e, false), 1);
  EXPECT_EQ(box->getText(), L"42");
  EXPECT_EQ(owner->texts(), Strings{"event 2"});

  box->setCharacters(L"", TextBoxBase::NoRestriction);
  e.setPayload("a\xFF\xC0z\x01\n");  // malformed bytes, a control character, a line break
  event_send(&e, false);
  EXPECT_EQ(box->getText(), L"42a\uFFFD\uFFFDz");
}

TEST_F(TextBoxFixture, PastedControlCharactersAreDroppedAndLineBreaksBecomeSpaces) {
  TextBox* box = focusedBox(L"");
  clipboard.setText(WString(L"a\tb\x07"
                            L"c\r\nd\x1B") +
                    L'\0' + L"e\n\n");
  h.key(kCtrlV);
  EXPECT_EQ(box->getText(), L"abc de");
}

namespace {

// A box that refuses 'x' on top of the usual rules, as a subclass with its own filter would.
class NoExBox : public TextBox {
 public:
  using TextBox::TextBox;
  bool isAllowed(wchar_t ch) const override { return ch != L'x' && TextBox::isAllowed(ch); }
};

// A box that logs every caret move it is asked to make, as the value box will watch them.
class CaretWatchingBox : public TextBox {
 public:
  using TextBox::TextBox;
  struct Move {
    int before, after;
  };
  std::vector<Move> moves;

 protected:
  void updateCurrentPosition(Glib::iFont::eCharSeekMethod method, int index) override {
    const int before = model().caret();
    TextBox::updateCurrentPosition(method, index);
    moves.push_back({before, model().caret()});
  }
};

}  // namespace

TEST_F(TextBoxFixture, TypingPasteAndComposedTextAllPassTheBoxsOwnFilter) {
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(200, 24, owner->canvas(), 10, 10);
  auto* box = new NoExBox(args);
  box->set_kbd_focus();
  h.type(L"axb");
  EXPECT_EQ(box->getText(), L"ab");
  clipboard.setText(L"xyx");
  h.key(kCtrlV);
  EXPECT_EQ(box->getText(), L"aby");
  Event e(kEventMessage);
  e.message(kMsgCompoundTextInput);
  e.setPayload("x1x");
  e.dest = box;
  event_send(&e, false);
  EXPECT_EQ(box->getText(), L"aby1");
  // Overwriting goes through the same gate.
  box->setEditMode(TextBoxBase::EditOverwrite);
  h.key(kHome);
  h.type(L"xz");
  EXPECT_EQ(box->getText(), L"zby1");
}

TEST_F(TextBoxFixture, EveryCaretMoveGoesThroughUpdateCurrentPositionOnce) {
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(300, 24, owner->canvas(), 10, 10);
  args.text = L"alpha beta";
  auto* box = new CaretWatchingBox(args);
  std::size_t seen = 0;
  int caret = box->model().caret();
  // Since the last look, the moves chain from the caret as it was to the caret as it is, and
  // each of them changed it.
  auto movesChain = [&](const char* what) {
    SCOPED_TRACE(what);
    const std::size_t before = seen;
    for (; seen < box->moves.size(); ++seen) {
      EXPECT_EQ(box->moves[seen].before, caret);
      EXPECT_NE(box->moves[seen].before, box->moves[seen].after);
      caret = box->moves[seen].after;
    }
    EXPECT_EQ(caret, box->model().caret());
    return seen - before;
  };

  h.clickOn(*box);  // takes the focus: caret to the end
  EXPECT_EQ(movesChain("focus"), 1u);
  h.key(kEnd);  // already there: only the selection goes
  h.type(L"!?");
  EXPECT_EQ(movesChain("typing"), 2u);
  h.key(kLeft);
  h.key(kLeft | kKeyCtrl);
  h.key(kHome);
  h.key(kHome);  // already at the start: no move
  EXPECT_EQ(movesChain("caret keys"), 3u);
  h.key(kEnd | kKeyShift);
  h.key(kBackspace);
  EXPECT_EQ(movesChain("select and erase"), 2u);
  clipboard.setText(L"pasted");
  h.key(kCtrlV);
  h.key(kCtrlZ);
  h.key(kCtrlY);
  h.key(kEscape);
  movesChain("clipboard, undo, redo and Escape");
  h.advance(1000);
  h.click(pointOnCharacter(*box, 3));
  h.drag(pointOnCharacter(*box, 1), pointOnCharacter(*box, 6));
  movesChain("click and drag");
  box->setCursorPosition(TextBox::CursorAtEnd);
  box->setText(L"new");
  owner->set_kbd_focus();
  movesChain("owner calls and focus loss");
  EXPECT_GT(seen, 12u);
}
