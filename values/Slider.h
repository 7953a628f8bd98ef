#pragma once
// A horizontal or vertical slider for a double: a groove with a draggable thumb and an optional
// point of interest that a click beside the thumb jumps to. It reports to its parent with
// "slider <position>" and "slider_released <position>" (the position in "%lf" form), either
// synchronously or queued, and publishes values through its ValWidget<double> side.
//
//   input                           state          does
//   press within the thumb (+2 px)  thumb shown    picks the thumb up, keeping the pointer's
//                                                  offset from the thumb's centre
//   chord (both buttons)            thumb shown    thumb to pointer + offset; both reports and
//                                                  a direct change if it moved
//   move                            picked         thumb to pointer + offset; both reports and a
//                                                  drag start, then drag steps, if it moved
//   release                         picked         "slider_released"; a drag release if it moved
//   left press beside the thumb     thumb shown    jumps to the point of interest, if there is
//                                                  one and it is elsewhere; ends the pick-up
//   arrows / Page Up, Down          focused        step by a hundredth / a tenth of the range
//   Home / End                      focused        the ends of the range
//
// A release leaves the thumb picked, with its offset: later moves over the slider go on
// dragging it until a jump to the point of interest ends the pick-up. Every step sends both
// reports. Values pushed by the model are clamped to the range and send nothing.
//
// Decisions where the behaviour was left open:
// - The constructors' flag says whether the slider is vertical.
// - Mapping runs left to right and bottom to top: the minimum is at the left or bottom end.
// - Keys: Right and Up step up, Left and Down step down, Page Up and Page Down step by a tenth
//   of the range, Home and End go to the minimum and maximum; each change is clamped to the
//   range, sends both reports and publishes a direct change. A press on the slider takes the
//   keyboard focus. A hidden thumb takes no keys.
// - An inactive slider ignores the pointer and keys, and draws faded.
// - Hiding the thumb ends a pick-up.
// - Bad input: setValueRange with min >= max or a bound that is not finite, setPosition with a
//   value that is not finite, and a point of interest that is not finite are refused with a
//   diagnostic and change nothing; resize with a size that is not finite is refused likewise.
// - Drawing: the groove runs along the half of the slider across from the thumb area (the
//   upper or right half); the thumb block fills the thumb area and its needle crosses the
//   groove; the point of interest is a short mark on the far side of the groove. The thumb
//   brightens while the pointer is over the slider.
#include "foundation/GlobTabStop.h"
#include "foundation/ValWidget.h"
#include "platform/glob/Glob.h"
#include "values/Orientation.h"

// Everything a slider is made from: where it goes and its settings.
struct SliderInitArgs : GlobCreationInfo {
  bool vertical = false;
  double minValue = 0.0;
  double maxValue = 1.0;
  double position = 0.0;
  bool hasPointOfInterest = false;
  double pointOfInterest = 0.0;
  bool synchronousMessages = false;
  bool thumbVisible = true;
  bool hasThumbColour = false;
  Colour thumbColour;

  SliderInitArgs() = default;
  explicit SliderInitArgs(const GlobCreationInfo& where, bool isVertical = false)
      : GlobCreationInfo(where), vertical(isVertical) {}
};

class Slider : public Glob, public ValWidget<double>, public GlobTabStop {
 public:
  // Offered to clients that announce a pick-up of their own; the slider does not send it.
  static const char* const thumbPickedMsg;
  static const char* const sliderMsg;
  static const char* const sliderReleasedMsg;

  // Size limits applied by resize: along the track and across it.
  static constexpr int kMaxHorizontalLength = 1000;
  static constexpr int kMaxVerticalLength = 800;
  static constexpr int kMinAcross = 6;
  static constexpr int kMaxAcross = 50;

  Slider(unsigned short width, unsigned short height, bool vertical, Canvas* parent);
  explicit Slider(const SliderInitArgs& args);

