#pragma once
// What every adaptor shares: the set of controls bound to it. The adaptor is reference counted
// (controls and the code that made it share it); the set holds plain pointers, kept honest from
// both ends: a control leaving removes itself, and a dying adaptor makes its controls forget it.
#include <memory>
#include <set>
#include <vector>

#include "platform/kw/Ptr.h"

class WidgetBase;

class AdaptorBase : public Kw::RefCounted {
 public:
  AdaptorBase() = default;
  ~AdaptorBase() override;
  AdaptorBase(const AdaptorBase&) = delete;
  AdaptorBase& operator=(const AdaptorBase&) = delete;

  // Adds `w` to `attached` (no duplicates). Null is ignored.
  void attachTo(WidgetBase* w);
  void detachFrom(WidgetBase* w);
  bool isAttached(const WidgetBase* w) const {
    return w && attached.count(const_cast<WidgetBase*>(w)) != 0;
  }
  size_t numAttached() const { return attached.size(); }

 protected:
  // Calls fn(control) for each control attached when the walk began that is still attached
  // when its turn comes. Stops early if a control's handler destroyed this adaptor; returns
  // false then.
  template <typename Fn>
  bool forEachAttached(Fn&& fn) {
    const std::shared_ptr<bool> alive = alive_;
    const std::vector<WidgetBase*> walk(attached.begin(), attached.end());
    for (WidgetBase* w : walk) {
      if (!attached.count(w)) continue;
      fn(w);
      if (!*alive) return false;
    }
    return true;
  }

  // Ordered by pointer value, as the set orders it.
  std::set<WidgetBase*> attached;

 private:
  std::shared_ptr<bool> alive_ = std::make_shared<bool>(true);
};
