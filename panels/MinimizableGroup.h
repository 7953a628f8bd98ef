#pragma once
// A group that can be shrunk to its title strip and opened again. The toggle is the title
// strip itself: it shows an arrow (down while open, right while minimised) before the title.
//
//   input                                   what happens
//   left press in the toggle area           handleFlipSize: the size flips, then the parent
//   (the top kMinimisedHeight pixels)       gets "MinimizableGroupSizeChange <new - old>"
//   "minify..." from a size button          handleFlipSize, likewise
//   setSize(state)                          the size changes silently
//   a grouped group's height-change report  as WidgetGroupEx: widgets below move, an
//                                           auto-sized group follows and reports
//
// Choices made here:
// - setSize records the height, hides the grouped widgets that widgetVisibilityCanChange
//   allows (remembering which were shown) and shrinks to kMinimisedHeight keeping the top
//   edge; opening restores the recorded full height first, then shows those widgets again.
// - The title widget, when there is one, is never hidden.
// - Presses and releases in the toggle area are the group's; the release does nothing.
#include "panels/WidgetGroupEx.h"

class MinimizableGroup : public WidgetGroupEx {
 public:
  static const char* const sizeChangedMsg;  // "MinimizableGroupSizeChange "
  // Room for the toggle arrow before the title.
  static constexpr int kToggleWidth = 14;

  explicit MinimizableGroup(const GlobCreationInfo& info, const WString& title = WString());
  MinimizableGroup(unsigned short width, unsigned short height, const WString& title,
                   Canvas* parent);

  // The change of height that a size-change message carries; 0 for any other message, and
  // for one without a number.
  static int getHeightDelta(const String& msg) { return parseHeightDelta(msg); }

  size_state getSizeState() const { return size_state_; }
  void setSizeState(size_state state) { size_state_ = state; }
  void setSize(size_state state);
  bool isMinimised() const { return size_state_ == SizeMinimised; }
  bool isCoordinateInSizeToggleArea(XY<int> pos) const;
  void mapWidgets(bool show);
  virtual bool widgetVisibilityCanChange(Glob* widget) const;

  // --- Panel ---
  void handleFlipSize() override;
  int handleMouseEvent(Event* e) override;
  int handleMessageEvent(const String& msg, Glob* sender) override;
  void drawBorder() override;
  const char* idstring() const override { return "minimizablegroup"; }

 protected:
  int titleLeadWidth() const override { return kToggleWidth + WidgetGroupEx::titleLeadWidth(); }

 private:
  size_state size_state_ = SizeFull;
  int fullHeight_ = 0;
  std::vector<GlobHandle<>> hidden_;
};
