#pragma once
// The operating-system service: the state of the keyboard's modifier keys. The window back end
// keeps it current; tests set it directly.

class OSKeyboard {
 public:
  // Modifier key codes, the same bits that key codes carry.
  static constexpr unsigned kShift = 0x01000000;
  static constexpr unsigned kCtrl = 0x02000000;
  static constexpr unsigned kAlt = 0x04000000;

  // True when the modifier key named by `key` (one of the codes above) is held.
  bool isKeyDown(unsigned key) const { return (modifiers_ & key) != 0; }
  unsigned modifiers() const { return modifiers_; }
  void setModifiers(unsigned mods) { modifiers_ = mods & (kShift | kCtrl | kAlt); }

 private:
  unsigned modifiers_ = 0;
};

class OSService {
 public:
  OSKeyboard& keyboard() { return keyboard_; }

 private:
  OSKeyboard keyboard_;
};

// The process's operating-system service.
OSService* OS();
