#pragma once
// A Glob that records what reaches it, for the framework's own tests.
#include <functional>
#include <vector>

#include "platform/glob/Glob.h"

struct Seen {
  int type;
  XY<int> pos;
  String text;
  uint32_t word2;
};

class RecordingGlob : public Glob {
 public:
  using Glob::Glob;

  int react(Event* e) override {
    seen.push_back({e->type, e->pos, e->text(), e->word2});
    if (onEvent) {
      const int r = onEvent(e);
      if (r >= 0) return r;
    }
    return consume ? 1 : Glob::react(e);
  }
  void handle_kbd_focus() override { focusCalls.push_back(hasKbdFocus()); }
  void handleMouseContainment(bool inside) override { containment.push_back(inside); }
  void draw() override { ++draws; }

  int count(int type) const {
    int n = 0;
    for (const auto& s : seen) n += s.type == type ? 1 : 0;
    return n;
  }

  std::vector<Seen> seen;
  std::vector<bool> focusCalls;  // true: gained, false: lost
  std::vector<bool> containment;
  // Returns the react result, or -1 to fall through to `consume`.
  std::function<int(Event*)> onEvent;
  bool consume = true;
  int draws = 0;
};

// A surface on a screen that is not a Glob: a Glob placed on it is on the screen but has no
// parent Glob. Made before the Globs it should lie under, or lowered, so that they stay on top.
class PlainSurface : public CanvasClient {
 public:
  PlainSurface(Canvas* screen, const Kw::Box<int>& rect) : canvas_(screen, this, rect) {
    canvas_.lower();
  }
  Canvas* canvas() { return &canvas_; }
  const char* idstring() const override { return "surface"; }
  String contextString(const XY<int>&, CanvasClient*) override { return String(); }
  MouseCursorID contextCursor(const XY<int>&) override { return kCursorArrow; }
  void handleMouseContainment(bool) override {}

 private:
  Canvas canvas_;
};
