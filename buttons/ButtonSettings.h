#pragma once
// Everything about a button that is a setting rather than state, with its defaults, written
// once. A button holds its settings as one shared record (buttons left at the defaults share a
// single instance), ButtonInitArgs carries one, and copying a button copies it whole. The
// colours are not here: their defaults come from the palette the button is made with.
#include "platform/glib/TextAlignment.h"
#include "platform/glib/TextStyles.h"
#include "platform/kw/String.h"

enum button_state : int { kButtonUp = 0, kButtonDown = 1 };

enum button_style : int { kButtonStyleFlat = 0, kButtonStyleBevelled = 1 };

// How a button latches; the numbers are those getLatchingMode reports.
enum button_latching : int {
  kNotLatching = 0,
  kLatching = 1,
  kLatchingWithLamp = 2,  // set_latching(true, true): a lamp shows while it is down
};

// What get_pressure reports: off, on, or a press being tracked.
enum button_pressure : int { kPressureOff = 0, kPressureOn = 1, kPressureTracking = -1 };

struct ButtonSettings {
  WString downLabel;  // shown while down, when not empty
  String upIcon;
  String downIcon;
  button_style style = kButtonStyleBevelled;
  int bevelWidth = 4;
  TextAlignment textAlignment = TextAlignment::Centred;
  button_latching latching = kNotLatching;
  bool pressure = false;
  int brightening = 1;  // non-zero: the face brightens under the pointer
  Glib::TextStyles::TextStyle textStyle = Glib::TextStyles::Normal;
  int repeatInterval = 0;  // milliseconds between repeats while held; 0 for none
  int repeatDelay = 0;     // milliseconds before the first repeat

  bool operator==(const ButtonSettings&) const = default;
};
