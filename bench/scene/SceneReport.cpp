#include "bench/scene/SceneReport.h"

#include <malloc.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace scene {

double nowMs() {
  using namespace std::chrono;
  return duration<double, std::milli>(steady_clock::now().time_since_epoch()).count();
}

double Samples::median() const {
  if (values_.empty()) return 0.0;
  std::vector<double> s = values_;
  std::sort(s.begin(), s.end());
  const size_t n = s.size();
  return n % 2 ? s[n / 2] : 0.5 * (s[n / 2 - 1] + s[n / 2]);
}

double Samples::min() const {
  return values_.empty() ? 0.0 : *std::min_element(values_.begin(), values_.end());
}

double Samples::max() const {
  return values_.empty() ? 0.0 : *std::max_element(values_.begin(), values_.end());
}

void report(const std::string& key, const Samples& s) {
  std::printf("R globkit %s %.6g %.6g %.6g %zu\n", key.c_str(), s.median(), s.min(), s.max(),
              s.count());
  std::fflush(stdout);
}

void reportOne(const std::string& key, double v) {
  std::printf("R globkit %s %.6g %.6g %.6g 1\n", key.c_str(), v, v, v);
  std::fflush(stdout);
}

void note(const std::string& text) {
  std::printf("N globkit %s\n", text.c_str());
  std::fflush(stdout);
}

void calibrate() {
  const size_t bytes = size_t{1920} * 1080 * 4;
  std::vector<unsigned char> buf(bytes);
  Samples s;
  for (int r = 0; r < 40; ++r) {
    const double t0 = nowMs();
    std::memset(buf.data(), r & 0xFF, bytes);
    asm volatile("" ::"r"(buf.data()) : "memory");
    s.add(nowMs() - t0);
  }
  report("CAL_memset_1080p_ms", s);
}

long statusKb(const char* field) {
  FILE* f = std::fopen("/proc/self/status", "r");
  if (!f) return -1;
  char line[256];
  long v = -1;
  const size_t len = std::strlen(field);
  while (std::fgets(line, sizeof line, f)) {
    if (std::strncmp(line, field, len) == 0 && line[len] == ':') {
      v = std::atol(line + len + 1);
      break;
    }
  }
  std::fclose(f);
  return v;
}

bool resetPeakRss() {
  FILE* f = std::fopen("/proc/self/clear_refs", "w");
  if (!f) return false;
  const bool wrote = std::fputs("5", f) >= 0;
  return std::fclose(f) == 0 && wrote;
}

long heapBytes() {
  const struct mallinfo2 mi = mallinfo2();
  return static_cast<long>(mi.uordblks + mi.hblkhd);
}

}  // namespace scene
