#pragma once
// A horizontal or vertical scroll bar: two arrow buttons, a trough and a thumb whose start and
// length are fractions of the whole. It scrolls nothing itself: it tells its parent what the
// user did with messages sent synchronously, and the parent answers during the call by setting
// the thumb; the bar then redraws what the answer changed.
//
//   input                          does
//   arrow button (and its repeat)  up/down or left/right "ButtonPressed" to the parent
//   wheel, n steps                 |n| up (n >= 1) or down (n < 1) reports
//   press on the thumb             starts a move, or a resize on a resizable thumb's 8-pixel end
//   drag while moving/resizing     moves the thumb (or grows/shrinks it about its centre),
//                                  "thumbMoved"
//   left press in the trough       pages by the thumb's size toward the pointer, "thumbMoved";
//                                  again after 300 ms, then every 100 ms, while the pointer is
//                                  still beyond the thumb
//   release                        stops paging; "thumbReleased" after a move or resize
//
// Presses do nothing while the thumb fills the bar (size 1) or the bar is inactive.
//
// Decisions where the behaviour was left open:
// - The bar is always thickness() (16) pixels thick; its arrow buttons are squares of that
//   side at its two ends, and the trough lies between them. resize keeps the thickness and
//   makes the bar at least minSizePixels() long. A thumb is at least minThumbSize_ long.
// - Vertical bars run downward: position 0 puts the thumb at the top.
// - The constructor's two colours are the thumb's and the buttons' faces; its number is the
//   bar's length and its flag makes the thumb resizable.
// - setThumbPos and setThumbSize refuse values that are not finite, and setThumbSize refuses
//   sizes below 0, with a diagnostic; a size above 1 is taken as 1. Both repaint the thumb when
//   they change it, so a parent may set the thumb at any time.
// - The thumb as a model value: the bar shows what the adaptor pushes, and publishes the thumb
//   after its own changes (paging as a direct change; a drag as start, steps and a release).
//   The arrow buttons and the wheel only ask the parent; they publish nothing.
// - A drag step reports "thumbMoved" only when the pointer moved a whole pixel along the bar.
// - Becoming inactive ends a move, a resize or paging without a report, and makes the arrow
//   buttons inactive too.
#include "buttons/Button.h"
#include "foundation/ThumbSettings.h"
#include "foundation/ValWidget.h"
#include "foundation/rect.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/NumRange.h"
#include "values/Orientation.h"
#include "values/ScrollBarGeometry.h"

class ScrollBarArrow;

// Everything a scroll bar is made from: where it goes and its settings.
struct ScrollBarInitArgs : GlobCreationInfo {
  Orientation orientation = kVertical;
  bool resizableThumb = false;
  bool hasThumbColour = false;
  Colour thumbColour;
  bool hasButtonColour = false;
  Colour buttonColour;

  ScrollBarInitArgs() = default;
  ScrollBarInitArgs(const GlobCreationInfo& where, Orientation o)
      : GlobCreationInfo(where), orientation(o) {}
};

class ScrollBar : public rect, public ValWidget<ThumbSettings> {
 public:
  static constexpr int resizeHandleSize_ = 8;
  static constexpr int decreaseEnd_ = -1;
  static constexpr int increaseEnd_ = 1;
  static constexpr int minThumbSize_ = 20;

  static const String thumbMovedMsg;
  static const String thumbReleasedMsg;
  static const String leftButtonPressedMsg;
  static const String rightButtonPressedMsg;
  static const String upButtonPressedMsg;
  static const String downButtonPressedMsg;
  static bool isScrollBarMsg(const String& msg);

  // What the arrow buttons send to the bar.
  static constexpr const char* kDecMsg = "dec";
  static constexpr const char* kIncMsg = "inc";

  ScrollBar(Orientation orientation, const Colour& thumbCol, const Colour& buttonCol,
            unsigned int length, bool resizable, Canvas* parent);
  explicit ScrollBar(const ScrollBarInitArgs& args);

  static int thickness() { return 16; }
  static int minSizePixels() { return 2 * thickness() + minThumbSize_; }

  bool setThumbPos(double v);
  bool setThumbSize(double s);
  bool setThumbPosDelta(double d) { return setThumbPos(thumbPos + d); }
  double getThumbPos() const { return thumbPos; }
  double getThumbSize() const { return thumbSize; }
  void setResizableThumb(bool resizable);
  bool getResizableThumb() const { return resizableThumb; }
  bool isThumbBeingMoved() const { return moving; }
  bool isThumbBeingResized() const { return resizingEnd != 0; }
  bool isPaging() const { return paging_; }
  Orientation getOrientation() const { return orientation; }
  // The thumb's first and last pixel along the bar, in the bar's own coordinates.
  NumRange<int, true> getThumbPixelExtents() const;
  void setThumbCol(const Colour& c);
  void setButtonCol(const Colour& c);
  Button* decrementButton() const;
  Button* incrementButton() const;

  // Keeps the thickness; the length is at least minSizePixels().
  void resize(double width, double height);

  // --- Glob ---
  int react(Event* e) override;
  void reshape() override;
  void draw() override { drawBackground(); }
  virtual void drawBackground();
  const char* idstring() const override { return "scrollbar"; }
  String describeValue() const override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  void setActive(bool active, bool redraw) override;
  void setPalette(const Palette& palette) override;
  void handleMouseContainment(bool inside) override {}

  // --- Value ---
  ThumbSettings getWidgetValue() override { return ThumbSettings{thumbPos, thumbSize}; }
  void setNewWidgetValue(ThumbSettings& value) override;
  void setEnabledState(bool enabled) override { setActive(enabled, true); }

 protected:
  virtual int handleMouseEvent(Event* e);
  virtual void handleTimerEvent();
  // True when handled.
  virtual bool handleMessageEvent(const String& msg, Glob* sender);

  // Delivers `msg` to the parent synchronously with redraws held back; the parent may set the
  // thumb (or delete the bar) during the call. Returns false when the bar is gone afterwards.
  bool informParent(const String& msg, bool positionMatters);
  int inResizingArea(const XY<int>& point) const;
  double getThumbRangePixels() const { return geometry().rangePixels(); }

 private:
  void init(Orientation o, bool resizable);
  void makeButtons();
  void placeButtons();
  ScrollBarGeometry geometry() const;
  int alongOf(const XY<int>& p) const;
  Kw::Box<int> troughBox() const;
  Kw::Box<int> thumbBox() const;
  void redrawThumb() { update(troughBox()); }
  void stopTracking();
  bool pointerBeyondThumb() const;
  bool pageOnce();
  void dragTo(const Event* e);
  bool publish(DataChangeType why);
  void applyButtonColours();

  // The fields of the given interface.
  double thumbPos = 0.0;
  double thumbSize = 1.0;
  Orientation orientation = kVertical;
  bool resizableThumb = false;
  GlobHandle<ScrollBarArrow> decButton;
  GlobHandle<ScrollBarArrow> incButton;
  double lastX = 0.0;
  double lastY = 0.0;
  double pageDelta = 0.0;
  int timerStart = 0;
  double repeatInterval = 0.3;
  bool moving = false;
  int resizingEnd = 0;

  bool hasThumbColour_ = false;  // else the look's thumb colour, which follows the palette
  Colour thumbColour_;
  bool hasButtonColour_ = false;
  Colour buttonColour_;
  bool paging_ = false;
  XY<int> pointer_;             // the pointer at the last mouse event, in the bar
  bool dragPublished_ = false;  // a drag has published its start
};
