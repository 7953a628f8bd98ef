// The input box: one at a time, placed on the requester's screen, sending its prefix and the
// typed text to the requester on Return or the do-it button, then closing; and what happens
// when the requester is gone or the user answers twice.
#include <gtest/gtest.h>

#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "text/InputBox.h"
#include "text/TextBox.h"
#include "text/TextLabel.h"

namespace {

struct InputBoxFixture : ::testing::Test {
  void TearDown() override { InputBox::removeAnyExistingInputBox(); }

  InputBox* ask(const WString& text = L"") {
    h.move(XY<int>(300, 200));
    return InputBox::make(L"Rename", L"New name:", text, "rename:", requester);
  }

  Harness h{600, 400};
  MessageProbe* requester = new MessageProbe(h.place(0, 0, 600, 400));
};

}  // namespace

TEST_F(InputBoxFixture, OpensOnTheRequestersScreenReadyForTyping) {
  InputBox* box = ask(L"Clip 4");
  ASSERT_NE(box, nullptr);
  EXPECT_EQ(InputBox::current(), box);
  EXPECT_EQ(box->root(), &h.root());
  EXPECT_EQ(box->width(), InputBox::kWidth);
  EXPECT_EQ(box->height(), InputBox::kHeight);
  // Centred on the pointer.
  EXPECT_EQ(box->canvas()->rect(), Kw::Box<int>::fromSize(300 - 125, 200 - 47, 250, 95));
  EXPECT_TRUE(box->isModal());
  EXPECT_TRUE(box->entry()->hasKbdFocus());
  EXPECT_EQ(box->getString(), L"Clip 4");
  EXPECT_EQ(box->getTitleW(), L"Rename");
  EXPECT_EQ(box->prompt()->getText(), L"New name:");
}

TEST_F(InputBoxFixture, NearTheEdgeItStaysOnTheScreen) {
  h.move(XY<int>(590, 5));
  InputBox* box = InputBox::make(L"Rename", L"Name:", L"", "rename:", requester);
  ASSERT_NE(box, nullptr);
  EXPECT_EQ(box->canvas()->rect(), Kw::Box<int>::fromSize(600 - 250, 0, 250, 95));
}

TEST_F(InputBoxFixture, ReturnSendsThePrefixAndTheTextThenCloses) {
  InputBox* box = ask();
  GlobHandle<InputBox> alive(box);
  h.type(L"ab");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(requester->texts(), std::vector<String>{"rename:ab"});
  EXPECT_FALSE(alive);
  EXPECT_EQ(InputBox::current(), nullptr);
  // The modal shade went with it.
  EXPECT_EQ(h.root().inputScope(), nullptr);
}

TEST_F(InputBoxFixture, TheDoItButtonAnswersLikeReturn) {
  InputBox* box = ask(L"Take 2");
  GlobHandle<InputBox> alive(box);
  Glob* doIt = box->doItButton();
  ASSERT_NE(doIt, nullptr);
  h.clickOn(*doIt);
  h.pump();
  EXPECT_EQ(requester->texts(), std::vector<String>{"rename:Take 2"});
  EXPECT_FALSE(alive);
}

TEST_F(InputBoxFixture, TheCloseButtonSendsNothing) {
  InputBox* box = ask(L"Take 2");
  GlobHandle<InputBox> alive(box);
  Glob* close = box->closeButton();
  ASSERT_NE(close, nullptr);
  h.clickOn(*close);
  h.pump();
  EXPECT_TRUE(requester->texts().empty());
  EXPECT_FALSE(alive);
}

TEST_F(InputBoxFixture, AnsweringTwiceBeforeItClosesSendsOnce) {
  InputBox* box = ask(L"x");
  box->do_act();
  box->do_act();
  EXPECT_TRUE(box->isDone());
  h.pump();
  EXPECT_EQ(requester->count("rename:x"), 1);
}

TEST_F(InputBoxFixture, ARequesterGoneBeforeReturnGetsNothingAndTheBoxStillCloses) {
  InputBox* box = ask(L"orphan");
  GlobHandle<InputBox> alive(box);
  delete requester;
  requester = nullptr;
  h.key(kKeyReturn);
  h.pump();
  EXPECT_FALSE(alive);
}

TEST_F(InputBoxFixture, ASecondBoxReplacesTheFirst) {
  InputBox* first = ask(L"one");
  GlobHandle<InputBox> firstAlive(first);
  InputBox* second =
      InputBox::make(Colour::fromHex(0x405060), L"Other:", L"two", "other:", requester);
  ASSERT_NE(second, nullptr);
  EXPECT_FALSE(firstAlive);
  EXPECT_EQ(InputBox::current(), second);
  EXPECT_TRUE(second->getTitleW().empty());
  EXPECT_EQ(second->getcol(), Colour::fromHex(0x405060));
  // Only the new box holds the screen.
  EXPECT_EQ(h.root().inputScope(), second);
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(requester->texts(), std::vector<String>{"other:two"});
}

TEST_F(InputBoxFixture, NoBoxForARequesterOnNoScreen) {
  MessageProbe loose{GlobCreationInfo(10, 10, nullptr)};
  EXPECT_EQ(InputBox::make(L"T", L"P", L"", "m", &loose), nullptr);
  EXPECT_EQ(InputBox::make(L"T", L"P", L"", "m", nullptr), nullptr);
  EXPECT_EQ(InputBox::current(), nullptr);
}

TEST_F(InputBoxFixture, AHiddenEntryStillSendsTheRealText) {
  h.move(XY<int>(300, 200));
  InputBox* box = InputBox::make(L"Password", L"Key:", L"", "key:", requester, true);
  ASSERT_NE(box, nullptr);
  EXPECT_TRUE(box->entry()->isObfuscatedDisplay());
  h.type(L"s3");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(requester->texts(), std::vector<String>{"key:s3"});
}
