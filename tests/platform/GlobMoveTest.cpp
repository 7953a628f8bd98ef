// Moving, resizing and re-parenting with the mouse, drag and drop between Globs, and saved
// layouts, all through the harness.
#include <gtest/gtest.h>

#include "panels/StandardPanel.h"
#include "platform/glob/DragPayload.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/GlobLayoutFile.h"
#include "platform/misc/FileText.h"
#include "platform/misc/configb.h"
#include "platform/testing/Harness.h"
#include "tests/platform/GlobTestSupport.h"
#include "tests/platform/TempDir.h"

namespace {

class Mover : public Glob {
 public:
  using Glob::Glob;
  bool pick() override {
    ++picks;
    return allowPick;
  }
  void moved() override { ++moves; }
  void drop() override { ++drops; }
  bool position_constrain(double x, double y, double* ax, double* ay) override {
    if (refuseAll) return false;
    *ax = x;
    *ay = snapY ? 0 : y;
    return true;
  }
  int picks = 0, moves = 0, drops = 0;
  bool allowPick = true, refuseAll = false, snapY = false;
};

XY<int> originOf(const Glob& g) {
  const Kw::Box<int>& r = g.canvas()->rect();
  return XY<int>(r.x0, r.y0);
}

TEST(GlobMove, AMovableGlobFollowsTheDragWithPickMovedDrop) {
  Harness h(400, 300);
  auto* g = new Mover(h.place(50, 50, 80, 60));
  h.drag(XY<int>(60, 60), XY<int>(160, 110));
  EXPECT_EQ(originOf(*g), XY<int>(50, 50));  // not movable: nothing
  g->set_movable(1);
  h.drag(XY<int>(60, 60), XY<int>(160, 110));
  EXPECT_EQ(originOf(*g), XY<int>(150, 100));
  EXPECT_EQ(g->picks, 1);
  EXPECT_EQ(g->moves, 4);
  EXPECT_EQ(g->drops, 1);
}

TEST(GlobMove, ConstraintsAndTheScreenEdgesBoundTheMove) {
  Harness h(400, 300);
  auto* g = new Mover(h.place(50, 50, 80, 60));
  g->set_movable(1);
  g->snapY = true;
  h.drag(XY<int>(60, 60), XY<int>(100, 200));
  EXPECT_EQ(originOf(*g), XY<int>(90, 0));
  g->snapY = false;
  // Off the root: kept inside it.
  h.drag(XY<int>(100, 10), XY<int>(-500, 900));
  EXPECT_EQ(originOf(*g), XY<int>(0, 240));
  // A constraint that refuses every place keeps the old one.
  g->refuseAll = true;
  h.drag(XY<int>(10, 250), XY<int>(200, 100));
  EXPECT_EQ(originOf(*g), XY<int>(0, 240));
  // pick may refuse the move altogether.
  g->refuseAll = false;
  g->allowPick = false;
  h.drag(XY<int>(10, 250), XY<int>(200, 100));
  EXPECT_EQ(originOf(*g), XY<int>(0, 240));
  // And a Glob moved off screen by the program is brought back.
  g->translate_canvas(1000, -1000);
  g->constrain_within_screen();
  EXPECT_EQ(originOf(*g), XY<int>(320, 0));
}

TEST(GlobMove, AGlobDeletedInTheMiddleOfItsMoveEndsItQuietly) {
  Harness h(400, 300);
  auto* g = new Mover(h.place(50, 50, 80, 60));
  g->set_movable(1);
  h.press(XY<int>(60, 60));
  h.move(XY<int>(70, 70));
  delete g;
  h.move(XY<int>(90, 90));
  h.release(XY<int>(90, 90));
  auto* other = new RecordingGlob(h.place(0, 0, 40, 40));
  h.click(XY<int>(10, 10));
  EXPECT_EQ(other->count(kEventLeftDown), 1);  // the pointer is free again
}

TEST(GlobMove, ResizeHandlesShowTheirCursorsAndKeepTheMinimum) {
  Harness h(400, 300);
  auto* g = new Mover(h.place(100, 100, 100, 80));
  g->set_resizeable(1);
  g->setMinimumSize(XY<int>(40, 30));
  h.move(XY<int>(198, 140));
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorResizeHorizontal);
  h.move(XY<int>(150, 101));
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorResizeVertical);
  h.move(XY<int>(198, 101));
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorResizeCorner);
  h.move(XY<int>(150, 140));
  EXPECT_EQ(h.root().cursorAtPointer(), kCursorArrow);

  h.drag(XY<int>(198, 140), XY<int>(248, 140));
  EXPECT_EQ(g->canvas()->rect(), Kw::Box<int>::fromSize(100, 100, 150, 80));
  // The bottom edge goes down and the top stays.
  h.drag(XY<int>(150, 101), XY<int>(150, 81));
  EXPECT_EQ(g->canvas()->rect(), Kw::Box<int>::fromSize(100, 80, 150, 100));
  // The corner, far past the minimum.
  h.drag(XY<int>(248, 81), XY<int>(0, 290));
  EXPECT_EQ(g->canvas()->rect(), Kw::Box<int>::fromSize(100, 150, 40, 30));
  EXPECT_GT(g->old_width(), 40);  // the width of the step before the last
}

