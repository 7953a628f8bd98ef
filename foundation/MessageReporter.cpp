#include "foundation/MessageReporter.h"

#include "platform/os/OS.h"

void MessageReporter::captureModifiers() {
  modifiers_ = 0;
  const OSKeyboard& kb = OS()->keyboard();
  if (kb.isKeyDown(0x1000000)) modifiers_ |= kFirstModifierBit;
  if (kb.isKeyDown(0x2000000)) modifiers_ |= kSecondModifierBit;
}

Glob* MessageReporter::target(Glob& self) {
  if (Glob* p = self.parent()) return p;
  Glob* nearest = find_nearest_glob(&self, nullptr);
  if (nearest && glob_pseudo_distance(&self, nearest) < 0.0) return nearest;
  return nullptr;
}

bool MessageReporter::report(Glob& self, const String& msg) const {
  Glob* to = target(self);
  if (!to) return false;
  // The event names the reporting control's canvas, not the receiver's: receivers that look
  // at where a report came from find the control there.
  Event e = make_message_event(&self, to, msg.empty() ? message_ : msg, modifiers_);
  e.canvas = self.canvas();
  event_send(&e, false);
  return true;
}
