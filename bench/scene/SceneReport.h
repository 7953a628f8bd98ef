#pragma once
// Timing and the result lines of the scene benchmark, in the format the comparison run reads:
// "R globkit <key> <median> <min> <max> <samples>" and "N globkit <text>".
#include <string>
#include <vector>

namespace scene {

double nowMs();

class Samples {
 public:
  void add(double v) { values_.push_back(v); }
  double median() const;
  double min() const;
  double max() const;
  size_t count() const { return values_.size(); }

 private:
  std::vector<double> values_;
};

void report(const std::string& key, const Samples& s);
void reportOne(const std::string& key, double v);
void note(const std::string& text);

// Memory bandwidth of this process (a memset of one 1920 x 1080 x 4 image), so that figures
// can be set against the peers' as ratios within one run.
void calibrate();

// Resident-set figures in kB from /proc/self/status; -1 when unreadable.
long statusKb(const char* field);
// Lets the next VmHWM reading be the peak reached from now on; false when refused.
bool resetPeakRss();
// Bytes the allocator has handed out.
long heapBytes();

}  // namespace scene