TEST(GlobMove, APanelMovesByItsTitleStripOnly) {
  Harness h(500, 400);
  auto* panel = new StandardPanel(GlobCreationInfo(200, 150, h.canvas(), 100, 100));
  panel->addStandardWidgets(StdPootButton);
  panel->set_movable(1);
  // The body does not move it.
  h.drag(XY<int>(200, 150), XY<int>(250, 150));
  EXPECT_EQ(originOf(*panel), XY<int>(100, 100));
  // The title strip does (an empty part of it, left of the close button).
  h.drag(XY<int>(130, 235), XY<int>(180, 185));
  EXPECT_EQ(originOf(*panel), XY<int>(150, 50));
}

TEST(GlobMove, ReparentingDropsIntoAGlobThatAllowsIt) {
  Harness h(400, 300);
  auto* dock = new RecordingGlob(h.place(200, 0, 200, 300));
  dock->consume = false;
  auto* g = new Mover(h.place(10, 10, 40, 40));
  g->set_movable(1);
  g->set_reparent(1);
  h.drag(XY<int>(20, 20), XY<int>(260, 120));
  EXPECT_EQ(g->parent(), &h.root());  // the dock does not take Globs
  dock->set_reparent(1);
  h.drag(XY<int>(260, 120), XY<int>(270, 130));
  EXPECT_EQ(g->parent(), dock);
  EXPECT_EQ(g->get_x(), 260.0);  // it stays where it was let go
  EXPECT_EQ(originOf(*g), XY<int>(60, 120));
}

// --- Drag and drop ---

class Source : public RecordingGlob {
 public:
  using RecordingGlob::RecordingGlob;
  bool dragPayload(const XY<int>&, DragPayload& out) override {
    out = DragPayload(DragPayload::kColour, "#FF8000");
    return true;
  }
};

class Target : public RecordingGlob {
 public:
  using RecordingGlob::RecordingGlob;
  bool acceptsDrop(const DragPayload& p) override { return p.is(DragPayload::kColour); }
  void handleDropHover(bool on) override {
    hovers.push_back(on);
    Glob::handleDropHover(on);
  }
  bool receiveDrop(const DragPayload& p, const XY<int>& pos) override {
    received = p.data();
    at = pos;
    return true;
  }
  std::vector<bool> hovers;
  String received;
  XY<int> at;
};

TEST(GlobDragDrop, APayloadLeavesItsSourceHoversAndLandsOnATarget) {
  Harness h(400, 300);
  auto* src = new Source(h.place(10, 10, 50, 50));
  auto* tgt = new Target(h.place(200, 10, 100, 100));
  auto* refuser = new RecordingGlob(h.place(100, 200, 50, 50));
  h.press(XY<int>(20, 20));
  h.move(XY<int>(40, 40));  // still inside: no drag yet
  EXPECT_EQ(h.root().dragSource(), nullptr);
  h.move(XY<int>(120, 220));  // over the refuser
  EXPECT_EQ(h.root().dragSource(), src);
  EXPECT_EQ(h.root().dropTarget(), nullptr);
  h.move(XY<int>(250, 50));
  EXPECT_EQ(h.root().dropTarget(), tgt);
  EXPECT_TRUE(tgt->isDropHovered());
  h.release(XY<int>(250, 50));
  EXPECT_EQ(tgt->received, "#FF8000");
  EXPECT_EQ(tgt->at, XY<int>(50, 40));
  EXPECT_EQ(tgt->hovers, (std::vector<bool>{true, false}));
  EXPECT_FALSE(tgt->isDropHovered());
  EXPECT_EQ(refuser->count(kEventLeftUp), 0);
  EXPECT_EQ(h.root().dragSource(), nullptr);
}

