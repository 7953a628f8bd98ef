#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "buttons/ImageButton.h"
#include "buttons/ImageSearchPath.h"
#include "buttons/PinButton.h"
#include "buttons/PootButton.h"
#include "buttons/SettingsButton.h"
#include "buttons/SizeButton.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

// Each look rendered alone on a small screen, the button on a panel-coloured parent.
struct ButtonLookTest : ::testing::Test {
  ButtonLookTest() {
    imageSearchPath().addDirectory(String(GLOBKIT_SOURCE_DIR) + "/gallery/icons");
  }
  Button* make(const WString& label, int w = 80, int hgt = 24) {
    return new Button(label, String("b"), GlobCreationInfo(w, hgt, parent.canvas(), 8, 8));
  }
  void expectGolden(const Glob& g, const char* name) {
    const GoldenResult r = GoldenImage::check(h, g, name);
    EXPECT_TRUE(r.ok) << r.message;
  }

  Harness h{120, 60};
  MessageProbe parent{h.place(0, 0, 120, 60)};
};

}  // namespace

TEST_F(ButtonLookTest, PushButtonStates) {
  Button* b = make(L"Apply");
  expectGolden(*b, "button_up");

  h.move(Harness::centreOf(*b));
  expectGolden(*b, "button_hover");

  h.press(Harness::centreOf(*b));
  expectGolden(*b, "button_down");
  h.release(Harness::centreOf(*b));
  h.move(XY<int>(1, 1));

  b->set_kbd_focus();
  expectGolden(*b, "button_focus");
  h.root().setFocus(nullptr);

  b->setActive(false, true);
  expectGolden(*b, "button_inactive");
}

TEST_F(ButtonLookTest, LatchedButtonShowsItsLamp) {
  Button* b = make(L"Solo");
  b->set_latching(true, true);
  h.clickOn(*b);
  h.move(XY<int>(1, 1));
  expectGolden(*b, "button_latched");
}

TEST_F(ButtonLookTest, ImageButtons) {
  ImageButton* img =
      new ImageButton(L"settings.png", L"settings.png", "s", 28, 24, parent.canvas());
  expectGolden(*img, "imagebutton");
  delete img;

  // A name found nowhere draws the placeholder, and is reported once however often it draws.
  Diagnostics::Capture cap;
  ImageButton* missing = new ImageButton(L"no-such-icon.png", "m", parent.canvas());
  EXPECT_EQ(missing->width(), 16 + 2 * ImageButton::kImageMargin);
  expectGolden(*missing, "imagebutton_missing");
  missing->update();
  h.render();
  int reports = 0;
  for (const String& line : cap.lines()) reports += line.find("no-such-icon.png") != String::npos;
  EXPECT_EQ(reports, 1);
}

TEST_F(ButtonLookTest, TitleButtons) {
  PootButton* poot = new PootButton(20, 0, parent.canvas());
  expectGolden(*poot, "titlebutton_poot");
  delete poot;

  SettingsButton* settings = new SettingsButton(16, 0, parent.canvas());
  expectGolden(*settings, "titlebutton_settings");
  delete settings;

  SizeButton* size = new SizeButton(true, 20, 0, parent.canvas());
  expectGolden(*size, "titlebutton_size_set");
  size->set_size(false);
  expectGolden(*size, "titlebutton_size_clear");
  delete size;

  PinButton* pin = new PinButton(16, 20, parent.canvas());
  expectGolden(*pin, "titlebutton_pin");
  h.clickOn(*pin);
  h.move(XY<int>(1, 1));
  expectGolden(*pin, "titlebutton_pinned");
}

TEST_F(ButtonLookTest, LabelsNeverLeaveTheButton) {
  Button* b = make(L"", 60, 24);
  h.render();
  // A ring of pixels just outside the button.
  auto ring = [&] {
    std::vector<uint32_t> px;
    for (int x = 6; x < 70; ++x) px.push_back(h.pixelAt(x, 7)), px.push_back(h.pixelAt(x, 32));
    for (int y = 7; y < 33; ++y) px.push_back(h.pixelAt(7, y)), px.push_back(h.pixelAt(68, y));
    return px;
  };
  const std::vector<uint32_t> before = ring();

  const WString labels[] = {
      WString(100000, L'W'),
      Kw::toWide("bad \xC3\x28 \xFF\xFE utf-8"),
      WString{L'a', static_cast<wchar_t>(0xD800), L'\n', L'\t', static_cast<wchar_t>(0x110000)},
      L"Gyp\u00C9\u00C7\u6F22\u5B57 much too long for the button",
  };
  for (const WString& label : labels) {
    b->setString(label);
    h.render();
    EXPECT_EQ(ring(), before);
    b->set_ranged_left(1);  // left and centred alignments both stay inside
    h.render();
    EXPECT_EQ(ring(), before);
    b->set_ranged_left(0);
  }
}

TEST_F(ButtonLookTest, DrawingChangesNothing) {
  Button* b = make(L"Apply");
  int calls = 0;
  button_state seen = kButtonDown;
  b->set_procedure([&](const Kw::Box<int>& face, button_state s) {
    ++calls;
    seen = s;
    EXPECT_EQ(face, Kw::Box<int>(0, 0, 80, 24));
  });
  const Palette palette = b->getPalette();
  h.render();
  EXPECT_EQ(calls, 1);
  EXPECT_EQ(seen, kButtonUp);
  EXPECT_TRUE(b->getPalette() == palette);
  EXPECT_FALSE(h.root().needsPaint());
}
