#include "foundation/TabOrderable.h"

#include <algorithm>

#include "foundation/TabOrderManager.h"

TabOrderable::~TabOrderable() {
  if (more_ && more_->alive) *more_->alive = false;
  TabOrderManager* only = nullptr;  // the usual case: one manager, no allocation
  std::vector<TabOrderManager*> from;
  {
    Kw::RWLock::WriteGuard g(lock_);
    if (more_ && !more_->managers.empty()) {
      from = registrations();
      more_->managers.clear();
    } else {
      only = first_;
    }
    first_ = nullptr;
  }
  if (only) only->forgetObject(this);
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
  More& m = more();
  if (!m.alive) m.alive = std::make_shared<bool>(true);
  return m.alive;
}

TabOrderable::More& TabOrderable::more() const {
  if (!more_) more_ = std::make_unique<More>();
  return *more_;
}

std::vector<TabOrderManager*> TabOrderable::registrations() const {
  std::vector<TabOrderManager*> out;
  if (!first_) return out;
  out.push_back(first_);
  if (more_) out.insert(out.end(), more_->managers.begin(), more_->managers.end());
  return out;
}

void TabOrderable::dropRegistrations(const TabOrderManager* m, bool all) const {
  if (!more_ || more_->managers.empty()) {  // the usual case: one manager, no allocation
    if (first_ == m) first_ = nullptr;
    return;
  }
  std::vector<TabOrderManager*> rest = registrations();
  bool dropped = false;
  std::erase_if(rest, [&](const TabOrderManager* r) {
    if (r != m || (dropped && !all)) return false;
    dropped = true;
    return true;
  });
  first_ = rest.empty() ? nullptr : rest.front();
  if (more_) more_->managers.assign(rest.begin() + (rest.empty() ? 0 : 1), rest.end());
}

void TabOrderable::registerManager(TabOrderManager* m) const {
  if (!m) return;
  Kw::RWLock::WriteGuard g(lock_);
  if (!first_) {
    first_ = m;
  } else {
    more().managers.push_back(m);
  }
}

void TabOrderable::deregisterManager(TabOrderManager* m) const {
  Kw::RWLock::WriteGuard g(lock_);
  dropRegistrations(m, false);
}

void TabOrderable::forgetManager(TabOrderManager* m) const {
  Kw::RWLock::WriteGuard g(lock_);
  dropRegistrations(m, true);
}

bool TabOrderable::isRegisteredWith(const TabOrderManager* m) const {
  Kw::RWLock::ReadGuard g(lock_);
  if (!m || !first_) return false;
  if (first_ == m) return true;
  return more_ &&
         std::find(more_->managers.begin(), more_->managers.end(), m) != more_->managers.end();
}

std::vector<TabOrderManager*> TabOrderable::getManagers() const {
  std::vector<TabOrderManager*> out;
  {
    Kw::RWLock::ReadGuard g(lock_);
    out = registrations();
  }
  // Registration order, each manager once.
  std::vector<TabOrderManager*> unique;
  for (TabOrderManager* m : out) {
    if (std::find(unique.begin(), unique.end(), m) == unique.end()) unique.push_back(m);
  }
  return unique;
}
