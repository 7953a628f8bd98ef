#include "foundation/TabOrderManager.h"

#include <algorithm>
#include <set>

#include "platform/glob/Drawable.h"

namespace {

using ReadGuard = Kw::RWLock::ReadGuard;
using WriteGuard = Kw::RWLock::WriteGuard;

// Holds repainting back for the length of a focus change, so the old and new stop repaint once.
class RedrawBatch {
 public:
  RedrawBatch() { Drawable::disableRedraws(); }
  ~RedrawBatch() { Drawable::enableRedraws(); }
  RedrawBatch(const RedrawBatch&) = delete;
  RedrawBatch& operator=(const RedrawBatch&) = delete;
};

}  // namespace

TabOrderManager::TabOrderManager(bool allowDuplicates) : allowDuplicates(allowDuplicates) {}

TabOrderManager::~TabOrderManager() {
  *alive_ = false;
  WriteGuard g(lock);
  for (const Stop& s : stops) s.object->forgetManager(this);
  stops.clear();
}

// --- Registration ---

bool TabOrderManager::addTabStop(TabOrderable& object, unsigned order) {
  WriteGuard g(lock);
  // The stop knows its managers: asking it is cheaper than searching every stop.
  if (!allowDuplicates && object.isRegisteredWith(this)) return false;
  if (order == kAfterLast) order = stops.empty() ? 0 : highestOrder + 1;
  if (order >= kFirstReservedOrder) return false;
  if (!makeWayForTabOrder(order)) return false;
  ascending_ = ascending_ && (stops.empty() || order > stops.back().tabOrder);
  stops.push_back(Stop{order, &object, true});
  object.registerManager(this);
  // The extremes so far are right for the older stops; the newest loses ties.
  const unsigned index = static_cast<unsigned>(stops.size() - 1);
  if (lowestIndex == kNone || order < lowestOrder) {
    lowestOrder = order;
    lowestIndex = index;
  }
  if (highestIndex == kNone || order > highestOrder) {
    highestOrder = order;
    highestIndex = index;
  }
  return true;
}

bool TabOrderManager::addTabStop(TabOrderable* object, unsigned order) {
  return object && addTabStop(*object, order);
}

bool TabOrderManager::addTabStops(TabOrderableHost& host, unsigned order) {
  std::vector<TabOrderable*> found;
  host.getTabOrderables(found);
  for (size_t i = 0; i < found.size(); ++i) {
    if (!found[i]) return false;
    unsigned o = order;
    if (order != kAfterLast) {
      if (order >= kFirstReservedOrder || i >= kFirstReservedOrder - order) return false;
      o = order + static_cast<unsigned>(i);
    }
    if (!addTabStop(*found[i], o)) return false;
  }
  return true;
}

bool TabOrderManager::removeTabStop(const TabOrderable& object) {
  TabOrderable* lost = nullptr;
  {
    WriteGuard g(lock);
    const unsigned index = indexOfLocked(&object);
    if (index == kNone) return false;
    lost = removeLocked(index);
  }
  if (lost) lost->handleTabStopFocusLoss();
  return true;
}

bool TabOrderManager::removeTabStop(const TabOrderable* object) {
  return object && removeTabStop(*object);
}

bool TabOrderManager::removeTabStop(unsigned index) {
  TabOrderable* lost = nullptr;
  {
    WriteGuard g(lock);
    if (index >= stops.size()) return false;
    lost = removeLocked(index);
  }
  if (lost) lost->handleTabStopFocusLoss();
  return true;
}

bool TabOrderManager::setTabOrder(const TabOrderable& object, unsigned order) {
  WriteGuard g(lock);
  return setTabOrderLocked(indexOfLocked(&object), order);
}

bool TabOrderManager::setTabOrder(const TabOrderable* object, unsigned order) {
  return object && setTabOrder(*object, order);
}

bool TabOrderManager::setTabOrder(unsigned index, unsigned order) {
  WriteGuard g(lock);
  return setTabOrderLocked(index, order);
}

