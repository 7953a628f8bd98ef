// The text box's caret timing, mouse, scrolling, display modes, tab stops and very long texts.
#include "panels/StandardPanel.h"
#include "platform/glob/RootGlob.h"
#include "tests/text/TextBoxTestSupport.h"
#include "text/PanelTitleTextBox.h"

using Strings = std::vector<String>;

TEST_F(TextBoxFixture, CaretStaysSolidWhileTypingAndFlashesAfterAPause) {
  TextBox* box = focusedBox(L"");
  TextCursor* caret = box->caret();
  ASSERT_NE(caret, nullptr);
  for (int i = 0; i < 6; ++i) {
    h.type(L"k");
    h.advance(400);
    EXPECT_FALSE(caret->isFlashing());
    EXPECT_TRUE(caret->isVisible());
  }
  h.advance(120);  // now more than 500 ms since the last key
  EXPECT_TRUE(caret->isFlashing());
  EXPECT_TRUE(caret->isVisible());
  h.advance(540);
  EXPECT_FALSE(caret->isVisible());
  h.advance(540);
  EXPECT_TRUE(caret->isVisible());
  // A key shows it at once and holds it.
  h.advance(540);
  EXPECT_FALSE(caret->isVisible());
  h.type(L"k");
  EXPECT_TRUE(caret->isVisible());
  EXPECT_FALSE(caret->isFlashing());
}

TEST_F(TextBoxFixture, ReadOnlyBoxesShareOneSecondClickClock) {
  TextBox::InitArgs args;
  args.editable = false;
  args.text = L"read only";
  TextBox* first = makeBox(args);
  args.info = {};
  TextBox* second = makeBox(args);
  second->translate_canvas(0, 40);
  h.clickOn(*first);
  h.advance(399);
  h.clickOn(*first);
  EXPECT_EQ(events(), Strings{"event 4"});
  // The click is not consumed: the owner sees it; the read-only box never takes the focus.
  EXPECT_NE(h.root().focus(), first);
  owner->clear();
  h.advance(100);
  h.clickOn(*second);  // 100 ms after a click on the other box
  EXPECT_EQ(events(), Strings{"event 4"});
  owner->clear();
  h.advance(400);
  h.clickOn(*first);
  EXPECT_TRUE(events().empty());
}

TEST_F(TextBoxFixture, ClickPlacesTheCaretAndDragSelects) {
  TextBox* box = makeBox();
  box->setText(L"alpha beta gamma");
  const int y = static_cast<int>(box->get_y()) + 12;
  // The first click gives the focus, which selects everything.
  h.click(XY<int>(rootXOf(*box, 3), y));
  EXPECT_EQ(h.root().focus(), box);
  EXPECT_EQ(box->getSelectedText(), L"alpha beta gamma");
  // A click in the focused box puts the caret at the nearest character boundary. (Clicks
  // here are apart in time, so that none makes a double click.)
  h.advance(500);
  h.click(XY<int>(rootXOf(*box, 3) + 1, y));
  EXPECT_EQ(box->model().caret(), 3);
  EXPECT_TRUE(box->getSelectedText().empty());
  EXPECT_EQ(box->model().selectionStart(), -1);
  h.drag(XY<int>(rootXOf(*box, 6), y), XY<int>(rootXOf(*box, 10), y));
  EXPECT_EQ(box->getSelectedText(), L"beta");
  EXPECT_EQ(box->model().caret(), 10);
  // Dragging back past the anchor selects the other way.
  h.advance(500);
  h.drag(XY<int>(rootXOf(*box, 6), y), XY<int>(rootXOf(*box, 0), y));
  EXPECT_EQ(box->getSelectedText(), L"alpha ");
  // Left of the text counts as its start, right of it as its end.
  h.click(XY<int>(static_cast<int>(box->get_x()) + 1, y));
  EXPECT_EQ(box->model().caret(), 0);
  h.click(XY<int>(static_cast<int>(box->get_x()) + 199, y));
  EXPECT_EQ(box->model().caret(), 16);
  // Other buttons and Ctrl-clicks are the owner's.
  h.setModifiers(kKeyCtrl);
  h.click(XY<int>(rootXOf(*box, 3), y));
  EXPECT_EQ(box->model().caret(), 16);
}

TEST_F(TextBoxFixture, ScrollingKeepsTheCaretVisibleWithTheLeastMovement) {
  TextBox* box = focusedBox(L"", {}, 80);
  const int left = TextBox::kDefaultMargin;
  const int right = 80 - TextBox::kDefaultMargin;
  auto caretInside = [&] {
    const int x = box->caretDisplayX();
    return x >= left && x <= right;
  };
  for (int i = 0; i < 40; ++i) {
    h.type(L"w");
    ASSERT_TRUE(caretInside()) << i;
  }
  EXPECT_GT(box->scrollOffset(), 0);
  // At the end the caret sits at the right edge of the stretch.
  EXPECT_EQ(box->caretDisplayX(), right);
  const int offset = box->scrollOffset();
  h.key(kLeft);  // still in view: nothing scrolls
  EXPECT_EQ(box->scrollOffset(), offset);
  h.key(kHome);
  EXPECT_EQ(box->scrollOffset(), 0);
  EXPECT_EQ(box->caretDisplayX(), left);
  for (int i = 0; i < 30; ++i) {
    h.key(kRight);
    ASSERT_TRUE(caretInside()) << i;
  }
  // Erasing from the end never leaves blank space where text could show.
  h.key(kEnd);
  for (int i = 0; i < 10; ++i) h.key(kBackspace);
  EXPECT_LE(box->scrollOffset(), box->ruler().width() - (right - left));
  // Losing the focus shows the start again.
  owner->set_kbd_focus();
  EXPECT_EQ(box->scrollOffset(), 0);
}

