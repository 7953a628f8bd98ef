// W1 and W5: building and tearing down the scene, and what it holds.
#include <string>

#include "bench/scene/SceneBuild.h"
#include "bench/scene/SceneReport.h"
#include "bench/scene/Workloads.h"
#include "platform/backend/RootRenderer.h"
#include "platform/glob/RootGlob.h"

namespace scene {

namespace {

void timeBuilds(RootGlob& screen, Placement placement, const std::string& prefix) {
  for (int n : {100, 1000, 10000}) {
    const int reps = n == 100 ? 30 : n == 1000 ? 10 : 3;
    Samples built, destroyed;
    for (int r = 0; r < reps; ++r) {
      const double t0 = nowMs();
      Scene s = build(screen, n, placement);
      const double t1 = nowMs();
      if (r == 0) {
        if (const int bad = geometryMismatches(s)) {
          note(prefix + " N=" + std::to_string(n) + " geometry mismatches: " + std::to_string(bad));
        }
      }
      const double t2 = nowMs();
      destroy(s);
      const double t3 = nowMs();
      built.add(t1 - t0);
      destroyed.add(t3 - t2);
    }
    report(prefix + "_build_N" + std::to_string(n) + "_ms", built);
    report(prefix + "_destroy_N" + std::to_string(n) + "_ms", destroyed);
  }
}

}  // namespace

void runBuildAndDestroy() {
  RootGlob screen(kScreenW, kScreenH);
  {
    Scene warm = build(screen, 100, Placement::Direct);
    destroy(warm);
  }
  timeBuilds(screen, Placement::Direct, "W1");
  timeBuilds(screen, Placement::AddWidget, "W1addWidget");
  // Nothing is deferred to the first paint but shaping of the labels, which no peer counts.
  note("W1: controls are complete when constructed; text is shaped when first drawn");
}

void runMemory() {
  RootGlob screen(kScreenW, kScreenH);
  {
    Scene warm = build(screen, 100, Placement::Direct);
    RootRenderer r(screen);
    r.render();
    destroy(warm);
    r.render();
  }
  if (!resetPeakRss()) note("W5: could not reset VmHWM");
  const long hwm0 = statusKb("VmHWM"), rss0 = statusKb("VmRSS");
  const long heap0 = heapBytes();
  constexpr int n = 10000;
  Scene s = build(screen, n, Placement::Direct);
  const long hwm1 = statusKb("VmHWM"), rss1 = statusKb("VmRSS");
  const long heap1 = heapBytes();
  reportOne("W5_peakrss_bytes_per_control", (hwm1 - hwm0) * 1024.0 / n);
  reportOne("W5_rss_bytes_per_control", (rss1 - rss0) * 1024.0 / n);
  reportOne("W5_heap_bytes_per_control", double(heap1 - heap0) / n);
  {
    RootRenderer r(screen);
    r.render();
    const long hwm2 = statusKb("VmHWM");
    reportOne("W5_peakrss_shown_bytes_per_control", (hwm2 - hwm0) * 1024.0 / n);
  }
  destroy(s);
}

}  // namespace scene
