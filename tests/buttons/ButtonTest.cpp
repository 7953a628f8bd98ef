#include <gtest/gtest.h>

#include <cmath>
#include <functional>

#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "foundation/TabOrderManager.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/KeyCodes.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/configb.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

using Texts = std::vector<String>;

class CountingAdaptor : public ButtonAdaptor<WString> {
 public:
  explicit CountingAdaptor(std::function<void()> onClick = {}) : onClick_(std::move(onClick)) {}
  void widgetLeftClicked() override {
    ++clicks;
    if (onClick_) onClick_();
  }
  EventHandlerRc messageReceived(String msg) override {
    seen.push_back(msg);
    return msg == "mine" ? kEventConsumed : kEventNotConsumed;
  }
  int clicks = 0;
  Texts seen;

 private:
  std::function<void()> onClick_;
};

struct ButtonTest : ::testing::Test {
  Button* make(const char* msg, int x = 20, int y = 20, int w = 60, int hgt = 24) {
    return new Button(L"OK", String(msg), GlobCreationInfo(w, hgt, parent.canvas(), x, y));
  }
  XY<int> centre(const Glob& g) { return Harness::centreOf(g); }

  Harness h;
  MessageProbe parent{h.place(0, 0, 300, 200)};
};

}  // namespace

TEST_F(ButtonTest, PlainReportsOnPressAndPopsUpSilently) {
  Button* b = make("go");
  EXPECT_STREQ(b->idstring(), "button");
  EXPECT_EQ(b->getWidgetValue(), L"OK");
  h.press(centre(*b));
  EXPECT_EQ(b->get_state(), kButtonDown);
  EXPECT_EQ(parent.texts(), Texts{"go"});
  EXPECT_EQ(parent.last()->sender, b);
  h.release(centre(*b));
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(parent.texts(), Texts{"go"});

  // The modifier keys held at the press travel with the report.
  h.setModifiers(kKeyShift | kKeyCtrl);
  h.click(centre(*b));
  EXPECT_EQ(parent.last()->modifiers, (1u << 24) | (1u << 25));
}

TEST_F(ButtonTest, LatchingTogglesOnEachPressOnly) {
  Button* b = make("lock");
  b->set_latching(true);
  EXPECT_TRUE(b->get_latching());
  h.click(centre(*b));
  EXPECT_EQ(b->get_state(), kButtonDown);
  h.click(centre(*b));
  EXPECT_EQ(b->get_state(), kButtonUp);
  h.click(centre(*b));
  EXPECT_EQ(parent.texts(), (Texts{"lock on", "lock off", "lock on"}));

  // The lamp option is still latching.
  b->set_latching(true, true);
  EXPECT_EQ(b->getLatchingMode(), 2);
  h.click(centre(*b));
  EXPECT_EQ(parent.texts().back(), "lock off");
}

TEST_F(ButtonTest, PressureButtonReportsPressAndRelease) {
  Button* b = make("p");
  b->set_pressure_button(5);
  EXPECT_EQ(b->get_pressure(), 1);
  h.press(centre(*b));
  EXPECT_EQ(b->get_pressure(), -1);
  // While tracked, everything but the left button is swallowed: keys and ticks do nothing.
  b->set_kbd_focus();
  h.key(kKeyReturn);
  EXPECT_EQ(parent.texts(), Texts{"p pressed"});
  h.release(centre(*b));
  EXPECT_EQ(b->get_pressure(), 1);
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(parent.texts(), (Texts{"p pressed", "p released"}));
}

TEST_F(ButtonTest, DragThresholdIsStrictlyMoreThanThreePixels) {
  Button* b = make("p");
  b->set_pressure_button(1);
  const XY<int> c = centre(*b);

  h.press(c);
  h.move(c + XY<int>(3, 0));
  h.move(c + XY<int>(2, 2));  // length 2.83 counts as 2
  h.move(c + XY<int>(0, -3));
  EXPECT_EQ(b->get_state(), kButtonDown);
  h.move(c + XY<int>(4, 0));
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_EQ(b->get_pressure(), 1);
  // The later release is that of an up button: nothing more.
  h.release(c + XY<int>(4, 0));
  EXPECT_EQ(parent.texts(), (Texts{"p pressed", "p dragged"}));

  // The threshold is shared and can be changed; negative values are refused.
  EXPECT_FALSE(Button::setDragThreshold(-1));
  ASSERT_TRUE(Button::setDragThreshold(10));
  parent.clear();
  h.press(c);
  h.move(c + XY<int>(0, 10));
  h.release(c + XY<int>(0, 10));
  EXPECT_TRUE(Button::setDragThreshold(3));
  EXPECT_EQ(parent.texts(), (Texts{"p pressed", "p released"}));
}

