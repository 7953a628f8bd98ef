#include "bench/scene/SceneBuild.h"

#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "platform/glib/Painter.h"
#include "platform/glob/RootGlob.h"
#include "text/TextBox.h"

namespace scene {

namespace {

// The slider cell until the real slider lands: a sunken track across the middle and a raised
// thumb at the value, drawn from the palette like the other controls.
class SliderCell : public Glob {
 public:
  SliderCell(const GlobCreationInfo& info, double value) : Glob(info), value_(value) {}
  void draw() override {
    Glib::Painter p(*canvas());
    const Palette& pal = getPalette();
    const int w = width();
    const int h = height();
    p.fillRect(p.bounds(), pal.get(Palette::Window));
    p.depthBox(Kw::Box<int>(6, h / 2 - 2, w - 6, h / 2 + 2), Glib::Bevel::Sunken, 1,
               pal.get(Palette::Light), pal.get(Palette::Shadow), pal.get(Palette::Base));
    const int x = 6 + static_cast<int>(value_ * (w - 12));
    p.depthBox(Kw::Box<int>(x - 5, 3, x + 5, h - 3), Glib::Bevel::Raised, 2,
               pal.get(Palette::Light), pal.get(Palette::Shadow), pal.get(Palette::Button));
  }
  const char* idstring() const override { return "slider"; }

 private:
  double value_;
};

constexpr double kSliderValue = 0.5;

// The one place that makes a slider cell.
Glob* makeSlider(const GlobCreationInfo& info) {
  return new SliderCell(info, kSliderValue);
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
      return new TextBox(args);
    }
  }
  return nullptr;
}

}  // namespace

std::wstring labelOf(int i) {
  switch (kindOf(i)) {
    case Kind::Button:
      return L"Button " + std::to_wstring(i);
    case Kind::Check:
      return L"Check " + std::to_wstring(i);
    case Kind::Slider:
      return std::wstring();
    case Kind::Text:
      return L"Text " + std::to_wstring(i);
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
