#pragma once
// The push button, and the base of every button-like control. One class covers three
// behaviours chosen by settings:
//
//   kind       press                     release                 drag past the threshold
//   plain      down, reports message     up, silent              -
//   latching   toggles, " on" / " off"   nothing                 -
//   pressure   down, " pressed"          up, " released"         up, " dragged" (no release report)
//
// A held button with a repeat rate reports its plain message again from the ticks. Return and
// space activate a focused button by a synthesised press and release at its centre.
//
// Decisions where the behaviour was left open:
// - button_style: kButtonStyleFlat (0) draws the face with a one-pixel outline and no bevel;
//   kButtonStyleBevelled (1, the default) and any other value draw the bevelled face.
// - set_latching(true, true) (latching 2) is a latching button whose face shows a highlight
//   lamp along its bottom edge while it is down; it behaves exactly like latching 1.
// - set_procedure: the callback of the older interface paints extra content. draw() calls it
//   last, with the face box and the state, on the Glob's own canvas.
// - The constructors' flag is the Glob creation flag word; post_init maps the canvas anyway.
// - set_state keeps the palette roles other than text and face (bevel, focus, highlight...)
//   when it applies the state's colours.
// - A button made inactive while a pressure press is tracked stops tracking silently, and one
//   subscribed to ticks for repeating leaves them.
// - Only the bare key codes 13 and 32 activate; with a modifier held they go to the parent.
// - set_repeating: a rate above 1000 per second keeps the shortest interval, 1 ms, rather than
//   none; a delay that is negative or not a number counts as 0 (with a diagnostic).
// - Receiving the tab focus takes the keyboard focus, so that Return and space reach it.
// - The drag threshold is one setting for all buttons (dragThreshold, 3 pixels at start).
// - Labels are drawn on one line: control characters show as spaces and text beyond 512
//   characters is not laid out; what does not fit is clipped at the button's edge.
// - The keyboard focus shows as a focus-coloured outline and a dotted mark inside the bevel.
// - set_state with a value other than up or down is refused with a diagnostic.
// - Copying copies the look and behaviour settings (label, message, colours, latching,
//   pressure, repeat...), not the state, the value binding or the tab stops. A copy is made on
//   the same parent canvas, at the same place and size.
#include <cstdint>
#include <functional>
#include <memory>

#include "buttons/ButtonSettings.h"
#include "foundation/ButtonWidget.h"
#include "foundation/GlobTabStop.h"
#include "foundation/MessageReporter.h"
#include "foundation/MessageSuffixes.h"
#include "foundation/rect.h"
#include "platform/glib/TextAlignment.h"
#include "platform/glib/TextStyles.h"
#include "platform/glib/look/ButtonLook.h"
#include "platform/kw/SharedRecord.h"

// The callback of the older interface: paints over the face box for the given state.
using ButtonProcedure = std::function<void(const Kw::Box<int>& face, button_state state)>;

// Everything a button is made from: where it goes (the creation record, palette included), its
// label and message, and its settings. The repeat is given as set_repeating takes it: reports
// per second and a delay in seconds (a rate of 0 or less for none).
struct ButtonInitArgs : GlobCreationInfo {
  WString label;
  String message;
  ButtonSettings settings;
  int repeatRate = 0;
  double repeatDelay = 0.0;
  bool ignoreMouseClicks = false;

  ButtonInitArgs() = default;
  ButtonInitArgs(const WString& l, const String& msg, const GlobCreationInfo& where)
      : GlobCreationInfo(where), label(l), message(msg) {}
};

namespace Glib {
class Image;
class Painter;
}  // namespace Glib

class Button : public rect, public ButtonWidget<WString>, public GlobTabStop {
 public:
  static constexpr double brightenFactor_ = Glib::ButtonLook::kHoverBrighten;
  // The thinner bevel of the small buttons of a panel's title strip.
  static constexpr int kTitleBevelWidth = 2;

  // The label is taken over (moved in) when given a temporary.
  Button(WString label, const String& message, const GlobCreationInfo& info);
  Button(const WString& label, const char* message, unsigned short width, unsigned short height,
         int flag, Canvas* parent);
  explicit Button(const ButtonInitArgs& args);
  Button(const Button& other);
  Button& operator=(const Button& other);
  ~Button() override;

  // --- Operations buttons add, in this order ---
  virtual void setString(const WString& s);
  virtual void set_state(button_state newState, bool redraw);
  // Changes the state the way a press does, reporting unless `silent`. The receiver of the
  // report may delete the button: callers check it is alive before touching it again.
  virtual void switch_state(button_state newState, bool silent);
  virtual void drawBackground();
  virtual void drawEdge();
  virtual void drawText();
  virtual Colour edgeColour();

  // --- Glob ---
  int react(Event* e) override;
  // The face and whatever a subclass adds round it (facepath, addpath).
  Kw::Ptr<iRegion> path() override;
  void handle_kbd_focus() override;
  void setActive(bool active, bool redraw) override;
  // Sets the face colour of both states.
  void setCol(const Colour& colour, bool redraw) override;
  void draw() override;
  const char* idstring() const override { return "button"; }
  // The label, or the up icon's name for a button without one.
  String describeValue() const override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  void handleMouseContainment(bool inside) override;

