#pragma once
// The value side of a button-like control: adds the click and message channels to its adaptor.
#include <type_traits>

#include "foundation/ButtonAdaptor.h"
#include "foundation/ValWidget.h"

template <typename T>
class ButtonWidget : public ValWidget<T> {
 public:
  ~ButtonWidget() override = default;

  using ValWidget<T>::setDataAdaptor;
  void setDataAdaptor(Kw::Ptr<ButtonAdaptor<T>> a) {
    ValWidget<T>::setDataAdaptor(Kw::Ptr<ValAdaptorBase<T>>(a));
  }
  // A pointer to a specialised button adaptor would convert to both overloads above.
  template <typename A, typename = std::enable_if_t<std::is_base_of_v<ButtonAdaptor<T>, A>>>
  void setDataAdaptor(Kw::Ptr<A> a) {
    ValWidget<T>::setDataAdaptor(Kw::Ptr<ValAdaptorBase<T>>(a));
  }
  // Null when there is none or the held adaptor is not a button adaptor.
  Kw::Ptr<ButtonAdaptor<T>> getButtonAdaptor() const {
    return Kw::ptr_cast<ButtonAdaptor<T>>(this->adaptor);
  }

  // Call after the control has changed its own state for a left press. The adaptor may
  // destroy the control.
  void widgetLeftClicked() {
    if (const Kw::Ptr<ButtonAdaptor<T>> a = getButtonAdaptor()) a->widgetLeftClicked();
  }
  // Offer every message event to the adaptor first; kEventConsumed means handled.
  EventHandlerRc messageReceived(String msg) {
    const Kw::Ptr<ButtonAdaptor<T>> a = getButtonAdaptor();
    return a ? a->messageReceived(std::move(msg)) : kEventNotConsumed;
  }
};

extern template class ButtonWidget<String>;
extern template class ButtonWidget<WString>;
