// Building a panel widget by widget: each addition places the newcomer and joins it to the
// tab order without disturbing what is there, and membership is told right after removals and
// deletions behind the panel's back.
#include <gtest/gtest.h>

#include <memory>
#include <vector>

#include "panels/PanelGeometry.h"
#include "panels/StandardPanel.h"
#include "platform/backend/RootRenderer.h"
#include "platform/testing/Harness.h"
#include "tests/panels/PanelTestSupport.h"

namespace {

struct PanelBuilding : ::testing::Test {
  Harness h{640, 480};
  std::unique_ptr<StandardPanel> panel = std::make_unique<StandardPanel>(h.place(20, 20, 400, 300));
};

}  // namespace

TEST_F(PanelBuilding, ManyAdditionsEachLandAtTheirPlaceInTabOrder) {
  std::vector<FocusChild*> kids;
  for (int i = 0; i < 60; ++i) {
    auto* k = new FocusChild(nullptr, 18, 8);
    ASSERT_TRUE(panel->addWidget(k, XY<int>((i % 10) * 20, (i / 10) * 10), OriginTopLeft));
    kids.push_back(k);
  }
  for (int i = 0; i < 60; ++i) {
    EXPECT_EQ(kids[i]->canvas()->rect(),
              Kw::Box<int>::fromSize((i % 10) * 20, 300 - (i / 10) * 10 - 8, 18, 8))
        << "widget " << i;
  }
  TabOrderManager& tabs = panel->tabOrder();
  ASSERT_EQ(tabs.numTabStops(), 60u);
  EXPECT_EQ(tabs.getLowestTabOrder(), 0u);
  EXPECT_EQ(tabs.getHighestTabOrder(), 59u);
  for (unsigned i = 0; i < 60; ++i) EXPECT_EQ(tabs.getTabStopTabOrder(i), i);
  // Tab walks them in the order they were added.
  for (int i = 0; i < 3; ++i) {
    ASSERT_TRUE(panel->incrementTab());
    EXPECT_EQ(kids[i]->receipts, 1) << "stop " << i;
  }
  // A stop added at a taken order still pushes the later ones up.
  auto* late = new FocusChild(nullptr, 18, 8);
  ASSERT_TRUE(panel->addWidget(late, XY<int>(0, 200), OriginTopLeft, SurroundNone, kids[0]));
  EXPECT_EQ(tabs.getTabStopTabOrder(60), 1u);
  EXPECT_EQ(tabs.getTabStopTabOrder(1), 2u);
  EXPECT_EQ(tabs.getHighestTabOrder(), 60u);
}

TEST_F(PanelBuilding, AnAdditionRepaintsTheNewcomerAndItsRingOnly) {
  h.render();
  h.renderer().takeChanged();
  auto topDown = [&](const Kw::Box<int>& r) {
    const int screenH = h.root().height();
    return Kw::Box<int>(r.x0, screenH - r.y1, r.x1, screenH - r.y0);
  };
  auto* plain = new FocusChild(nullptr, 18, 8);
  ASSERT_TRUE(panel->addWidget(plain, XY<int>(30, 40), OriginTopLeft));
  h.render();
  EXPECT_EQ(h.renderer().takeChanged(), topDown(plain->canvas()->rootRect()));

  auto* ringed = new FocusChild(nullptr, 18, 8);
  ASSERT_TRUE(panel->addWidget(ringed, XY<int>(100, 40), OriginTopLeft, SurroundFramed));
  h.render();
  const int s = PanelGeometry::surroundWidth(SurroundFramed);
  ASSERT_GT(s, 0);
  const Kw::Box<int> r = ringed->canvas()->rootRect();
  EXPECT_EQ(h.renderer().takeChanged(),
            topDown(Kw::Box<int>(r.x0 - s, r.y0 - s, r.x1 + s, r.y1 + s)));
}

TEST_F(PanelBuilding, MembershipAfterRemovalAndDeletionBehindTheBack) {
  auto* a = new Child(nullptr, 10, 10);
  auto* b = new Child(nullptr, 10, 10);
  ASSERT_TRUE(panel->addWidget(a, XY<int>(0, 0)));
  ASSERT_TRUE(panel->addWidget(b, XY<int>(20, 0)));
  EXPECT_FALSE(panel->addWidget(b, XY<int>(40, 0)));
  // Taken out, it may come back.
  ASSERT_TRUE(panel->removeWidget(b, false));
  EXPECT_TRUE(panel->addWidget(b, XY<int>(40, 0)));
  EXPECT_EQ(b->canvas()->rect().x0, 40);
  // Deleted behind the panel's back: its entry stays, by address, and a new Glob (whatever its
  // address) is a newcomer.
  const Glob* gone = a;
  delete a;
  EXPECT_EQ(panel->numWidgets(), 2u);
  auto* c = new Child(nullptr, 10, 10);
  EXPECT_TRUE(panel->addWidget(c, XY<int>(60, 0)));
  EXPECT_TRUE(panel->isChildWidget(c));
  EXPECT_NE(panel->getWidget(gone), nullptr);
  EXPECT_EQ(panel->numWidgets(), 3u);
  EXPECT_TRUE(panel->isChildWidget(b));
  EXPECT_FALSE(panel->addWidget(c, XY<int>(80, 0)));
}