TEST_F(TextBoxFixture, ObfuscatedDisplayShowsOneAsteriskPerCharacterInAMonospaceFont) {
  TextBox::InitArgs args;
  args.obfuscated = true;
  args.ghostLabel = L"password";
  TextBox* box = makeBox(args);
  EXPECT_TRUE(box->isGhostLabelVisible());
  box->setText(L"secret");
  EXPECT_FALSE(box->isGhostLabelVisible());
  EXPECT_EQ(box->getDisplayText(), L"******");
  EXPECT_EQ(box->displayFont()->desc().face, TextBox::kObfuscationFace);
  // Positions are uniform: every asterisk is as wide as the others.
  const int64_t one = box->ruler().xOf(1);
  EXPECT_GT(one, 0);
  EXPECT_EQ(box->ruler().xOf(6), box->ruler().width());
  EXPECT_NEAR(static_cast<double>(box->ruler().width()), 6.0 * one, 1.0);
  // The clipboard never sees the hidden text.
  box->set_kbd_focus();
  clipboard.setText(L"before");
  h.key(kCtrlC);
  EXPECT_EQ(clipboard.getText(), L"before");
  box->setObfuscatedDisplay(false);
  EXPECT_EQ(box->getDisplayText(), L"secret");
  EXPECT_EQ(box->displayFont(), box->getFontPtr());
  // The ghost label shows only while the box is empty and unfocused.
  box->setText(L"");
  EXPECT_FALSE(box->isGhostLabelVisible());
  owner->set_kbd_focus();
  EXPECT_TRUE(box->isGhostLabelVisible());
}

TEST_F(TextBoxFixture, TabMovesBetweenBoxesOfAPanel) {
  auto* panel = new StandardPanel(h.place(0, 100, 400, 100));
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(150, 24, panel->canvas());
  auto* a = new TextBox(args);
  auto* b = new TextBox(args);
  panel->addWidget(a, 10, 10);
  panel->addWidget(b, 200, 10);
  a->set_kbd_focus();
  EXPECT_TRUE(a->isTabStopFocus());
  h.key(kTab);
  EXPECT_EQ(h.root().focus(), b);
  EXPECT_TRUE(b->isTabStopFocus());
  EXPECT_EQ(a->caret(), nullptr);
  ASSERT_NE(b->caret(), nullptr);
  h.key(kTab | kKeyShift);
  EXPECT_EQ(h.root().focus(), a);
  // A click on a box also makes it the panel's current stop.
  h.clickOn(*b);
  EXPECT_TRUE(b->isTabStopFocus());
}

TEST_F(TextBoxFixture, VeryLongTextsPasteSelectAndUndo) {
  TextBox* box = focusedBox(L"");
  WString big;
  big.reserve(1000000);
  for (int i = 0; i < 1000000; ++i) big += i % 7 == 6 ? L' ' : static_cast<wchar_t>(L'a' + i % 26);
  clipboard.setText(big);
  h.key(kCtrlV);
  ASSERT_EQ(box->getText().size(), 1000000u);
  // The caret, at the end, is in view; the ruler holds the whole line.
  EXPECT_EQ(box->caretDisplayX(), 200 - TextBox::kDefaultMargin);
  EXPECT_EQ(box->ruler().length(), 1000000);
  box->highlightAllText(true);
  EXPECT_EQ(box->getSelectedText().size(), 1000000u);
  h.paint();
  h.key(kCtrlZ);
  EXPECT_TRUE(box->isEmpty());
  EXPECT_EQ(box->scrollOffset(), 0);
}

TEST_F(TextBoxFixture, AnEditablePanelTitleBoxRenamesThePanel) {
  auto* panel = new StandardPanel(h.place(0, 0, 300, 120));
  panel->setTitle(L"Old title");
  panel->addStandardWidgets(StdEditableTitleBox);
  PanelTitleTextBox* title = panel->titleBox();
  ASSERT_NE(title, nullptr);
  EXPECT_EQ(title->height(), 20);
  EXPECT_TRUE(title->isEditable());
  EXPECT_EQ(title->getText(), L"Old title");
  title->set_kbd_focus();
  h.type(L"New");
  h.key(kEnter);
  h.pump();
  EXPECT_EQ(panel->getTitleW(), L"New");
  // The panel's own setTitle shows in the box without echoing back.
  panel->setTitle(L"Set");
  EXPECT_EQ(title->getText(), L"Set");

  auto* plain = new StandardPanel(h.place(0, 0, 300, 120));
  plain->addStandardWidgets(StdTitleBox);
  ASSERT_NE(plain->titleBox(), nullptr);
  EXPECT_FALSE(plain->titleBox()->isEditable());
}
