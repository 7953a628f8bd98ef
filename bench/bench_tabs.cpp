// Opening a lazy dialogue of 1,000 deferred pages and selecting its first page (target: at
// most 5 ms).
#include <benchmark/benchmark.h>

#include <string>

#include "panels/LazyTabbedDialogue.h"
#include "platform/testing/Harness.h"

namespace {

class EmptyPages : public LazyTabbedDialogue {
 public:
  using LazyTabbedDialogue::LazyTabbedDialogue;
  void buildPage(const WString&) override {}
};

void BM_OpenLazyDialogueOf1000Pages(benchmark::State& state) {
  Harness h(1280, 820);
  for (auto _ : state) {
    EmptyPages dlg(h.place(0, 0, 900, 600));
    for (int i = 0; i < 1000; ++i) {
      dlg.addPageDeferred(L"Page " + std::to_wstring(i), kTabDefaultColour);
    }
    dlg.selectPage(L"Page 0", true, true);
    benchmark::DoNotOptimize(dlg.currentPageBuilt());
  }
}
BENCHMARK(BM_OpenLazyDialogueOf1000Pages)->Unit(benchmark::kMillisecond);

}  // namespace
