#include "platform/testing/Harness.h"

#include <algorithm>
#include <cmath>

#include "platform/backend/RootRenderer.h"
#include "platform/glob/RuntimeClock.h"
#include "platform/os/OS.h"

namespace {

// A repaint pass that produces no pixels; it only lets the root walk what it would draw.
class NullPaintSession : public PaintSession {
 public:
  void beginFrame(const std::vector<Kw::Box<int>>&) override {}
  void endFrame(const std::vector<Kw::Box<int>>&) override {}
  void beginCanvas(Canvas&, const Kw::Box<int>&, const std::vector<Kw::Box<int>>&) override {}
  void endCanvas(Canvas&) override {}
  void fillCanvas(const Colour&) override {}
};

}  // namespace

Harness::Harness(int width, int height) {
  RuntimeClock::setManual(true, 1000);
  OS()->keyboard().setModifiers(0);
  root_ = std::make_unique<RootGlob>(width, height);
  root_->setDrawObserver([this](Glob* g) { drawn_.push_back(g); });
}

Harness::~Harness() {
  renderer_.reset();
  root_.reset();
  OS()->keyboard().setModifiers(0);
  RuntimeClock::setManual(false);
}

GlobCreationInfo Harness::place(int x, int y, int width, int height) const {
  return GlobCreationInfo(static_cast<unsigned short>(width), static_cast<unsigned short>(height),
                          root_->canvas(), x, y);
}

void Harness::move(XY<int> p) {
  root_->injectMouse(kEventMouseMove, p);
}

void Harness::press(XY<int> p, MouseButton b) {
  root_->injectMouse(0x102 | static_cast<int>(b), p);
}

void Harness::release(XY<int> p, MouseButton b) {
  root_->injectMouse(0x101 | static_cast<int>(b), p);
}

void Harness::click(XY<int> p, MouseButton b) {
  move(p);
  press(p, b);
  release(p, b);
}

void Harness::drag(XY<int> from, XY<int> to, int steps, MouseButton b) {
  steps = std::max(1, steps);
  move(from);
  press(from, b);
  for (int i = 1; i <= steps; ++i) {
    move(XY<int>(from.x + (to.x - from.x) * i / steps, from.y + (to.y - from.y) * i / steps));
  }
  release(to, b);
}

void Harness::wheel(XY<int> p, int steps) {
  root_->injectMouse(kEventMouseWheel, p, steps);
}

XY<int> Harness::centreOf(const Glob& g) {
  const Kw::Box<int> r = g.canvas()->visibleRootRect();
  return XY<int>((r.x0 + r.x1) / 2, (r.y0 + r.y1) / 2);
}

void Harness::setModifiers(unsigned mods) {
  modifiers_ = mods & kKeyModifierMask;
  OS()->keyboard().setModifiers(modifiers_);
}

unsigned Harness::withModifiers(unsigned code) const {
  return code | modifiers_;
}

void Harness::key(unsigned code) {
  keyPress(code);
  keyRelease(code);
}

void Harness::keyPress(unsigned code) {
  root_->injectKey(kEventKeyPress, withModifiers(code));
}
void Harness::keyRelease(unsigned code) {
  root_->injectKey(kEventKeyRelease, withModifiers(code));
}

void Harness::type(const WString& text) {
  for (wchar_t c : text) key(static_cast<unsigned>(c));
}

int64_t Harness::now() {
  return RuntimeClock::now();
}

std::vector<Glob*> Harness::paint() {
  if (renderer_) return render();
  drawn_.clear();
  NullPaintSession session;
  root_->paint(session);
  return drawn_;
}

RootRenderer& Harness::renderer() {
  if (!renderer_) renderer_ = std::make_unique<RootRenderer>(*root_);
  return *renderer_;
}

std::vector<Glob*> Harness::render() {
  RootRenderer& r = renderer();
  drawn_.clear();
  r.render();
  return drawn_;
}

uint32_t Harness::pixelAt(int x, int y) const {
  return renderer_ ? renderer_->pixelAt(XY<int>(x, y)) : 0;
}

uint32_t Harness::argb(const Colour& c) {
  auto byte = [](double v) {
    return static_cast<uint32_t>(std::lround(std::clamp(v, 0.0, 1.0) * 255.0));
  };
  const double a = std::clamp(double{c.a}, 0.0, 1.0);
  return byte(a) << 24 | byte(c.r * a) << 16 | byte(c.g * a) << 8 | byte(c.b * a);
}

bool Harness::drew(const Glob* g) const {
  return std::find(drawn_.begin(), drawn_.end(), g) != drawn_.end();
}