TEST(GlobDragDrop, ATargetDeletedDuringTheDragIsHarmless) {
  Harness h(400, 300);
  new Source(h.place(10, 10, 50, 50));
  auto* tgt = new Target(h.place(200, 10, 100, 100));
  h.press(XY<int>(20, 20));
  h.move(XY<int>(250, 50));
  EXPECT_EQ(h.root().dropTarget(), tgt);
  delete tgt;
  h.move(XY<int>(260, 50));
  h.release(XY<int>(260, 50));
  EXPECT_EQ(h.root().dragSource(), nullptr);
}

// --- Saved layouts ---

struct Panels {
  Harness h{600, 400};
  Glob* a = new Glob(h.place(10, 10, 100, 80));
  Glob* b = new Glob(h.place(200, 10, 120, 90));
  Panels() {
    a->set_name("left");
    b->set_name("right");
    new Glob(GlobCreationInfo(20, 20, a->canvas(), 5, 5));
  }
  std::vector<Glob*> list() const { return {a, b}; }
};

TEST(GlobLayout, DumpAndLoadCarryPlaceSizeStateAndChildren) {
  Panels p;
  configb saved;
  p.a->dump(saved);
  EXPECT_EQ(saved.get("left.x"), "10");
  EXPECT_EQ(saved.get("left/glob.width"), "20");
  saved.set("left.x", "40");
  saved.set("left.size", "1");
  saved.set("left/glob.y", "7");
  EXPECT_TRUE(p.a->load(saved));
  EXPECT_EQ(originOf(*p.a), XY<int>(40, 10));
  EXPECT_EQ(p.a->getSizeState(), SizeMinimised);
  EXPECT_EQ(p.a->children()[0]->canvas()->rect().y0, 7);

  // Out of range, not a number, newer than we write: that Glob's entries are all refused.
  for (const auto& [key, value] : std::vector<std::pair<String, String>>{
           {"left.width", "70000"}, {"left.x", "12abc"}, {"left.version", "9"}, {"left.y", ""}}) {
    configb bad = saved;
    bad.set("left.x", "99");
    bad.set(key, value);
    EXPECT_FALSE(p.a->load(bad)) << key;
    EXPECT_EQ(originOf(*p.a), XY<int>(40, 10)) << key;
  }
}

TEST(GlobLayout, AFileIsWrittenAndReadBackAndBadFilesAreRefused) {
  TempDir dir;
  const String path = dir.file("layout");
  {
    Panels p;
    p.b->translate_canvas(30, 40);
    GlobLayoutFile file(path, "test");
    ASSERT_TRUE(file.save(p.list()));
  }
  Panels p;
  GlobLayoutFile file(path, "test");
  ASSERT_TRUE(file.restore(p.list())) << file.lastError();
  EXPECT_EQ(originOf(*p.b), XY<int>(230, 50));

  String text;
  String why;
  ASSERT_EQ(FileText::read(path, text, why), FileText::ReadResult::Ok);
  auto refused = [&](const String& bytes, std::vector<Glob*> globs, const String& app) {
    TempDir::write(path, bytes);
    Panels fresh;
    GlobLayoutFile f(path, app);
    const bool ok = f.restore(globs.empty() ? fresh.list() : globs);
    return !ok && originOf(*fresh.b) == XY<int>(200, 10);
  };
  EXPECT_TRUE(refused(text.substr(0, text.size() / 2), {}, "test"));  // truncated
  EXPECT_TRUE(refused(text, {}, "another"));                          // foreign
  EXPECT_TRUE(refused("garbage\n" + text, {}, "test"));               // not a layout
  EXPECT_TRUE(refused(text + "left.x = 3\n", {}, "test"));            // after the end
  {
    Panels fresh;
    TempDir::write(path, text);
    GlobLayoutFile f(path, "test");
    EXPECT_FALSE(f.restore({fresh.b}));  // made for another set of panels
    EXPECT_EQ(originOf(*fresh.b), XY<int>(200, 10));
  }
}

}  // namespace
