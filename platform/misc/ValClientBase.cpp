#include "platform/misc/ValClientBase.h"

#include <algorithm>

#include "platform/misc/ValServerBase.h"

ValClientBase::~ValClientBase() {
  deregisterFromAll();
}

bool ValClientBase::registerWithBase(ValServerBase* server) {
  if (!server || isRegisteredWith(server)) return false;
  servers_.push_back(server);
  server->addClient(this);
  return true;
}

bool ValClientBase::deregisterFrom(ValServerBase* server) {
  auto it = std::find(servers_.begin(), servers_.end(), server);
  if (!server || it == servers_.end()) return false;
  servers_.erase(it);
  server->removeClient(this);
  return true;
}

void ValClientBase::deregisterFromAll() {
  while (!servers_.empty()) deregisterFrom(servers_.back());
}

ValServerBase* ValClientBase::getValServerBase(unsigned index) const {
  return index < servers_.size() ? servers_[index] : nullptr;
}

bool ValClientBase::isRegisteredWith(const ValServerBase* server) const {
  return server && std::find(servers_.begin(), servers_.end(), server) != servers_.end();
}

void ValClientBase::serverDestroyed(ValServerBase* server) {
  auto it = std::find(servers_.begin(), servers_.end(), server);
  if (it == servers_.end()) return;
  servers_.erase(it);
  server->removeClient(this);
  valServerDestroyedNtfy(server);
}
