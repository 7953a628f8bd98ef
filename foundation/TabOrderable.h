#pragma once
// A control that can take keyboard focus through one or more TabOrderManagers. It keeps the
// managers it is registered with (once per stop) under its own lock; destroying it removes its
// stops from every manager, and a manager destroyed first is forgotten.
//
// Lock discipline, shared with TabOrderManager: a manager may take this object's lock while
// holding its own, never the reverse; this object reads its manager list under its lock and
// calls the managers after releasing it.
#include <memory>
#include <vector>

#include "platform/kw/RWLock.h"

class TabOrderManager;

class TabOrderable {
 public:
  TabOrderable() = default;
  virtual ~TabOrderable();
  TabOrderable(const TabOrderable&) = delete;
  TabOrderable& operator=(const TabOrderable&) = delete;

  // Whether the control can take focus now (shown, active...).
  virtual bool isTabStopActive() { return true; }
  // Called with no manager lock held: the handlers may query or change any manager.
  virtual void handleTabStopFocusReceipt() {}
  virtual void handleTabStopFocusLoss() {}

  // True when any of its managers has it as the current stop.
  bool isTabStopFocus() const;
  // Clears the focus of every manager whose current stop it is (others keep theirs).
  void relinquishTabStopFocus();
  // Asks every manager to focus it; returns isTabStopFocus() afterwards.
  bool requestTabStopFocus();

  // Called by the managers as stops are added and removed.
  void registerManager(TabOrderManager* m) const;
  void deregisterManager(TabOrderManager* m) const;
  bool isRegisteredWith(const TabOrderManager* m) const;
  // Each manager once.
  std::vector<TabOrderManager*> getManagers() const;

 private:
  friend class TabOrderManager;
  // A dying manager drops every one of its entries here.
  void forgetManager(TabOrderManager* m) const;
  // The flag that outlives this object while a handler may destroy it; made on first need, so
  // that controls built by the thousand cost no allocation for it.
  std::shared_ptr<bool> aliveFlag();

  // What only some stops need: registrations after the first, and the liveness flag.
  struct More {
    std::vector<TabOrderManager*> managers;
    std::shared_ptr<bool> alive;
  };
  More& more() const;
  // Every registration in order (the first, then the rest); call under the lock.
  std::vector<TabOrderManager*> registrations() const;
  // Drops the first registration of `m`, or every one; call under the write lock.
  void dropRegistrations(const TabOrderManager* m, bool all) const;

  // Most controls sit in one panel's tab order: its manager is kept here without a container.
  // Invariant: when first_ is null there are no further registrations.
  mutable TabOrderManager* first_ = nullptr;
  mutable std::unique_ptr<More> more_;
  Kw::RWLock lock_{1, 100, 1};
};