  // Refused (false, nothing changed) unless min < max, both finite.
  bool setValueRange(double min, double max);
  double getMinValue() const { return minValue; }
  double getMaxValue() const { return maxValue; }
  // Stores `v` unclamped; false when it is within 1e-6 of the current position (or refused).
  bool setPosition(double v);
  double getPosition() const { return position; }
  void setOrientation(Orientation o);
  Orientation getOrientation() const { return vertical ? kVertical : kHorizontal; }
  void setThumbVisibility(bool visible);
  bool getThumbVisibility() const { return thumbVisible; }
  void setThumbColour(const Colour& c);
  const Colour& getThumbColour() const { return thumbColour; }
  // Returns the pixel along the track where the point lies.
  double setPointOfInterest(double v);
  double getPointOfInterest() const { return pointOfInterest; }
  bool hasPointOfInterestSet() const { return hasPointOfInterest; }
  void removePointOfInterest();
  void setSynchronousMessages(bool sync) { synchronousMessages = sync; }
  bool getSynchronousMessages() const { return synchronousMessages; }
  bool isThumbPicked() const { return thumbPicked; }
  double getStartPixel() const { return startPixel; }
  double getEndPixel() const { return endPixel; }

  // Resizes, clamping the size to the limits of the orientation first.
  void resize(double width, double height);

  // --- Glob ---
  int react(Event* e) override;
  void reshape() override;
  void draw() override;
  const char* idstring() const override { return "slider"; }
  String describeValue() const override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  void handleMouseContainment(bool inside) override;
  void handle_kbd_focus() override { update(); }
  void setActive(bool active, bool redraw) override;

  // --- Value ---
  double getWidgetValue() override { return position; }
  void setNewWidgetValue(double& value) override;
  void setEnabledState(bool enabled) override { setActive(enabled, true); }

 protected:
  double x2v(double pixel) const;
  double v2x(double value) const;
  bool isWithinThumb(const XY<int>& point) const;
  void pickUpThumb(Event* e);
  bool setSliderFromPixelPos(Event* e);
  // Sends "slider" (or "slider_released" when `changeType` is 2) with the position. The
  // receiver of a synchronous report may delete the slider.
  virtual void informParent(int changeType);

 private:
  void init(bool isVertical);
  void applySettings(const SliderInitArgs& args);
  void recalculateStartAndEnd();
  Kw::Box<short> getThumbArea() const;
  int trackLength() const { return vertical ? height() : width(); }
  int acrossExtent() const { return vertical ? width() : height(); }
  int along(const XY<int>& p) const { return vertical ? p.y : p.x; }
  // A box given along and across the track, in the slider's own coordinates.
  Kw::Box<int> oriented(int along0, int across0, int along1, int across1) const;
  // The band across the whole slider that the thumb at `value` paints.
  Kw::Box<int> thumbBand(double value) const;
  void redrawThumbMove(double from, double to);
  // setPosition's checks and move; `repaint` false while being built (the whole slider was
  // damaged when it was put on its parent).
  bool movePosition(double v, bool repaint);
  int handleMouseEvent(Event* e);
  int handleKey(unsigned key);
  // Reports a user change (both reports) and publishes it; false when the slider is gone.
  bool reportChange(DataChangeType why);
  bool publish(double value, DataChangeType why);

  // The fields of the given interface, in its order.
  bool synchronousMessages = false;
  double startPixel = 0.0;
  double endPixel = 0.0;
  double minValue = 0.0;
  double maxValue = 1.0;
  double position = 0.0;
  double pointOfInterest = 0.0;
  bool hasPointOfInterest = false;
  Colour thumbColour;
  int thumbHalfSize = 6;
  int grabOffset = 0;
  bool thumbVisible = true;
  DataChangeType pendingChangeType = kChangeUserToggle;
  bool vertical = false;
  bool thumbPicked = false;

  bool mouseInside_ = false;
  bool buttonHeld_ = false;  // for drawing the held thumb only
};
