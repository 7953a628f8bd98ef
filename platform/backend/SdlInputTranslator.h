#pragma once
// Turns SDL events into the library's input: mouse codes in root coordinates, key codes with
// modifier bits, composed text, and the window's own requests. It touches no window and no
// global state, so tests feed it hand-made SDL events.
//
// Mouse buttons. Left, right and middle map to their press/release codes. Pressing left while
// right is held (or the reverse) is a chord: one chord press (0x182). Releasing either button
// then ends the chord (0x181) and the other button's later release is swallowed, so every press
// the root sees has exactly one release. A release whose press was never seen (it began outside
// the window) is dropped.
//
// Keys. Non-character keys are sent from key-down (repeats included) with their modifier bits:
// Return 13, Backspace 8, Tab 9, Escape 27, the PC scan-code keys as kKeyScanCode | scan code.
// Characters come from text input, as the bare character. A character key held with Ctrl or the
// left Alt is a shortcut and is sent from key-down instead (see kKeyClipboard in Event.h); the
// text input that follows it is dropped. The right Alt is left to text input because many
// layouts compose characters with it. Key releases are sent for the keys whose press is.
//
// Text. A text input of one character is a key press of that character. Several characters at
// once, or the commit of an input method's composition, arrive as one kMsgCompoundTextInput
// message with the text. The composition in progress is not shown by the library: the input
// method's own window shows it.
#include <SDL.h>

#include <vector>

#include "platform/kw/String.h"
#include "platform/kw/XY.h"

// One piece of library input made from an SDL event.
struct TranslatedInput {
  enum class Kind {
    Mouse,         // injectMouse(type, pos, wheelSteps)
    Key,           // injectKey(type, keyCode)
    ComposedText,  // kMsgCompoundTextInput with `text` to the keyboard focus
    Modifiers,     // the modifier keys now held (kKeyShift | kKeyCtrl | kKeyAlt)
    Resized,       // the window changed size: read the new sizes
    Exposed,       // the window's pixels were lost: present everything again
    FocusLost,     // keys held now are released elsewhere
    Quit,
  };
  Kind kind = Kind::Quit;
  int type = 0;
  XY<int> pos;
  int wheelSteps = 0;
  unsigned keyCode = 0;
  unsigned modifiers = 0;
  String text;
};

// Sizes needed to place the pointer in the root: SDL reports window units, the root counts
// drawable pixels (more of them on a HiDPI screen).
struct WindowGeometry {
  int windowWidth = 1;
  int windowHeight = 1;
  int rootWidth = 1;
  int rootHeight = 1;
};

class SdlInputTranslator {
 public:
  std::vector<TranslatedInput> translate(const SDL_Event& event, const WindowGeometry& geometry);

  // The library key code for a key-down, or 0 when the key is left to text input or has no
  // code in the library.
  static unsigned keyCodeFor(SDL_Keycode sym, Uint16 mod);
  // The modifier bits (kKeyShift, kKeyCtrl, kKeyAlt) of an SDL modifier state.
  static unsigned modifierBits(Uint16 mod);
  // A window position (top-left origin, window units) in root coordinates (bottom-left origin,
  // y upward, drawable pixels).
  static XY<int> toRoot(int windowX, int windowY, const WindowGeometry& geometry);

  // Buttons the translator believes are held (mouse code bits 0x10, 0x20, 0x40).
  int buttonsHeld() const;

 private:
  void translateButton(const SDL_MouseButtonEvent& b, bool down, const WindowGeometry& geometry,
                       std::vector<TranslatedInput>& out);
  void translateKey(const SDL_KeyboardEvent& k, bool down, std::vector<TranslatedInput>& out);
  void translateText(const char* utf8, std::vector<TranslatedInput>& out);

  struct ButtonState {
    bool down = false;
    bool swallowRelease = false;  // its release was already reported by a chord release
  };
  ButtonState left_, right_, middle_;
  bool chord_ = false;
  bool composing_ = false;
  bool dropNextText_ = false;
  XY<int> lastPointer_;
};
