#pragma once
// A labelled tick box bound to a bool. It is a standard panel (border style, child layout, tab
// order), reports a user toggle to its parent with a message made of a prefix and "TICKED" or
// "CLEAR", and can hand the decision about a click to a user function instead.
//
//   input                                  clicks enabled, active   otherwise
//   left press   (message generation 0)    toggle + report          panel handling
//   left release (message generation 1)    toggle + report          panel handling
//   Return / space                         toggle + report          toggle + report
//
// "Toggle + report" is requestToggleState(): with a user function set, only the function runs.
//
// Choices made here:
// - Appearances: BoxLeft (0) draws the tick box at the left with the label to its right;
//   BoxRight (1) puts the label at the left and the box at the right edge; FlatToggle (2) draws
//   a flat switch (a track whose knob sits left when clear, right and lit when ticked, in the
//   middle for the indeterminate mark) with the label to its right.
// - The tick character 0 (the default) draws the vector tick glyph; any other character is
//   drawn as text, centred in the box, in the tick colour.
// - The indeterminate mark (drawTick(false)) is a horizontal bar; it repaints the box first,
//   so it replaces a tick rather than overlaying it.
// - make's flag1, when non-zero, makes the label bold; calcWidth's bool asks for the width of
//   a bold label.
// - The label is the box's own text (setLabel); the panel title stays free for the panel.
// - The text colour, when clear, is the palette's window text colour unless setTextColour
//   changed it.
// - Copying takes the look and behaviour settings, label and ticked state, not the value
//   binding, tab stops or user function. The copy goes on the same parent canvas at the same
//   place.
// - The box has no dump support, so it is never dumped.
#include <cstdint>

#include "foundation/DataChangeType.h"
#include "foundation/GlobTabStop.h"
#include "foundation/ValWidget.h"
#include "panels/StandardPanel.h"
#include "platform/glib/FontDesc.h"
#include "platform/glib/TextAlignment.h"
#include "platform/kw/SharedRecord.h"

class Checkbox;

struct CheckboxInitArgs;

class Checkbox : public StandardPanel, public ValWidget<bool>, public GlobTabStop {
 public:
  enum eMsgGeneration : int { GenerateOnPress = 0, GenerateOnRelease = 1 };
  enum Appearance : int { BoxLeft = 0, BoxRight = 1, FlatToggle = 2 };
  using UserFunction = void (*)(Checkbox* box, void* data);

  static constexpr const char* kDefaultPrefix = "Checkbox ";
  static constexpr const char* kTickedWord = "TICKED";
  static constexpr const char* kClearWord = "CLEAR";
  // The change type of a user toggle, as the adaptor sees it.
  static constexpr DataChangeType kToggleChange = kChangeUserToggle;
  static constexpr uint16_t kDefaultMargin = 3;
  static constexpr int kBoxSize = 13;      // the tick box, square
  static constexpr int kToggleWidth = 26;  // the flat switch's track
  static constexpr int kToggleHeight = 14;
  static constexpr int kLabelGap = 5;  // between the indicator and the label

  // Everything about a box that is a setting rather than state, with its defaults, written
  // once: boxes left at the defaults share one record, CheckboxInitArgs carries one and copies
  // take it whole. The colours are not here: their defaults come from the palette.
  struct Settings {
    Glib::FontDesc font;
    String msgPrefix = kDefaultPrefix;
    bool appendState = true;
    eMsgGeneration msgGeneration = GenerateOnPress;
    Appearance appearance = BoxLeft;
    UifTypeOfBorder borderStyle = UifBorderNone;
    TextAlignment textAlignment = TextAlignment::Left;
    uint16_t margin = kDefaultMargin;
    bool boldWhenTicked = false;
    bool brighten = true;  // the box lightens under the pointer
    char tickCharacter = 0;

    bool operator==(const Settings&) const = default;
  };

  Checkbox(unsigned short width, unsigned short height, bool ticked, int flag, Canvas* parent);
  Checkbox(const GlobCreationInfo& info, bool ticked);
  explicit Checkbox(const CheckboxInitArgs& args);
  Checkbox(const Checkbox& other);
  Checkbox& operator=(const Checkbox&) = delete;
  ~Checkbox() override;

  // Builds a box with a label and face colour. flag1 makes the label bold; flag2 selects the
  // flat toggle appearance.
  static Checkbox* make(unsigned short width, unsigned short height, const WString& label,
                        bool ticked, const Colour& colour, Canvas* parent, int flag1, int flag2);
  // The width a box needs to show `label` in full with that border and appearance.
  static unsigned short calcWidth(const WString& label, UifTypeOfBorder border,
                                  Appearance appearance, bool bold);

