#pragma once
// An adaptor between a model value of type T and the controls that show it. The model decides:
// a control's edit arrives as requestSetNewDataValue, and an accepted value comes back to every
// attached control through setNewWidgetValue.
#include "foundation/AdaptorBase.h"
#include "foundation/DataChangeType.h"
#include "foundation/ThumbSettings.h"
#include "platform/kw/String.h"
#include "platform/misc/ColourData.h"

template <typename T>
class ValWidget;

template <typename T>
class ValAdaptorBase : public AdaptorBase {
 public:
  ~ValAdaptorBase() override = default;

  // The model value.
  virtual T getDataValue() = 0;
  // Re-reads the model and shows it in every attached control.
  virtual void forceWidgetUpdate() { setNewWidgetValue(getDataValue()); }
  // A control asks for the model to take `value`; true when accepted.
  virtual bool requestSetNewDataValue(const T& value, DataChangeType why) = 0;
  // A control's message for the code around it; ignored unless overridden.
  virtual void handleMsgForParent(String msg) {}
  // Shows `value` in every attached control, in set order. Each control gets its own copy.
  virtual void setNewWidgetValue(T value) {
    forEachAttached([&value](WidgetBase* w) {
      if (auto* vw = dynamic_cast<ValWidget<T>*>(w)) {
        T copy = value;
        vw->setNewWidgetValue(copy);
      }
    });
  }

  void setWidgetEnabledState(bool enabled) {
    forEachAttached([enabled](WidgetBase* w) {
      if (auto* vw = dynamic_cast<ValWidget<T>*>(w)) vw->setEnabledState(enabled);
    });
  }
};

extern template class ValAdaptorBase<String>;
extern template class ValAdaptorBase<WString>;
extern template class ValAdaptorBase<ColourData>;
extern template class ValAdaptorBase<bool>;
extern template class ValAdaptorBase<int>;
extern template class ValAdaptorBase<unsigned int>;
extern template class ValAdaptorBase<float>;
extern template class ValAdaptorBase<double>;
extern template class ValAdaptorBase<ThumbSettings>;

// The control side completes the pair; included here so either header is enough.
#include "foundation/ValWidget.h"
