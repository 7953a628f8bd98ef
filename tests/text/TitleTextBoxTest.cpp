// Titled text boxes: the layout of each style, the operations passed to the inner box, the
// owner's callbacks, and the inner box's place in the tab order of the panel around it.
#include <gtest/gtest.h>

#include "panels/StandardPanel.h"
#include "platform/glib/FontCache.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "text/TitleTextBox.h"

namespace {

struct TitledFixture : ::testing::Test {
  TitleTextBox* make(TitleTextBox::eStyle style, unsigned short titleWidth = 60) {
    TitleTextBoxInitArgs args;
    args.info = GlobCreationInfo(0, 0, owner->canvas(), 10, 10);
    args.title = L"Reel";
    args.titleWidth = titleWidth;
    args.boxWidth = 120;
    args.style = style;
    return new TitleTextBox(args);
  }
  Harness h{500, 200};
  MessageProbe* owner = new MessageProbe(h.place(0, 0, 500, 200));
};

}  // namespace

TEST_F(TitledFixture, EachStyleLaysOutTitleAndBox) {
  TitleTextBox* beside = make(TitleTextBox::StyleBeside);
  EXPECT_EQ(beside->width(), 60 + TitleTextBox::kTitleGap + 120);
  EXPECT_EQ(beside->height(), TitleTextBox::kDefaultHeight);
  EXPECT_EQ(beside->textBox()->canvas()->rect().x0, 60 + TitleTextBox::kTitleGap);
  EXPECT_FALSE(beside->hasTitleTab());

  TitleTextBox* tab = make(TitleTextBox::StyleTab);
  EXPECT_EQ(tab->width(), 60 + 120);
  EXPECT_EQ(tab->textBox()->canvas()->rect().x0, 60);
  EXPECT_TRUE(tab->hasTitleTab());

  TitleTextBox* above = make(TitleTextBox::StyleAbove);
  EXPECT_EQ(above->width(), 120);
  EXPECT_GT(above->height(), TitleTextBox::kDefaultHeight);
  EXPECT_EQ(above->textBox()->canvas()->rect().y0, 0);
  EXPECT_EQ(above->titleBox().y0, TitleTextBox::kDefaultHeight);

  // Restyling lays out again and keeps the top-left corner; an unknown style is refused.
  const int top = beside->canvas()->rect().y1;
  beside->setStyle(TitleTextBox::StyleAbove);
  EXPECT_EQ(beside->width(), 120);
  EXPECT_EQ(beside->canvas()->rect().y1, top);
  beside->setStyle(static_cast<TitleTextBox::eStyle>(7));
  EXPECT_EQ(beside->getStyle(), TitleTextBox::StyleAbove);
}

TEST_F(TitledFixture, AMeasuredTitleFollowsItsText) {
  TitleTextBox* box = make(TitleTextBox::StyleBeside, 0);
  const int w = box->width();
  box->setTitle(L"A much longer title");
  EXPECT_GT(box->width(), w);
  EXPECT_EQ(box->titleBox().width(), Glib::fonts().standard()->textWidth(L"A much longer title"));
}

TEST_F(TitledFixture, TextOperationsReachTheInnerBox) {
  TitleTextBox* box = make(TitleTextBox::StyleBeside);
  TextBox* tb = box->textBox();
  box->setString(L"A12");
  EXPECT_EQ(tb->getText(), L"A12");
  EXPECT_EQ(box->getString(), L"A12");

  box->setCharacters(L"0123456789", TextBoxBase::OnlyListed);
  box->setSizeLimit(5);
  box->set_kbd_focus();
  EXPECT_TRUE(tb->hasKbdFocus());
  h.key(kKeyEnd);
  h.type(L"x34z5");
  EXPECT_EQ(box->getString(), L"A1234");
  EXPECT_TRUE(box->getChanged());
  box->clearChanged();
  EXPECT_FALSE(box->getChanged());

  box->setObfuscatedDisplay(true);
  EXPECT_TRUE(tb->isObfuscatedDisplay());
  box->setAlignment(TextAlignment::Right);
  EXPECT_EQ(tb->getAlignment(), TextAlignment::Right);
  box->setGhostLabel(L"Reel number");
  EXPECT_EQ(tb->getGhostLabel(), L"Reel number");
  box->setFont(Glib::FontDesc(String(), 16));
  EXPECT_EQ(tb->getFontDesc().size, 16);

  box->setEditable(false);
  h.type(L"9");
  EXPECT_EQ(box->getString(), L"A1234");
}

TEST_F(TitledFixture, OwnerCallbacksReachTheParentWithTheInnerBoxAsSender) {
  TitleTextBox* box = make(TitleTextBox::StyleTab);
  box->requestCallback("reel entered", nullptr, TextBoxBase::EnterPressed);
  box->requestCallback("reel typed", nullptr, TextBoxBase::TextChangedByKey);
  MessageProbe* elsewhere = new MessageProbe(h.place(0, 0, 1, 1));
  box->requestCallback("to elsewhere", elsewhere, TextBoxBase::EnterPressed);
  box->set_kbd_focus();
  h.type(L"7");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(owner->count("reel typed"), 1);
  EXPECT_EQ(owner->count("reel entered"), 1);
  ASSERT_NE(owner->last(), nullptr);
  EXPECT_EQ(owner->last()->sender, box->textBox());
  EXPECT_EQ(owner->count("to elsewhere"), 0);
  EXPECT_EQ(elsewhere->count("to elsewhere"), 1);
}

TEST(TitleTextBoxTabs, TheInnerBoxTakesItsPlaceInThePanelsTabOrder) {
  Harness h(600, 200);
  auto* panel = new StandardPanel(h.place(0, 0, 600, 200));
  TextBox::InitArgs plain;
  plain.info = GlobCreationInfo(100, 24, panel->canvas());
  auto* first = new TextBox(plain);
  auto* titled = new TitleTextBox(L"Scene", 50, 100, panel->getPalette().get(Palette::Window),
                                  panel->canvas());
  auto* last = new TextBox(plain);
  panel->addWidget(first, 10, 10);
  panel->addWidget(titled, 130, 10);
  panel->addWidget(last, 400, 10);
  ASSERT_EQ(panel->tabOrder().numTabStops(), 3u);

  first->set_kbd_focus();
  h.key(kKeyTab);
  EXPECT_TRUE(titled->textBox()->hasKbdFocus());
  h.key(kKeyTab);
  EXPECT_TRUE(last->hasKbdFocus());
  h.key(kKeyShift | kKeyTab);
  EXPECT_TRUE(titled->textBox()->hasKbdFocus());

  panel->removeWidget(titled, true);
  EXPECT_EQ(panel->tabOrder().numTabStops(), 2u);
}
