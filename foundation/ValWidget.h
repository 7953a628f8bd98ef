#pragma once
// The value side of a control that shows a T. The control never owns the value: it asks its
// adaptor, hands every user edit to the adaptor, and shows what the adaptor pushes back. With no
// adaptor, edits are accepted and kept only in the control.
#include "foundation/DataChangeType.h"
#include "foundation/ValAdaptorBase.h"
#include "foundation/WidgetBase.h"
#include "platform/glob/Drawable.h"

template <typename T>
class ValWidget : public WidgetBase {
 public:
  ~ValWidget() override = default;

  virtual void setDataAdaptor(Kw::Ptr<ValAdaptorBase<T>> a) { setAdaptor(Kw::Ptr<AdaptorBase>(a)); }
  // Null when there is none, or when the held adaptor is not for T.
  virtual Kw::Ptr<ValAdaptorBase<T>> getDataAdaptor() const {
    return Kw::ptr_cast<ValAdaptorBase<T>>(adaptor);
  }
  // The value as the control shows it now.
  virtual T getWidgetValue() = 0;
  // Hands a user edit to the adaptor with redraws held back, so that every control the accepted
  // value reaches repaints once afterwards. The adaptor may destroy this control; nothing of it
  // is touched after the call.
  virtual bool requestSetNewDataValue(const T& value, DataChangeType why) {
    const Kw::Ptr<ValAdaptorBase<T>> a = getDataAdaptor();
    if (!a) return true;
    Drawable::disableRedraws();
    const bool accepted = a->requestSetNewDataValue(value, why);
    Drawable::enableRedraws();
    return accepted;
  }
  // Shows `value`. Must never call back into the adaptor: that is what stops the loop.
  virtual void setNewWidgetValue(T& value) = 0;
  // Controls map this to setActive.
  virtual void setEnabledState(bool enabled) {}

  // The model value, or a default T with no adaptor.
  T getDataValue() {
    const Kw::Ptr<ValAdaptorBase<T>> a = getDataAdaptor();
    return a ? a->getDataValue() : T{};
  }
  void handleMsgForParent(String msg) {
    if (const Kw::Ptr<ValAdaptorBase<T>> a = getDataAdaptor())
      a->handleMsgForParent(std::move(msg));
  }
};

extern template class ValWidget<String>;
extern template class ValWidget<WString>;
extern template class ValWidget<ColourData>;
extern template class ValWidget<bool>;
extern template class ValWidget<int>;
extern template class ValWidget<unsigned int>;
extern template class ValWidget<float>;
extern template class ValWidget<double>;
extern template class ValWidget<ThumbSettings>;
