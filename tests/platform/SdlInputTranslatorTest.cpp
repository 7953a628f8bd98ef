#include "platform/backend/SdlInputTranslator.h"

#include <gtest/gtest.h>

#include <cstring>

#include "platform/backend/SdlCursorSet.h"
#include "platform/glob/Event.h"

namespace {

using Kind = TranslatedInput::Kind;

const WindowGeometry kPlain{800, 600, 800, 600};

SDL_Event button(bool down, Uint8 which, int x, int y) {
  SDL_Event e{};
  e.type = down ? SDL_MOUSEBUTTONDOWN : SDL_MOUSEBUTTONUP;
  e.button.button = which;
  e.button.x = x;
  e.button.y = y;
  return e;
}

SDL_Event motion(int x, int y) {
  SDL_Event e{};
  e.type = SDL_MOUSEMOTION;
  e.motion.x = x;
  e.motion.y = y;
  return e;
}

SDL_Event key(bool down, SDL_Keycode sym, Uint16 mod = KMOD_NONE) {
  SDL_Event e{};
  e.type = down ? SDL_KEYDOWN : SDL_KEYUP;
  e.key.keysym.sym = sym;
  e.key.keysym.mod = mod;
  return e;
}

SDL_Event text(const char* utf8) {
  SDL_Event e{};
  e.type = SDL_TEXTINPUT;
  std::strncpy(e.text.text, utf8, sizeof(e.text.text) - 1);
  return e;
}

SDL_Event editing(const char* utf8) {
  SDL_Event e{};
  e.type = SDL_TEXTEDITING;
  std::strncpy(e.edit.text, utf8, sizeof(e.edit.text) - 1);
  return e;
}

SDL_Event windowEvent(Uint8 what) {
  SDL_Event e{};
  e.type = SDL_WINDOWEVENT;
  e.window.event = what;
  return e;
}

// The mouse codes produced by a run of events, in order.
std::vector<int> mouseCodes(SdlInputTranslator& t, const std::vector<SDL_Event>& events) {
  std::vector<int> codes;
  for (const auto& e : events) {
    for (const auto& in : t.translate(e, kPlain)) {
      if (in.kind == Kind::Mouse) codes.push_back(in.type);
    }
  }
  return codes;
}

// The key codes pressed by a run of events, and the composed texts, in order.
struct Typed {
  std::vector<unsigned> keys;
  std::vector<String> composed;
};
Typed typed(SdlInputTranslator& t, const std::vector<SDL_Event>& events) {
  Typed out;
  for (const auto& e : events) {
    for (const auto& in : t.translate(e, kPlain)) {
      if (in.kind == Kind::Key && in.type == kEventKeyPress) out.keys.push_back(in.keyCode);
      if (in.kind == Kind::ComposedText) out.composed.push_back(in.text);
    }
  }
  return out;
}

}  // namespace

