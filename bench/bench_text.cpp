// Typing, pasting and undoing in long texts: the editing model on its own, then the text box
// with the relayout of what it shows.
#include <benchmark/benchmark.h>

#include "platform/misc/InProcessClipboard.h"
#include "platform/misc/WindowsClipboard.h"
#include "platform/testing/Harness.h"
#include "text/TextBox.h"
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

// --- The text box: the model plus the ruler, the scroll offset and the caret ---

namespace {

// A focused 300-pixel box holding `text`, with the caret at the end.
TextBox* focusedBox(Harness& h, const WString& text) {
  TextBox::InitArgs args;
  args.info = h.place(10, 10, 300, 24);
  args.text = text;
  auto* box = new TextBox(args);
  box->set_kbd_focus();
  h.key(kKeyEnd);
  h.pump();
  return box;
}

// One key typed at the end of a 10,000-character text, through the screen's key routing, with
// the relayout of what the box shows (ruler, scroll offset, caret). Arg 1 also repaints the
// box into the screen's image.
void BM_TextBoxTypeAtEndOf10k(benchmark::State& state) {
  Harness h(400, 60);
  const WString base = sampleText(10000);
  TextBox* box = focusedBox(h, base);
  const bool repaint = state.range(0) != 0;
  if (repaint) h.render();
  int typed = 0;
  for (auto _ : state) {
    h.key(static_cast<unsigned>(L'a' + typed % 26));
    if (repaint) h.render();
    if (++typed % 1000 == 0) {
      state.PauseTiming();
      box->setText(base);
      h.pump();
      state.ResumeTiming();
    }
  }
  benchmark::DoNotOptimize(box->caretDisplayX());
}
BENCHMARK(BM_TextBoxTypeAtEndOf10k)->Arg(0)->Arg(1)->Unit(benchmark::kMicrosecond);

// One key typed in the middle of a 10,000-character text: only the pieces round the caret are
// measured again.
void BM_TextBoxTypeInMiddleOf10k(benchmark::State& state) {
  Harness h(400, 60);
  const WString base = sampleText(10000);
  TextBox* box = focusedBox(h, base);
  box->setCursorPosition(static_cast<unsigned short>(5000));
  int typed = 0;
  for (auto _ : state) {
    h.key(static_cast<unsigned>(L'a' + typed % 26));
    if (++typed % 1000 == 0) {
      state.PauseTiming();
      box->setText(base);
      box->setCursorPosition(static_cast<unsigned short>(5000));
      state.ResumeTiming();
    }
  }
}
BENCHMARK(BM_TextBoxTypeInMiddleOf10k)->Unit(benchmark::kMicrosecond);

// Ctrl+V of 100,000 characters over a short selection of a 10,000-character text: the model's
// paste and the measuring of the whole new line.
void BM_TextBoxPaste100k(benchmark::State& state) {
  Harness h(400, 60);
  InProcessClipboard clipboard;
  WindowsClipboard::setProvider(&clipboard);
  const WString base = sampleText(10000);
  clipboard.setText(sampleText(100000));
  TextBox* box = focusedBox(h, base);
  for (auto _ : state) {
    state.PauseTiming();
    box->setText(base);
    box->setSelection(NumRange<int, true>(5000, 5010));
    state.ResumeTiming();
    h.key(TextBoxBase::kKeyPaste);
  }
  WindowsClipboard::setProvider(nullptr);
}
BENCHMARK(BM_TextBoxPaste100k)->Unit(benchmark::kMillisecond);

// One Ctrl+Z after typing 100 words at the end of a 10,000-character text.
void BM_TextBoxUndoAfter100Words(benchmark::State& state) {
  Harness h(400, 60);
  const WString base = sampleText(10000);
  TextBox* box = focusedBox(h, base);
  for (auto _ : state) {
    state.PauseTiming();
    box->setText(base);
    for (int w = 0; w < 100; ++w) h.type(w > 0 ? L" quick" : L"quick");
    state.ResumeTiming();
    h.key(TextBoxBase::kKeyUndo);
  }
}
BENCHMARK(BM_TextBoxUndoAfter100Words)->Iterations(300)->Unit(benchmark::kMicrosecond);

}  // namespace
