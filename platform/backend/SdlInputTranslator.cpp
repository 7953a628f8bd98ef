#include "platform/backend/SdlInputTranslator.h"

#include <algorithm>
#include <cmath>

#include "platform/glob/KeyCodes.h"

namespace {

// PC scan codes of the keys that have no character.
unsigned scanCodeOf(SDL_Keycode sym) {
  switch (sym) {
    case SDLK_HOME:
      return kScanHome;
    case SDLK_UP:
      return kScanUp;
    case SDLK_PAGEUP:
      return kScanPageUp;
    case SDLK_LEFT:
      return kScanLeft;
    case SDLK_RIGHT:
      return kScanRight;
    case SDLK_END:
      return kScanEnd;
    case SDLK_DOWN:
      return kScanDown;
    case SDLK_PAGEDOWN:
      return kScanPageDown;
    case SDLK_INSERT:
      return kScanInsert;
    case SDLK_DELETE:
      return kScanDelete;
    case SDLK_F1:
      return 0x3B;
    case SDLK_F2:
      return 0x3C;
    case SDLK_F3:
      return 0x3D;
    case SDLK_F4:
      return 0x3E;
    case SDLK_F5:
      return 0x3F;
    case SDLK_F6:
      return 0x40;
    case SDLK_F7:
      return 0x41;
    case SDLK_F8:
      return 0x42;
    case SDLK_F9:
      return 0x43;
    case SDLK_F10:
      return 0x44;
    case SDLK_F11:
      return 0x57;
    case SDLK_F12:
      return 0x58;
    default:
      return 0;
  }
}

// Keys that are control characters in the library's numbering.
unsigned controlCharOf(SDL_Keycode sym) {
  switch (sym) {
    case SDLK_RETURN:
    case SDLK_KP_ENTER:
      return kKeyReturn;
    case SDLK_BACKSPACE:
      return kKeyBackspace;
    case SDLK_TAB:
      return kKeyTab;
    case SDLK_ESCAPE:
      return kKeyEscape;
    default:
      return 0;
  }
}

bool isCharacterKey(SDL_Keycode sym) {
  return sym >= 32 && sym != 127 && (sym & SDLK_SCANCODE_MASK) == 0;
}

bool isShortcutHeld(Uint16 mod) {
  // The right Alt is AltGr on many layouts: it composes characters rather than shortcuts.
  return (mod & KMOD_CTRL) != 0 || ((mod & KMOD_LALT) != 0 && (mod & (KMOD_RALT | KMOD_MODE)) == 0);
}

TranslatedInput mouseInput(int type, XY<int> pos, int wheel = 0) {
  TranslatedInput t;
  t.kind = TranslatedInput::Kind::Mouse;
  t.type = type;
  t.pos = pos;
  t.wheelSteps = wheel;
  return t;
}

TranslatedInput simpleInput(TranslatedInput::Kind kind) {
  TranslatedInput t;
  t.kind = kind;
  return t;
}

}  // namespace

unsigned SdlInputTranslator::modifierBits(Uint16 mod) {
  unsigned bits = 0;
  if (mod & KMOD_SHIFT) bits |= kKeyShift;
  if (mod & KMOD_CTRL) bits |= kKeyCtrl;
  if (mod & KMOD_ALT) bits |= kKeyAlt;
  return bits;
}

unsigned SdlInputTranslator::keyCodeFor(SDL_Keycode sym, Uint16 mod) {
  const unsigned mods = modifierBits(mod);
  if (const unsigned scan = scanCodeOf(sym)) return kKeyScanCode | scan | mods;
  if (const unsigned c = controlCharOf(sym)) return c | mods;
  if (!isCharacterKey(sym) || !isShortcutHeld(mod)) return 0;
  unsigned c = static_cast<unsigned>(sym);
  if (c >= 'a' && c <= 'z') c -= 'a' - 'A';
  unsigned code = c | mods;
  if ((mods & kKeyCtrl) && !(mods & kKeyAlt) && (c == 'C' || c == 'X' || c == 'V')) {
    code |= kKeyClipboard;
  }
  return code;
}

XY<int> SdlInputTranslator::toRoot(int windowX, int windowY, const WindowGeometry& g) {
  const double sx = static_cast<double>(g.rootWidth) / std::max(1, g.windowWidth);
  const double sy = static_cast<double>(g.rootHeight) / std::max(1, g.windowHeight);
  const int x = static_cast<int>(std::floor(windowX * sx));
  const int row = static_cast<int>(std::floor(windowY * sy));
  // Pixel row 0 is the top one, root y = height - 1.
  return XY<int>(x, g.rootHeight - 1 - row);
}

int SdlInputTranslator::buttonsHeld() const {
  return (left_.down ? 0x20 : 0) | (right_.down ? 0x40 : 0) | (middle_.down ? 0x10 : 0);
}

