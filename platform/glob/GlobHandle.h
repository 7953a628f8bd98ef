#pragma once
// A pointer to a Glob that knows when the Glob has been deleted: get() returns null from then
// on, even if a new Glob later takes the same address.
#include <cstdint>

#include "platform/glob/Glob.h"

template <typename T = Glob>
class GlobHandle {
 public:
  GlobHandle() = default;
  GlobHandle(T* g) : p_(g), serial_(g ? static_cast<const Glob*>(g)->serial() : 0) {}

  T* get() const { return p_ && glob_serial_is_alive(p_, serial_) ? p_ : nullptr; }
  bool alive() const { return get() != nullptr; }
  T* operator->() const { return get(); }
  explicit operator bool() const { return alive(); }
  void reset() {
    p_ = nullptr;
    serial_ = 0;
  }
  // Compares identities, alive or not.
  bool refersTo(const T* g) const {
    return g && p_ == g && serial_ == static_cast<const Glob*>(g)->serial();
  }

 private:
  T* p_ = nullptr;
  uint64_t serial_ = 0;
};
