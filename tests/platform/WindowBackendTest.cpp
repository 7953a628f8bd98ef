#include "platform/backend/WindowBackend.h"

#include <gtest/gtest.h>

#include <unistd.h>
#include <cstdio>
#include <cstring>

#include "platform/glib/CairoPaintSession.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/WindowsClipboard.h"
#include "platform/os/OS.h"

// The window back end on SDL's display-less video driver: SDL events pushed into its queue go
// through the whole path to the Globs, and the window's pixels are real.
namespace {

// Records what reaches it and paints itself in one colour.
class Recorder : public Glob {
 public:
  Recorder(const GlobCreationInfo& info, const Colour& colour) : Glob(info), colour_(colour) {}
  int react(Event* e) override {
    events.push_back(*e);
    return 1;
  }
  void draw() override {
    auto* s = dynamic_cast<Glib::CairoPaintSession*>(canvas()->paintSession());
    if (!s || !s->context()) return;
    cairo_set_source_rgb(s->context(), colour_.r, colour_.g, colour_.b);
    cairo_paint(s->context());
  }
  void setColour(const Colour& c) {
    colour_ = c;
    update();
  }
  std::vector<Event> events;

 private:
  Colour colour_;
};

class WindowBackendTest : public ::testing::Test {
 protected:
  void SetUp() override {
    SDL_SetHint(SDL_HINT_VIDEODRIVER, "dummy");
    window_ = WindowBackend::open("test", 200, 100);
    if (!window_) GTEST_SKIP() << "SDL's dummy video driver is not available";
    // The right half of the window.
    recorder_ =
        new Recorder(GlobCreationInfo(100, 100, window_->root().canvas(), 100, 0), Colour(1, 0, 0));
  }
  void TearDown() override {
    window_.reset();
    SDL_ResetHint(SDL_HINT_VIDEODRIVER);
  }

  void push(SDL_Event e) {
    if (e.type == SDL_WINDOWEVENT) e.window.windowID = window_->windowId();
    SDL_PushEvent(&e);
  }
  void pushButton(bool down, int x, int y) {
    SDL_Event e{};
    e.type = down ? SDL_MOUSEBUTTONDOWN : SDL_MOUSEBUTTONUP;
    e.button.button = SDL_BUTTON_LEFT;
    e.button.x = x;
    e.button.y = y;
    push(e);
  }
  void pushKey(bool down, SDL_Keycode sym, Uint16 mod) {
    SDL_Event e{};
    e.type = down ? SDL_KEYDOWN : SDL_KEYUP;
    e.key.keysym.sym = sym;
    e.key.keysym.mod = mod;
    push(e);
  }
  void pushText(Uint32 type, const char* utf8) {
    SDL_Event e{};
    e.type = type;
    std::strncpy(type == SDL_TEXTINPUT ? e.text.text : e.edit.text, utf8, 31);
    push(e);
  }

  // A pixel of what the window shows, x and y from its top-left corner, as 0xRRGGBB.
  uint32_t shown(int x, int y) {
    SDL_Renderer* r = SDL_GetRenderer(SDL_GetWindowFromID(window_->windowId()));
    uint32_t p = 0;
    const SDL_Rect at{x, y, 1, 1};
    EXPECT_EQ(SDL_RenderReadPixels(r, &at, SDL_PIXELFORMAT_ARGB8888, &p, 4), 0) << SDL_GetError();
    return p & 0xFFFFFF;
  }

  std::unique_ptr<WindowBackend> window_;
  Recorder* recorder_ = nullptr;
};

}  // namespace

TEST_F(WindowBackendTest, ClicksLandWhereTheWindowSaysInLocalUpwardCoordinates) {
  pushButton(true, 130, 10);  // 10 below the top: y = 89 in the root and in the recorder
  pushButton(false, 130, 10);
  pushButton(true, 20, 50);  // left half: not the recorder's
  pushButton(false, 20, 50);
  EXPECT_TRUE(window_->step(0));
  ASSERT_EQ(recorder_->events.size(), 2u);
  EXPECT_EQ(recorder_->events[0].type, kEventLeftDown);
  EXPECT_EQ(recorder_->events[0].pos, XY<int>(30, 89));
  EXPECT_EQ(recorder_->events[1].type, kEventLeftUp);
}

TEST_F(WindowBackendTest, KeysAndComposedTextGoToTheFocus) {
  recorder_->set_kbd_focus();
  pushKey(true, SDLK_LCTRL, KMOD_LCTRL);
  pushKey(true, SDLK_c, KMOD_LCTRL);
  window_->step(0);
  EXPECT_TRUE(OS()->keyboard().isKeyDown(OSKeyboard::kCtrl));
  pushKey(false, SDLK_LCTRL, KMOD_NONE);
  pushText(SDL_TEXTEDITING, "ni");
  pushText(SDL_TEXTINPUT, "\xE4\xBD\xA0");
  window_->step(0);
  EXPECT_FALSE(OS()->keyboard().isKeyDown(OSKeyboard::kCtrl));

  std::vector<unsigned> presses;
  const Event* composed = nullptr;
  for (const Event& e : recorder_->events) {
    if (key_press_event(&e)) presses.push_back(e.keyCode());
    if (message_event(&e)) composed = &e;
  }
  EXPECT_EQ(presses, std::vector<unsigned>{0x22000043});
  ASSERT_NE(composed, nullptr);
  EXPECT_STREQ(composed->msg(), kMsgCompoundTextInput);
  EXPECT_EQ(composed->payload(), "\xE4\xBD\xA0");
}

