#include "foundation/AdaptorBase.h"

#include <algorithm>

#include "foundation/WidgetBase.h"

AdaptorBase::~AdaptorBase() {
  *alive_ = false;
  for (WidgetBase* w : attached) {
    auto& list = w->attachedTo_;
    list.erase(std::remove(list.begin(), list.end(), this), list.end());
  }
}

void AdaptorBase::attachTo(WidgetBase* w) {
  if (!w || !attached.insert(w).second) return;
  w->attachedTo_.push_back(this);
}

void AdaptorBase::detachFrom(WidgetBase* w) {
  if (!w || attached.erase(w) == 0) return;
  auto& list = w->attachedTo_;
  list.erase(std::remove(list.begin(), list.end(), this), list.end());
}
