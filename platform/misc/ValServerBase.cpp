#include "platform/misc/ValServerBase.h"

#include "platform/misc/ValClientBase.h"

ValServerBase::~ValServerBase() {
  ValServerBase* self = this;
  clients_.forEach([self](ValClientBase* c) { c->serverDestroyed(self); });
}

bool ValServerBase::notifyPreChange() {
  return clients_.forEach([](ValClientBase* c) {
    if (c->wantsPreChangeNtfy()) c->valPreChangedNtfy();
  });
}

bool ValServerBase::notifyChanged() {
  return clients_.forEach([](ValClientBase* c) { c->valChangedNtfy(); });
}
