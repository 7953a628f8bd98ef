#pragma once
// The keyboard tab order of a panel or dialogue: numbered stops, one of them focused.
//
// Orders are kept unique: adding or moving a stop to an order that is taken pushes the holder,
// and the holder of each directly following order, up by one. 0xFFFFFFFE asks for the order
// after the highest in use (0 in an empty manager); orders from 0xFFFFEFFF up are reserved and
// refused, and so is a push that would reach them.
//
// Choices made here:
// - findNextHighestTabOrder / findNextLowestTabOrder return the index of the stop whose order
//   comes nearest above / below `order` (at `order` itself too when `inclusive`), skipping
//   disabled stops and stops whose control reports isTabStopActive() false. Orders are unique,
//   so ties only matter if they ever arise; the lower index wins. 0xFFFFFFFF when none
//   qualifies.
// - Focusing the stop that already has the focus succeeds and calls no handler. When the old
//   and new stop are the same control (duplicates allowed), it is not told of a loss.
// - Removing the focused stop clears the focus and tells that control it lost it; a control
//   being destroyed, or a manager being destroyed, tells no one.
// - addTabStops gives a host's stops consecutive orders from the requested one, so they keep
//   the host's order.
// - Locking: queries take the lock as reader, changes as writer, and no lock is ever held while
//   a control is called (isTabStopActive and the focus handlers). A handler may therefore call
//   back into this manager, even to add or remove stops, without deadlocking; the focus change
//   re-checks its stop after each call, and a handler may even destroy the manager.
// - Indices are unsigned; pass literal indices as 0u, since a plain 0 could also be a pointer.
#include <memory>
#include <vector>

#include "foundation/TabOrderable.h"
#include "foundation/TabOrderableHost.h"
#include "platform/kw/RWLock.h"

class TabOrderManager {
 public:
  static constexpr unsigned kNone = 0xFFFFFFFF;
  static constexpr unsigned kAfterLast = 0xFFFFFFFE;
  static constexpr unsigned kFirstReservedOrder = 0xFFFFEFFF;

  explicit TabOrderManager(bool allowDuplicates = false);
  ~TabOrderManager();
  TabOrderManager(const TabOrderManager&) = delete;
  TabOrderManager& operator=(const TabOrderManager&) = delete;

  // --- Registration ---
  bool addTabStop(TabOrderable& object, unsigned order);
  bool addTabStop(TabOrderable* object, unsigned order);
  // Adds every stop the host hands out; stops at the first failure (a null stop is one).
  bool addTabStops(TabOrderableHost& host, unsigned order);
  // The first stop of the object.
  bool removeTabStop(const TabOrderable& object);
  bool removeTabStop(const TabOrderable* object);
  bool removeTabStop(unsigned index);
  bool setTabOrder(const TabOrderable& object, unsigned order);
  bool setTabOrder(const TabOrderable* object, unsigned order);
  bool setTabOrder(unsigned index, unsigned order);
  // Disabling the focused stop leaves the focus where it is.
  bool setTabStopEnabled(const TabOrderable& object, bool enabled);
  bool setTabStopEnabled(const TabOrderable* object, bool enabled);
  bool setTabStopEnabled(unsigned index, bool enabled);
  // False when not found; `found` (optional) tells which.
  bool getTabStopEnabled(const TabOrderable& object, bool* found) const;
  bool getTabStopEnabled(const TabOrderable* object, bool* found) const;
  bool getTabStopEnabled(unsigned index, bool* found) const;

  // --- Queries ---
  unsigned numTabStops() const;
  // kNone / null for an index past the end.
  unsigned getTabStopTabOrder(unsigned index) const;
  TabOrderable* getTabStopObject(unsigned index) const;
  unsigned getCurrentTabStopIndex() const;
  unsigned getCurrentTabOrder() const;
  unsigned getLowestTabOrder() const;
  unsigned getHighestTabOrder() const;
  bool isTabStopFocus(const TabOrderable& object) const;

  // --- Focus ---
  // Null clears the focus.
  bool setTabStopFocus(const TabOrderable* object);
  // kNone clears the focus.
  bool setTabStopFocus(unsigned index);
  // Move to the next / previous stop, wrapping round; both return the current index.
  unsigned incrementTabStop();
  unsigned decrementTabStop();
  unsigned findNextHighestTabOrder(unsigned order, bool inclusive) const;
  unsigned findNextLowestTabOrder(unsigned order, bool inclusive) const;

 private:
  friend class TabOrderable;

  struct Stop {
    unsigned tabOrder;
    TabOrderable* object;
    bool enabled;
  };

  // `flag` is accepted for the callers that pass it and changes nothing.
  bool internalSetTabStopFocus(unsigned index, bool flag);
  // The rest run with the writer lock held.
  bool makeWayForTabOrder(unsigned order, unsigned excludeIndex = kNone);
  // Finds the lowest and highest stops again; a scan only when the orders do not rise with the
  // index.
  void recomputeExtremes();
  unsigned indexOfLocked(const TabOrderable* object) const;
  // Removes stop `index`; returns the object when it had the focus.
  TabOrderable* removeLocked(unsigned index);
  bool setTabOrderLocked(unsigned index, unsigned order);
  // Stop `index` still holds `object`.
  bool stillHolds(unsigned index, const TabOrderable* object) const;
  bool holdsObject(const TabOrderable* object) const;
  // A dying object's stops go, without calling it.
  void forgetObject(TabOrderable* object);
  // Nearest qualifying stop in the direction given; `upward` selects findNextHighest.
  unsigned findNext(unsigned order, bool inclusive, bool upward) const;

  std::vector<Stop> stops;
  const bool allowDuplicates;
  Kw::RWLock lock{1, 100, 1};
  unsigned currentOrder = kNone;
  unsigned currentIndex = kNone;
  unsigned lowestOrder = kNone;
  unsigned lowestIndex = kNone;
  unsigned highestOrder = kNone;
  unsigned highestIndex = kNone;
  bool ascending_ = true;  // every stop's order is above the one before it
  std::shared_ptr<bool> alive_ = std::make_shared<bool>(true);
};
