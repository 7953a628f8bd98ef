#include "foundation/TabOrderable.h"

#include <algorithm>

#include "foundation/TabOrderManager.h"

TabOrderable::~TabOrderable() {
  if (alive_) *alive_ = false;
  std::vector<TabOrderManager*> from;
  {
    Kw::RWLock::WriteGuard g(lock_);
    from.swap(managers_);
  }
  std::sort(from.begin(), from.end());
  from.erase(std::unique(from.begin(), from.end()), from.end());
  for (TabOrderManager* m : from) m->forgetObject(this);
}

bool TabOrderable::isTabStopFocus() const {
  for (TabOrderManager* m : getManagers()) {
    if (m->isTabStopFocus(*this)) return true;
  }
  return false;
}

void TabOrderable::relinquishTabStopFocus() {
  const std::shared_ptr<bool> alive = aliveFlag();
  for (TabOrderManager* m : getManagers()) {
    // A focus-loss handler may have destroyed this object or a later manager.
    if (!*alive) return;
    if (isRegisteredWith(m) && m->isTabStopFocus(*this)) m->setTabStopFocus(nullptr);
  }
}

bool TabOrderable::requestTabStopFocus() {
  const std::shared_ptr<bool> alive = aliveFlag();
  for (TabOrderManager* m : getManagers()) {
    if (!*alive) return false;
    if (isRegisteredWith(m)) m->setTabStopFocus(this);
  }
  return *alive && isTabStopFocus();
}

std::shared_ptr<bool> TabOrderable::aliveFlag() {
  if (!alive_) alive_ = std::make_shared<bool>(true);
  return alive_;
}

void TabOrderable::registerManager(TabOrderManager* m) const {
  if (!m) return;
  Kw::RWLock::WriteGuard g(lock_);
  managers_.push_back(m);
}

void TabOrderable::deregisterManager(TabOrderManager* m) const {
  Kw::RWLock::WriteGuard g(lock_);
  auto it = std::find(managers_.begin(), managers_.end(), m);
  if (it != managers_.end()) managers_.erase(it);
}

void TabOrderable::forgetManager(TabOrderManager* m) const {
  Kw::RWLock::WriteGuard g(lock_);
  managers_.erase(std::remove(managers_.begin(), managers_.end(), m), managers_.end());
}

bool TabOrderable::isRegisteredWith(const TabOrderManager* m) const {
  Kw::RWLock::ReadGuard g(lock_);
  return m && std::find(managers_.begin(), managers_.end(), m) != managers_.end();
}

std::vector<TabOrderManager*> TabOrderable::getManagers() const {
  std::vector<TabOrderManager*> out;
  {
    Kw::RWLock::ReadGuard g(lock_);
    out = managers_;
  }
  // Registration order, each manager once.
  std::vector<TabOrderManager*> unique;
  for (TabOrderManager* m : out) {
    if (std::find(unique.begin(), unique.end(), m) == unique.end()) unique.push_back(m);
  }
  return unique;
}
