#include "platform/kw/RWLock.h"

#include <thread>

namespace Kw {

namespace {

// Spins first: the holder is usually another short query; then leaves the core to it.
void backOff(int& attempts) {
  constexpr int kSpins = 64;
  if (++attempts > kSpins) std::this_thread::yield();
}

}  // namespace

void RWLock::lockRead() const {
  int attempts = 0;
  for (;;) {
    int32_t s = state_.load(std::memory_order_relaxed);
    if (s != kWriter && state_.compare_exchange_weak(s, s + 1, std::memory_order_acquire)) return;
    backOff(attempts);
  }
}

void RWLock::lockWrite() const {
  int attempts = 0;
  for (;;) {
    int32_t free = 0;
    if (state_.compare_exchange_weak(free, kWriter, std::memory_order_acquire)) return;
    backOff(attempts);
  }
}

}  // namespace Kw
