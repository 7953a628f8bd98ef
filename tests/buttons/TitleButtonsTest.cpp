#include <gtest/gtest.h>

#include "buttons/ImageSearchPath.h"
#include "buttons/PinButton.h"
#include "buttons/PootButton.h"
#include "buttons/SettingsButton.h"
#include "buttons/SizeButton.h"
#include "platform/glob/KeyCodes.h"
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
  h.key(kKeyReturn);
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

TEST_F(TitleButtonsTest, SettingsButtonIsAtLeastTwentyWide) {
  SettingsButton* narrow = new SettingsButton(10, 0, panel.canvas());
  EXPECT_EQ(narrow->width(), 20);
  EXPECT_EQ(narrow->height(), 20);
  SettingsButton* wide = new SettingsButton(24, 16, panel.canvas());
  EXPECT_EQ(wide->width(), 24);
  EXPECT_EQ(wide->height(), 16);
  EXPECT_EQ(wide->getUpImage(), L"settings.png");
  h.clickOn(*wide);
  EXPECT_EQ(panel.texts(), Texts{"screwdriver"});
}

TEST_F(TitleButtonsTest, PinButtonLatchesBetweenItsImages) {
  PinButton* pin = new PinButton(16, 20, panel.canvas());
  EXPECT_EQ(pin->width(), 16);
  EXPECT_EQ(pin->height(), 20);
  EXPECT_EQ(pin->getUpImage(), L"pin.png");
  EXPECT_EQ(pin->getDownImage(), L"pinned.png");
  h.clickOn(*pin);
  EXPECT_EQ(pin->get_state(), kButtonDown);
  h.clickOn(*pin);
  EXPECT_EQ(panel.texts(), (Texts{"freeze_flip on", "freeze_flip off"}));

  // A panel wanting "pin on" / "pin off" renames the message.
  pin->set_message("pin");
  h.clickOn(*pin);
  EXPECT_EQ(panel.texts().back(), "pin on");

  PinButton copy(*pin);
  EXPECT_EQ(copy.getDownImage(), L"pinned.png");
  EXPECT_TRUE(copy.get_latching());
}

TEST_F(TitleButtonsTest, ImageButtonsTakeTheirPicturesSize) {
  ImageSearchPath& path = imageSearchPath();
  const std::vector<String> saved = path.directories();
  path.addDirectory(String(GLOBKIT_SOURCE_DIR) + "/gallery/icons");
  ImageButton* a = new ImageButton(L"pin.png", "a", panel.canvas());
  EXPECT_EQ(a->width(), 16 + 2 * ImageButton::kImageMargin);
  EXPECT_EQ(a->height(), 16 + 2 * ImageButton::kImageMargin);

  ImageButtonInitArgs args(L"pin.png", L"pinned.png", "b", GlobCreationInfo(0, 30, panel.canvas()));
  args.transparentBackground = true;
  ImageButton* b = new ImageButton(args);
  EXPECT_EQ(b->width(), 16 + 2 * ImageButton::kImageMargin);
  EXPECT_EQ(b->height(), 30);
  EXPECT_TRUE(b->getTransparentBackground());
  path.clear();
  for (const String& d : saved) path.addDirectory(d);
}

TEST(ImageSearchPath, FindsNamesInTheFirstDirectoryHoldingThem) {
  ImageSearchPath path;
  path.clear();
  const String icons = String(GLOBKIT_SOURCE_DIR) + "/gallery/icons";
  EXPECT_EQ(path.resolve(String("pin.png")), "pin.png");
  path.addDirectory("/nonexistent/dir");
  path.addDirectory(icons);
  path.addDirectory(icons);
  path.addDirectory("");
  EXPECT_EQ(path.directories().size(), 2u);
  EXPECT_EQ(path.resolve(String("pin.png")), icons + "/pin.png");
  EXPECT_EQ(path.resolve(WString(L"pinned.png")), icons + "/pinned.png");
  EXPECT_EQ(path.resolve(String("missing.png")), "missing.png");
  EXPECT_EQ(path.resolve(String("/abs/x.png")), "/abs/x.png");
  EXPECT_EQ(path.resolve(String()), "");
}