TEST_F(WindowBackendTest, PaintsTheRootAndWritesScreenshots) {
  window_->step(0);
  cairo_surface_t* s = window_->surface();
  ASSERT_NE(s, nullptr);
  const auto* row = reinterpret_cast<const uint32_t*>(cairo_image_surface_get_data(s));
  EXPECT_EQ(row[150] & 0xFFFFFF, 0xFF0000u);  // the recorder's half is red
  EXPECT_NE(row[50] & 0xFFFFFF, 0xFF0000u);

  char dir[] = "/tmp/globkit-window-XXXXXX";
  ASSERT_NE(mkdtemp(dir), nullptr);
  const String whole = String(dir) + "/whole.png";
  const String part = String(dir) + "/part.png";
  EXPECT_TRUE(window_->screenshot(whole));
  EXPECT_TRUE(window_->screenshot(*recorder_, part));
  cairo_surface_t* png = cairo_image_surface_create_from_png(part.c_str());
  EXPECT_EQ(cairo_image_surface_get_width(png), 100);
  cairo_surface_destroy(png);
  {
    Diagnostics::Capture capture;
    EXPECT_FALSE(window_->screenshot(String(dir) + "/missing/x.png"));
    EXPECT_TRUE(capture.contains("cannot write"));
  }
  {
    Diagnostics::Capture capture;
    recorder_->unmap_canvas();
    EXPECT_FALSE(window_->screenshot(*recorder_, part));
    EXPECT_TRUE(capture.contains("not shown"));
  }
  std::remove(whole.c_str());
  std::remove(part.c_str());
  rmdir(dir);
}

TEST_F(WindowBackendTest, PresentsOnlyWhatTheRepaintChanged) {
  auto* patch =
      new Recorder(GlobCreationInfo(20, 20, window_->root().canvas(), 10, 10), Colour(0, 0, 1));
  window_->step(0);
  EXPECT_EQ(shown(150, 50), 0xFF0000u);
  EXPECT_EQ(shown(15, 75), 0x0000FFu);

  // A mark in the image that no repaint asked for: if the window shows it, more than the
  // repainted area went up.
  cairo_surface_t* image = window_->surface();
  cairo_surface_flush(image);
  auto* row = reinterpret_cast<uint32_t*>(cairo_image_surface_get_data(image) +
                                          5 * cairo_image_surface_get_stride(image));
  row[5] = 0xFF00FF00u;
  cairo_surface_mark_dirty(image);

  patch->setColour(Colour(1, 1, 0));
  window_->step(0);
  // 10..30 up from the bottom of a 100-high root is 70..90 down from its top.
  const std::vector<Kw::Box<int>> expected{Kw::Box<int>(10, 70, 30, 90)};
  EXPECT_EQ(window_->renderer().presentedAreas(), expected);
  EXPECT_EQ(shown(15, 75), 0xFFFF00u);
  EXPECT_EQ(shown(150, 50), 0xFF0000u);
  EXPECT_NE(shown(5, 5), 0x00FF00u);
}

TEST_F(WindowBackendTest, FollowsTheWindowsNewSize) {
  window_->step(0);
  SDL_SetWindowSize(SDL_GetWindowFromID(window_->windowId()), 300, 150);
  SDL_Event resized{};
  resized.type = SDL_WINDOWEVENT;
  resized.window.event = SDL_WINDOWEVENT_SIZE_CHANGED;
  resized.window.data1 = 300;
  resized.window.data2 = 150;
  push(resized);
  window_->step(0);
  EXPECT_EQ(window_->root().canvas()->width(), 300);
  EXPECT_EQ(window_->root().canvas()->height(), 150);
  EXPECT_EQ(cairo_image_surface_get_width(window_->surface()), 300);
  EXPECT_EQ(cairo_image_surface_get_height(window_->surface()), 150);
  // The recorder keeps its place from the bottom-left corner; all of the new image is shown.
  EXPECT_EQ(shown(150, 100), 0xFF0000u);
  EXPECT_EQ(shown(150, 10), window_->renderer().pixelAt(XY<int>(150, 139)) & 0xFFFFFF);
  EXPECT_EQ(shown(290, 140), window_->renderer().pixelAt(XY<int>(290, 9)) & 0xFFFFFF);
  EXPECT_NE(shown(290, 140), 0u);
}

TEST_F(WindowBackendTest, InstallsTheSystemClipboardWhileItLives) {
  EXPECT_NE(dynamic_cast<SdlClipboardProvider*>(&WindowsClipboard::provider()), nullptr);
  window_.reset();
  EXPECT_EQ(dynamic_cast<SdlClipboardProvider*>(&WindowsClipboard::provider()), nullptr);
}

TEST_F(WindowBackendTest, ClosingTheWindowEndsTheLoop) {
  EXPECT_TRUE(window_->step(0));
  SDL_Event close{};
  close.type = SDL_WINDOWEVENT;
  close.window.event = SDL_WINDOWEVENT_CLOSE;
  push(close);
  EXPECT_FALSE(window_->step(0));
}