TEST_F(ButtonTest, RepeatSettingsHalveRateAndDelay) {
  Button* b = make("r");
  b->set_repeating(10, 0.4);
  EXPECT_EQ(b->getRepeatDelay(), 200);
  EXPECT_EQ(b->getRepeatInterval(), 50);
  b->set_repeating(3, 1.0);
  EXPECT_EQ(b->getRepeatInterval(), 166);  // (1000 / 3) / 2, truncated twice
  EXPECT_EQ(b->getRepeatDelay(), 500);
  b->set_repeating(5000, 0.1);
  EXPECT_EQ(b->getRepeatInterval(), 1);
  b->set_repeating(0, 0.4);
  EXPECT_EQ(b->getRepeatInterval(), 0);
  b->set_repeating(10, 0.4);
  b->set_repeating(-3, 0.4);
  EXPECT_EQ(b->getRepeatInterval(), 0);

  // A delay that is not a number of seconds becomes 0, with a diagnostic.
  Diagnostics::Capture cap;
  b->set_repeating(10, std::nan(""));
  EXPECT_EQ(b->getRepeatDelay(), 0);
  b->set_repeating(10, -2.0);
  EXPECT_EQ(b->getRepeatDelay(), 0);
  EXPECT_EQ(cap.lines().size(), 2u);
}

TEST_F(ButtonTest, RepeatsFromTheClockWhileHeld) {
  Button* b = make("r");
  b->set_repeating(10, 0.4);  // first repeat after more than 200 ms, then every 50 ms
  h.press(centre(*b));
  EXPECT_EQ(parent.count("r"), 1);
  h.advance(200);
  EXPECT_EQ(parent.count("r"), 1);
  h.advance(10);
  EXPECT_EQ(parent.count("r"), 2);
  h.advance(50);
  EXPECT_EQ(parent.count("r"), 2);
  h.advance(10);
  EXPECT_EQ(parent.count("r"), 3);
  h.release(centre(*b));
  EXPECT_EQ(b->interest() & kInterestTicks, 0);
  h.advance(1000);
  EXPECT_EQ(parent.count("r"), 3);

  // Without a rate, a held button never repeats.
  b->set_repeating(-1, 0.4);
  h.press(centre(*b));
  h.advance(1000);
  h.release(centre(*b));
  EXPECT_EQ(parent.count("r"), 4);
}

TEST_F(ButtonTest, ReturnAndSpaceActivateOnce) {
  Button* b = make("go");
  b->set_kbd_focus();
  h.key(kKeyReturn);
  EXPECT_EQ(parent.texts(), Texts{"go"});
  EXPECT_EQ(b->get_state(), kButtonUp);
  h.key(kKeySpace);
  EXPECT_EQ(parent.texts(), (Texts{"go", "go"}));

  // Other keys, and Return with a modifier, go on to the parent without a report.
  h.key('a');
  h.setModifiers(kKeyCtrl);
  h.key(kKeyReturn);
  h.setModifiers(0);
  EXPECT_EQ(parent.count("go"), 2);

  Button* latch = make("l", 100, 20);
  latch->set_latching(true);
  latch->set_kbd_focus();
  h.key(kKeySpace);
  EXPECT_EQ(latch->get_state(), kButtonDown);

  Button* pressure = make("p", 180, 20);
  pressure->set_pressure_button(1);
  pressure->set_kbd_focus();
  parent.clear();
  h.key(kKeyReturn);
  EXPECT_EQ(parent.texts(), (Texts{"p pressed", "p released"}));
  EXPECT_EQ(pressure->get_pressure(), 1);
}