bool TabOrderManager::setTabStopEnabled(const TabOrderable& object, bool enabled) {
  WriteGuard g(lock);
  const unsigned index = indexOfLocked(&object);
  if (index == kNone) return false;
  stops[index].enabled = enabled;
  return true;
}

bool TabOrderManager::setTabStopEnabled(const TabOrderable* object, bool enabled) {
  return object && setTabStopEnabled(*object, enabled);
}

bool TabOrderManager::setTabStopEnabled(unsigned index, bool enabled) {
  WriteGuard g(lock);
  if (index >= stops.size()) return false;
  stops[index].enabled = enabled;
  return true;
}

bool TabOrderManager::getTabStopEnabled(const TabOrderable& object, bool* found) const {
  ReadGuard g(lock);
  const unsigned index = indexOfLocked(&object);
  if (found) *found = index != kNone;
  return index != kNone && stops[index].enabled;
}

bool TabOrderManager::getTabStopEnabled(const TabOrderable* object, bool* found) const {
  if (!object) {
    if (found) *found = false;
    return false;
  }
  return getTabStopEnabled(*object, found);
}

bool TabOrderManager::getTabStopEnabled(unsigned index, bool* found) const {
  ReadGuard g(lock);
  const bool ok = index < stops.size();
  if (found) *found = ok;
  return ok && stops[index].enabled;
}

// --- Queries ---

unsigned TabOrderManager::numTabStops() const {
  ReadGuard g(lock);
  return static_cast<unsigned>(stops.size());
}

unsigned TabOrderManager::getTabStopTabOrder(unsigned index) const {
  ReadGuard g(lock);
  return index < stops.size() ? stops[index].tabOrder : kNone;
}

TabOrderable* TabOrderManager::getTabStopObject(unsigned index) const {
  ReadGuard g(lock);
  return index < stops.size() ? stops[index].object : nullptr;
}

unsigned TabOrderManager::getCurrentTabStopIndex() const {
  ReadGuard g(lock);
  return currentIndex;
}

unsigned TabOrderManager::getCurrentTabOrder() const {
  ReadGuard g(lock);
  return currentOrder;
}

unsigned TabOrderManager::getLowestTabOrder() const {
  ReadGuard g(lock);
  return lowestOrder;
}

unsigned TabOrderManager::getHighestTabOrder() const {
  ReadGuard g(lock);
  return highestOrder;
}

bool TabOrderManager::isTabStopFocus(const TabOrderable& object) const {
  ReadGuard g(lock);
  return currentIndex != kNone && stops[currentIndex].object == &object;
}

// --- Focus ---

bool TabOrderManager::setTabStopFocus(const TabOrderable* object) {
  if (!object) return internalSetTabStopFocus(kNone, true);
  unsigned index;
  {
    ReadGuard g(lock);
    index = indexOfLocked(object);
  }
  return index != kNone && internalSetTabStopFocus(index, true);
}

bool TabOrderManager::setTabStopFocus(unsigned index) {
  return internalSetTabStopFocus(index, true);
}

unsigned TabOrderManager::incrementTabStop() {
  const std::shared_ptr<bool> alive = alive_;
  unsigned next = kNone;
  if (getCurrentTabStopIndex() != kNone)
    next = findNextHighestTabOrder(getCurrentTabOrder(), false);
  if (next == kNone) next = findNextHighestTabOrder(0, true);
  if (next != kNone) internalSetTabStopFocus(next, true);
  return *alive ? getCurrentTabStopIndex() : kNone;
}

unsigned TabOrderManager::decrementTabStop() {
  const std::shared_ptr<bool> alive = alive_;
  unsigned next = kNone;
  if (getCurrentTabStopIndex() != kNone) next = findNextLowestTabOrder(getCurrentTabOrder(), false);
  if (next == kNone) next = findNextLowestTabOrder(kNone, true);
  if (next != kNone) internalSetTabStopFocus(next, true);
  return *alive ? getCurrentTabStopIndex() : kNone;
}

