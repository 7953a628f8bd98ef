// The text-editing model on its own: typing, pasting and undoing in long texts. The text box
// will add the relayout of the visible stretch on top of these figures.
#include <benchmark/benchmark.h>

#include "text/TextEditModel.h"

namespace {

WString sampleText(std::size_t length) {
  const WString words = L"lorem ipsum dolor sit amet, consectetur adipiscing elit ";
  WString s;
  s.reserve(length);
  while (s.size() < length) s += words;
  s.resize(length);
  return s;
}

// One key typed at the end of a 10,000-character text. Every 1,000 keys the text is put back,
// so it stays between 10,000 and 11,000 characters and the undo list runs at its full depth.
void BM_TypeAtEndOf10k(benchmark::State& state) {
  const WString base = sampleText(10000);
  TextEditModel model;
  model.setText(base);
  int typed = 0;
  for (auto _ : state) {
    benchmark::DoNotOptimize(model.handleKey(L'a' + typed % 26));
    if (++typed % 1000 == 0) {
      state.PauseTiming();
      model.setText(base);
      state.ResumeTiming();
    }
  }
}
BENCHMARK(BM_TypeAtEndOf10k);

// One key typed in the middle of a 10,000-character text.
void BM_TypeInMiddleOf10k(benchmark::State& state) {
  const WString base = sampleText(10000);
  TextEditModel model;
  model.setText(base);
  model.setCaret(5000);
  int typed = 0;
  for (auto _ : state) {
    benchmark::DoNotOptimize(model.handleKey(L'a' + typed % 26));
    if (++typed % 1000 == 0) {
      state.PauseTiming();
      model.setText(base);
      model.setCaret(5000);
      state.ResumeTiming();
    }
  }
}
BENCHMARK(BM_TypeInMiddleOf10k);

// 100,000 characters pasted over a short selection in the middle of a 10,000-character text.
void BM_Paste100k(benchmark::State& state) {
  const WString base = sampleText(10000);
  const WString clip = sampleText(100000);
  TextEditModel model;
  for (auto _ : state) {
    state.PauseTiming();
    model.setText(base);
    model.select(5000, 5010);
    state.ResumeTiming();
    benchmark::DoNotOptimize(model.paste(clip));
  }
  state.SetItemsProcessed(state.iterations() * static_cast<int64_t>(clip.size()));
}
BENCHMARK(BM_Paste100k)->Unit(benchmark::kMillisecond);

// One undo after typing 100 words; the undo takes back the last word. Arg 0 types at the end
// of a 10,000-character text, arg 1 in its middle. The setup dwarfs the timed undo, so the
// iteration count is fixed.
void BM_UndoWordAfter100Words(benchmark::State& state) {
  const WString base = sampleText(10000);
  const WString word = L"quick";
  TextEditModel model;
  for (auto _ : state) {
    state.PauseTiming();
    model.setText(base);
    model.setCaret(state.range(0) == 0 ? model.length() : 5000);
    for (int w = 0; w < 100; ++w) {
      if (w > 0) model.handleKey(L' ');
      for (wchar_t ch : word) model.handleKey(ch);
    }
    state.ResumeTiming();
    benchmark::DoNotOptimize(model.undo());
  }
}
BENCHMARK(BM_UndoWordAfter100Words)
    ->Arg(0)
    ->Arg(1)
    ->Iterations(2000)
    ->Unit(benchmark::kMicrosecond);

}  // namespace
