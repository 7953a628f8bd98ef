#pragma once
// A record of settings shared by every holder until one of them changes it. Holders that keep
// the defaults all point at one instance, so a control whose settings are the defaults pays for
// one pointer; copying a holder copies the pointer. Single-threaded, like the GUI objects.
#include <memory>

namespace Kw {

template <typename T>
class SharedRecord {
 public:
  SharedRecord() : record_(defaults()) {}

  const T& operator*() const { return *record_; }
  const T* operator->() const { return record_.get(); }

  // The record for changing, made this holder's own first when another holder shares it.
  T& edit() {
    if (record_.use_count() > 1) record_ = std::make_shared<T>(*record_);
    return *record_;
  }
  // Back to the shared defaults.
  void reset() { record_ = defaults(); }
  bool isDefault() const { return record_ == defaults(); }

 private:
  static const std::shared_ptr<T>& defaults() {
    static const std::shared_ptr<T> d = std::make_shared<T>();
    return d;
  }

  std::shared_ptr<T> record_;
};

}  // namespace Kw
