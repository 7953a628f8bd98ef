#pragma once
// What the sliders page keeps alive beside its controls: one level from 0 to 10 that a slider
// and a level meter both show, and a trim in decibels that a slider and a value box both edit.
// The slider edits the level as a double; the model rounds it to a whole level and pushes that
// back, so the slider snaps to the meter's steps. The trim needs no glue: both controls are
// bound to one adaptor over it, so moving either moves the other. It is an invisible child of
// the page and goes with it.
#include "foundation/ValServerAdaptor.h"
#include "platform/glob/Glob.h"
#include "values/UnitDisplayer.h"

class LevelMeter;
class Slider;
class VariBox;

class SlidersPageModel : public Glob {
 public:
  explicit SlidersPageModel(Canvas* page);

  ValServer<int>& level() { return level_; }
  void bind(Slider* slider);
  void bind(LevelMeter* meter);

  static constexpr double kTrimMin = -12.0;
  static constexpr double kTrimMax = 12.0;
  ValServer<double>& trim() { return trim_; }
  // Binds a slider over the trim's range to the trim.
  void bindTrim(Slider* slider);
  // Gives the box a parser for the trim, bound to it.
  void bindTrim(VariBox* box);

  const char* idstring() const override { return "sliderspagemodel"; }

 private:
  ValServer<int> level_{4};
  Kw::Ptr<ValAdaptorBase<double>> sliderAdaptor_;
  Kw::Ptr<ValServerAdaptor<int>> meterAdaptor_;
  ValServer<double> trim_{0.0};
  UnitDisplayer<double> trimText_{L" dB", 1};
  Kw::Ptr<ValServerAdaptor<double>> trimAdaptor_;
};
