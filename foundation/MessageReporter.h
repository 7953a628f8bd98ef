#pragma once
// How a control tells the code around it what the user did: a message event sent synchronously
// to its parent or, for a control without one, to the Glob it lies on. Every control keeps one
// of these for its message string and the modifier word of the last reported press.
#include <cstdint>

#include "platform/glob/Glob.h"
#include "platform/kw/String.h"

class MessageReporter {
 public:
  // Bits of the modifier word, copied from the two modifier keys at a press.
  static constexpr uint32_t kFirstModifierBit = 1u << 24;   // key 0x1000000
  static constexpr uint32_t kSecondModifierBit = 1u << 25;  // key 0x2000000

  void set_message(const char* msg) { message_ = msg ? msg : ""; }
  const String& message() const { return message_; }

  // Clears the modifier word, then records which of the two modifier keys are held now.
  void captureModifiers();
  void clearModifiers() { modifiers_ = 0; }
  uint32_t modifiers() const { return modifiers_; }

  // Where `self` reports to: its parent; else the nearest Glob it lies inside (negative pseudo
  // distance); else null.
  static Glob* target(Glob& self);

  // Sends `msg` (the message string when empty) to target(self) as a message event carrying the
  // modifier word, and returns whether anything was sent. The receiver runs before this returns
  // and may delete `self`, and with it this reporter: callers check before touching either.
  bool report(Glob& self, const String& msg) const;

 private:
  String message_;
  uint32_t modifiers_ = 0;
};