  // --- Value: the label ---
  WString getWidgetValue() override { return label; }
  void setNewWidgetValue(WString& value) override;
  void setEnabledState(bool enabled) override { setActive(enabled, true); }

  // --- Reporting ---
  // Sends `msg` (the button's message when empty) to the parent as a message event. The
  // receiver runs before this returns and may delete the button.
  void informParent(const String& msg);
  void set_message(const char* msg) { reporter_.set_message(msg); }
  const String& get_message() const { return reporter_.message(); }
  uint32_t getModifiers() const { return reporter_.modifiers(); }

  // --- Settings ---
  const WString& getString() const { return label; }
  void setDownString(const WString& s);
  const WString& getDownString() const { return settings_->downLabel; }
  void set_up_icon(const char* name);
  void set_down_icon(const char* name);
  const String& get_up_icon() const { return settings_->upIcon; }
  const String& get_down_icon() const { return settings_->downIcon; }

  void set_latching(bool latch, bool option = false);
  bool get_latching() const { return settings_->latching != kNotLatching; }
  button_latching getLatchingMode() const { return settings_->latching; }
  void set_pressure_button(int on);
  button_pressure get_pressure() const {
    return tracking_ ? kPressureTracking : settings_->pressure ? kPressureOn : kPressureOff;
  }
  // `rate` reports per second while held, starting `delay` seconds after the press; both are
  // halved (the ticks of the older timer ran at twice the rate). A rate of 0 or less stops
  // repeating.
  void set_repeating(int rate, double delay);
  int getRepeatInterval() const { return settings_->repeatInterval; }
  int getRepeatDelay() const { return settings_->repeatDelay; }

  void set_ignore_mouse_clicks(int ignore);
  int get_ignore_mouse_clicks() const { return ignoreMouseClicks ? 1 : 0; }

  void set_style(button_style s);
  button_style get_style() const { return settings_->style; }
  button_state get_state() const { return state; }
  int get_bevel_width() const { return settings_->bevelWidth; }
  // Negative widths are refused.
  void set_bevel_width(int w);
  int get_brightening() const { return settings_->brightening; }
  void set_brightening(int b);
  void set_ranged_left(int left);
  void setTextAlignment(TextAlignment a);
  TextAlignment getTextAlignment() const { return settings_->textAlignment; }
  void setTextStyle(Glib::TextStyles::TextStyle s);
  Glib::TextStyles::TextStyle getTextStyle() const { return settings_->textStyle; }
  const ButtonSettings& settings() const { return *settings_; }
  void set_procedure(ButtonProcedure procedure);
  bool isMouseInside() const { return mouseInside; }

  // --- Colours ---
  const Colour& get_forecol() const;
  // The face colour of the state, brightened while the pointer is over an active button.
  Colour get_backcol() const;
  void setcols(const Colour& fore, const Colour& back);
  void set_upcols(const Colour& fore, const Colour& back);
  void set_downcols(const Colour& fore, const Colour& back);
  const Colour& getUpForeCol() const { return upForeCol; }
  const Colour& getDownForeCol() const { return downForeCol; }
  const Colour& getUpBackCol() const { return upBackCol; }
  const Colour& getDownBackCol() const { return downBackCol; }

  // --- The drag threshold shared by every pressure button, in pixels (3 at start) ---
  static int dragThreshold() { return dragThreshold_; }
  // Negative values are refused.
  static bool setDragThreshold(int pixels);

 protected:
  // The box inside the bevel where labels and icons go.
  Kw::Box<int> contentBox() const;
  // The label the state shows: the down label while down, when there is one.
  const WString& shownLabel() const;
  // The face and label colours as drawn: the state's, dimmed while inactive.
  Colour faceColour() const;
  Colour labelColour() const;
  // Where a symbol glyph standing for the label goes: the middle half of the button, nudged
  // like a label while pressed.
  Kw::Box<int> symbolBox() const;
  // Draws the picture inside the bevel (shrunk to fit when larger), centred when `alone` and
  // at the left of the room otherwise; returns the x just right of it.
  int drawIcon(Glib::Painter& p, const Glib::Image& img, bool alone);

 private:
  void init();
  void post_init();
  void applySettings(const ButtonInitArgs& args);
  void copySettingsFrom(const Button& other);
  void applyStatePalette();
  int reactWhileTracking(Event* e);
  int reactToTick();
  int reactToPress(Event* e);
  int reactToRelease(Event* e);
  int activateFromKeyboard();
  // Sends a synthesised left-button event of `type` at the centre; false when the button was
  // deleted meanwhile.
  bool sendCentreEvent(int type);

  WString label;
  Kw::SharedRecord<ButtonSettings> settings_;
  button_state state = kButtonUp;
  bool tracking_ = false;  // a pressure press is being tracked
  bool ignoreMouseClicks = false;
  bool firstRepeat = false;
  bool mouseInside = false;
  int lastRepeatTime = 0;
  Colour upForeCol;
  Colour downForeCol;
  Colour upBackCol;
  Colour downBackCol;
  MessageReporter reporter_;  // the message string and the modifier word
  // Few buttons draw through a procedure of their own: a pointer until one is set.
  std::unique_ptr<ButtonProcedure> procedure_;

  static int dragThreshold_;
};
