#pragma once
// An event travelling through the Glob tree: input, ticks and string messages.
#include <cstdint>

#include "platform/kw/String.h"
#include "platform/kw/XY.h"

class Canvas;
class Glob;

// Event type codes. Mouse codes are 0x1BA: B names the button (0x10 middle, 0x20 left,
// 0x40 right, 0x80 chord of left and right, 0 none) and A the action (1 release, 2 press,
// 3 move, 4 wheel).
enum EventType : int {
  kEventMouseMove = 0x103,
  kEventMouseWheel = 0x104,
  kEventMiddleUp = 0x111,
  kEventMiddleDown = 0x112,
  kEventMiddleMove = 0x113,
  kEventLeftUp = 0x121,
  kEventLeftDown = 0x122,
  kEventLeftMove = 0x123,
  kEventRightUp = 0x141,
  kEventRightDown = 0x142,
  kEventRightMove = 0x143,
  kEventChordUp = 0x181,
  kEventChordDown = 0x182,
  kEventChordMove = 0x183,
  kEventKeyPress = 0x200,
  kEventKeyRelease = 0x201,
  kEventTick = 0x1000,
  kEventMessage = 0x4001,
};

// Interest bits a Glob subscribes to with set_interest.
constexpr int kInterestTicks = 0x1000;

// Modifier and flag bits carried in key codes.
constexpr unsigned kKeyShift = 0x01000000;
constexpr unsigned kKeyCtrl = 0x02000000;
constexpr unsigned kKeyAlt = 0x04000000;
constexpr unsigned kKeyScanCode = 0x08000000;
// Marks the three clipboard shortcuts: Ctrl+C, Ctrl+X and Ctrl+V arrive as
// kKeyClipboard | kKeyCtrl | the upper-case letter (Ctrl+C = 0x22000043), Shift added when held.
// Every other Ctrl or Alt combination with a character key is the modifier bits | the character,
// letters upper-cased (Ctrl+Z = 0x0200005A). Characters typed without Ctrl or Alt arrive as the
// bare character, with no modifier bits: the character already says whether Shift was held.
constexpr unsigned kKeyClipboard = 0x20000000;
constexpr unsigned kKeyModifierMask = kKeyShift | kKeyCtrl | kKeyAlt;

// The message carrying text composed by an input method (or several characters committed at
// once). It goes to the keyboard focus; the composed UTF-8 text is the event's payload().
constexpr const char* kMsgCompoundTextInput = "CompoundTextInput";

class Event {
 public:
  Event() = default;
  explicit Event(int type) : type(type) {}

  int type = 0;
  // Second word: the key code of a key event, the modifier word of a message event, the
  // signed step count of a wheel event.
  uint32_t word2 = 0;
  XY<int> pos;        // in the receiving canvas, bottom-left origin
  XY<int> screenPos;  // in the root
  XY<int> pressPos;   // root position of the press that started a drag
  Canvas* canvas = nullptr;
  Glob* dest = nullptr;

  // Message text.
  const char* msg() const { return text_.c_str(); }
  const String& text() const { return text_; }
  void message(const String& m) { text_ = m; }
  // Data that travels with a message beside its text, for messages whose text only names them
  // (kMsgCompoundTextInput carries the composed UTF-8 text here). Empty for most messages.
  const String& payload() const { return payload_; }
  void setPayload(const String& data) { payload_ = data; }

  // Pointer offset from the press point.
  XY<int> distance() const { return screenPos - pressPos; }
  unsigned keyCode() const { return word2; }
  int wheelSteps() const { return static_cast<int32_t>(word2); }

  // The sender of a message: kept with its serial so that a sender deleted since is seen as
  // gone (event_to_sender_glob).
  void setSender(Glob* g);
  Glob* senderIfAlive() const;

 private:
  String text_;
  String payload_;
  Glob* sender_ = nullptr;
  uint64_t senderSerial_ = 0;
};

bool mouse_event(const Event* e);
bool mouse_left_event(const Event* e);
bool mouse_right_event(const Event* e);
bool mouse_middle_event(const Event* e);
bool mouse_chord_event(const Event* e);
bool mouse_down_event(const Event* e);
bool mouse_up_event(const Event* e);
bool mouse_move_event(const Event* e);
bool mouse_wheel_event(const Event* e);
bool key_event(const Event* e);
bool key_press_event(const Event* e);
bool tick_event(const Event* e);
bool message_event(const Event* e);

// The Glob that sent a message event, or null when there is none or it has been deleted.
Glob* event_to_sender_glob(const Event* e);