TEST(SdlKeyMapping, CodesTheControlsExpect) {
  struct Case {
    SDL_Keycode sym;
    Uint16 mod;
    unsigned code;
  };
  const Case cases[] = {
      // Clipboard shortcuts carry the extra bit; other Ctrl+letters do not.
      {SDLK_c, KMOD_LCTRL, 0x22000043},
      {SDLK_x, KMOD_RCTRL, 0x22000058},
      {SDLK_v, KMOD_LCTRL, 0x22000056},
      {SDLK_z, KMOD_LCTRL, 0x0200005A},
      {SDLK_y, KMOD_LCTRL, 0x02000059},
      {SDLK_z, KMOD_LCTRL | KMOD_LSHIFT, 0x0300005A},
      {SDLK_c, KMOD_LCTRL | KMOD_LALT, 0x06000043},
      {SDLK_a, KMOD_LALT, 0x04000041},
      {SDLK_1, KMOD_LCTRL, 0x02000031},
      // Control characters, with and without modifiers.
      {SDLK_BACKSPACE, KMOD_LALT, 0x04000008},
      {SDLK_BACKSPACE, KMOD_NONE, 8},
      {SDLK_BACKSPACE, KMOD_LCTRL, 0x02000008},
      {SDLK_RETURN, KMOD_NONE, 13},
      {SDLK_KP_ENTER, KMOD_NONE, 13},
      {SDLK_TAB, KMOD_LSHIFT, 0x01000009},
      {SDLK_ESCAPE, KMOD_NONE, 27},
      // Scan-code keys; lock keys add nothing.
      {SDLK_HOME, KMOD_NONE, 0x08000047},
      {SDLK_LEFT, KMOD_LSHIFT, 0x0900004B},
      {SDLK_RIGHT, KMOD_LCTRL | KMOD_LSHIFT, 0x0B00004D},
      {SDLK_END, KMOD_NUM | KMOD_CAPS, 0x0800004F},
      {SDLK_DELETE, KMOD_NONE, 0x08000053},
      {SDLK_UP, KMOD_NONE, 0x08000048},
      {SDLK_DOWN, KMOD_NONE, 0x08000050},
      {SDLK_PAGEUP, KMOD_NONE, 0x08000049},
      {SDLK_PAGEDOWN, KMOD_NONE, 0x08000051},
      {SDLK_INSERT, KMOD_NONE, 0x08000052},
      // Left to text input: plain and shifted characters, space, and AltGr compositions.
      {SDLK_a, KMOD_NONE, 0},
      {SDLK_a, KMOD_LSHIFT, 0},
      {SDLK_SPACE, KMOD_NONE, 0},
      {SDLK_q, KMOD_RALT, 0},
      // Keys the library has no code for.
      {SDLK_LSHIFT, KMOD_LSHIFT, 0},
      {SDLK_CAPSLOCK, KMOD_NONE, 0},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(SdlInputTranslator::keyCodeFor(c.sym, c.mod), c.code)
        << "sym " << c.sym << " mod " << c.mod;
  }
}

TEST(SdlInputTranslator, CharactersArriveOnceFromTextInput) {
  SdlInputTranslator t;
  const Typed plain =
      typed(t, {key(true, SDLK_a), text("a"), key(false, SDLK_a), key(true, SDLK_a, KMOD_LSHIFT),
                text("A"), key(true, SDLK_SPACE), text(" "), text("\xC3\xA9")});
  EXPECT_EQ(plain.keys, (std::vector<unsigned>{'a', 'A', ' ', 0xE9}));

  // A shortcut comes from key-down and the text that follows it is dropped, once.
  const Typed shortcut =
      typed(t, {key(true, SDLK_c, KMOD_LCTRL), text("c"), key(true, SDLK_a, KMOD_LALT), text("a"),
                key(true, SDLK_b), text("b")});
  EXPECT_EQ(shortcut.keys, (std::vector<unsigned>{0x22000043, 0x04000041, 'b'}));

  // Key repeat of a non-character key sends the press again.
  SDL_Event repeat = key(true, SDLK_LEFT);
  repeat.key.repeat = 1;
  EXPECT_EQ(typed(t, {key(true, SDLK_LEFT), repeat}).keys,
            (std::vector<unsigned>{0x0800004B, 0x0800004B}));
}

TEST(SdlInputTranslator, ComposedTextBecomesOneMessage) {
  SdlInputTranslator t;
  // An input method's commit, even of one character, and any multi-character commit.
  const Typed out = typed(t, {editing("ni"), editing("\xE4\xBD\xA0"), text("\xE4\xBD\xA0"),
                              text("\xE4\xBD\xA0\xE5\xA5\xBD"), text("x")});
  EXPECT_EQ(out.composed, (std::vector<String>{"\xE4\xBD\xA0", "\xE4\xBD\xA0\xE5\xA5\xBD"}));
  EXPECT_EQ(out.keys, (std::vector<unsigned>{'x'}));

  // A cancelled composition leaves the next character a plain key; bad bytes are replaced.
  const Typed after = typed(t, {editing("n"), editing(""), text("n"), text("a\xFF")});
  EXPECT_EQ(after.keys, (std::vector<unsigned>{'n'}));
  EXPECT_EQ(after.composed, (std::vector<String>{"a\xEF\xBF\xBD"}));
}

