#pragma once
// The adaptor of a button-like control: a value (its caption, say) plus the left click and the
// messages the control receives. Unspecialised, it has no value, refuses every change and
// consumes no message.
#include "foundation/EventHandlerRc.h"
#include "foundation/ValAdaptorBase.h"

template <typename T>
class ButtonAdaptor : public ValAdaptorBase<T> {
 public:
  ~ButtonAdaptor() override = default;

  T getDataValue() override { return T{}; }
  bool requestSetNewDataValue(const T& value, DataChangeType why) override { return false; }

  // The control has changed its own state for a left press.
  virtual void widgetLeftClicked() {}
  // A message event reached the control; kEventConsumed ends its handling there.
  virtual EventHandlerRc messageReceived(String msg) { return kEventNotConsumed; }
};

extern template class ButtonAdaptor<String>;
extern template class ButtonAdaptor<WString>;
