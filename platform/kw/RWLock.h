#pragma once
// Reader-writer lock of the core module, one 32-bit word: every focusable control carries
// one, so it must cost no more than a counter. Contention is rare (the GUI thread does nearly
// all the work), so a waiter spins briefly and then yields its time slice. Read locks may be
// taken again by a thread that holds one; a write lock is not recursive. The constructor's
// tuning parameters are accepted for callers that pass them and have no effect.
#include <atomic>
#include <cstdint>

namespace Kw {

class RWLock {
 public:
  RWLock() = default;
  RWLock(int /*spin*/, int /*sleepMs*/, int /*recursive*/) {}
  RWLock(const RWLock&) = delete;
  RWLock& operator=(const RWLock&) = delete;

  void lockRead() const;
  void unlockRead() const { state_.fetch_sub(1, std::memory_order_release); }
  void lockWrite() const;
  void unlockWrite() const { state_.store(0, std::memory_order_release); }

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
  static constexpr int32_t kWriter = -1;
  // The number of readers, or kWriter while a writer holds the lock.
  mutable std::atomic<int32_t> state_{0};
};

}  // namespace Kw
