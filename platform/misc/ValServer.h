#pragma once
// An observable value of type T. Setting an equal value changes nothing and tells no one.
#include <utility>

#include "platform/misc/ValServerBase.h"

template <typename T>
class ValServer : public ValServerBase {
 public:
  ValServer() = default;
  explicit ValServer(T value) : value_(std::move(value)) {}

  const T& getValue() const { return value_; }

  // Returns true when the value changed. The clients that asked are told before, all clients
  // after; a client's handler may destroy this server, which ends the call at once (false).
  bool setValue(const T& value) {
    if (value_ == value) return false;
    if (!notifyPreChange()) return false;
    value_ = value;
    notifyChanged();
    return true;
  }

 private:
  T value_{};
};
