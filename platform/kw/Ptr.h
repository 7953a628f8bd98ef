#pragma once
// Intrusive reference counting: objects carry their own count, so a raw pointer can be turned
// back into a counted one without a separate control block.
#include <cstddef>
#include <utility>

namespace Kw {

class RefCounted {
 public:
  RefCounted() = default;
  RefCounted(const RefCounted&) : refs_(0) {}
  RefCounted& operator=(const RefCounted&) { return *this; }
  virtual ~RefCounted() = default;

  void addRef() const { ++refs_; }
  void release() const {
    if (--refs_ == 0) delete this;
  }
  int refCount() const { return refs_; }

 private:
  mutable int refs_ = 0;
};

template <typename T>
class Ptr {
 public:
  Ptr() = default;
  Ptr(std::nullptr_t) {}
  Ptr(T* p) : p_(p) { acquire(); }
  Ptr(const Ptr& o) : p_(o.p_) { acquire(); }
  Ptr(Ptr&& o) noexcept : p_(std::exchange(o.p_, nullptr)) {}
  template <typename U>
  Ptr(const Ptr<U>& o) : p_(o.get()) {
    acquire();
  }
  ~Ptr() { drop(); }

  Ptr& operator=(const Ptr& o) {
    Ptr(o).swap(*this);
    return *this;
  }
  Ptr& operator=(Ptr&& o) noexcept {
    Ptr(std::move(o)).swap(*this);
    return *this;
  }
  Ptr& operator=(T* p) {
    Ptr(p).swap(*this);
    return *this;
  }

  void swap(Ptr& o) noexcept { std::swap(p_, o.p_); }
  void reset() { Ptr().swap(*this); }

  T* get() const { return p_; }
  T* operator->() const { return p_; }
  T& operator*() const { return *p_; }
  explicit operator bool() const { return p_ != nullptr; }
  friend bool operator==(const Ptr& a, const Ptr& b) { return a.p_ == b.p_; }

 private:
  void acquire() {
    if (p_) p_->addRef();
  }
  void drop() {
    if (p_) p_->release();
    p_ = nullptr;
  }
  T* p_ = nullptr;
};

template <typename T, typename U>
Ptr<T> ptr_cast(const Ptr<U>& p) {
  return Ptr<T>(dynamic_cast<T*>(p.get()));
}

}  // namespace Kw