std::vector<TranslatedInput> SdlInputTranslator::translate(const SDL_Event& ev,
                                                           const WindowGeometry& g) {
  std::vector<TranslatedInput> out;
  // The text input that follows a shortcut's key-down comes right after it, or not at all.
  if (ev.type != SDL_TEXTINPUT) dropNextText_ = false;

  switch (ev.type) {
    case SDL_QUIT:
      out.push_back(simpleInput(TranslatedInput::Kind::Quit));
      break;
    case SDL_WINDOWEVENT:
      switch (ev.window.event) {
        case SDL_WINDOWEVENT_CLOSE:
          out.push_back(simpleInput(TranslatedInput::Kind::Quit));
          break;
        case SDL_WINDOWEVENT_SIZE_CHANGED:
          out.push_back(simpleInput(TranslatedInput::Kind::Resized));
          break;
        case SDL_WINDOWEVENT_EXPOSED:
          out.push_back(simpleInput(TranslatedInput::Kind::Exposed));
          break;
        case SDL_WINDOWEVENT_FOCUS_LOST:
          composing_ = false;
          out.push_back(simpleInput(TranslatedInput::Kind::FocusLost));
          break;
        case SDL_WINDOWEVENT_LEAVE:
          // Nothing is under the pointer any more, unless a drag carries on outside.
          if (buttonsHeld() == 0) out.push_back(mouseInput(kEventMouseMove, XY<int>(-1, -1)));
          break;
        default:
          break;
      }
      break;
    case SDL_MOUSEMOTION:
      if (ev.motion.which == SDL_TOUCH_MOUSEID) break;
      lastPointer_ = toRoot(ev.motion.x, ev.motion.y, g);
      out.push_back(mouseInput(kEventMouseMove, lastPointer_));
      break;
    case SDL_MOUSEBUTTONDOWN:
    case SDL_MOUSEBUTTONUP:
      if (ev.button.which == SDL_TOUCH_MOUSEID) break;
      translateButton(ev.button, ev.type == SDL_MOUSEBUTTONDOWN, g, out);
      break;
    case SDL_MOUSEWHEEL: {
      if (ev.wheel.which == SDL_TOUCH_MOUSEID) break;
      int steps = ev.wheel.y;
      if (ev.wheel.direction == SDL_MOUSEWHEEL_FLIPPED) steps = -steps;
      if (steps != 0) out.push_back(mouseInput(kEventMouseWheel, lastPointer_, steps));
      break;
    }
    case SDL_KEYDOWN:
    case SDL_KEYUP:
      translateKey(ev.key, ev.type == SDL_KEYDOWN, out);
      break;
    case SDL_TEXTEDITING:
      composing_ = ev.edit.text[0] != '\0';
      break;
    case SDL_TEXTINPUT:
      if (dropNextText_) {
        dropNextText_ = false;
        break;
      }
      translateText(ev.text.text, out);
      break;
    default:
      break;
  }
  return out;
}

void SdlInputTranslator::translateButton(const SDL_MouseButtonEvent& b, bool down,
                                         const WindowGeometry& g,
                                         std::vector<TranslatedInput>& out) {
  lastPointer_ = toRoot(b.x, b.y, g);
  ButtonState* self = nullptr;
  ButtonState* partner = nullptr;
  int code = 0;
  switch (b.button) {
    case SDL_BUTTON_LEFT:
      self = &left_;
      partner = &right_;
      code = 0x20;
      break;
    case SDL_BUTTON_RIGHT:
      self = &right_;
      partner = &left_;
      code = 0x40;
      break;
    case SDL_BUTTON_MIDDLE:
      self = &middle_;
      code = 0x10;
      break;
    default:
      return;
  }
  if (down) {
    if (self->down) return;  // a second press without a release: keep the first
    self->down = true;
    self->swallowRelease = false;
    if (partner && partner->down && !chord_) {
      chord_ = true;
      out.push_back(mouseInput(kEventChordDown, lastPointer_));
    } else {
      out.push_back(mouseInput(0x102 | code, lastPointer_));
    }
    return;
  }
  if (!self->down) return;  // pressed outside the window
  self->down = false;
  if (partner && chord_) {
    chord_ = false;
    partner->swallowRelease = true;
    out.push_back(mouseInput(kEventChordUp, lastPointer_));
  } else if (self->swallowRelease) {
    self->swallowRelease = false;
  } else {
    out.push_back(mouseInput(0x101 | code, lastPointer_));
  }
}

void SdlInputTranslator::translateKey(const SDL_KeyboardEvent& k, bool down,
                                      std::vector<TranslatedInput>& out) {
  TranslatedInput mods = simpleInput(TranslatedInput::Kind::Modifiers);
  mods.modifiers = modifierBits(k.keysym.mod);
  out.push_back(mods);

  const unsigned code = keyCodeFor(k.keysym.sym, k.keysym.mod);
  if (code == 0) return;
  if (down && isCharacterKey(k.keysym.sym)) dropNextText_ = true;
  TranslatedInput key = simpleInput(TranslatedInput::Kind::Key);
  key.type = down ? kEventKeyPress : kEventKeyRelease;
  key.keyCode = code;
  out.push_back(key);
}

void SdlInputTranslator::translateText(const char* utf8, std::vector<TranslatedInput>& out) {
  const WString wide = Kw::toWide(utf8);
  const bool composed = composing_;
  composing_ = false;
  if (wide.empty()) return;
  if (wide.size() == 1 && !composed) {
    const unsigned c = static_cast<unsigned>(wide[0]);
    if (c < 32 || c == 127) return;
    TranslatedInput key = simpleInput(TranslatedInput::Kind::Key);
    key.type = kEventKeyPress;
    key.keyCode = c;
    out.push_back(key);
    return;
  }
  TranslatedInput text = simpleInput(TranslatedInput::Kind::ComposedText);
  text.text = Kw::toUtf8(wide);  // invalid bytes become replacement characters
  out.push_back(text);
}
