#include <gtest/gtest.h>

#include <functional>

#include "platform/glob/Event.h"
#include "platform/kw/CharClassifier.h"
#include "text/TextEditModel.h"

namespace {

using Model = TextEditModel;
using Restriction = TextEditModel::CharacterRestriction;

constexpr unsigned kHome = kKeyHome;
constexpr unsigned kLeft = kKeyLeft;
constexpr unsigned kRight = kKeyRight;
constexpr unsigned kEnd = kKeyEnd;
constexpr unsigned kDelete = kKeyDelete;
constexpr unsigned kBackspace = kKeyBackspace;
constexpr unsigned kEscape = kKeyEscape;

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

TEST(TextEditModel, CaretKeysStayInsideTheTextAndOtherKeysTravelOn) {
  Model m = withText(L"abc", 1);
  const std::pair<unsigned, int> steps[] = {
      {kRight, 2}, {kEnd, 3}, {kRight, 3}, {kLeft, 2}, {kHome | kKeyCtrl, 0}, {kLeft, 0}};
  for (auto [key, caret] : steps) {
    EXPECT_TRUE(m.handleKey(key));
    EXPECT_EQ(m.caret(), caret);
  }
  const auto revision = m.revision();
  for (unsigned key :
       {kKeyTab, kKeyReturn, kKeyShift | kKeyTab, kKeyAlt | kLeft, kKeyCtrl | 'A', kKeyUp}) {
    EXPECT_FALSE(m.handleKey(key)) << std::hex << key;
  }
  EXPECT_EQ(m.revision(), revision);
}

TEST(TextEditModel, WordMovesAndWordErasesStopAtEachCharacterClass) {
  // Word, spaces, punctuation, spaces (one a no-break space), a word with a non-ASCII letter,
  // an em dash, a word.
  Model m = withText(L"foo_bar1  ,.;\u00A0 h\u00E9llo\u2014x9", 0);
  for (int stop : {10, 15, 20, 21, 23, 23}) {
    m.handleKey(kRight | kKeyCtrl);
    EXPECT_EQ(m.caret(), stop);
  }
  for (int stop : {21, 20, 15, 10, 0}) {
    m.handleKey(kLeft | kKeyCtrl);
    EXPECT_EQ(m.caret(), stop);
  }
  m.setCaret(4);  // inside a word, a move reaches its start
  m.handleKey(kLeft | kKeyCtrl);
  EXPECT_EQ(m.caret(), 0);
  EXPECT_FALSE(CharClassifier::sameCharType(L' ', L'\x01'));

  Model e = withText(L"one two, three", 7);
  EXPECT_TRUE(e.handleKey(kBackspace | kKeyCtrl));
  EXPECT_EQ(e.text(), L"one , three");
  EXPECT_EQ(e.caret(), 4);
  EXPECT_TRUE(e.handleKey(kDelete | kKeyCtrl));  // the comma and the space after it
  EXPECT_EQ(e.text(), L"one three");
  e.setCaret(0);
  EXPECT_TRUE(e.handleKey(kBackspace));  // nothing before the caret: consumed, no change
  e.handleKey(kEnd);
  EXPECT_TRUE(e.handleKey(kDelete));
  EXPECT_EQ(e.text(), L"one three");
}

TEST(TextEditModel, ShiftAndDragExtendThePlainKeysCollapse) {
  Model m = withText(L"hello world", 5);
  m.handleKey(kRight | kKeyShift);
  m.handleKey(kRight | kKeyShift | kKeyCtrl);
  EXPECT_EQ(m.selectedText(), L" world");
  m.handleKey(kHome | kKeyShift);  // back past the anchor: the anchor stays
  EXPECT_EQ(m.selectionStart(), 5);
  EXPECT_EQ(m.selectionEnd(), 0);
  m.handleKey(kRight);
  EXPECT_EQ(m.selectionStart(), -1);
  EXPECT_EQ(m.caret(), 1);

  // Shift at a boundary anchors an empty selection, which typing ignores.
  m.handleKey(kHome);
  m.handleKey(kLeft | kKeyShift);
  type(m, L">");
  EXPECT_EQ(m.text(), L">hello world");
  m.select(8, 2);
  m.handleKey(kBackspace);
  EXPECT_EQ(m.text(), L">horld");
  EXPECT_FALSE(m.hasSelection());

  // A press anchors, a drag moves the caret and the selection's end together.
  Model d = withText(L"abcdef", 2);
  d.anchorSelection();
  d.dragTo(5);
  EXPECT_EQ(d.selectedText(), L"cde");
  d.dragTo(1);
  EXPECT_EQ(d.selectedText(), L"b");
  d.dragTo(99);
  EXPECT_EQ(d.caret(), 6);
  EXPECT_FALSE(d.select(-1, 1));
  Model empty;
  empty.highlightAll(true);
  EXPECT_EQ(empty.selectionStart(), -1);
}

TEST(TextEditModel, FilterOnTypingAndPaste) {
  Model m;
  m.setCharacters(L"0123456789", Restriction::OnlyListed);
  EXPECT_TRUE(m.handleKey(L'a'));  // refused by the filter: swallowed
  EXPECT_FALSE(m.isModified());
  type(m, L"42");
  m.setCharacters(L"0123456789", Restriction::AllButListed);
  EXPECT_TRUE(m.handleKey(L'5'));
  type(m, L"a");
  EXPECT_EQ(m.text(), L"42a");
  m.setCharacters(L"", Restriction::None);
  EXPECT_FALSE(m.handleKey(L'\t'));  // TAB never goes in
  EXPECT_EQ(m.text(), L"42a");

  Model hex;
  hex.setCharacters(L"0123456789ABCDEF", Restriction::OnlyListed);
  EXPECT_TRUE(hex.paste(L"1f zA\tB\u00C9F"));
  EXPECT_EQ(hex.text(), L"1ABF");
  EXPECT_FALSE(hex.paste(L"xyz"));  // nothing kept, nothing selected: no edit
  EXPECT_FALSE(hex.pasteUtf8("\xFF"));
  EXPECT_EQ(hex.text(), L"1ABF");
}

TEST(TextEditModel, PasteDropsControlsAndFlattensLineBreaks) {
  Model m;
  m.paste(L"a\r\nb\rc\nd\u2028e\t\x01\x7F\u0085f\x1B\n\r\n");
  EXPECT_EQ(m.text(), L"a b c d e f");
  EXPECT_EQ(m.caret(), 11);
  m.setText(L"");
  m.pasteUtf8("ok\xC3(\xE2\x82\xAC");  // one replacement character per bad sequence
  EXPECT_EQ(m.text(), L"ok\uFFFD(\u20AC");
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
  m.select(0, 3);
  EXPECT_TRUE(m.handleKey(L'A'));
  EXPECT_EQ(m.text(), L"Ade");
  m.setSizeLimit(2);
  m.select(1, 3);
  EXPECT_TRUE(m.paste(L"xyz"));  // judged after the selection is gone
  EXPECT_EQ(m.text(), L"Axyz");
  // Overwrite mode lifts the limit: over the text and past its end alike.
  m.setEditMode(Model::EditMode::Overwrite);
  m.setCaret(1);
  EXPECT_TRUE(m.handleKey(L'B'));
  EXPECT_EQ(m.text(), L"AByz");
  m.handleKey(kEnd);
  EXPECT_TRUE(m.handleKey(L'!'));
  EXPECT_TRUE(m.paste(L"??"));
  EXPECT_EQ(m.text(), L"AByz!??");
}

// An owner made of two functions; a missing one answers as the model alone would.
struct FunctionOwner : Model::Owner {
  explicit FunctionOwner(Model& m) : model(m) {}
  bool ownerAllows(wchar_t ch) override { return allows ? allows(ch) : model.isAllowed(ch); }
  void ownerMovesCaret(Model::SeekMethod method, int index) override {
    if (moveCaret) {
      moveCaret(method, index);
    } else {
      model.applyCaretMove(method, index);
    }
  }
  Model& model;
  std::function<bool(wchar_t)> allows;
  std::function<void(Model::SeekMethod, int)> moveCaret;
};

TEST(TextEditModel, TheOwnerSeesEveryCharacterAndEveryCaretMoveOnce) {
  Model m = withText(L"one two", 7);
  std::vector<std::pair<int, int>> moves;  // (caret before, caret after) of each owner call
  WString asked;
  FunctionOwner owner(m);
  owner.allows = [&](wchar_t ch) {
    asked += ch;
    return ch != L'x' && m.isAllowed(ch);
  };
  owner.moveCaret = [&](Model::SeekMethod method, int index) {
    const int before = m.caret();
    m.applyCaretMove(method, index);
    moves.emplace_back(before, m.caret());
  };
  m.setOwner(&owner);

  // Every path that inserts asks about each character, and every move is seen once, from
  // where the caret stood.
  type(m, L"ax");
  EXPECT_TRUE(m.paste(L"bxc"));
  EXPECT_EQ(m.text(), L"one twoabc");
  EXPECT_NE(asked.find(L"bxc"), WString::npos);
  m.handleKey(kLeft | kKeyCtrl);
  m.handleKey(kEnd);
  m.handleKey(kEnd);  // already there: no move
  m.handleKey(kBackspace);
  m.select(0, 3);
  m.paste(L"ONE");  // the selection goes first, then the caret follows the insert
  m.undo();
  m.setText(L"new", Model::SeekMethod::StartOfText);
  const std::vector<std::pair<int, int>> expected = {{7, 8}, {8, 10}, {10, 4}, {4, 10}, {10, 9},
                                                     {9, 3}, {3, 0},  {0, 3},  {3, 0}};
  EXPECT_EQ(moves, expected);
  EXPECT_EQ(m.caret(), 0);

  // An owner that refuses a move leaves the caret inside the text all the same.
  FunctionOwner refuses(m);
  refuses.moveCaret = [](Model::SeekMethod, int) {};
  m.setOwner(&refuses);
  m.setCaret(2);
  EXPECT_EQ(m.caret(), 0);
  m.setText(L"");
  EXPECT_EQ(m.caret(), 0);
}

TEST(TextEditModel, MaskedTextHasNoWords) {
  Model m = withText(L"my secret-word", 14);
  m.setMask(L'*');
  m.handleKey(kLeft | kKeyCtrl);
  EXPECT_EQ(m.caret(), 0);
  m.handleKey(kRight | kKeyCtrl);
  EXPECT_EQ(m.caret(), 14);
  m.handleKey(kLeft);
  m.handleKey(kLeft | kKeyShift | kKeyCtrl);
  EXPECT_EQ(m.selectionLow(), 0);
  m.selectWordAt(4);
  EXPECT_EQ(m.selectedText(), L"my secret-word");
  m.clearSelection();
  m.setCaret(3);
  EXPECT_EQ(m.characterAtCaret(), L'*');
  EXPECT_TRUE(m.handleKey(kDelete | kKeyCtrl));
  EXPECT_EQ(m.text(), L"my ");
  EXPECT_TRUE(m.handleKey(kBackspace | kKeyCtrl));
  EXPECT_TRUE(m.isEmpty());

  // Unmasked, the same text has its words back.
  Model plain = withText(L"my secret-word", 0);
  plain.selectWordAt(4);
  EXPECT_EQ(plain.selectedText(), L"secret");
  EXPECT_EQ(plain.caret(), 9);
  EXPECT_EQ(plain.characterAtCaret(), L'-');
}

TEST(TextEditModel, WordSelectionAndShiftExtension) {
  Model m = withText(L"alpha  beta,gamma", 0);
  const std::pair<int, const wchar_t*> words[] = {{0, L"alpha"}, {4, L"alpha"}, {5, L"  "},
                                                  {8, L"beta"},  {11, L","},    {17, L"gamma"}};
  for (auto [index, word] : words) {
    m.selectWordAt(index);
    EXPECT_EQ(m.selectedText(), word) << index;
  }
  // The word's start is the anchor that Shift extends from, in either direction.
  m.selectWordAt(8);
  m.extendSelectionTo(15);
  EXPECT_EQ(m.selectedText(), L"beta,gam");
  m.extendSelectionTo(2);
  EXPECT_EQ(m.selectedText(), L"pha  ");
  EXPECT_EQ(m.caret(), 2);
  // With no selection the caret is the anchor.
  m.clearSelection();
  m.extendSelectionTo(0);
  EXPECT_EQ(m.selectedText(), L"al");
  Model empty;
  empty.selectWordAt(0);
  EXPECT_FALSE(empty.hasSelection());
}

TEST(TextEditModel, HugePasteFollowsTheLimitAndCanBeSelectedCutAndUndone) {
  const WString huge(1000000, L'x');
  Model m = withText(L"abc", 3);
  m.setSizeLimit(3);
  EXPECT_FALSE(m.paste(huge));
  m.setSizeLimit(4);
  EXPECT_TRUE(m.paste(huge));
  EXPECT_EQ(m.length(), 1000003);
  m.highlightAll(true);
  EXPECT_EQ(m.cut().size(), 1000003u);
  EXPECT_TRUE(m.isEmpty());
  EXPECT_TRUE(m.undo());
  EXPECT_EQ(m.length(), 1000003);
}

TEST(TextEditModel, OverwriteReplacesTheCharacterUnderTheCaret) {
  Model m = withText(L"abc", 1);
  m.setEditMode(Model::EditMode::Overwrite);
  EXPECT_EQ(m.characterAtCaret(), L'b');
  type(m, L"XYZ");
  EXPECT_EQ(m.text(), L"aXYZ");  // the last one is past the end: appended
  EXPECT_EQ(m.characterAtCaret(), L' ');
  // Each overwrite replaced a character, so each is undone on its own.
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
  for (const WString expected : {L"ab ", L"ab", L""}) {
    EXPECT_TRUE(m.undo());
    EXPECT_EQ(m.text(), expected);
  }
  EXPECT_FALSE(m.undo());
  for (const WString expected : {L"ab", L"ab ", L"ab cd"}) {
    EXPECT_TRUE(m.redo());
    EXPECT_EQ(m.text(), expected);
  }
  EXPECT_EQ(m.caret(), 5);
  m.undo();  // redone typing merges again

  // A paste, an erase or a change between spaces and non-spaces ends a word.
  m.paste(L"xy");
  type(m, L"z  ");
  m.handleKey(kBackspace);
  type(m, L"q");
  for (const WString expected : {L"ab xyz ", L"ab xyz  ", L"ab xyz", L"ab xy", L"ab "}) {
    m.undo();
    EXPECT_EQ(m.text(), expected);
  }
}

TEST(TextEditModel, UndoRestoresTheSelectionAndANewEditClearsRedo) {
  Model m = withText(L"hello world", 0);
  m.select(6, 11);
  type(m, L"you");
  m.undo();  // "ou": the "y" replaced text, so it stands alone
  EXPECT_EQ(m.text(), L"hello y");
  m.undo();
  EXPECT_EQ(m.selectedText(), L"world");
  EXPECT_EQ(m.caret(), 11);
  type(m, L"!");
  EXPECT_FALSE(m.canRedo());
  EXPECT_EQ(m.text(), L"hello !");

  // Typing in two places merges into one word all the same: only kind and spaces count.
  Model n = withText(L"--", 0);
  type(n, L"ab");
  n.handleKey(kEnd);
  type(n, L"cd");
  n.undo();
  EXPECT_EQ(n.text(), L"--");
  EXPECT_EQ(n.caret(), 0);
  n.redo();
  EXPECT_EQ(n.text(), L"ab--cd");
}

TEST(TextEditModel, SetTextAndEscape) {
  Model m;
  EXPECT_FALSE(m.handleKey(kEscape));  // nothing saved: travels on
  type(m, L"draft");
  EXPECT_TRUE(m.getChanged());  // nothing saved: any text is a change
  EXPECT_TRUE(m.setText(L"name"));
  EXPECT_FALSE(m.isModified());
  EXPECT_FALSE(m.canUndo());
  EXPECT_FALSE(m.setText(L"name"));

  m.handleKey(kHome);
  type(m, L"my ");
  m.handleKey(kEnd);
  m.handleKey(kBackspace);
  EXPECT_TRUE(m.getChanged());
  EXPECT_EQ(m.savedText(), L"name");  // edits leave the saved text as it was
  EXPECT_TRUE(m.handleKey(kEscape));
  EXPECT_EQ(m.text(), L"name");
  EXPECT_EQ(m.selectedText(), L"name");
  EXPECT_FALSE(m.isModified());
  EXPECT_FALSE(m.getChanged());
  m.undo();  // Escape is one edit
  EXPECT_EQ(m.text(), L"my nam");
  EXPECT_TRUE(m.isModified());

  // Escape returns to the text saved when editing started.
  m.highlightAll(true);
  type(m, L"x");
  m.saveText();
  EXPECT_EQ(m.savedText(), L"x");
  EXPECT_FALSE(m.getChanged());
  type(m, L"yz");
  EXPECT_EQ(m.savedText(), L"x");
  EXPECT_TRUE(m.getChanged());
  m.handleKey(kLeft);
  m.handleKey(kEscape | kKeyShift);
  EXPECT_EQ(m.selectedText(), L"x");
}

TEST(TextEditModel, CopyCutAndRanges) {
  Model m = withText(L"alpha beta", 3);
  EXPECT_EQ(m.copyText(), L"alpha beta");  // no selection: the whole text
  m.select(6, 10);
  EXPECT_EQ(m.cut(), L"beta");
  m.setCaret(2);
  EXPECT_EQ(m.cut(), L"alpha ");  // no selection: cut empties the box
  EXPECT_TRUE(m.isEmpty());
  EXPECT_EQ(m.cut(), L"");
  m.undo();
  EXPECT_EQ(m.text(), L"alpha ");

  EXPECT_EQ(m.textRange(4, 1), L"lph");
  EXPECT_EQ(m.textRange(2, 2), L"");
  EXPECT_EQ(m.textRange(-1, 3), L"");
  EXPECT_FALSE(m.erase(-1, 2, true));
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
