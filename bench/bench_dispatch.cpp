// Pointer dispatch over the benchmark grid: plain child Globs stand in for controls; each
// reacts to containment like a button does (it notes the change and asks for a repaint).
#include <benchmark/benchmark.h>

#include <algorithm>
#include <memory>
#include <vector>

#include "platform/testing/Harness.h"

namespace {

constexpr int kRootW = 1920;
constexpr int kRootH = 1080;

class StandIn : public Glob {
 public:
  using Glob::Glob;
  int react(Event* e) override {
    if (mouse_down_event(e)) {
      down_ = !down_;
      update();
      return 1;
    }
    return mouse_event(e) ? 1 : Glob::react(e);
  }
  void handleMouseContainment(bool inside) override {
    inside_ = inside;
    update();
  }

 private:
  bool inside_ = false;
  bool down_ = false;
};

struct GridScene {
  explicit GridScene(int n) : harness(kRootW, kRootH) {
    const int rows = (n + 9) / 10;
    const int panelH = std::max(kRootH, 4 + rows * 32);
    // The panel's top edge is at the root's top: a scrolled view at offset 0.
    panel = new Glob(harness.place(0, kRootH - panelH, kRootW, panelH));
    for (int i = 0; i < n; ++i) {
      const int x = 4 + (i % 10) * 184;
      const int top = 4 + (i / 10) * 32;
      new StandIn(GlobCreationInfo(180, 28, panel->canvas(), x, panelH - top - 28));
    }
    harness.paint();
  }
  Harness harness;
  Glob* panel;
};

void BM_PointerMove(benchmark::State& state) {
  GridScene scene(static_cast<int>(state.range(0)));
  RootGlob& root = scene.harness.root();
  long k = 0;
  for (auto _ : state) {
    for (int i = 0; i < 10000; ++i, ++k) {
      const int x = static_cast<int>((k * 7919) % kRootW);
      const int yTop = static_cast<int>((k * 104729) % kRootH);
      root.injectMouse(kEventMouseMove, XY<int>(x, kRootH - 1 - yTop));
    }
    state.PauseTiming();
    scene.harness.paint();  // painting is not part of the measure; keep damage bounded
    state.ResumeTiming();
  }
  state.SetItemsProcessed(state.iterations() * 10000);
  state.counters["ns_per_move"] =
      benchmark::Counter(static_cast<double>(state.iterations()) * 10000,
                         benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}
BENCHMARK(BM_PointerMove)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);

void BM_ClickVisibleCells(benchmark::State& state) {
  GridScene scene(static_cast<int>(state.range(0)));
  RootGlob& root = scene.harness.root();
  // Centres of the visible cells of kind 1 (the check boxes of the scene).
  std::vector<XY<int>> targets;
  for (int i = 1; i < state.range(0); i += 4) {
    const int top = 4 + (i / 10) * 32;
    if (top + 28 > kRootH) break;
    targets.emplace_back(4 + (i % 10) * 184 + 90, kRootH - top - 14);
  }
  size_t t = 0;
  for (auto _ : state) {
    for (int i = 0; i < 1000; ++i) {
      const XY<int> p = targets[t++ % targets.size()];
      root.injectMouse(kEventLeftDown, p);
      root.injectMouse(kEventLeftUp, p);
    }
    state.PauseTiming();
    scene.harness.paint();
    state.ResumeTiming();
  }
  state.counters["ns_per_click"] =
      benchmark::Counter(static_cast<double>(state.iterations()) * 1000,
                         benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}
BENCHMARK(BM_ClickVisibleCells)->Arg(1000)->Unit(benchmark::kMillisecond);

}  // namespace
