#pragma once
// Reader-writer lock of the core module. The constructor's tuning parameters are accepted for
// compatibility with callers that pass them and have no effect on this implementation.
#include <shared_mutex>

namespace Kw {

class RWLock {
 public:
  RWLock() = default;
  RWLock(int /*spin*/, int /*sleepMs*/, int /*recursive*/) {}
  RWLock(const RWLock&) = delete;
  RWLock& operator=(const RWLock&) = delete;

  void lockRead() const { mutex_.lock_shared(); }
  void unlockRead() const { mutex_.unlock_shared(); }
  void lockWrite() const { mutex_.lock(); }
  void unlockWrite() const { mutex_.unlock(); }

  class ReadGuard {
   public:
    explicit ReadGuard(const RWLock& l) : l_(l) { l_.lockRead(); }
    ~ReadGuard() { l_.unlockRead(); }
    ReadGuard(const ReadGuard&) = delete;
    ReadGuard& operator=(const ReadGuard&) = delete;

   private:
    const RWLock& l_;
  };
  class WriteGuard {
   public:
    explicit WriteGuard(const RWLock& l) : l_(l) { l_.lockWrite(); }
    ~WriteGuard() { l_.unlockWrite(); }
    WriteGuard(const WriteGuard&) = delete;
    WriteGuard& operator=(const WriteGuard&) = delete;

   private:
    const RWLock& l_;
  };

 private:
  mutable std::shared_mutex mutex_;
};

}  // namespace Kw