TEST(SdlInputTranslator, KeysReportTheModifiersHeld) {
  SdlInputTranslator t;
  const auto out = t.translate(key(true, SDLK_LSHIFT, KMOD_LSHIFT | KMOD_RCTRL), kPlain);
  ASSERT_EQ(out.size(), 1u);
  EXPECT_EQ(out[0].kind, Kind::Modifiers);
  EXPECT_EQ(out[0].modifiers, kKeyShift | kKeyCtrl);

  const auto up = t.translate(key(false, SDLK_DELETE, KMOD_NONE), kPlain);
  ASSERT_EQ(up.size(), 2u);
  EXPECT_EQ(up[1].type, kEventKeyRelease);
  EXPECT_EQ(up[1].keyCode, 0x08000053u);
}

TEST(SdlInputTranslator, PointerPositionsCountUpwardInDrawablePixels) {
  SdlInputTranslator t;
  auto at = [&](int x, int y, const WindowGeometry& g) {
    return t.translate(motion(x, y), g).at(0).pos;
  };
  EXPECT_EQ(at(0, 0, kPlain), XY<int>(0, 599));
  EXPECT_EQ(at(799, 599, kPlain), XY<int>(799, 0));
  EXPECT_EQ(at(10, 100, kPlain), XY<int>(10, 499));
  // A HiDPI window: 400x300 units over 800x600 pixels.
  const WindowGeometry hidpi{400, 300, 800, 600};
  EXPECT_EQ(at(0, 0, hidpi), XY<int>(0, 599));
  EXPECT_EQ(at(10, 100, hidpi), XY<int>(20, 399));
  EXPECT_EQ(at(399, 299, hidpi), XY<int>(798, 1));
}

TEST(SdlInputTranslator, ButtonsAndChords) {
  SdlInputTranslator t;
  EXPECT_EQ(mouseCodes(t, {button(true, SDL_BUTTON_LEFT, 5, 5), motion(6, 6),
                           button(false, SDL_BUTTON_LEFT, 6, 6)}),
            (std::vector<int>{0x122, 0x103, 0x121}));
  EXPECT_EQ(mouseCodes(
                t, {button(true, SDL_BUTTON_RIGHT, 5, 5), button(false, SDL_BUTTON_RIGHT, 5, 5),
                    button(true, SDL_BUTTON_MIDDLE, 5, 5), button(false, SDL_BUTTON_MIDDLE, 5, 5)}),
            (std::vector<int>{0x142, 0x141, 0x112, 0x111}));

  // Left then right: a chord; the first release ends it, the second is swallowed.
  EXPECT_EQ(
      mouseCodes(t, {button(true, SDL_BUTTON_LEFT, 5, 5), button(true, SDL_BUTTON_RIGHT, 5, 5),
                     button(false, SDL_BUTTON_RIGHT, 5, 5), button(false, SDL_BUTTON_LEFT, 5, 5)}),
      (std::vector<int>{0x122, 0x182, 0x181}));
  EXPECT_EQ(t.buttonsHeld(), 0);
  // Right then left, released in press order; then a fresh left click is ordinary again.
  EXPECT_EQ(
      mouseCodes(t, {button(true, SDL_BUTTON_RIGHT, 5, 5), button(true, SDL_BUTTON_LEFT, 5, 5),
                     button(false, SDL_BUTTON_RIGHT, 5, 5), button(false, SDL_BUTTON_LEFT, 5, 5),
                     button(true, SDL_BUTTON_LEFT, 5, 5), button(false, SDL_BUTTON_LEFT, 5, 5)}),
      (std::vector<int>{0x142, 0x182, 0x181, 0x122, 0x121}));

  // Releases whose press happened outside, doubled presses and extra buttons are dropped.
  EXPECT_EQ(mouseCodes(t, {button(false, SDL_BUTTON_LEFT, 5, 5), button(true, SDL_BUTTON_X1, 5, 5),
                           button(true, SDL_BUTTON_LEFT, 5, 5), button(true, SDL_BUTTON_LEFT, 5, 5),
                           button(false, SDL_BUTTON_LEFT, 5, 5)}),
            (std::vector<int>{0x122, 0x121}));
}

