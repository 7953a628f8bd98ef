// Liveness, teardown and the shared pieces a Glob holds: what must stay true now that the
// registry keeps slots, subtrees go in one sweep and palettes share their records.
#include <gtest/gtest.h>

#include <vector>

#include "platform/glob/GlobHandle.h"
#include "platform/glob/GlobRegistry.h"
#include "platform/testing/Harness.h"
#include "tests/platform/GlobTestSupport.h"

namespace {

// Notes its number in a shared log as it is destroyed.
class WitnessGlob : public Glob {
 public:
  WitnessGlob(Canvas* parent, std::vector<int>& log, int id)
      : Glob(GlobCreationInfo(10, 10, parent)), log_(log), id_(id) {}
  ~WitnessGlob() override { log_.push_back(id_); }

 private:
  std::vector<int>& log_;
  int id_;
};

}  // namespace

TEST(GlobLiveness, IdentitiesAreNeverReusedAndOnlyExactAddressesAreLive) {
  Harness h;
  const uint32_t before = GlobRegistry::liveCount();
  std::vector<uint64_t> seen;
  for (int i = 0; i < 50; ++i) {
    auto* g = new RecordingGlob(h.place(0, 0, 10, 10));
    EXPECT_NE(g->serial(), 0u);
    for (uint64_t s : seen) EXPECT_NE(s, g->serial());
    seen.push_back(g->serial());
    const char* inside = reinterpret_cast<const char*>(g);
    EXPECT_TRUE(is_good_glob_ptr(g));
    EXPECT_FALSE(is_good_glob_ptr(inside + 1));
    EXPECT_FALSE(is_good_glob_ptr(inside + 8));
    EXPECT_TRUE(glob_serial_is_alive(g, g->serial()));
    EXPECT_FALSE(glob_serial_is_alive(g, g->serial() + (uint64_t{1} << 32)));
    delete g;
    EXPECT_FALSE(is_good_glob_ptr(g));
  }
  EXPECT_FALSE(is_good_glob_ptr(nullptr));
  EXPECT_EQ(GlobRegistry::liveCount(), before);
}

TEST(GlobLiveness, HandleOfAnotherGlobNeverMatchesAReusedSlot) {
  Harness h;
  auto* a = new RecordingGlob(h.place(0, 0, 10, 10));
  GlobHandle<> ha(a);
  delete a;
  // The freed slot goes to the next Glob; the old handle names the old generation.
  auto* b = new RecordingGlob(h.place(0, 0, 10, 10));
  GlobHandle<> hb(b);
  EXPECT_FALSE(ha.alive());
  EXPECT_TRUE(hb.alive());
  EXPECT_FALSE(ha.refersTo(b));
  delete b;
}

TEST(GlobTeardown, SubtreeGoesWholeAndOnlyItsOwnAreaIsRepainted) {
  Harness h(400, 300);
  auto* panel = new RecordingGlob(h.place(50, 40, 200, 100));
  std::vector<int> log;
  std::vector<WitnessGlob*> kids;
  for (int i = 0; i < 40; ++i) {
    auto* k = new WitnessGlob(panel->canvas(), log, i);
    k->translate_canvas((i % 10) * 20, (i / 10) * 20);
    kids.push_back(k);
    new WitnessGlob(k->canvas(), log, 100 + i);  // a grandchild in each
  }
  auto* focused = kids[7];
  focused->set_kbd_focus();
  h.move(Harness::centreOf(*kids[3]));
  h.paint();
  const uint32_t before = GlobRegistry::liveCount();
  delete panel;
  // Youngest first, each child just before its own child.
  ASSERT_EQ(log.size(), 80u);
  EXPECT_EQ(log[0], 39);
  EXPECT_EQ(log[1], 139);
  EXPECT_EQ(log[78], 0);
  EXPECT_EQ(log[79], 100);
  EXPECT_EQ(GlobRegistry::liveCount(), before - 81);
  EXPECT_EQ(h.root().focus(), nullptr);
  EXPECT_EQ(h.root().hovered(), nullptr);
  // The damage is the panel's own rectangle: nothing outside it repaints.
  ASSERT_EQ(h.root().dirty().rects().size(), 1u);
  EXPECT_EQ(h.root().dirty().rects()[0], Kw::Box<int>::fromSize(50, 40, 200, 100));
  EXPECT_EQ(h.canvas()->children().size(), 0u);
}

TEST(GlobTeardown, RemovingAnyChildKeepsTheOthersInStackingOrder) {
  Harness h;
  auto* parent = new RecordingGlob(h.place(0, 0, 100, 100));
  std::vector<RecordingGlob*> kids;
  for (int i = 0; i < 6; ++i)
    kids.push_back(new RecordingGlob(GlobCreationInfo(5, 5, parent->canvas())));
  delete kids[2];
  kids[4]->detachFromParent();
  const std::vector<Canvas*> want = {kids[0]->canvas(), kids[1]->canvas(), kids[3]->canvas(),
                                     kids[5]->canvas()};
  EXPECT_EQ(parent->canvas()->children(), want);
  delete kids[4];
  delete parent;
}

TEST(GlobExtras, NamesHelpAndCursorsDefaultUntilSet) {
  Harness h;
  auto* g = new RecordingGlob(h.place(0, 0, 10, 10));
  EXPECT_EQ(g->get_name(), "");
  EXPECT_EQ(g->get_id(), "glob");
  EXPECT_EQ(g->contextString(XY<int>(1, 1), nullptr), "");
  EXPECT_EQ(g->contextCursor(XY<int>(1, 1)), kCursorArrow);
  g->set_name("named");
  g->setContextString("help");
  EXPECT_EQ(g->get_id(), "named");
  EXPECT_EQ(g->contextString(XY<int>(1, 1), nullptr), "help");
  g->set_name("");
  EXPECT_EQ(g->get_id(), "glob");
  EXPECT_EQ(g->contextString(XY<int>(1, 1), nullptr), "help");
  delete g;
}

TEST(PaletteSharing, CopiesShareUntilOneChanges) {
  const Palette standard;
  Palette copy = standard;
  EXPECT_EQ(copy, standard);
  copy.set(Palette::Window, Colour(1, 0, 0));
  EXPECT_EQ(copy.get(Palette::Window), Colour(1, 0, 0));
  EXPECT_EQ(standard.get(Palette::Window), Palette::dark().get(Palette::Window));
  EXPECT_FALSE(copy == standard);
  Palette moved = std::move(copy);
  EXPECT_EQ(moved.get(Palette::Window), Colour(1, 0, 0));
  Palette assigned;
  assigned = moved;
  assigned.set(Palette::Text, Colour(0, 1, 0));
  EXPECT_EQ(moved.get(Palette::Text), Palette::dark().get(Palette::Text));
  EXPECT_FALSE(Palette::light() == Palette::dark());
  EXPECT_EQ(Palette::light().windowShade(3), Palette::light().get(Palette::Window));
}

TEST(PaletteSharing, AGlobsColourChangeStaysItsOwn) {
  Harness h;
  auto* parent = new RecordingGlob(h.place(0, 0, 100, 100));
  auto* a = new RecordingGlob(GlobCreationInfo(10, 10, parent->canvas()));
  auto* b = new RecordingGlob(GlobCreationInfo(10, 10, parent->canvas()));
  a->setCol(Colour(0, 0, 1), false);
  EXPECT_EQ(a->getPalette().get(Palette::Window), Colour(0, 0, 1));
  EXPECT_EQ(b->getPalette(), parent->getPalette());
  EXPECT_EQ(parent->getPalette().get(Palette::Window), Palette().get(Palette::Window));
  delete parent;
}
