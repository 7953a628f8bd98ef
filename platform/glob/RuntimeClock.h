#pragma once
// The runtime clock in milliseconds. Real time by default; tests switch it to a manual clock
// that moves only when told.
#include <cstdint>

class RuntimeClock {
 public:
  // Milliseconds since the clock started (real) or the manual reading.
  static int64_t now();
  static void setManual(bool manual, int64_t startMs = 0);
  static bool isManual();
  // Moves a manual clock to `ms` (never backwards); no effect on the real clock.
  static void setManualTime(int64_t ms);
};
