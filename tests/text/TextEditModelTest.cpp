#include <gtest/gtest.h>

#include "platform/glob/Event.h"
#include "text/CharClassifier.h"
#include "text/TextEditModel.h"

namespace {

using Model = TextEditModel;
using Restriction = TextEditModel::CharacterRestriction;

constexpr unsigned kHome = Model::kKeyHome;
constexpr unsigned kLeft = Model::kKeyLeft;
constexpr unsigned kRight = Model::kKeyRight;
constexpr unsigned kEnd = Model::kKeyEnd;
constexpr unsigned kDelete = Model::kKeyDelete;
constexpr unsigned kBackspace = Model::kKeyBackspace;

void type(Model& m, const WString& s) {
  for (wchar_t ch : s) m.handleKey(static_cast<unsigned>(ch));
}

Model withText(const WString& s, int caret) {
  Model m;
  m.setText(s);
  m.setCaret(caret);
  return m;
}

}  // namespace

TEST(TextEditModel, CaretKeysMoveWithinTheText) {
  Model m = withText(L"abc", 1);
  EXPECT_TRUE(m.handleKey(kRight));
  EXPECT_EQ(m.caret(), 2);
  EXPECT_TRUE(m.handleKey(kEnd));
  EXPECT_EQ(m.caret(), 3);
  EXPECT_TRUE(m.handleKey(kRight));  // at the end: consumed, stays
  EXPECT_EQ(m.caret(), 3);
  EXPECT_TRUE(m.handleKey(kLeft));
  EXPECT_EQ(m.caret(), 2);
  EXPECT_TRUE(m.handleKey(kHome | kKeyCtrl));  // Ctrl is masked off for Home
  EXPECT_EQ(m.caret(), 0);
  EXPECT_TRUE(m.handleKey(kLeft));
  EXPECT_EQ(m.caret(), 0);
  const auto rev = m.revision();
  // Keys that belong to the text box or to nobody travel on.
  for (unsigned key : {Model::kKeyTab, Model::kKeyEnter, kKeyShift | Model::kKeyTab,
                       kKeyAlt | kLeft, kKeyCtrl | 0x41u, 0x08000048u}) {
    EXPECT_FALSE(m.handleKey(key)) << std::hex << key;
  }
  EXPECT_EQ(m.text(), L"abc");
  EXPECT_EQ(m.revision(), rev);
}

TEST(TextEditModel, WordMovesStopAtEachCharacterClass) {
  // word, spaces, punctuation, spaces (one a no-break space), word with a non-ASCII letter,
  // an em dash (punctuation), word.
  const WString s = L"foo_bar1  ,.;\u00A0 h\u00E9llo\u2014x9";
  Model m = withText(s, 0);
  const int stops[] = {10, 15, 20, 21, 23};
  for (int stop : stops) {
    m.handleKey(kRight | kKeyCtrl);
    EXPECT_EQ(m.caret(), stop);
  }
  m.handleKey(kRight | kKeyCtrl);
  EXPECT_EQ(m.caret(), 23);
  const int back[] = {21, 20, 15, 10, 0};
  for (int stop : back) {
    m.handleKey(kLeft | kKeyCtrl);
    EXPECT_EQ(m.caret(), stop);
  }
  // From inside a word the moves reach its ends.
  m.setCaret(4);
  m.handleKey(kLeft | kKeyCtrl);
  EXPECT_EQ(m.caret(), 0);
  EXPECT_TRUE(CharClassifier::sameCharType(L'_', L'7'));
  EXPECT_FALSE(CharClassifier::sameCharType(L'a', L'-'));
  EXPECT_FALSE(CharClassifier::sameCharType(L' ', L'\x01'));
}

