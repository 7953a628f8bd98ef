// Workload W6: a pop-up menu of 100,000 items. Targets: build at most 20 ms, show until the
// first paint at most 2 ms, scroll by one page until repainted at most 0.5 ms.
#include <benchmark/benchmark.h>

#include <chrono>

#include "bench/MenuWorkload.h"

namespace {

constexpr int kItems = 100000;

template <typename Fn>
double secondsOf(Fn&& fn) {
  const auto t0 = std::chrono::steady_clock::now();
  fn();
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - t0).count();
}

void BM_W6_Build(benchmark::State& state) {
  MenuWorkload w;
  for (auto _ : state) {
    state.SetIterationTime(secondsOf([&] { w.build(kItems); }));
    w.close();
  }
}
BENCHMARK(BM_W6_Build)->UseManualTime()->Unit(benchmark::kMillisecond);

void BM_W6_Show(benchmark::State& state) {
  MenuWorkload w;
  for (auto _ : state) {
    w.build(kItems);
    state.SetIterationTime(secondsOf([&] { w.show(); }));
    w.close();
  }
}
BENCHMARK(BM_W6_Show)->UseManualTime()->Unit(benchmark::kMillisecond);

void BM_W6_ScrollPage(benchmark::State& state) {
  MenuWorkload w;
  w.build(kItems);
  w.show();
  for (auto _ : state) {
    if (w.atEnd()) w.rewind();
    state.SetIterationTime(secondsOf([&] { w.scrollPage(); }));
  }
  benchmark::DoNotOptimize(w.menu()->scrollOffset());
}
BENCHMARK(BM_W6_ScrollPage)->UseManualTime()->Unit(benchmark::kMicrosecond);

}  // namespace