TEST(SdlInputTranslator, WheelStepsAtThePointer) {
  SdlInputTranslator t;
  t.translate(motion(30, 40), kPlain);
  SDL_Event w{};
  w.type = SDL_MOUSEWHEEL;
  w.wheel.y = 2;
  auto out = t.translate(w, kPlain);
  ASSERT_EQ(out.size(), 1u);
  EXPECT_EQ(out[0].type, kEventMouseWheel);
  EXPECT_EQ(out[0].wheelSteps, 2);
  EXPECT_EQ(out[0].pos, XY<int>(30, 559));

  w.wheel.y = 3;
  w.wheel.direction = SDL_MOUSEWHEEL_FLIPPED;
  EXPECT_EQ(t.translate(w, kPlain).at(0).wheelSteps, -3);
  // Sideways scrolling only: nothing for the library.
  w.wheel.y = 0;
  w.wheel.x = 1;
  EXPECT_TRUE(t.translate(w, kPlain).empty());
}

TEST(SdlInputTranslator, WindowRequests) {
  SdlInputTranslator t;
  SDL_Event quit{};
  quit.type = SDL_QUIT;
  EXPECT_EQ(t.translate(quit, kPlain).at(0).kind, Kind::Quit);
  EXPECT_EQ(t.translate(windowEvent(SDL_WINDOWEVENT_CLOSE), kPlain).at(0).kind, Kind::Quit);
  EXPECT_EQ(t.translate(windowEvent(SDL_WINDOWEVENT_SIZE_CHANGED), kPlain).at(0).kind,
            Kind::Resized);
  EXPECT_EQ(t.translate(windowEvent(SDL_WINDOWEVENT_FOCUS_LOST), kPlain).at(0).kind,
            Kind::FocusLost);

  // Leaving the window clears the hover, but not in the middle of a drag.
  auto leave = t.translate(windowEvent(SDL_WINDOWEVENT_LEAVE), kPlain);
  ASSERT_EQ(leave.size(), 1u);
  EXPECT_EQ(leave[0].pos, XY<int>(-1, -1));
  t.translate(button(true, SDL_BUTTON_LEFT, 1, 1), kPlain);
  EXPECT_TRUE(t.translate(windowEvent(SDL_WINDOWEVENT_LEAVE), kPlain).empty());
}

TEST(SdlCursorSet, EveryShapeHasASystemCursor) {
  bool hidden = false;
  EXPECT_EQ(SdlCursorSet::systemCursorFor(kCursorText, hidden), SDL_SYSTEM_CURSOR_IBEAM);
  EXPECT_EQ(SdlCursorSet::systemCursorFor(kCursorHand, hidden), SDL_SYSTEM_CURSOR_HAND);
  EXPECT_EQ(SdlCursorSet::systemCursorFor(kCursorResizeVertical, hidden), SDL_SYSTEM_CURSOR_SIZENS);
  EXPECT_EQ(SdlCursorSet::systemCursorFor(kCursorHorizontalMove, hidden), SDL_SYSTEM_CURSOR_SIZEWE);
  EXPECT_FALSE(hidden);
  EXPECT_EQ(SdlCursorSet::systemCursorFor(static_cast<MouseCursorID>(999), hidden),
            SDL_SYSTEM_CURSOR_ARROW);
  SdlCursorSet::systemCursorFor(kCursorNone, hidden);
  EXPECT_TRUE(hidden);
}