TEST(TextEditModel, CtrlBackspaceAndCtrlDeleteEraseWords) {
  Model m = withText(L"one two, three", 7);
  EXPECT_TRUE(m.handleKey(kBackspace | kKeyCtrl));
  EXPECT_EQ(m.text(), L"one , three");
  EXPECT_EQ(m.caret(), 4);
  EXPECT_TRUE(m.handleKey(kDelete | kKeyCtrl));  // the comma and the space after it
  EXPECT_EQ(m.text(), L"one three");
  m.handleKey(kBackspace);
  EXPECT_EQ(m.text(), L"onethree");
  m.setCaret(0);
  EXPECT_TRUE(m.handleKey(kBackspace));  // nothing before the caret: consumed, no change
  m.handleKey(kEnd);
  EXPECT_TRUE(m.handleKey(kDelete));
  EXPECT_EQ(m.text(), L"onethree");
}

TEST(TextEditModel, ShiftExtendsAndPlainKeysCollapseTheSelection) {
  Model m = withText(L"hello world", 5);
  m.handleKey(kRight | kKeyShift);
  m.handleKey(kRight | kKeyShift | kKeyCtrl);
  EXPECT_EQ(m.selectionStart(), 5);
  EXPECT_EQ(m.selectionEnd(), 11);
  EXPECT_EQ(m.selectedText(), L" world");
  // Going back past the anchor reverses the selection; the anchor stays.
  m.handleKey(kHome | kKeyShift);
  EXPECT_EQ(m.selectionStart(), 5);
  EXPECT_EQ(m.selectionEnd(), 0);
  EXPECT_EQ(m.selectedText(), L"hello");
  m.handleKey(kRight);
  EXPECT_FALSE(m.hasSelection());
  EXPECT_EQ(m.selectionStart(), -1);
  EXPECT_EQ(m.caret(), 1);

  // Shift at a boundary anchors an empty selection; typing then simply inserts.
  m.handleKey(kHome);
  m.handleKey(kLeft | kKeyShift);
  EXPECT_FALSE(m.hasSelection());
  type(m, L">");
  EXPECT_EQ(m.text(), L">hello world");

  // Typing and Backspace replace and remove a selection.
  m.select(1, 6);
  type(m, L"H");
  EXPECT_EQ(m.text(), L">H world");
  EXPECT_EQ(m.caret(), 2);
  m.select(8, 2);
  m.handleKey(kBackspace);
  EXPECT_EQ(m.text(), L">H");
  EXPECT_FALSE(m.hasSelection());
  EXPECT_FALSE(m.select(-1, 1));
}

TEST(TextEditModel, MousePressDragAndReleaseSelect) {
  Model m = withText(L"abcdef", 0);
  m.setCaret(2);
  m.anchorSelection();
  m.dragTo(5);
  EXPECT_EQ(m.selectedText(), L"cde");
  m.dragTo(99);
  EXPECT_EQ(m.caret(), 6);
  m.dragTo(1);
  EXPECT_EQ(m.selectedText(), L"b");
  m.highlightAll(true);
  EXPECT_EQ(m.selectedText(), L"abcdef");
  EXPECT_EQ(m.caret(), 6);
  m.highlightAll(false);
  EXPECT_EQ(m.selectionStart(), -1);
  Model empty;
  empty.highlightAll(true);
  EXPECT_EQ(empty.selectionStart(), -1);
}

TEST(TextEditModel, FilterOnTypingAndPaste) {
  Model m;
  m.setCharacters(L"0123456789", Restriction::OnlyListed);
  EXPECT_TRUE(m.handleKey(L'a'));  // refused by the filter: swallowed
  EXPECT_TRUE(m.isEmpty());
  EXPECT_FALSE(m.isModified());
  type(m, L"42");
  EXPECT_EQ(m.text(), L"42");

  m.setCharacters(L"0123456789", Restriction::AllButListed);
  EXPECT_TRUE(m.handleKey(L'5'));
  EXPECT_EQ(m.text(), L"42");
  type(m, L"a");
  EXPECT_EQ(m.text(), L"42a");

  // TAB never goes in, whatever the filter.
  m.setCharacters(L"", Restriction::None);
  EXPECT_FALSE(m.handleKey(L'\t'));
  EXPECT_FALSE(m.isAllowed(L'\t'));
  m.paste(L"\tb");
  EXPECT_EQ(m.text(), L"42ab");

  Model hex;
  hex.setCharacters(L"0123456789ABCDEF", Restriction::OnlyListed);
  EXPECT_TRUE(hex.paste(L"1f zA\tB\u00C9F"));
  EXPECT_EQ(hex.text(), L"1ABF");
  EXPECT_FALSE(hex.paste(L"xyz"));  // nothing kept, nothing selected: no edit
  EXPECT_EQ(hex.text(), L"1ABF");
  EXPECT_FALSE(hex.pasteUtf8("\xFF"));  // a replacement character is not a hex digit
}

