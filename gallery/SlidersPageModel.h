#pragma once
// What the sliders page keeps alive beside its controls: one level from 0 to 10 that a slider
// and a level meter both show. The slider edits the level as a double; the model rounds it to
// a whole level and pushes that back, so the slider snaps to the meter's steps. It is an
// invisible child of the page and goes with it.
#include "foundation/ValServerAdaptor.h"
#include "platform/glob/Glob.h"

class LevelMeter;
class Slider;

class SlidersPageModel : public Glob {
 public:
  explicit SlidersPageModel(Canvas* page);

  ValServer<int>& level() { return level_; }
  void bind(Slider* slider);
  void bind(LevelMeter* meter);

  const char* idstring() const override { return "sliderspagemodel"; }

 private:
  ValServer<int> level_{4};
  Kw::Ptr<ValAdaptorBase<double>> sliderAdaptor_;
  Kw::Ptr<ValServerAdaptor<int>> meterAdaptor_;
};
