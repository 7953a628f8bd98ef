#pragma once
// The observers of one observable object, safe to change while they are being notified: an
// observer removed during a walk is skipped (its slot is emptied and compacted afterwards), one
// added during a walk waits for the next, and a list destroyed by an observer's handler ends
// the walk without touching freed memory.
#include <algorithm>
#include <memory>
#include <vector>

template <typename Observer>
class ObserverList {
 public:
  ObserverList() : alive_(std::make_shared<bool>(true)) {}
  ~ObserverList() { *alive_ = false; }
  ObserverList(const ObserverList&) = delete;
  ObserverList& operator=(const ObserverList&) = delete;

  // False for null or for an observer already listed.
  bool add(Observer* o) {
    if (!o || contains(o)) return false;
    items_.push_back(o);
    return true;
  }

  bool remove(Observer* o) {
    auto it = std::find(items_.begin(), items_.end(), o);
    if (!o || it == items_.end()) return false;
    if (walking_ > 0) {
      *it = nullptr;
      hasHoles_ = true;
    } else {
      items_.erase(it);
    }
    return true;
  }

  bool contains(const Observer* o) const {
    return o && std::find(items_.begin(), items_.end(), o) != items_.end();
  }

  size_t size() const {
    return static_cast<size_t>(std::count_if(items_.begin(), items_.end(),
                                             [](const Observer* o) { return o != nullptr; }));
  }

  std::vector<Observer*> snapshot() const {
    std::vector<Observer*> out;
    for (Observer* o : items_) {
      if (o) out.push_back(o);
    }
    return out;
  }

  // Calls fn(observer) for each observer listed when the walk began and still listed when its
  // turn comes. Returns false when the list was destroyed during the walk.
  template <typename Fn>
  bool forEach(Fn&& fn) {
    const std::shared_ptr<bool> alive = alive_;
    ++walking_;
    const size_t n = items_.size();
    for (size_t i = 0; i < n; ++i) {
      Observer* o = items_[i];
      if (!o) continue;
      fn(o);
      if (!*alive) return false;
    }
    if (--walking_ == 0 && hasHoles_) {
      items_.erase(std::remove(items_.begin(), items_.end(), nullptr), items_.end());
      hasHoles_ = false;
    }
    return true;
  }

 private:
  std::vector<Observer*> items_;
  int walking_ = 0;
  bool hasHoles_ = false;
  std::shared_ptr<bool> alive_;
};
