// Rendering the benchmark scene: a 1920 x 1080 root showing the top of a panel with a grid of
// 1,000 cells, each a bevelled box with a label. Measures a full repaint and the repaint after
// one label changes.
#include <benchmark/benchmark.h>

#include <memory>
#include <vector>

#include "platform/backend/RootRenderer.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glob/RootGlob.h"

namespace {

constexpr int kRootW = 1920;
constexpr int kRootH = 1080;
constexpr int kCellW = 180;
constexpr int kCellH = 28;
constexpr int kPitchX = 184;
constexpr int kPitchY = 32;
constexpr int kMargin = 4;
constexpr int kColumns = 10;

class Panel : public Glob {
 public:
  explicit Panel(const GlobCreationInfo& info) : Glob(info) { canvas()->setOpaque(true); }
  void draw() override {
    Glib::Painter p(*canvas());
    p.fillRect(p.bounds(), getPalette().get(Palette::Window));
  }
};

// Stands in for a push button until the real one exists: face, bevel, centred label.
class Cell : public Glob {
 public:
  Cell(const GlobCreationInfo& info, WString label) : Glob(info), label_(std::move(label)) {
    canvas()->setOpaque(true);
  }

  void setLabel(WString label) {
    if (label == label_) return;
    label_ = std::move(label);
    update();
  }

  void draw() override {
    Glib::Painter p(*canvas());
    const Palette& pal = getPalette();
    p.depthBox(p.bounds(), Glib::Bevel::Raised, 2, pal.get(Palette::Light),
               pal.get(Palette::Shadow), pal.get(Palette::Button));
    p.text(label_, Kw::Box<int>(4, 2, width() - 4, height() - 2), *font_,
           pal.get(Palette::ButtonText));
  }

 private:
  WString label_;
  Kw::Ptr<Glib::ShapedFont> font_ = Glib::fonts().standard();
};

struct Scene {
  explicit Scene(int n) : root(kRootW, kRootH) {
    const int rows = (n + kColumns - 1) / kColumns;
    const int panelH = std::max(kRootH, kMargin + rows * kPitchY);
    GlobCreationInfo pi(kRootW, static_cast<unsigned short>(panelH), root.canvas(), 0,
                        kRootH - panelH);
    panel = new Panel(pi);
    for (int i = 0; i < n; ++i) {
      const int x = kMargin + (i % kColumns) * kPitchX;
      const int yTop = kMargin + (i / kColumns) * kPitchY;
      GlobCreationInfo ci(kCellW, kCellH, panel->canvas(), x, panelH - yTop - kCellH);
      cells.push_back(new Cell(ci, L"Button " + std::to_wstring(i)));
    }
    renderer = std::make_unique<RootRenderer>(root);
    renderer->render();
  }

  RootGlob root;
  Panel* panel = nullptr;
  std::vector<Cell*> cells;
  std::unique_ptr<RootRenderer> renderer;
};

void BM_FullRepaint(benchmark::State& state) {
  Scene scene(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    scene.root.canvas()->damage();
    scene.renderer->render();
  }
}
BENCHMARK(BM_FullRepaint)->Arg(1000)->Unit(benchmark::kMillisecond);

void BM_LabelChangeRepaint(benchmark::State& state) {
  Scene scene(static_cast<int>(state.range(0)));
  Cell* cell = scene.cells[44];
  int k = 0;
  for (auto _ : state) {
    cell->setLabel(L"Button 44 #" + std::to_wstring(++k));
    scene.renderer->render();
  }
}
BENCHMARK(BM_LabelChangeRepaint)->Arg(1000)->Unit(benchmark::kMicrosecond);

// The same change when the label's layout is already shaped (a label flipping between a few
// texts): what remains is the damage bookkeeping and the pixels.
void BM_LabelToggleRepaint(benchmark::State& state) {
  Scene scene(static_cast<int>(state.range(0)));
  Cell* cell = scene.cells[44];
  int k = 0;
  for (auto _ : state) {
    cell->setLabel(L"Button 44 #" + std::to_wstring(++k % 4));
    scene.renderer->render();
  }
}
BENCHMARK(BM_LabelToggleRepaint)->Arg(1000)->Unit(benchmark::kMicrosecond);

}  // namespace