TEST_F(ButtonTest, InactiveButtonsDoNotStayDownUnlessLatching) {
  Button* plain = make("a", 20, 20);
  Button* latch = make("b", 100, 20);
  latch->set_latching(true);
  h.click(centre(*latch));
  h.press(centre(*plain));
  parent.clear();

  plain->setActive(false, true);
  latch->setActive(false, true);
  EXPECT_EQ(plain->get_state(), kButtonUp);
  EXPECT_EQ(latch->get_state(), kButtonDown);
  EXPECT_TRUE(parent.texts().empty());
  EXPECT_EQ(plain->get_ignore_mouse_clicks(), 1);
  h.release(centre(*plain));

  // An inactive button ignores clicks and shows the plain arrow.
  h.click(centre(*latch));
  EXPECT_EQ(latch->get_state(), kButtonDown);
  EXPECT_TRUE(parent.texts().empty());
  h.move(centre(*latch));
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorArrow);

  // Activating clears the ignore setting, whatever it was.
  latch->set_ignore_mouse_clicks(1);
  latch->setActive(true, true);
  EXPECT_EQ(latch->get_ignore_mouse_clicks(), 0);
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorHand);
  h.click(centre(*latch));
  EXPECT_EQ(parent.texts(), Texts{"b off"});
}

TEST_F(ButtonTest, AButtonItsOwnReportDeactivatesNeitherStaysDownNorRepeatsNorTracks) {
  Button* plain = make("plain", 20, 20);
  Button* repeating = make("rep", 100, 20);
  repeating->set_repeating(10, 0.0);
  Button* pressure = make("pres", 180, 20);
  pressure->set_pressure_button(1);
  for (Button* b : {plain, repeating}) {
    parent.trigger = b->get_message();
    parent.action = [b] { b->setActive(false, true); };
    h.press(centre(*b));
    EXPECT_EQ(b->get_state(), kButtonUp) << b->get_message();
    EXPECT_EQ(b->interest() & kInterestTicks, 0) << b->get_message();
    h.advance(500);
    h.release(centre(*b));
  }
  EXPECT_EQ(parent.count("rep"), 1);

  parent.trigger = "pres pressed";
  parent.action = [pressure] { pressure->setActive(false, true); };
  h.press(centre(*pressure));
  EXPECT_EQ(pressure->get_state(), kButtonUp);
  EXPECT_EQ(pressure->get_pressure(), 1);  // not tracking
  h.release(centre(*pressure));
  EXPECT_EQ(parent.count("pres released"), 0);

  // A repeating button made inactive from a later repeat stops repeating at once.
  repeating->setActive(true, true);
  parent.trigger = "rep";
  int reports = 0;
  parent.action = [&reports, repeating] {
    if (++reports == 3) repeating->setActive(false, true);
  };
  h.press(centre(*repeating));
  h.advance(1000);
  EXPECT_EQ(reports, 3);
  EXPECT_EQ(repeating->get_state(), kButtonUp);
  h.release(centre(*repeating));
}

TEST_F(ButtonTest, IgnoredClicksChangeNothing) {
  Button* b = make("x");
  b->set_ignore_mouse_clicks(1);
  h.click(centre(*b));
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_TRUE(parent.texts().empty());
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorArrow);
  b->set_ignore_mouse_clicks(0);
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorHand);
}

TEST_F(ButtonTest, HoverBrightensTheFaceOfActiveButtons) {
  Button* b = make("x");
  b->set_upcols(Colour(1, 1, 1), Colour(0.5, 0.25, 0.1));
  b->set_downcols(Colour(0, 0, 0), Colour(0.2, 0.2, 0.2));
  EXPECT_EQ(b->get_backcol(), Colour(0.5, 0.25, 0.1));
  h.move(centre(*b));
  EXPECT_TRUE(b->isMouseInside());
  EXPECT_EQ(b->get_backcol(), Colour(0.6, 0.3, 0.12));
  h.press(centre(*b));
  EXPECT_EQ(b->get_forecol(), Colour(0, 0, 0));
  EXPECT_EQ(b->get_backcol(), Colour(0.24, 0.24, 0.24));
  // The state's colours reach the palette the button draws with.
  EXPECT_EQ(b->getPalette().get(Palette::ButtonText), Colour(0, 0, 0));
  h.release(centre(*b));

  b->set_brightening(0);
  EXPECT_EQ(b->get_backcol(), Colour(0.5, 0.25, 0.1));
  b->set_brightening(1);
  b->setActive(false, true);  // the pointer counts as gone for an inactive button
  b->setActive(true, true);
  EXPECT_EQ(b->get_backcol(), Colour(0.5, 0.25, 0.1));
  h.move(XY<int>(5, 5));
  h.move(centre(*b));
  EXPECT_EQ(b->get_backcol(), Colour(0.6, 0.3, 0.12));
}

