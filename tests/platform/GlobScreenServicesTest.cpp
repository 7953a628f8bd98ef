// What the screen offers a Glob beyond routing: event filters, painting a region at once,
// moves and resizes held back by freezing, and the single layout of a quickdraw resize.
#include <gtest/gtest.h>

#include "platform/glob/BoxRegion.h"
#include "platform/glob/GlobHandle.h"
#include "platform/testing/Harness.h"
#include "tests/glib/PaintGlob.h"
#include "tests/platform/GlobTestSupport.h"

namespace {

// A Glob that filters the screen's events: it records what it saw and keeps what `keep` says.
class Filter : public Glob {
 public:
  using Glob::Glob;
  bool fsFilterThis(Event* e, void* context) override {
    seen.push_back({e->type, e->pos, String(), e->word2});
    contexts.push_back(context);
    return keep ? keep(e) : false;
  }
  const char* idstring() const override { return "filter"; }

  std::function<bool(Event*)> keep;
  std::vector<Seen> seen;
  std::vector<void*> contexts;
};

PaintGlob* solid(Harness& h, const Kw::Box<int>& r, const Colour* colour) {
  return new PaintGlob(h.place(r.x0, r.y0, r.width(), r.height()),
                       [colour](Glib::Painter& p) { p.fillRect(p.bounds(), *colour); });
}

}  // namespace

TEST(EventFilters, SeeInputBeforeRoutingAndMayKeepIt) {
  Harness h(300, 200);
  auto* target = new RecordingGlob(h.place(10, 10, 100, 100));
  auto* filter = new Filter(h.place(200, 100, 50, 50));
  int token = 7;
  ASSERT_TRUE(h.root().addEventFilter(filter, &token));
  ASSERT_FALSE(h.root().addEventFilter(nullptr));

  // Let through: the filter sees the press first, in its own coordinates, then the target.
  h.click(XY<int>(20, 30));
  ASSERT_GE(filter->seen.size(), 3u);
  EXPECT_EQ(filter->seen[1].type, kEventLeftDown);
  EXPECT_EQ(filter->seen[1].pos, XY<int>(20 - 200, 30 - 100));
  EXPECT_EQ(filter->contexts[1], &token);
  EXPECT_EQ(target->count(kEventLeftDown), 1);
  EXPECT_EQ(target->count(kEventLeftUp), 1);

  // Kept: presses never reach the target, and no grab is left behind by them.
  filter->keep = [](Event* e) { return e->type == kEventLeftDown; };
  h.click(XY<int>(20, 30));
  EXPECT_EQ(target->count(kEventLeftDown), 1);
  EXPECT_EQ(h.root().grabbed(), nullptr);
  filter->keep = [](Event* e) { return e->type == kEventKeyPress; };
  target->set_kbd_focus();
  h.key('a');
  EXPECT_EQ(target->count(kEventKeyPress), 0);
  EXPECT_EQ(target->count(kEventKeyRelease), 1);

  // Removed: everything reaches the target again.
  h.root().removeEventFilter(filter);
  EXPECT_EQ(h.root().eventFilterCount(), 0u);
  h.key('b');
  EXPECT_EQ(target->count(kEventKeyPress), 1);
}

TEST(EventFilters, NewestFirstAndAFilterDeletedWhileFilteringIsHarmless) {
  Harness h(300, 200);
  auto* target = new RecordingGlob(h.place(10, 10, 100, 100));
  std::vector<String> order;
  // The newer filter deletes itself and the older one while it filters the press.
  struct Deleting : Filter {
    using Filter::Filter;
    bool fsFilterThis(Event* e, void*) override {
      order->push_back("newer");
      if (e->type == kEventLeftDown) {
        delete other;
        delete this;
      }
      return false;
    }
    std::vector<String>* order = nullptr;
    Glob* other = nullptr;
  };
  auto* older = new Filter(GlobCreationInfo(1, 1, nullptr));  // a filter need not be shown
  auto* newer = new Deleting(h.place(0, 0, 5, 5));
  older->keep = [&order](Event*) {
    order.push_back("older");
    return false;
  };
  newer->order = &order;
  newer->other = older;
  GlobHandle<> newerAlive(newer);
  h.root().addEventFilter(older);
  h.root().addEventFilter(newer);
  h.move(XY<int>(20, 20));
  EXPECT_EQ(order, (std::vector<String>{"newer", "older"}));
  h.click(XY<int>(20, 20));
  EXPECT_FALSE(newerAlive.alive());
  EXPECT_EQ(h.root().eventFilterCount(), 0u);
  EXPECT_EQ(target->count(kEventLeftDown), 1);  // the press went on to be routed
  EXPECT_EQ(target->count(kEventLeftUp), 1);
}