unsigned TabOrderManager::findNextHighestTabOrder(unsigned order, bool inclusive) const {
  return findNext(order, inclusive, true);
}

unsigned TabOrderManager::findNextLowestTabOrder(unsigned order, bool inclusive) const {
  return findNext(order, inclusive, false);
}

unsigned TabOrderManager::findNext(unsigned order, bool inclusive, bool upward) const {
  struct Candidate {
    unsigned order, index;
    TabOrderable* object;
  };
  std::vector<Candidate> candidates;
  {
    ReadGuard g(lock);
    for (unsigned i = 0; i < stops.size(); ++i) {
      const Stop& s = stops[i];
      const bool beyond = upward ? s.tabOrder > order : s.tabOrder < order;
      if (s.enabled && (beyond || (inclusive && s.tabOrder == order))) {
        candidates.push_back(Candidate{s.tabOrder, i, s.object});
      }
    }
  }
  // Nearest order first; the lower index breaks a tie.
  std::sort(candidates.begin(), candidates.end(), [upward](const Candidate& a, const Candidate& b) {
    if (a.order != b.order) return upward ? a.order < b.order : a.order > b.order;
    return a.index < b.index;
  });
  const std::shared_ptr<bool> alive = alive_;
  for (const Candidate& c : candidates) {
    // isTabStopActive runs unlocked and may change the stops: ask only stops still in place.
    if (!*alive) return kNone;
    if (stillHolds(c.index, c.object) && c.object->isTabStopActive()) return c.index;
  }
  return kNone;
}

bool TabOrderManager::internalSetTabStopFocus(unsigned index, bool flag) {
  RedrawBatch batch;
  const std::shared_ptr<bool> alive = alive_;
  if (index == kNone) {
    TabOrderable* old = nullptr;
    {
      WriteGuard g(lock);
      if (currentIndex != kNone) old = stops[currentIndex].object;
      currentIndex = currentOrder = kNone;
    }
    if (old) old->handleTabStopFocusLoss();
    return true;
  }

  TabOrderable* object = nullptr;
  {
    ReadGuard g(lock);
    if (index >= stops.size() || !stops[index].enabled) return false;
    if (index == currentIndex) return true;
    object = stops[index].object;
  }
  if (!object->isTabStopActive() || !*alive) return false;

  TabOrderable* old = nullptr;
  {
    WriteGuard g(lock);
    // The control was called unlocked: make sure its stop is still there and enabled.
    if (index >= stops.size() || stops[index].object != object || !stops[index].enabled) {
      return false;
    }
    if (currentIndex != kNone) old = stops[currentIndex].object;
    currentIndex = index;
    currentOrder = stops[index].tabOrder;
  }
  object->handleTabStopFocusReceipt();
  // The receipt handler may have destroyed this manager or the old control.
  if (*alive && old && old != object && holdsObject(old)) old->handleTabStopFocusLoss();
  return true;
}

// --- Internals (writer lock held unless noted) ---

bool TabOrderManager::makeWayForTabOrder(unsigned order, unsigned excludeIndex) {
  // An order outside the ones in use is free without looking (the usual append).
  if (excludeIndex == kNone && (stops.empty() || order > highestOrder || order < lowestOrder)) {
    return true;
  }
  std::set<unsigned> taken;
  for (unsigned i = 0; i < stops.size(); ++i) {
    if (i != excludeIndex) taken.insert(stops[i].tabOrder);
  }
  if (taken.empty() || order < *taken.begin() || order > *taken.rbegin() || !taken.count(order)) {
    return true;
  }
  // The run of directly following taken orders moves up by one, into the first free order.
  unsigned end = order;
  while (taken.count(end)) {
    if (end + 1 >= kFirstReservedOrder) return false;
    ++end;
  }
  for (unsigned i = 0; i < stops.size(); ++i) {
    if (i != excludeIndex && stops[i].tabOrder >= order && stops[i].tabOrder < end) {
      ++stops[i].tabOrder;
    }
  }
  ascending_ = false;  // the scan below finds out again
  recomputeExtremes();
  return true;
}