TEST_F(ButtonTest, ColoursComeFromThePaletteAndBadSettingsAreRefused) {
  GlobCreationInfo info(60, 24, parent.canvas(), 10, 10);
  info.palette.set(Palette::Button, Colour(0.3, 0.3, 0.3));
  info.palette.set(Palette::ButtonText, Colour(0.9, 0.8, 0.7));
  Button* b = new Button(L"A", String("a"), info);
  EXPECT_EQ(b->getUpBackCol(), Colour(0.3, 0.3, 0.3));
  EXPECT_EQ(b->getDownForeCol(), Colour(0.9, 0.8, 0.7));
  b->set_ranged_left(7);
  EXPECT_EQ(b->getTextAlignment(), TextAlignment::Left);
  b->setTextAlignment(static_cast<TextAlignment>(9));
  EXPECT_EQ(b->getTextAlignment(), TextAlignment::Left);
  b->set_bevel_width(-2);
  EXPECT_EQ(b->get_bevel_width(), 4);
  b->set_up_icon("a.png");
  b->set_up_icon(nullptr);
  EXPECT_EQ(b->get_up_icon(), "a.png");

  // An unknown state is refused and nothing is reported.
  Diagnostics::Capture cap;
  b->switch_state(static_cast<button_state>(7), false);
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_TRUE(parent.texts().empty());
  EXPECT_FALSE(cap.lines().empty());
}

TEST_F(ButtonTest, InitArgsApplySettingsAndPalette) {
  ButtonInitArgs args(L"Go", "go", GlobCreationInfo(50, 20, parent.canvas(), 5, 5));
  args.settings.latching = kLatching;
  args.repeatRate = 10;
  args.repeatDelay = 0.4;
  args.settings.textAlignment = TextAlignment::Right;
  args.palette.set(Palette::Focus, Colour(1, 0, 1));
  Button* b = new Button(args);
  EXPECT_TRUE(b->get_latching());
  EXPECT_EQ(b->getRepeatInterval(), 50);
  EXPECT_EQ(b->getTextAlignment(), TextAlignment::Right);
  EXPECT_EQ(b->getPalette().get(Palette::Focus), Colour(1, 0, 1));
  h.click(centre(*b));
  // The state's palette keeps the record's other colours.
  EXPECT_EQ(b->getPalette().get(Palette::Focus), Colour(1, 0, 1));
  EXPECT_EQ(parent.texts(), Texts{"go on"});
}

TEST_F(ButtonTest, CopiesTakeSettingsButNotState) {
  Button* a = make("a", 30, 40, 70, 22);
  a->set_latching(true);
  a->setDownString(L"Down");
  a->set_upcols(Colour(1, 0, 0), Colour(0, 0, 1));
  h.click(centre(*a));
  Button* b = new Button(*a);
  EXPECT_EQ(b->parent(), &parent);
  EXPECT_EQ(b->canvas()->rect(), a->canvas()->rect());
  EXPECT_EQ(b->get_state(), kButtonUp);
  EXPECT_TRUE(b->get_latching());
  EXPECT_EQ(b->getDownString(), L"Down");
  EXPECT_EQ(b->get_message(), "a");
  EXPECT_EQ(b->getUpBackCol(), Colour(0, 0, 1));

  Button* c = make("c", 200, 40);
  *c = *a;
  EXPECT_EQ(c->get_message(), "a");
  EXPECT_EQ(c->canvas()->rect().x0, 200);

  // Copies share the settings until one of them changes: the others keep theirs.
  c->set_bevel_width(7);
  c->setDownString(L"Other");
  EXPECT_EQ(a->get_bevel_width(), 4);
  EXPECT_EQ(b->getDownString(), L"Down");
  EXPECT_EQ(c->getLatchingMode(), kLatching);
  // A button made with default settings holds the shared defaults until it is changed.
  Button* plain = make("p", 20, 100);
  EXPECT_EQ(plain->settings(), ButtonSettings{});
  plain->set_style(kButtonStyleFlat);
  EXPECT_EQ(make("q", 100, 100)->get_style(), kButtonStyleBevelled);
}