TEST(GlobHandleEvent, HandsTheEventToTheGlobWithoutBubbling) {
  Harness h(200, 200);
  auto* parent = new RecordingGlob(h.place(0, 0, 100, 100));
  auto* child = new RecordingGlob(GlobCreationInfo(20, 20, parent->canvas()));
  child->consume = false;
  Event e(kEventKeyPress);
  e.word2 = 'x';
  EXPECT_EQ(child->handleEvent(&e), kEventNotConsumed);
  EXPECT_EQ(e.dest, child);
  EXPECT_EQ(e.canvas, child->canvas());
  EXPECT_EQ(child->count(kEventKeyPress), 1);
  EXPECT_EQ(parent->count(kEventKeyPress), 0);
  EXPECT_EQ(child->handleEvent(nullptr), kEventNotConsumed);
}

TEST(DrawUnbuffered, PaintsTheRegionIntoTheImageAtOnce) {
  Harness h(200, 100);
  const Colour red(1, 0, 0), blue(0, 0, 1), green(0, 1, 0);
  Colour face = red;
  PaintGlob* g = solid(h, Kw::Box<int>::fromSize(10, 10, 80, 40), &face);
  // A Glob above part of it, which the immediate paint must leave on top.
  solid(h, Kw::Box<int>::fromSize(20, 10, 10, 10), &green);
  h.render();
  ASSERT_EQ(h.pixelAt(15, 15), Harness::argb(red));
  const uint32_t screen = h.pixelAt(150, 50);

  face = blue;  // changed without asking for a repaint
  const int drawsBefore = g->draws;
  g->drawUnbuffered(Kw::Ptr<iRegion>(new BoxRegion(Kw::Box<int>(0, 0, 40, 40))));
  EXPECT_EQ(g->draws, drawsBefore + 1);
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(blue));   // inside the region: now
  EXPECT_EQ(h.pixelAt(25, 15), Harness::argb(green));  // still covered
  EXPECT_EQ(h.pixelAt(70, 15), Harness::argb(red));    // outside the region: untouched
  EXPECT_FALSE(h.root().needsPaint());                 // nothing left for the next frame

  // A region past the Glob's edge is cut to it; the whole Glob for none.
  g->drawUnbuffered(Kw::Ptr<iRegion>(new BoxRegion(Kw::Box<int>(60, -50, 500, 500))));
  EXPECT_EQ(h.pixelAt(70, 15), Harness::argb(blue));
  EXPECT_EQ(h.pixelAt(95, 15), screen);  // beyond the Glob, never painted by it
  face = green;
  g->drawUnbuffered(Kw::Ptr<iRegion>());
  EXPECT_EQ(h.pixelAt(50, 45), Harness::argb(green));
}

TEST(DrawUnbuffered, WaitsForTheFrameWhenItCannotPaintNow) {
  Harness h(200, 100);
  const Colour red(1, 0, 0), blue(0, 0, 1);
  Colour face = red;
  PaintGlob* g = solid(h, Kw::Box<int>::fromSize(10, 10, 80, 40), &face);
  // No image yet: the area is left for the first frame.
  g->drawUnbuffered(Kw::Ptr<iRegion>());
  h.render();
  face = blue;
  g->freeze();
  g->drawUnbuffered(Kw::Ptr<iRegion>());
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(red));
  g->unfreeze();
  h.render();
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(blue));
  face = red;
  Drawable::disableRedraws();
  g->drawUnbuffered(Kw::Ptr<iRegion>());
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(blue));
  Drawable::enableRedraws();
  h.render();
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(red));
}