  // --- Operations check boxes add, in this order ---
  // The user asked for a toggle: the user function decides when there is one; otherwise the
  // state flips and the toggle message goes to the parent, which may delete the box.
  virtual void requestToggleState();
  // Shows `value` and, when the bound model holds another value, asks it to take this one.
  virtual void setState(bool value);
  // true: the tick; false: the indeterminate mark.
  virtual void drawTick(bool full);
  virtual void drawTickBox();
  virtual Colour getTextColour();
  virtual void setStateInternal(bool value);

  // Calls setState(value) when `notify`, else only stores the state (no redraw, no request).
  void setState(bool value, bool notify);
  bool getState() const { return ticked; }

  // --- Glob and panel ---
  int react(Event* e) override;
  void setActive(bool active, bool redraw) override;
  void handle_kbd_focus() override;
  void handleMouseContainment(bool inside) override;
  void setBorderStyle(UifTypeOfBorder border) override;
  void drawBackground() override;
  void draw() override;
  const char* idstring() const override { return "checkbox"; }
  String describeValue() const override;

  // --- Value: the ticked flag ---
  bool getWidgetValue() override { return ticked; }
  void setNewWidgetValue(bool& value) override { setState(value); }
  void setEnabledState(bool enabled) override { setActive(enabled, true); }

  // --- Reporting ---
  void setMsgPrefix(const String& prefix, bool appendState = true);
  const String& getMsgPrefix() const { return settings_->msgPrefix; }
  bool getAppendState() const { return settings_->appendState; }
  // The prefix, then the state word when `withState`.
  String toggleMessage(bool withState) const;
  // Sends toggleMessage(withState) to the parent as a message event; false with no parent.
  // The receiver runs before this returns and may delete the box.
  bool sendToggleMessage(bool withState);
  void setMessageGeneration(eMsgGeneration generation);
  eMsgGeneration getMessageGeneration() const { return settings_->msgGeneration; }
  void setClicksEnabled(bool enabled) { clicksEnabled = enabled; }
  bool getClicksEnabled() const { return clicksEnabled; }
  void setUserFunction(UserFunction fn, void* data);
  UserFunction getUserFunction() const { return userFunction; }
  void* getUserData() const { return userData; }

  // --- Look ---
  void setLabel(WString text);
  const WString& getLabel() const { return label_; }
  void setFont(const Glib::FontDesc& desc);
  const Glib::FontDesc& getFont() const { return settings_->font; }
  void setTextColourWhenTicked(const Colour& c);
  const Colour& getTextColourWhenTicked() const { return textColourWhenTicked; }
  void setTextColour(const Colour& c);
  void setAppearance(Appearance a);
  Appearance getAppearance() const { return settings_->appearance; }
  void setTextAlignment(TextAlignment a);
  TextAlignment getTextAlignment() const { return settings_->textAlignment; }
  void setMargin(uint16_t m);
  uint16_t getMargin() const { return settings_->margin; }
  void setBoldWhenTicked(bool b);
  bool getBoldWhenTicked() const { return settings_->boldWhenTicked; }
  // Whether the box lightens under the pointer.
  void setBrighten(bool b);
  void setTickCharacter(char c);
  char getTickCharacter() const { return settings_->tickCharacter; }
  const Settings& settings() const { return *settings_; }
  bool isMouseInside() const { return mouseInside; }

  // Where the indicator (tick box or switch track) and the label go, in the box's coordinates.
  Kw::Box<int> indicatorBox() const;
  Kw::Box<int> labelBox() const;

 protected:
  // The text colour over window shade 3 for the given enablement.
  Colour textColourFor(bool enabled) const;
  // The well or track, empty, in its hover and enablement look.
  void paintIndicatorWell();
  void drawLabel();
  // The font the label shows in now (bold while ticked when asked).
  Glib::FontDesc labelFont() const;

 private:
  void init(bool initialTicked);
  void applyArgs(const CheckboxInitArgs& args);
  void copySettingsFrom(const Checkbox& other);
  int reactToLeftButton(Event* e);
  static int indicatorWidth(Appearance a);

  bool ticked = false;
  // Every box has its own label, so it lives here and not in the shared settings.
  WString label_;
  Kw::SharedRecord<Settings> settings_;
  bool clicksEnabled = true;  // changes with the box's part in a radio row, so kept apart
  UserFunction userFunction = nullptr;
  void* userData = nullptr;
  Colour textColourWhenTicked;
  Colour textColour;
  bool mouseInside = false;
};

// Everything a check box is made from: where it goes, whether it starts ticked, and its
// settings.
struct CheckboxInitArgs : GlobCreationInfo {
  bool ticked = false;
  WString label;
  Checkbox::Settings settings;
  bool clicksEnabled = true;

  CheckboxInitArgs() = default;
  CheckboxInitArgs(const WString& label, bool tick, const GlobCreationInfo& where)
      : GlobCreationInfo(where), ticked(tick), label(label) {}
};
