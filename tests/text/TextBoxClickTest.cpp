// The text box's multiple clicks, Shift-clicks, select-all and the edit menu's hook, and how
// the password display hides the words of its text from all of them.
#include "tests/text/TextBoxTestSupport.h"

namespace {

// Records the edit menu's requests, and shows a "menu" when told to.
class MenuWatchingBox : public TextBox {
 public:
  using TextBox::TextBox;
  bool openEditMenu(XY<int> pos) override {
    requests.push_back(pos);
    return showsMenu;
  }
  std::vector<XY<int>> requests;
  bool showsMenu = false;
};

}  // namespace

TEST_F(TextBoxFixture, DoubleClickSelectsAWordAndTripleClickEverything) {
  TextBox* box = focusedBox(L"alpha beta, gamma");
  const XY<int> onBeta = pointOnCharacter(*box, 8);
  h.click(onBeta);
  EXPECT_FALSE(box->model().hasSelection());
  h.click(onBeta);
  EXPECT_EQ(box->getSelectedText(), L"beta");
  h.click(onBeta + XY<int>(TextBox::kClickSlop, 0));
  EXPECT_EQ(box->getSelectedText(), L"alpha beta, gamma");
  h.click(onBeta);  // a fourth click starts again
  EXPECT_FALSE(box->model().hasSelection());

  // Too slow, or somewhere else, and it is two single clicks.
  h.advance(1000);
  h.click(onBeta);
  h.advance(static_cast<int>(TextBox::kSecondClickMs));
  h.click(onBeta);
  EXPECT_FALSE(box->model().hasSelection());
  h.advance(1000);
  h.click(onBeta);
  h.click(pointOnCharacter(*box, 14));
  EXPECT_FALSE(box->model().hasSelection());

  // A double click on the punctuation takes the punctuation; a drag from a word selection
  // extends it from the word's start.
  h.advance(1000);
  h.click(pointOnCharacter(*box, 10));
  h.click(pointOnCharacter(*box, 10));
  EXPECT_EQ(box->getSelectedText(), L",");
  h.advance(1000);
  h.click(onBeta);
  h.drag(onBeta, pointOnCharacter(*box, 13));
  EXPECT_EQ(box->getSelectedText(), L"beta, g");
  EXPECT_TRUE(events().empty());  // selecting changes no text
}

TEST_F(TextBoxFixture, ShiftClickExtendsTheSelectionFromItsAnchor) {
  TextBox* box = focusedBox(L"alpha beta gamma");
  h.click(XY<int>(rootXOf(*box, 2), pointOnCharacter(*box, 2).y));
  h.setModifiers(kKeyShift);
  h.advance(1000);
  h.click(XY<int>(rootXOf(*box, 8), pointOnCharacter(*box, 8).y));
  EXPECT_EQ(box->getSelectedText(), L"pha be");
  h.advance(1000);
  h.click(XY<int>(rootXOf(*box, 0), pointOnCharacter(*box, 0).y));
  EXPECT_EQ(box->getSelectedText(), L"al");
  EXPECT_EQ(box->model().caret(), 0);

  // Into a box without the focus: the focus selects all, and Shift keeps the start.
  owner->set_kbd_focus();
  h.advance(1000);
  h.click(XY<int>(rootXOf(*box, 5), pointOnCharacter(*box, 5).y));
  EXPECT_TRUE(box->hasKeyboardFocus());
  EXPECT_EQ(box->getSelectedText(), L"alpha");
}

TEST_F(TextBoxFixture, CtrlASelectsEverythingWhileTheCaretKeysStillCollapseIt) {
  TextBox* box = focusedBox(L"some text");
  h.key(kHome);
  h.key(kCtrlA);
  EXPECT_EQ(box->getSelectedText(), L"some text");
  EXPECT_TRUE(owner->keysReceived.empty());
  h.key(kLeft);
  EXPECT_FALSE(box->model().hasSelection());
  // A read-only box lets it travel on.
  box->setEditable(false);
  box->set_kbd_focus();
  h.key(kCtrlA);
  EXPECT_EQ(owner->keysReceived, std::vector<unsigned>{kCtrlA});
}

TEST_F(TextBoxFixture, ARightPressAsksForTheEditMenuOnEditableAndReadOnlyBoxes) {
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(200, 24, owner->canvas(), 10, 10);
  args.text = L"menu";
  auto* box = new MenuWatchingBox(args);
  const XY<int> at = Harness::centreOf(*box);
  h.click(at, MouseButton::Right);
  ASSERT_EQ(box->requests.size(), 1u);
  EXPECT_EQ(box->requests[0], at - XY<int>(10, 10));
  // No menu shown: the press is the owner's, as before; a menu consumes it.
  EXPECT_EQ(owner->pressesReceived, 1);
  box->showsMenu = true;
  h.click(at, MouseButton::Right);
  EXPECT_EQ(owner->pressesReceived, 1);
  EXPECT_EQ(box->getText(), L"menu");

  // (Long after any click of another test: read-only boxes share their second-click clock.)
  h.advance(10000);
  box->setEditable(false);
  h.click(at, MouseButton::Right);
  EXPECT_EQ(box->requests.size(), 3u);
  // Not on an inactive box, and not with Ctrl held (the owner's); a left click is no request.
  box->setActive(false, true);
  h.click(at, MouseButton::Right);
  box->setActive(true, true);
  h.setModifiers(kKeyCtrl);
  h.click(at, MouseButton::Right);
  h.setModifiers(0);
  h.click(at);
  EXPECT_EQ(box->requests.size(), 3u);
}

TEST_F(TextBoxFixture, ObfuscatedDisplayHidesItsWordsAndItsCharacters) {
  TextBox::InitArgs args;
  args.obfuscated = true;
  TextBox* box = focusedBox(L"my secret", args);
  // The block caret shows the mask, never the hidden character.
  h.key(kHome);
  box->setEditMode(TextBoxBase::EditOverwrite);
  ASSERT_NE(box->caret(), nullptr);
  EXPECT_EQ(box->caret()->currentChar(), TextBox::kObfuscationChar);
  h.key(kRight);
  EXPECT_EQ(box->caret()->currentChar(), TextBox::kObfuscationChar);
  box->setEditMode(TextBoxBase::EditInsert);

  // The words are one: word moves go to the ends, word erases take everything.
  h.key(kEnd);
  h.key(kLeft | kKeyCtrl);
  EXPECT_EQ(box->model().caret(), 0);
  h.key(kRight | kKeyCtrl);
  EXPECT_EQ(box->model().caret(), 9);
  h.key(kBackspace | kKeyCtrl);
  EXPECT_TRUE(box->isEmpty());
  h.key(kCtrlZ);
  EXPECT_EQ(box->getText(), L"my secret");

  // A double click selects it all.
  h.advance(1000);
  h.click(pointOnCharacter(*box, 4));
  h.click(pointOnCharacter(*box, 4));
  EXPECT_EQ(box->getSelectedText(), L"my secret");
  // Shown plainly again, the words are back.
  box->setObfuscatedDisplay(false);
  h.advance(1000);
  h.click(pointOnCharacter(*box, 4));
  h.click(pointOnCharacter(*box, 4));
  EXPECT_EQ(box->getSelectedText(), L"secret");
}