TEST(GlobFreeze, MovesAndResizesWhileFrozenRepaintOnlyOnTheLastThaw) {
  Harness h(300, 100);
  const Colour red(1, 0, 0);
  PaintGlob* g = solid(h, Kw::Box<int>::fromSize(10, 10, 40, 40), &red);
  h.render();
  const uint32_t screen = h.pixelAt(150, 30);
  ASSERT_NE(screen, Harness::argb(red));

  g->freeze();
  g->freeze();
  g->translate_canvas(100, 0);
  g->reshape_canvas(110, 10, 60, 40);
  EXPECT_TRUE(h.render().empty());
  EXPECT_EQ(h.pixelAt(20, 30), Harness::argb(red));  // the old place still shows it
  EXPECT_EQ(h.pixelAt(150, 30), screen);             // the new place not yet
  g->unfreeze();
  EXPECT_TRUE(h.render().empty());

  g->unfreeze();
  const std::vector<Glob*> drawn = h.render();
  EXPECT_EQ(std::count(drawn.begin(), drawn.end(), g), 1);
  EXPECT_EQ(h.pixelAt(20, 30), h.pixelAt(5, 5));  // the old place is the screen again
  EXPECT_EQ(h.pixelAt(150, 30), Harness::argb(red));
  EXPECT_EQ(h.pixelAt(165, 30), Harness::argb(red));
}

TEST(GlobFreeze, AChildMovedInsideAFrozenParentRepaintsWithTheParent) {
  Harness h(300, 100);
  const Colour grey(0.5, 0.5, 0.5), red(1, 0, 0);
  PaintGlob* parent = solid(h, Kw::Box<int>::fromSize(0, 0, 200, 100), &grey);
  auto* child = new PaintGlob(GlobCreationInfo(20, 20, parent->canvas(), 10, 10),
                              [&red](Glib::Painter& p) { p.fillRect(p.bounds(), red); });
  h.render();
  parent->freeze();
  child->freeze();
  child->translate_canvas(100, 0);
  child->unfreeze();  // the parent still holds it
  EXPECT_TRUE(h.render().empty());
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(red));
  parent->unfreeze();
  h.render();
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(grey));
  EXPECT_EQ(h.pixelAt(115, 15), Harness::argb(red));
}

TEST(GlobQuickdraw, AUserResizeLaysOutOnceAtTheRelease) {
  Harness h(400, 300);
  struct Counting : RecordingGlob {
    using RecordingGlob::RecordingGlob;
    void reshape() override { ++layouts; }
    int layouts = 0;
  };
  auto* plain = new Counting(h.place(10, 100, 100, 80));
  auto* quick = new Counting(h.place(200, 100, 100, 80));
  plain->consume = quick->consume = false;
  for (Counting* g : {plain, quick}) g->set_resizeable(1);
  quick->set_quickdraw(1);
  EXPECT_EQ(quick->get_quickdraw(), 1);

  h.drag(XY<int>(108, 140), XY<int>(148, 140), 4);
  EXPECT_EQ(plain->layouts, 4);
  EXPECT_EQ(plain->width(), 140);

  h.move(XY<int>(298, 140));
  h.press(XY<int>(298, 140));
  h.move(XY<int>(318, 140));
  h.move(XY<int>(328, 140));
  EXPECT_EQ(quick->width(), 130);  // the size follows the pointer
  EXPECT_EQ(quick->layouts, 0);    // the layout waits
  h.move(XY<int>(338, 140));
  h.release(XY<int>(348, 140));
  EXPECT_EQ(quick->width(), 150);
  EXPECT_EQ(quick->layouts, 1);

  // Resizes by code are laid out at once, and a user move lays nothing out.
  quick->resize(90, 80);
  EXPECT_EQ(quick->layouts, 2);
  quick->set_movable(1);
  h.drag(XY<int>(250, 140), XY<int>(250, 200));
  EXPECT_EQ(quick->layouts, 2);
}

TEST(GlobQuickdraw, AGlobDeletedDuringItsResizeEndsTheSessionQuietly) {
  Harness h(400, 300);
  auto* quick = new RecordingGlob(h.place(200, 100, 100, 80));
  quick->consume = false;
  quick->set_resizeable(1);
  quick->set_quickdraw(1);
  GlobHandle<> alive(quick);
  h.move(XY<int>(298, 140));
  h.press(XY<int>(298, 140));
  h.move(XY<int>(318, 140));
  delete quick;
  h.move(XY<int>(328, 140));
  h.release(XY<int>(328, 140));
  EXPECT_FALSE(alive.alive());
  EXPECT_EQ(h.root().userMoveTarget(), nullptr);
}
