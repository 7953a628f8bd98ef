#pragma once
// A Glob whose drawing a test supplies, counting how often it was asked to draw.
#include <functional>

#include "platform/glib/Painter.h"
#include "platform/glob/Glob.h"

class PaintGlob : public Glob {
 public:
  using Paint = std::function<void(Glib::Painter&)>;

  PaintGlob(const GlobCreationInfo& info, Paint paint) : Glob(info), paint_(std::move(paint)) {}

  void draw() override {
    ++draws;
    Glib::Painter p(*canvas());
    if (paint_) paint_(p);
  }
  void setPaint(Paint paint) { paint_ = std::move(paint); }

  int draws = 0;

 private:
  Paint paint_;
};
