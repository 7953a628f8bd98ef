#pragma once
// An observable value, without its type: it keeps the clients that follow it and tells them
// before (when they asked) and after the value changes. A server destroyed before its clients
// makes each of them forget it first.
#include "platform/misc/ObserverList.h"

class ValClientBase;

class ValServerBase {
 public:
  ValServerBase() = default;
  virtual ~ValServerBase();
  ValServerBase(const ValServerBase&) = delete;
  ValServerBase& operator=(const ValServerBase&) = delete;

  size_t numValClients() const { return clients_.size(); }
  bool hasValClient(const ValClientBase* c) const { return clients_.contains(c); }

 protected:
  // Each returns false when a client's handler destroyed this server; the caller must then
  // touch nothing of it.
  bool notifyPreChange();
  bool notifyChanged();

 private:
  friend class ValClientBase;
  bool addClient(ValClientBase* c) { return clients_.add(c); }
  bool removeClient(ValClientBase* c) { return clients_.remove(c); }

  ObserverList<ValClientBase> clients_;
};
