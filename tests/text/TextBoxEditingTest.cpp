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
  // Overwrite mode replaces a character, so it may type at the limit only when under it.
  box->setEditMode(TextBoxBase::EditOverwrite);
  h.key(kHome);
  EXPECT_FALSE(box->isAllowed(L'z'));
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
  h.key(0x04000008);  // Alt+Backspace undoes too
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
