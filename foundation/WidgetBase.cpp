#include "foundation/WidgetBase.h"

WidgetBase::~WidgetBase() {
  if (attachedTo_) {
    // Copied: each detachFrom edits the list.
    const std::vector<AdaptorBase*> from = *attachedTo_;
    for (AdaptorBase* a : from) a->detachFrom(this);
  }
  adaptor.reset();
}

void WidgetBase::addAttachment(AdaptorBase* a) {
  if (!attachedTo_) attachedTo_ = std::make_unique<std::vector<AdaptorBase*>>();
  attachedTo_->push_back(a);
}

void WidgetBase::dropAttachment(const AdaptorBase* a) {
  if (attachedTo_) std::erase(*attachedTo_, a);
}

void WidgetBase::setAdaptor(Kw::Ptr<AdaptorBase> a) {
  // Binding to the held adaptor again re-attaches a control that was detached from it.
  if (!(a == adaptor)) adaptor = std::move(a);
  if (adaptor) adaptor->attachTo(this);
}
