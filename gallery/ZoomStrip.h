#pragma once
// A gallery stand-in for a zoomable timeline: a ruler of a 100-second span over a horizontal
// scroll bar whose resizable thumb is the part shown. Dragging the thumb pans, dragging its
// ends zooms about its centre; the arrow buttons pan and the wheel zooms. The strip answers
// the bar's reports and passes them on to its page for the message log.
#include "platform/glob/Glob.h"

class ScrollBar;

class ZoomStrip : public Glob {
 public:
  static constexpr double kSpanSeconds = 100.0;

  explicit ZoomStrip(const GlobCreationInfo& info);

  int react(Event* e) override;
  void draw() override;
  const char* idstring() const override { return "zoomstrip"; }
  String describeValue() const override;

  ScrollBar* bar() const { return bar_; }

 private:
  void zoom(double factor);

  ScrollBar* bar_ = nullptr;  // a child: lives as long as this strip
};
