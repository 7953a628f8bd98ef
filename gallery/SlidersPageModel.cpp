#include "gallery/SlidersPageModel.h"

#include <algorithm>
#include <cmath>

#include "gallery/LevelMeter.h"
#include "values/Slider.h"
#include "values/VariBox.h"
#include "values/VariBoxParserBasic.h"

namespace {

// The whole-number level seen as a double: requests are rounded into the level, and the
// rounded level goes back to every slider even when it did not change.
class LevelAsDouble : public ValAdaptorBase<double>, public ValClient<int> {
 public:
  explicit LevelAsDouble(ValServer<int>* level) { registerWith(level); }

  double getDataValue() override {
    const ValServer<int>* s = getValServer(0);
    return s ? s->getValue() : 0.0;
  }
  bool requestSetNewDataValue(const double& v, DataChangeType) override {
    ValServer<int>* s = getValServer(0);
    if (!s || !std::isfinite(v)) return false;
    s->setValue(static_cast<int>(std::lround(std::clamp(v, 0.0, 10.0))));
    setNewWidgetValue(getDataValue());
    return true;
  }
  void valChangedNtfy() override { setNewWidgetValue(getDataValue()); }
};

}  // namespace

SlidersPageModel::SlidersPageModel(Canvas* page)
    : Glob(GlobCreationInfo(1, 1, page)),
      sliderAdaptor_(new LevelAsDouble(&level_)),
      meterAdaptor_(new ValServerAdaptor<int>(&level_)),
      trimAdaptor_(new ValServerAdaptor<double>(&trim_)) {
  unmap_canvas();
}

void SlidersPageModel::bind(Slider* slider) {
  slider->setDataAdaptor(sliderAdaptor_);
  sliderAdaptor_->forceWidgetUpdate();
}

void SlidersPageModel::bind(LevelMeter* meter) {
  meter->setDataAdaptor(meterAdaptor_);
  meterAdaptor_->forceWidgetUpdate();
}

void SlidersPageModel::bindTrim(Slider* slider) {
  slider->setValueRange(kTrimMin, kTrimMax);
  slider->setDataAdaptor(trimAdaptor_);
  trimAdaptor_->forceWidgetUpdate();
}

void SlidersPageModel::bindTrim(VariBox* box) {
  auto* parser = new VariBoxParserBasic<double>(box, &trimText_, kTrimMin, kTrimMax, 0.1, 1.0,
                                                trim_.getValue(), 0.0);
  parser->setDataAdaptor(trimAdaptor_);
  box->setParser(parser, true);
}