TEST(TextEditModel, PasteDropsControlsAndFlattensLineBreaks) {
  Model m;
  m.paste(L"a\r\nb\rc\nd\u2028e\x01\x7F\u0085f\x1B\n\r\n");
  EXPECT_EQ(m.text(), L"a b c d e f");
  EXPECT_EQ(m.caret(), 11);
  // Malformed UTF-8 shows as one replacement character per bad sequence.
  m.setText(L"");
  m.pasteUtf8("ok\xC3(\xE2\x82\xAC");
  EXPECT_EQ(m.text(), L"ok\uFFFD(\u20AC");
  // Lone surrogates and non-characters are dropped.
  m.setText(L"");
  m.paste(WString{L'x', static_cast<wchar_t>(0xD800), static_cast<wchar_t>(0xFFFF), L'y'});
  EXPECT_EQ(m.text(), L"xy");
}

TEST(TextEditModel, SizeLimitOnTypingAndPaste) {
  Model m = withText(L"ab", 2);
  m.setSizeLimit(3);
  // Short of the limit, a paste goes in whole even when it overruns.
  EXPECT_TRUE(m.paste(L"cde"));
  EXPECT_EQ(m.text(), L"abcde");
  EXPECT_FALSE(m.handleKey(L'f'));  // refused for want of room: travels on
  EXPECT_FALSE(m.paste(L"f"));
  m.select(0, 1);
  EXPECT_FALSE(m.handleKey(L'A'));  // still over the limit once "a" is gone
  EXPECT_EQ(m.text(), L"abcde");
  // A character that replaces a selection fits when that brings the text under the limit.
  m.select(0, 3);
  EXPECT_TRUE(m.handleKey(L'A'));
  EXPECT_EQ(m.text(), L"Ade");
  EXPECT_FALSE(m.handleKey(L'g'));
  // Overwrite replaces inside a full text but cannot grow it at the end.
  m.setEditMode(Model::EditMode::Overwrite);
  m.setCaret(1);
  EXPECT_TRUE(m.handleKey(L'B'));
  EXPECT_EQ(m.text(), L"ABe");
  m.setCaret(3);
  EXPECT_FALSE(m.handleKey(L'F'));
  // A paste over a selection is judged after the selection is gone.
  m.setSizeLimit(2);
  m.select(1, 3);
  EXPECT_TRUE(m.paste(L"xyz"));
  EXPECT_EQ(m.text(), L"Axyz");
}

TEST(TextEditModel, HugePasteRespectsTheLimitAndSelectAllWorks) {
  const WString huge(1000000, L'x');
  Model m = withText(L"abc", 3);
  m.setSizeLimit(3);
  EXPECT_FALSE(m.paste(huge));
  EXPECT_EQ(m.length(), 3);
  m.setSizeLimit(4);
  EXPECT_TRUE(m.paste(huge));
  EXPECT_EQ(m.length(), 1000003);
  EXPECT_EQ(m.caret(), 1000003);
  m.highlightAll(true);
  EXPECT_EQ(m.selectedText().size(), 1000003u);
  EXPECT_EQ(m.cut().size(), 1000003u);
  EXPECT_TRUE(m.isEmpty());
  EXPECT_TRUE(m.undo());
  EXPECT_EQ(m.length(), 1000003);
}

