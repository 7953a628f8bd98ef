// A drop-down of 100,000 entries on the 1920 x 1080 screen of workload W6: the press that opens
// its list until the list's first paint, to set beside the pop-up menu's build and show
// (bench_menu). The list is made from the button's entries on every press, as in use.
#include <benchmark/benchmark.h>

#include <chrono>

#include "bench/MenuWorkload.h"
#include "dropdowns/DropDownMenuButton.h"

namespace {

constexpr int kEntries = 100000;

template <typename Fn>
double secondsOf(Fn&& fn) {
  const auto t0 = std::chrono::steady_clock::now();
  fn();
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - t0).count();
}

class DropDownWorkload {
 public:
  DropDownWorkload() {
    owner_ =
        new MessageProbe(h_.place(0, 0, MenuWorkload::kScreenWidth, MenuWorkload::kScreenHeight));
    std::vector<WString> entries;
    entries.reserve(kEntries);
    for (int i = 0; i < kEntries; ++i) entries.push_back(L"Entry " + std::to_wstring(i));
    button_ = new DropDownMenuButton(
        L"Pick", entries,
        GlobCreationInfo(200, 24, owner_->canvas(), 10, MenuWorkload::kScreenHeight - 40));
    button_->setSelectedItem(kEntries / 2);
    h_.render();
  }
  // Press on the button (the list opens below it, scrolled to the selection) and paint.
  void open() {
    h_.press(Harness::centreOf(*button_));
    h_.render();
  }
  void close() {
    h_.release(Harness::centreOf(*button_));
    button_->removeMenuFromScreen();
    button_->set_state(kButtonUp, true);
    h_.render();
  }
  bool isOpen() const { return button_->isDropDownValid(); }

 private:
  Harness h_{MenuWorkload::kScreenWidth, MenuWorkload::kScreenHeight};
  MessageProbe* owner_ = nullptr;
  DropDownMenuButton* button_ = nullptr;
};

void BM_DropDown_Open(benchmark::State& state) {
  DropDownWorkload w;
  for (auto _ : state) {
    state.SetIterationTime(secondsOf([&] { w.open(); }));
    if (!w.isOpen()) state.SkipWithError("the list did not open");
    w.close();
  }
}
BENCHMARK(BM_DropDown_Open)->UseManualTime()->Unit(benchmark::kMillisecond);

// The pop-up menu of the same length built and shown, timed as one step like the press above.
void BM_DropDown_MenuBuildAndShow(benchmark::State& state) {
  MenuWorkload w;
  for (auto _ : state) {
    state.SetIterationTime(secondsOf([&] {
      w.build(kEntries);
      w.show();
    }));
    w.close();
  }
}
BENCHMARK(BM_DropDown_MenuBuildAndShow)->UseManualTime()->Unit(benchmark::kMillisecond);

}  // namespace
