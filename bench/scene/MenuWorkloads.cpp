// W6: a pop-up menu of 100,000 items, built, shown until its first paint and scrolled by one
// page until repainted, with the steps the menu benchmark also runs.
#include "bench/MenuWorkload.h"
#include "bench/scene/SceneReport.h"
#include "bench/scene/Workloads.h"

namespace scene {

void runMenu() {
  constexpr int kItems = 100000;
  constexpr int kReps = 7;
  constexpr int kPages = 40;
  Samples built, shown, paged, closed;
  MenuWorkload w;
  for (int r = 0; r < kReps; ++r) {
    double t0 = nowMs();
    w.build(kItems);
    double t1 = nowMs();
    w.show();
    double t2 = nowMs();
    built.add(t1 - t0);
    shown.add(t2 - t1);
    if (r == 0) {
      const Menu* m = w.menu();
      note("W6 menu: " + std::to_string(m->nonHiddenRowCount()) + " rows, " +
           std::to_string(m->visibleItems().size()) + " in view, " + std::to_string(m->width()) +
           "x" + std::to_string(m->height()) + " on a 1920x1080 screen");
    }
    // Only the first pass counts for scrolling: later passes would find the rows' labels
    // already shaped.
    for (int p = 0; r == 0 && p < kPages && !w.atEnd(); ++p) {
      t0 = nowMs();
      w.scrollPage();
      paged.add(nowMs() - t0);
    }
    t0 = nowMs();
    w.close();
    closed.add(nowMs() - t0);
  }
  report("W6_menu_build_ms", built);
  report("W6_menu_show_ms", shown);
  report("W6_menu_pagedown_ms", paged);
  report("W6_menu_destroy_ms", closed);
}

}  // namespace scene
