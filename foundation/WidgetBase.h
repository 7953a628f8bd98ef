#pragma once
// The value-binding side of a control: the counted reference to its adaptor.
//
// setAdaptor does not take the control out of the previous adaptor's set: a control re-bound
// without detachFrom first stays attached to both, and both push values to it. That is safe:
// the control remembers every adaptor it is attached to and leaves all of them when destroyed,
// and an adaptor destroyed first is forgotten.
#include <memory>
#include <vector>

#include "foundation/AdaptorBase.h"
#include "platform/kw/Ptr.h"

class WidgetBase {
 public:
  WidgetBase() = default;
  virtual ~WidgetBase();
  WidgetBase(const WidgetBase&) = delete;
  WidgetBase& operator=(const WidgetBase&) = delete;

  // Replaces the held reference and attaches to the new adaptor, when there is one.
  void setAdaptor(Kw::Ptr<AdaptorBase> a);
  const Kw::Ptr<AdaptorBase>& getAdaptor() const { return adaptor; }

 protected:
  Kw::Ptr<AdaptorBase> adaptor;

 private:
  friend class AdaptorBase;
  void addAttachment(AdaptorBase* a);
  void dropAttachment(const AdaptorBase* a);
  // The adaptors this control is attached to; made at the first attachment, since most
  // controls are never bound.
  std::unique_ptr<std::vector<AdaptorBase*>> attachedTo_;
};
