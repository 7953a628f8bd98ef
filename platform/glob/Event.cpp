#include "platform/glob/Event.h"

#include "platform/glob/Glob.h"

void Event::setSender(Glob* g) {
  sender_ = g;
  senderSerial_ = g ? g->serial() : 0;
}

Glob* Event::senderIfAlive() const {
  return sender_ && glob_serial_is_alive(sender_, senderSerial_) ? sender_ : nullptr;
}

bool mouse_event(const Event* e) {
  return e && (e->type & 0xF00) == 0x100;
}
bool mouse_left_event(const Event* e) {
  return mouse_event(e) && (e->type & 0xF0) == 0x20;
}
bool mouse_right_event(const Event* e) {
  return mouse_event(e) && (e->type & 0xF0) == 0x40;
}
bool mouse_middle_event(const Event* e) {
  return mouse_event(e) && (e->type & 0xF0) == 0x10;
}
bool mouse_chord_event(const Event* e) {
  return mouse_event(e) && (e->type & 0xF0) == 0x80;
}
bool mouse_down_event(const Event* e) {
  return mouse_event(e) && (e->type & 0xF) == 2;
}
bool mouse_up_event(const Event* e) {
  return mouse_event(e) && (e->type & 0xF) == 1;
}
bool mouse_move_event(const Event* e) {
  return mouse_event(e) && (e->type & 0xF) == 3;
}
bool mouse_wheel_event(const Event* e) {
  return e && e->type == kEventMouseWheel;
}
bool key_event(const Event* e) {
  return e && (e->type & 0xF00) == 0x200;
}
bool key_press_event(const Event* e) {
  return e && e->type == kEventKeyPress;
}
bool tick_event(const Event* e) {
  return e && (e->type & kEventTick) != 0 && e->type != kEventMessage;
}
bool message_event(const Event* e) {
  return e && e->type == kEventMessage;
}

Glob* event_to_sender_glob(const Event* e) {
  return e ? e->senderIfAlive() : nullptr;
}
