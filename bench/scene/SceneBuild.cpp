#include "bench/scene/SceneBuild.h"

#include <utility>

#include "bench/NumberedLabel.h"

#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "platform/glob/RootGlob.h"
#include "text/TextBox.h"
#include "values/Slider.h"

namespace scene {

namespace {

constexpr double kSliderValue = 0.5;

// The one place that makes a slider cell.
Glob* makeSlider(const GlobCreationInfo& info) {
  SliderInitArgs args(info);
  args.position = kSliderValue;  // range 0..1, no label, no value text
  return new Slider(args);
}

Glob* makeControl(int i, const GlobCreationInfo& info) {
  switch (kindOf(i)) {
    case Kind::Button:
      return new Button(labelOf(i), "", info);
    case Kind::Check: {
      auto* c = new Checkbox(info, false);
      c->setLabel(labelOf(i));
      return c;
    }
    case Kind::Slider:
      return makeSlider(info);
    case Kind::Text: {
      TextBox::InitArgs args;
      args.info = info;
      args.text = labelOf(i);
      return new TextBox(std::move(args));
    }
  }
  return nullptr;
}

}  // namespace

std::wstring labelOf(int i) {
  switch (kindOf(i)) {
    case Kind::Button:
      return numberedLabel(L"Button ", i);
    case Kind::Check:
      return numberedLabel(L"Check ", i);
    case Kind::Slider:
      return std::wstring();
    case Kind::Text:
      return numberedLabel(L"Text ", i);
  }
  return std::wstring();
}

int ScenePanel::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg.rfind(Checkbox::kDefaultPrefix, 0) == 0) {
    ++toggles_;
    return 1;
  }
  return 0;
}

Scene build(RootGlob& screen, int n, Placement placement) {
  Scene s;
  const int h = panelHeight(n);
  s.panel = new ScenePanel(
      GlobCreationInfo(kScreenW, static_cast<unsigned short>(h), screen.canvas(), 0, kScreenH - h));
  s.controls.reserve(static_cast<size_t>(n));
  Canvas* on = s.panel->canvas();
  for (int i = 0; i < n; ++i) {
    if (placement == Placement::Direct) {
      s.controls.push_back(makeControl(
          i, GlobCreationInfo(kCellW, kCellH, on, cellLeft(i), h - cellTop(i) - kCellH)));
    } else {
      Glob* g = makeControl(i, GlobCreationInfo(kCellW, kCellH, nullptr));
      s.panel->addWidget(g, XY<int>(cellLeft(i), cellTop(i)), OriginTopLeft);
      s.controls.push_back(g);
    }
  }
  return s;
}

int geometryMismatches(const Scene& s) {
  const int h = s.panel->height();
  int bad = 0;
  for (size_t k = 0; k < s.controls.size(); ++k) {
    const int i = static_cast<int>(k);
    const Canvas* c = s.controls[k]->canvas();
    const auto want = Kw::Box<int>::fromSize(cellLeft(i), h - cellTop(i) - kCellH, kCellW, kCellH);
    if (c->parent() != s.panel->canvas() || !(c->rect() == want)) ++bad;
  }
  return bad;
}

void destroy(Scene& s) {
  delete s.panel;
  s.panel = nullptr;
  s.controls.clear();
}

}  // namespace scene