TEST_F(ButtonTest, AdaptorHearsClicksAndMessages) {
  Button* b = make("go");
  Kw::Ptr<CountingAdaptor> a(new CountingAdaptor([&] { EXPECT_EQ(b->get_state(), kButtonDown); }));
  b->setDataAdaptor(a);
  h.click(centre(*b));
  EXPECT_EQ(a->clicks, 1);

  // A message the adaptor consumes stops there; others reach the base handling.
  parent.send_msg(b, "mine");
  parent.send_msg(b, "other");
  h.pump();
  EXPECT_EQ(a->seen, (Texts{"mine", "other"}));

  WString v = L"New";
  a->setNewWidgetValue(v);
  EXPECT_EQ(b->getWidgetValue(), L"New");
  a->setWidgetEnabledState(false);
  EXPECT_FALSE(b->isActive());
}

TEST_F(ButtonTest, TabStopsFollowActivityAndHandFocusBack) {
  Button* a = make("a", 20, 20);
  Button* b = make("b", 100, 20);
  TabOrderManager m;
  m.addTabStop(a, TabOrderManager::kAfterLast);
  m.addTabStop(b, TabOrderManager::kAfterLast);

  m.incrementTabStop();
  EXPECT_EQ(h.root().focus(), a);
  h.key(kKeyReturn);
  EXPECT_EQ(parent.texts(), Texts{"a"});

  // An inactive or hidden button is skipped.
  b->setActive(false, true);
  EXPECT_FALSE(b->isTabStopActive());
  EXPECT_FALSE(m.setTabStopFocus(b));
  b->setActive(true, true);
  b->setVisible(false);
  EXPECT_FALSE(b->isTabStopActive());
  b->setVisible(true);
  m.incrementTabStop();
  EXPECT_EQ(h.root().focus(), b);

  // Losing the tab focus gives the keyboard focus to the parent.
  b->relinquishTabStopFocus();
  EXPECT_EQ(h.root().focus(), &parent);
}

TEST_F(ButtonTest, ButtonDeletedByItsOwnReportIsNotTouched) {
  // Each way a button reports, with the parent deleting it on that report.
  struct Case {
    const char* name;
    std::function<void(Button*)> setup;
    String trigger;
    std::function<void(Harness&, Button*)> act;
  };
  const std::vector<Case> cases = {
      {"plain press", [](Button*) {}, "x", [](Harness& h, Button* b) { h.clickOn(*b); }},
      {"pressure release", [](Button* b) { b->set_pressure_button(1); }, "x released",
       [](Harness& h, Button* b) { h.clickOn(*b); }},
      {"drag", [](Button* b) { b->set_pressure_button(1); }, "x dragged",
       [](Harness& h, Button* b) {
         const XY<int> c = Harness::centreOf(*b);
         h.drag(c, c + XY<int>(10, 0));
       }},
      {"keyboard", [](Button*) {}, "x",
       [](Harness& h, Button* b) {
         b->set_kbd_focus();
         h.key(kKeySpace);
       }},
      {"repeat", [](Button* b) { b->set_repeating(10, 0.4); }, "x",
       [](Harness& h, Button* b) {
         // The first report (the press) is let through; the repeat deletes.
         h.press(Harness::centreOf(*b));
         h.advance(300);
         h.release(XY<int>(1, 1));
       }},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    parent.clear();
    Button* b = make("x");
    c.setup(b);
    GlobHandle<Button> handle(b);
    int seen = 0;
    const bool letFirstThrough = String(c.name) == "repeat";
    parent.trigger = c.trigger;
    parent.action = [&] {
      if (letFirstThrough && seen++ == 0) return;
      delete handle.get();
    };
    c.act(h, b);
    EXPECT_FALSE(handle.alive());
    parent.action = nullptr;
  }
}

TEST(ButtonFramework, PathIsTheFaceAndBoxesStayOutOfSavedLayouts) {
  Harness h(200, 100);
  auto* b = new Button(L"Go", "go", h.place(10, 10, 60, 24));
  Kw::Ptr<iRegion> outline = b->path();
  ASSERT_TRUE(outline);
  EXPECT_EQ(outline->bounds(), b->facepath());
  EXPECT_TRUE(b->isOpaqueAt(XY<int>(5, 5)));
  auto* box = new Checkbox(80, 20, false, 0, h.canvas());
  EXPECT_EQ(box->get_dumpable(), 0);
  configb saved;
  box->dump(saved);
  EXPECT_EQ(saved.size(), 0u);
  b->dump(saved);
  EXPECT_EQ(saved.get("button.width"), "60");
}
