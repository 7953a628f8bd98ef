#include "foundation/AdaptorBase.h"

#include <algorithm>

#include "foundation/WidgetBase.h"

AdaptorBase::~AdaptorBase() {
  *alive_ = false;
  for (WidgetBase* w : attached) w->dropAttachment(this);
}

void AdaptorBase::attachTo(WidgetBase* w) {
  if (!w || !attached.insert(w).second) return;
  w->addAttachment(this);
}

void AdaptorBase::detachFrom(WidgetBase* w) {
  if (!w || attached.erase(w) == 0) return;
  w->dropAttachment(this);
}
