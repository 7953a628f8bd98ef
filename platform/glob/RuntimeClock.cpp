#include "platform/glob/RuntimeClock.h"

#include <chrono>

namespace {
bool gManual = false;
int64_t gManualNow = 0;
const auto gStart = std::chrono::steady_clock::now();
}  // namespace

int64_t RuntimeClock::now() {
  if (gManual) return gManualNow;
  return std::chrono::duration_cast<std::chrono::milliseconds>(std::chrono::steady_clock::now() -
                                                               gStart)
      .count();
}

void RuntimeClock::setManual(bool manual, int64_t startMs) {
  gManual = manual;
  gManualNow = startMs;
}

bool RuntimeClock::isManual() {
  return gManual;
}

void RuntimeClock::setManualTime(int64_t ms) {
  if (ms > gManualNow) gManualNow = ms;
}
