#pragma once
// An adaptor over one observable model value: every control bound to it shows the server's
// value, and every edit a control asks for is written to the server, which then pushes it back
// to all of them. One server can drive any number of controls this way with no other glue.
//
// If the server is destroyed first, the adaptor keeps the last value it saw, refuses every
// further change and disables its controls; nothing dangles.
#include "foundation/ValAdaptorBase.h"
#include "platform/misc/ValClient.h"

template <typename T>
class ValServerAdaptor : public ValAdaptorBase<T>, public ValClient<T> {
 public:
  explicit ValServerAdaptor(ValServer<T>* server) {
    if (server) {
      this->registerWith(server);
      last_ = server->getValue();
    }
  }

  ValServer<T>* server() const { return this->getValServer(0); }

  T getDataValue() override {
    if (ValServer<T>* s = server()) last_ = s->getValue();
    return last_;
  }
  bool requestSetNewDataValue(const T& value, DataChangeType why) override {
    ValServer<T>* s = server();
    if (!s) return false;
    s->setValue(value);
    return true;
  }
  void valChangedNtfy() override { this->setNewWidgetValue(getDataValue()); }
  void valServerDestroyedNtfy(ValServerBase*) override { this->setWidgetEnabledState(false); }

 private:
  T last_{};
};

extern template class ValServerAdaptor<String>;
extern template class ValServerAdaptor<WString>;
extern template class ValServerAdaptor<ColourData>;
extern template class ValServerAdaptor<bool>;
extern template class ValServerAdaptor<int>;
extern template class ValServerAdaptor<unsigned int>;
extern template class ValServerAdaptor<float>;
extern template class ValServerAdaptor<double>;
extern template class ValServerAdaptor<ThumbSettings>;
