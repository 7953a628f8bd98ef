// W4: pointer moves and clicks delivered to S(1000) with no painting inside the timed loops.
#include <string>

#include "bench/scene/SceneBuild.h"
#include "bench/scene/SceneReport.h"
#include "bench/scene/Workloads.h"
#include "buttons/Checkbox.h"
#include "platform/backend/RootRenderer.h"
#include "platform/glob/RootGlob.h"
#include "platform/glob/RuntimeClock.h"

namespace scene {

namespace {

XY<int> jumpPoint(long k) {
  return XY<int>(static_cast<int>(k * 7919 % kScreenW),
                 screenY(static_cast<int>(k * 104729 % kScreenH)));
}

XY<int> sweepPoint(long k) {
  const long p = k * 3;
  const int row = static_cast<int>((p / kScreenW) % kVisibleRows);
  return XY<int>(static_cast<int>(p % kScreenW), screenY(kGap + row * kPitchY + kCellH / 2));
}

int clickIndex(int c) {
  return 1 + 4 * (c % kVisibleChecks);
}

}  // namespace

void runInput() {
  RootGlob screen(kScreenW, kScreenH);
  Scene s = build(screen, 1000, Placement::Direct);
  RootRenderer r(screen);
  r.render();

  for (int pass = 0; pass < 2; ++pass) {
    Samples batches;
    long k = 0;
    for (int batch = 0; batch < 10; ++batch) {
      const double t = nowMs();
      for (int e = 0; e < 1000; ++e, ++k) {
        screen.injectMouse(kEventMouseMove, pass == 0 ? jumpPoint(k) : sweepPoint(k));
      }
      batches.add((nowMs() - t) * 1000.0 / 1000);
    }
    report(pass == 0 ? "W4_move_jump_us_per_event" : "W4_move_sweep_us_per_event", batches);
    r.render();  // the hover repaints that piled up, untimed
  }

  // Presses a second apart on the manual clock: none of them makes a double click.
  RuntimeClock::setManual(true, 0);
  int64_t clock = 0;
  Samples clicks;
  int c = 0;
  for (int batch = 0; batch < 10; ++batch) {
    const double t = nowMs();
    for (int e = 0; e < 100; ++e, ++c) {
      const int i = clickIndex(c);
      const XY<int> at(cellLeft(i) + 10, screenY(cellTop(i) + kCellH / 2));
      clock += 1000;
      RuntimeClock::setManualTime(clock);
      screen.injectMouse(kEventLeftDown, at);
      screen.injectMouse(kEventLeftUp, at);
    }
    clicks.add((nowMs() - t) * 1000.0 / 100);
  }
  report("W4_click_us_per_click", clicks);
  int on = 0;
  for (Glob* g : s.controls) {
    if (auto* box = dynamic_cast<Checkbox*>(g); box && box->getState()) ++on;
  }
  note("W4 toggles observed: " + std::to_string(s.panel->toggles()) +
       " of 1000; boxes now on: " + std::to_string(on) + " (want 4)");
  RuntimeClock::setManual(false);
  r.render();
  destroy(s);
}

}  // namespace scene