TEST(TextEditModel, OverwriteModeReplacesTheCharacterUnderTheCaret) {
  Model m = withText(L"abc", 1);
  m.setEditMode(Model::EditMode::Overwrite);
  EXPECT_EQ(m.characterAtCaret(), L'b');
  type(m, L"XYZ");
  EXPECT_EQ(m.text(), L"aXYZ");  // the last one is past the end: appended
  EXPECT_EQ(m.characterAtCaret(), L' ');
  m.select(0, 2);
  type(m, L"-");
  EXPECT_EQ(m.text(), L"-YZ");
  // Each overwrite replaced a character, so each is undone on its own.
  m.undo();
  EXPECT_EQ(m.text(), L"aXYZ");
  EXPECT_EQ(m.selectedText(), L"aX");
  m.undo();
  EXPECT_EQ(m.text(), L"aXY");
  m.undo();
  m.undo();
  EXPECT_EQ(m.text(), L"abc");
  EXPECT_EQ(m.caret(), 1);
  EXPECT_FALSE(m.hasSelection());
}

TEST(TextEditModel, UndoTakesTypingBackWordByWord) {
  Model m;
  type(m, L"ab cd");
  EXPECT_TRUE(m.undo());
  EXPECT_EQ(m.text(), L"ab ");
  EXPECT_EQ(m.caret(), 3);
  m.undo();
  EXPECT_EQ(m.text(), L"ab");
  m.undo();
  EXPECT_EQ(m.text(), L"");
  EXPECT_FALSE(m.undo());

  // Redo replays the same groups, newest undo first.
  EXPECT_TRUE(m.redo());
  EXPECT_EQ(m.text(), L"ab");
  m.redo();
  m.redo();
  EXPECT_EQ(m.text(), L"ab cd");
  EXPECT_EQ(m.caret(), 5);
  EXPECT_FALSE(m.redo());
  // Redone typing merges again on the next undo.
  m.undo();
  EXPECT_EQ(m.text(), L"ab ");

  // A paste, an erase or a run of spaces each ends a word.
  m.paste(L"xy");
  type(m, L"z  ");
  m.handleKey(kBackspace);
  type(m, L"q");
  const WString steps[] = {L"ab xyz ", L"ab xyz  ", L"ab xyz", L"ab xy", L"ab "};
  for (const WString& expected : steps) {
    m.undo();
    EXPECT_EQ(m.text(), expected);
  }
}

TEST(TextEditModel, UndoRestoresTheSelectionAndANewEditClearsRedo) {
  Model m = withText(L"hello world", 0);
  m.select(6, 11);
  type(m, L"you");
  EXPECT_EQ(m.text(), L"hello you");
  m.undo();  // "ou"; the "y" replaced text, so it is not merged with them
  EXPECT_EQ(m.text(), L"hello y");
  m.undo();
  EXPECT_EQ(m.text(), L"hello world");
  EXPECT_EQ(m.selectedText(), L"world");
  EXPECT_EQ(m.caret(), 11);
  EXPECT_TRUE(m.canRedo());
  type(m, L"!");
  EXPECT_FALSE(m.canRedo());
  EXPECT_EQ(m.text(), L"hello !");

  // Typing in different places still merges into one word, as long as it is all typing.
  Model n = withText(L"--", 0);
  type(n, L"ab");
  n.handleKey(kEnd);
  type(n, L"cd");
  EXPECT_EQ(n.text(), L"ab--cd");
  n.undo();
  EXPECT_EQ(n.text(), L"--");
  EXPECT_EQ(n.caret(), 0);
  n.redo();
  EXPECT_EQ(n.text(), L"ab--cd");
}

TEST(TextEditModel, SetTextClearsHistoryAndModified) {
  Model m;
  type(m, L"draft");
  EXPECT_TRUE(m.isModified());
  EXPECT_TRUE(m.getChanged());  // nothing saved: any text is a change
  EXPECT_TRUE(m.setText(L"fresh"));
  EXPECT_FALSE(m.isModified());
  EXPECT_FALSE(m.getChanged());
  EXPECT_FALSE(m.canUndo());
  EXPECT_FALSE(m.undo());
  EXPECT_EQ(m.text(), L"fresh");
  EXPECT_EQ(m.caret(), 5);
  EXPECT_FALSE(m.setText(L"fresh"));
  type(m, L"!");
  m.undo();
  EXPECT_FALSE(m.getChanged());
  EXPECT_TRUE(m.isModified());
}

