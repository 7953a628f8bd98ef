#include <gtest/gtest.h>

#include "buttons/PootButton.h"
#include "buttons/SizeButton.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/ResourceStrings.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

using Texts = std::vector<String>;

struct TitleButtonsTest : ::testing::Test {
  TitleButtonsTest() {
    resourceStrings().set(SizeButton::kContextStringSizeSet, L"Smaller");
    resourceStrings().set(SizeButton::kContextStringSizeClear, L"Larger");
  }
  ~TitleButtonsTest() override { resourceStrings().clear(); }

  Harness h;
  MessageProbe panel{h.place(0, 0, 300, 100)};
};

}  // namespace

TEST_F(TitleButtonsTest, HeightZeroMakesSquareButtons) {
  PootButton* poot = new PootButton(18, 0, panel.canvas());
  SizeButton* size = new SizeButton(true, 22, 0, panel.canvas());
  EXPECT_EQ(poot->width(), 18);
  EXPECT_EQ(poot->height(), 18);
  EXPECT_EQ(size->height(), 22);
  PootButton* tall = new PootButton(18, 30, panel.canvas());
  EXPECT_EQ(tall->height(), 30);
}

TEST_F(TitleButtonsTest, CloseButtonReportsPoot) {
  PootButton* poot = new PootButton(18, 0, panel.canvas());
  h.clickOn(*poot);
  EXPECT_EQ(panel.texts(), Texts{"poot"});
  EXPECT_EQ(poot->get_state(), kButtonUp);

  PootButton copy(*poot);
  EXPECT_EQ(copy.get_message(), "poot");
  EXPECT_EQ(copy.width(), 18);
}

TEST_F(TitleButtonsTest, SizeButtonFlipsBeforeReporting) {
  SizeButton* size = new SizeButton(true, 20, 0, panel.canvas());
  EXPECT_EQ(size->getString(), L">");
  EXPECT_EQ(size->contextString(XY<int>(), nullptr), "Smaller");

  // The label and help text have flipped by the time the panel hears "minify".
  WString labelSeen;
  String contextSeen;
  struct Panel : MessageProbe {
    using MessageProbe::MessageProbe;
    int react(Event* e) override {
      if (message_event(e) && onMessage) onMessage();
      return MessageProbe::react(e);
    }
    std::function<void()> onMessage;
  };
  Panel p(h.place(0, 0, 300, 100));
  SizeButton* b = new SizeButton(true, 20, 0, p.canvas());
  p.onMessage = [&] {
    labelSeen = b->getString();
    contextSeen = b->contextString(XY<int>(), nullptr);
  };
  h.clickOn(*b);
  EXPECT_EQ(p.texts(), Texts{"minify"});
  EXPECT_EQ(labelSeen, L"H");
  EXPECT_EQ(contextSeen, "Larger");
  EXPECT_FALSE(b->get_size());

  // Return flips once too; the release does not flip back.
  b->set_kbd_focus();
  h.key(13);
  EXPECT_EQ(b->getString(), L">");
  EXPECT_TRUE(b->get_size());
  EXPECT_EQ(p.count("minify"), 2);
}

TEST_F(TitleButtonsTest, FrozenLabelOnlyFlipsTheHelpText) {
  SizeButton* b = new SizeButton(false, 20, 0, panel.canvas());
  EXPECT_EQ(b->getString(), L"H");
  b->setLabelFreeze(0x80000000u);
  b->setString(L"Mine");
  h.clickOn(*b);
  EXPECT_EQ(b->getString(), L"Mine");
  EXPECT_TRUE(b->get_size());
  EXPECT_EQ(b->contextString(XY<int>(), nullptr), "Smaller");
  h.clickOn(*b);
  EXPECT_EQ(b->contextString(XY<int>(), nullptr), "Larger");
  EXPECT_EQ(panel.count("minify"), 2);

  SizeButton copy(*b);
  EXPECT_EQ(copy.getLabelFreeze(), 0x80000000u);
  EXPECT_FALSE(copy.get_size());
  EXPECT_EQ(copy.contextString(XY<int>(), nullptr), "Larger");
}

TEST_F(TitleButtonsTest, MissingHelpTextShowsThePlaceholder) {
  resourceStrings().clear();
  Diagnostics::Capture cap;
  SizeButton* b = new SizeButton(true, 20, 0, panel.canvas());
  EXPECT_EQ(b->contextString(XY<int>(), nullptr), "[missing string 2714]");
  EXPECT_TRUE(cap.contains("2714"));
}
