#pragma once
// An owner of a context menu that records every message it hears before the menu base handles
// it, and a fixture with a screen, such an owner and preferences kept in memory.
#include <gtest/gtest.h>

#include "foundation/MenuGlob.h"
#include "menus/Menu.h"
#include "platform/misc/EditorPreferences.h"
#include "platform/testing/Harness.h"

class RecordingOwner : public MenuGlob {
 public:
  explicit RecordingOwner(const GlobCreationInfo& info) : MenuGlob(info) {}

  int react(Event* e) override {
    if (message_event(e)) heard.push_back(e->text());
    return MenuGlob::react(e);
  }
  void draw() override {}
  WString getMenuTitle() override {
    if (throwOnTitle) throw std::runtime_error("no title");
    return MenuGlob::getMenuTitle();
  }
  int count(const String& msg) const {
    int n = 0;
    for (const String& m : heard) n += m == msg ? 1 : 0;
    return n;
  }

  std::vector<String> heard;
  bool throwOnTitle = false;
};

class MenuFixture : public ::testing::Test {
 protected:
  MenuFixture() : h(400, 300) {
    prefs().setPath("");
    owner = new RecordingOwner(h.place(20, 20, 200, 200));
  }
  ~MenuFixture() override { prefs().setPath(""); }

  // Opens the owner's menu with a right click at `at` (root coordinates).
  Menu* openAt(XY<int> at) {
    h.click(at, MouseButton::Right);
    return owner->openMenu();
  }
  // The centre of the row of item `index`, in root coordinates.
  XY<int> rowCentre(const Menu* m, int index) const {
    const Kw::Box<int> a = m->itemArea(index);
    const XY<int> o = m->canvas()->rootOrigin();
    return XY<int>(o.x + (a.x0 + a.x1) / 2, o.y + (a.y0 + a.y1) / 2);
  }

  // A point on the label of the row of item `index`, clear of a multi-choice row's drop-down.
  XY<int> rowLabel(const Menu* m, int index) const {
    const Kw::Box<int> a = m->itemArea(index);
    const XY<int> o = m->canvas()->rootOrigin();
    return XY<int>(o.x + a.x0 + Menu::kGlyphColumn + 4, o.y + (a.y0 + a.y1) / 2);
  }

  Harness h;
  RecordingOwner* owner;
};