void TabOrderManager::recomputeExtremes() {
  lowestOrder = lowestIndex = highestOrder = highestIndex = kNone;
  // Orders rising with the index (stops appended in order, removed in any order) keep their
  // extremes at the ends: no scan, so a panel's stops leave in linear time.
  if (ascending_ && !stops.empty()) {
    lowestIndex = 0;
    lowestOrder = stops.front().tabOrder;
    highestIndex = static_cast<unsigned>(stops.size() - 1);
    highestOrder = stops.back().tabOrder;
    currentOrder = currentIndex < stops.size() ? stops[currentIndex].tabOrder : kNone;
    return;
  }
  ascending_ = true;
  for (unsigned i = 0; i < stops.size(); ++i) {
    const unsigned o = stops[i].tabOrder;
    if (i > 0 && o <= stops[i - 1].tabOrder) ascending_ = false;
    if (lowestIndex == kNone || o < lowestOrder) {
      lowestOrder = o;
      lowestIndex = i;
    }
    if (highestIndex == kNone || o > highestOrder) {
      highestOrder = o;
      highestIndex = i;
    }
  }
  currentOrder = currentIndex < stops.size() ? stops[currentIndex].tabOrder : kNone;
}

unsigned TabOrderManager::indexOfLocked(const TabOrderable* object) const {
  for (unsigned i = 0; i < stops.size(); ++i) {
    if (stops[i].object == object) return i;
  }
  return kNone;
}

TabOrderable* TabOrderManager::removeLocked(unsigned index) {
  TabOrderable* object = stops[index].object;
  stops.erase(stops.begin() + index);
  object->deregisterManager(this);
  TabOrderable* lost = nullptr;
  if (currentIndex == index) {
    currentIndex = kNone;
    lost = object;
  } else if (currentIndex != kNone && currentIndex > index) {
    --currentIndex;
  }
  recomputeExtremes();
  return lost;
}

bool TabOrderManager::setTabOrderLocked(unsigned index, unsigned order) {
  if (index >= stops.size()) return false;
  if (order == kAfterLast) {
    order = highestIndex == index ? stops[index].tabOrder : highestOrder + 1;
  }
  if (order >= kFirstReservedOrder) return false;
  if (stops[index].tabOrder == order) return true;
  if (!makeWayForTabOrder(order, index)) return false;
  stops[index].tabOrder = order;
  ascending_ = false;  // the scan below finds out again
  recomputeExtremes();
  return true;
}

bool TabOrderManager::stillHolds(unsigned index, const TabOrderable* object) const {
  ReadGuard g(lock);
  return index < stops.size() && stops[index].object == object;
}

bool TabOrderManager::holdsObject(const TabOrderable* object) const {
  ReadGuard g(lock);
  return indexOfLocked(object) != kNone;
}

void TabOrderManager::forgetObject(TabOrderable* object) {
  WriteGuard g(lock);
  // Searched from the newest: stops that go in the reverse of their coming cost no scan. The
  // extremes are recomputed only when one of them went.
  bool extremeGone = false;
  for (unsigned i = static_cast<unsigned>(stops.size()); i-- > 0;) {
    if (stops[i].object != object) continue;
    stops.erase(stops.begin() + i);
    if (currentIndex == i) {
      currentIndex = kNone;
    } else if (currentIndex != kNone && currentIndex > i) {
      --currentIndex;
    }
    if (i == lowestIndex || i == highestIndex) {
      extremeGone = true;
    } else {
      if (lowestIndex != kNone && lowestIndex > i) --lowestIndex;
      if (highestIndex != kNone && highestIndex > i) --highestIndex;
    }
    if (!allowDuplicates) break;
  }
  if (extremeGone) {
    recomputeExtremes();
  } else {
    currentOrder = currentIndex < stops.size() ? stops[currentIndex].tabOrder : kNone;
  }
}