TEST(TextEditModel, EscapeRestoresTheSavedText) {
  Model m;
  EXPECT_FALSE(m.handleKey(Model::kKeyEscape));  // nothing saved: travels on
  m.setText(L"name");
  m.handleKey(kHome);
  type(m, L"my ");
  m.handleKey(kEnd);
  m.handleKey(kBackspace);
  EXPECT_EQ(m.text(), L"my nam");
  EXPECT_TRUE(m.getChanged());
  EXPECT_TRUE(m.handleKey(Model::kKeyEscape));
  EXPECT_EQ(m.text(), L"name");
  EXPECT_EQ(m.selectedText(), L"name");
  EXPECT_EQ(m.caret(), 4);
  EXPECT_FALSE(m.isModified());
  EXPECT_FALSE(m.getChanged());
  // Escape is one edit that can be undone.
  m.undo();
  EXPECT_EQ(m.text(), L"my nam");
  m.redo();
  EXPECT_EQ(m.text(), L"name");

  // The text saved when editing starts is what Escape returns to.
  m.highlightAll(true);
  type(m, L"x");
  m.saveText();
  type(m, L"yz");
  m.handleKey(Model::kKeyEscape);
  EXPECT_EQ(m.text(), L"x");
  // Escape on unchanged text still selects everything.
  m.handleKey(kLeft);
  m.handleKey(Model::kKeyEscape | kKeyShift);
  EXPECT_EQ(m.selectedText(), L"x");
}

TEST(TextEditModel, CopyCutAndRanges) {
  Model m = withText(L"alpha beta", 3);
  EXPECT_EQ(m.copyText(), L"alpha beta");  // no selection: the whole text
  m.select(6, 10);
  EXPECT_EQ(m.copyText(), L"beta");
  EXPECT_EQ(m.cut(), L"beta");
  EXPECT_EQ(m.text(), L"alpha ");
  m.setCaret(2);
  EXPECT_EQ(m.cut(), L"alpha ");  // no selection: cut empties the box
  EXPECT_TRUE(m.isEmpty());
  EXPECT_EQ(m.cut(), L"");
  m.undo();
  EXPECT_EQ(m.text(), L"alpha ");

  EXPECT_EQ(m.textRange(4, 1), L"lph");
  EXPECT_EQ(m.textRange(2, 2), L"");
  EXPECT_EQ(m.textRange(-1, 3), L"");
  EXPECT_EQ(m.textRange(3, 100), L"ha ");
  EXPECT_FALSE(m.erase(-1, 2, true));
  EXPECT_FALSE(m.erase(4, 4, true));
  EXPECT_TRUE(m.erase(5, 1, false));
  EXPECT_EQ(m.text(), L"a ");
  EXPECT_FALSE(m.canUndo());  // older records would no longer fit the text
}

TEST(EditHistory, GroupsTypingByWordAndBoundsItsDepth) {
  EditHistory h;
  auto typed = [](int pos, wchar_t ch) {
    EditHistory::Item item;
    item.position = pos;
    item.inserted = WString(1, ch);
    item.caretAfter = pos + 1;
    return item;
  };
  const WString typing = L"ab\ncd\n\n";
  for (std::size_t i = 0; i < typing.size(); ++i) h.record(typed(static_cast<int>(i), typing[i]));
  std::vector<std::size_t> sizes;
  while (h.undo([&](std::span<const EditHistory::Item> g) { sizes.push_back(g.size()); })) {
  }
  EXPECT_EQ(sizes, (std::vector<std::size_t>{1, 1, 2, 1, 2}));

  for (std::size_t i = 0; i < EditHistory::kDepth + 10; ++i) h.record(typed(0, L'x'));
  EXPECT_FALSE(h.canRedo());
  EXPECT_EQ(h.undoCount(), EditHistory::kDepth);
}
