#pragma once
// A screen with a probe for a parent, and helpers to find and drive a drop-down's open list.
#include <gtest/gtest.h>

#include "dropdowns/DropDownMenuButton.h"
#include "platform/misc/EditorPreferences.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

using Texts = std::vector<String>;

struct DropDownFixture : ::testing::Test {
  DropDownFixture() { prefs().setPath(""); }
  ~DropDownFixture() override { prefs().setPath(""); }

  DropDownMenuButton* make(std::vector<WString> entries, int x = 20, int y = 200) {
    return new DropDownMenuButton(L"Pick", entries,
                                  GlobCreationInfo(120, 24, parent.canvas(), x, y));
  }
  // The centre of the row of item `index` of an open list, in root coordinates.
  static XY<int> rowCentre(const Menu* m, int index) {
    const Kw::Box<int> a = m->itemArea(index);
    const XY<int> o = m->canvas()->rootOrigin();
    return XY<int>(o.x + (a.x0 + a.x1) / 2, o.y + (a.y0 + a.y1) / 2);
  }
  int countKind(const char* kind) {
    int n = 0;
    for (Glob* g : h.root().children()) n += g->m_is_type(kind) ? 1 : 0;
    return n;
  }

  Harness h{400, 300};
  MessageProbe parent{h.place(0, 0, 400, 300)};
};
