#include <gtest/gtest.h>

#include <random>

#include "platform/glob/DirtyRegion.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"
#include "tests/platform/GlobTestSupport.h"

TEST(GlobPaint, OnlyDamagedGlobsDrawInStackingOrder) {
  Harness h(400, 300);
  auto* a = new RecordingGlob(h.place(0, 0, 100, 100));
  auto* b = new RecordingGlob(h.place(50, 50, 100, 100));  // overlaps a, on top
  auto* c = new RecordingGlob(h.place(300, 200, 50, 50));
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{a, b, c}));
  EXPECT_TRUE(h.paint().empty());  // nothing damaged since

  c->update();
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{c}));
  a->update(Kw::Box<int>(0, 0, 10, 10));  // a corner b does not cover
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{a}));
  b->update();  // b's area covers part of a, which is beneath and repainted first
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{a, b}));
  a->pop_to_top();
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{b, a}));
}

TEST(GlobPaint, HiddenEmptyAndOffScreenCanvasesNeverDraw) {
  Harness h(400, 300);
  auto* hidden = new RecordingGlob(h.place(0, 0, 50, 50));
  hidden->unmap_canvas();
  auto* empty = new RecordingGlob(h.place(10, 10, 0, 40));
  auto* off = new RecordingGlob(h.place(500, 500, 40, 40));
  auto* parent = new RecordingGlob(h.place(100, 100, 20, 20));
  auto* clipped = new RecordingGlob(GlobCreationInfo(10, 10, parent->canvas(), 30, 30));
  h.paint();
  EXPECT_FALSE(h.drew(hidden));
  EXPECT_FALSE(h.drew(empty));
  EXPECT_FALSE(h.drew(off));
  EXPECT_FALSE(h.drew(clipped));  // entirely outside its parent
  EXPECT_TRUE(h.drew(parent));
  EXPECT_FALSE(off->canDraw());
  off->update();
  EXPECT_FALSE(h.root().needsPaint());
}

TEST(GlobPaint, BatchingNestsAndUnbalancedEnableIsHarmless) {
  Harness h(200, 200);
  auto* g = new RecordingGlob(h.place(0, 0, 50, 50));
  h.paint();
  Drawable::disableRedraws();
  Drawable::disableRedraws();
  g->update();
  EXPECT_TRUE(h.paint().empty());
  Drawable::enableRedraws();
  EXPECT_TRUE(h.paint().empty());
  Drawable::enableRedraws();
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{g}));  // the damage waited, nothing lost

  refresh_off();
  Drawable::disableRedraws();
  g->update();
  Drawable::enableRedraws();
  EXPECT_TRUE(h.paint().empty());  // refresh still off
  refresh_on();
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{g}));

  Diagnostics::Capture diags;
  Drawable::enableRedraws();
  refresh_on();
  EXPECT_EQ(diags.lines().size(), 2u);
  g->update();
  EXPECT_EQ(h.paint(), (std::vector<Glob*>{g}));  // counts did not go negative
}

TEST(GlobPaint, GeometryChangesDamageOldAndNewPlaces) {
  Harness h(400, 300);
  auto* under = new RecordingGlob(h.place(0, 0, 60, 60));
  auto* mover = new RecordingGlob(h.place(0, 0, 20, 20));
  auto* far = new RecordingGlob(h.place(300, 200, 20, 20));
  h.paint();
  mover->translate_canvas(200, 0);  // uncovers part of `under`, lands on empty root
  const auto drawn = h.paint();
  EXPECT_TRUE(h.drew(under));
  EXPECT_TRUE(h.drew(mover));
  EXPECT_FALSE(h.drew(far));
  delete far;  // the hole it leaves is damage too
  EXPECT_TRUE(h.root().needsPaint());
  EXPECT_EQ(h.root().dirty().bounds(), Kw::Box<int>(300, 200, 320, 220));
}

TEST(DirtyRegion, MergesOverlapsAndCollapsesPastTheLimit) {
  DirtyRegion r(4);
  r.add(Kw::Box<int>(0, 0, 10, 10));
  r.add(Kw::Box<int>(5, 5, 15, 15));
  ASSERT_EQ(r.rects().size(), 1u);
  EXPECT_EQ(r.rects()[0], Kw::Box<int>(0, 0, 15, 15));
  r.add(Kw::Box<int>(2, 2, 4, 4));  // already covered
  EXPECT_EQ(r.rects().size(), 1u);
  for (int i = 0; i < 4; ++i) r.add(Kw::Box<int>::fromSize(100 + 20 * i, 0, 5, 5));
  ASSERT_EQ(r.rects().size(), 1u);
  EXPECT_EQ(r.rects()[0], Kw::Box<int>(0, 0, 165, 15));
}

// The spatial index must find exactly what a linear scan finds, through restacking, moves
// and removals, for overlapping children and children reaching outside their parent.
TEST(GlobHitTest, IndexedParentAgreesWithLinearScan) {
  Harness h(1000, 800);
  auto* panel = new RecordingGlob(h.place(0, 0, 1000, 800));
  std::mt19937 rng(7);
  std::uniform_int_distribution<int> pos(-50, 980), size(1, 120);
  std::vector<RecordingGlob*> kids;
  for (int i = 0; i < 400; ++i) {
    kids.push_back(new RecordingGlob(GlobCreationInfo(static_cast<unsigned short>(size(rng)),
                                                      static_cast<unsigned short>(size(rng)),
                                                      panel->canvas(), pos(rng), pos(rng) % 780)));
  }
  auto linear = [&](XY<int> p) -> Glob* {
    const auto& cs = panel->canvas()->children();
    for (auto it = cs.rbegin(); it != cs.rend(); ++it) {
      if ((*it)->isMapped() && (*it)->rect().contains(p))
        return dynamic_cast<Glob*>((*it)->client());
    }
    return panel;
  };
  auto check = [&] {
    std::uniform_int_distribution<int> px(0, 999), py(0, 799);
    for (int k = 0; k < 2000; ++k) {
      const XY<int> p(px(rng), py(rng));
      ASSERT_EQ(h.root().globAt(p), linear(p)) << p.x << "," << p.y;
    }
  };
  check();
  for (int i = 0; i < 50; ++i) kids[static_cast<size_t>(i)]->pop_to_top();
  for (int i = 50; i < 100; ++i) kids[static_cast<size_t>(i)]->translate_canvas(13, -7);
  for (int i = 100; i < 150; ++i) kids[static_cast<size_t>(i)]->unmap_canvas();
  for (int i = 150; i < 200; ++i) delete kids[static_cast<size_t>(i)];
  check();
}
