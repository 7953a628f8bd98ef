// W2 and W3: whole frames of S(1000), and one label change repainted through the damage path.
#include <string>

#include "bench/scene/SceneBuild.h"
#include "bench/scene/SceneReport.h"
#include "bench/scene/Workloads.h"
#include "buttons/Button.h"
#include "platform/backend/RootRenderer.h"
#include "platform/glob/RootGlob.h"

namespace scene {

namespace {

constexpr int kLabelIndex = 44;  // a button at (740, 132) from the top-left

void fullPanelFrames() {
  // A screen as tall as the panel shows all 1000 controls.
  RootGlob tall(kScreenW, panelHeight(1000));
  Scene s = build(tall, 1000, Placement::Direct);
  s.panel->reshape_canvas(0, 0, kScreenW, panelHeight(1000));
  RootRenderer r(tall);
  r.render();
  Samples frames;
  for (int f = 0; f < 20; ++f) {
    const double t = nowMs();
    tall.canvas()->damage();
    r.render();
    frames.add(nowMs() - t);
  }
  report("W2_frame_fullpanel_1000ctl_ms", frames);
  destroy(s);
}

}  // namespace

void runFrames() {
  RootGlob screen(kScreenW, kScreenH);
  Scene s = build(screen, 1000, Placement::Direct);
  RootRenderer r(screen);
  {
    const double t0 = nowMs();
    r.render();
    reportOne("W2_first_frame_ms", nowMs() - t0);
  }
  Samples frames;
  for (int f = 0; f < 50; ++f) {
    const double t = nowMs();
    screen.canvas()->damage();
    r.render();
    frames.add(nowMs() - t);
  }
  report("W2_frame_1080_ms", frames);

  auto* button = dynamic_cast<Button*>(s.controls[kLabelIndex]);
  if (!button) {
    note("W3: control 44 is not a button");
  } else {
    Samples changes;
    r.takeChanged();
    for (int k = 1; k <= 200; ++k) {
      const std::wstring label = L"Button 44 #" + std::to_wstring(k);
      const double t = nowMs();
      button->setString(label);
      r.render();
      changes.add(nowMs() - t);
    }
    report("W3_label_change_ms", changes);
    const Kw::Box<int> last = r.takeChanged();
    note("W3: area repainted by the 200 changes " + std::to_string(last.width()) + "x" +
         std::to_string(last.height()) + " at " + std::to_string(last.x0) + "," +
         std::to_string(last.y0) + " (top-down)");
  }
  destroy(s);
  fullPanelFrames();
}

}  // namespace scene
