// The Glob interface: its tables in their fixed order, walks that survive deletion, freezing,
// stacking, counts, "it", notifications and self-checks.
#include <gtest/gtest.h>

#include <cstring>

#include "platform/glob/BoxRegion.h"
#include "platform/glob/GlobHandle.h"
#include "platform/testing/Harness.h"
#include "tests/platform/GlobTestSupport.h"

namespace {

#if defined(__GXX_ABI_VERSION)
// The slot of a virtual operation in its table, read from the member pointer (a virtual one
// holds 1 + the slot's byte offset).
template <typename F>
long slotOf(F f) {
  struct Rep {
    long ptr;
    long adj;
  } rep;
  static_assert(sizeof(F) == sizeof(Rep));
  std::memcpy(&rep, &f, sizeof rep);
  return (rep.ptr - 1) / static_cast<long>(sizeof(void*));
}

TEST(GlobTable, PrimaryOperationsFollowTheDestructorInTheirFixedOrder) {
  using US = unsigned short (Glob::*)() const;
  const std::vector<long> slots = {
      slotOf(&Glob::notify),
      slotOf(&Glob::destroy),
      slotOf(&Glob::bufNotify),
      slotOf(&Glob::position_constrain),
      slotOf(&Glob::realPositionConstrain),
      slotOf(&Glob::parent),
      slotOf(&Glob::load),
      slotOf(&Glob::dump),
      slotOf(&Glob::old_height),
      slotOf(&Glob::old_width),
      slotOf(static_cast<US>(&Glob::height)),
      slotOf(static_cast<US>(&Glob::width)),
      slotOf(&Glob::react),
      slotOf(&Glob::reshape),
      slotOf(&Glob::reshape_myself),
      slotOf(&Glob::path),
      slotOf(&Glob::reshape_and_draw),
      slotOf(&Glob::version),
      slotOf(&Glob::pick),
      slotOf(&Glob::drop),
      slotOf(&Glob::moved),
      slotOf(&Glob::set_canvas),
      slotOf(&Glob::set_interest),
      slotOf(&Glob::clear_interest),
      slotOf(&Glob::pop_to_top),
      slotOf(&Glob::push_to_bottom),
      slotOf(&Glob::map_canvas),
      slotOf(&Glob::unmap_canvas),
      slotOf(&Glob::reshape_canvas),
      slotOf(&Glob::translate_canvas),
      slotOf(&Glob::translate_canvtree),
      slotOf(&Glob::walk_older_siblings),
      slotOf(&Glob::walk_younger_siblings),
      slotOf(&Glob::walk_siblings),
      slotOf(&Glob::walk_children),
      slotOf(&Glob::walk_ancestors),
      slotOf(&Glob::walk_subtree),
      slotOf(&Glob::walk_postorder),
      slotOf(&Glob::sibling_count),
      slotOf(&Glob::child_count),
      slotOf(&Glob::next_child),
      slotOf(&Glob::freeze),
      slotOf(&Glob::unfreeze),
      slotOf(&Glob::set_movable),
      slotOf(&Glob::get_movable),
      slotOf(&Glob::set_reparent),
      slotOf(&Glob::get_reparent),
      slotOf(&Glob::set_resizeable),
      slotOf(&Glob::set_dumpable),
      slotOf(&Glob::get_dumpable),
      slotOf(&Glob::set_dump_ifnot_subglob),
      slotOf(&Glob::get_dump_ifnot_subglob),
      slotOf(&Glob::set_quickdraw),
      slotOf(&Glob::get_quickdraw),
      slotOf(&Glob::make_dirty),
      slotOf(&Glob::make_clean),
      slotOf(&Glob::is_dirty),
      slotOf(&Glob::set_kbd_focus),
      slotOf(&Glob::shape),
      slotOf(&Glob::is_currently_trashable),
      slotOf(&Glob::can_be_it),
      slotOf(&Glob::set_can_be_it),
      slotOf(&Glob::set_becomes_it_if_moved),
      slotOf(&Glob::handle_it),
      slotOf(&Glob::m_is_type),
      slotOf(&Glob::m_is_same_type),
      slotOf(&Glob::glob_tidy),
      slotOf(&Glob::call_msg),
      slotOf(&Glob::constrain_within_screen),
      slotOf(&Glob::handle_kbd_focus),
      slotOf(&Glob::get_glob_cookie),
      slotOf(&Glob::getDataFiles),
      slotOf(&Glob::get_id),
      slotOf(&Glob::get_name),
      slotOf(&Glob::asString),
      slotOf(&Glob::validate),
      slotOf(&Glob::setActive),
      slotOf(&Glob::setVisible),
      slotOf(&Glob::setPalette),
      slotOf(&Glob::setCol),
      slotOf(&Glob::setSizeState),
      slotOf(&Glob::set_size_flag),
      slotOf(&Glob::detachFromParent),
  };
  // The two destructor entries come first; then every operation in the next slot.
  for (size_t i = 0; i < slots.size(); ++i) EXPECT_EQ(slots[i], static_cast<long>(i) + 2) << i;
}

TEST(GlobTable, SecondaryTablesKeepTheirOrder) {
  EXPECT_EQ(slotOf(&Drawable::update), 0);
  EXPECT_EQ(slotOf(&Drawable::draw), 1);
  EXPECT_EQ(slotOf(&Drawable::canDraw), 2);
  const std::vector<long> client = {
      slotOf(&CanvasClient::fsFilterThis),   slotOf(&CanvasClient::handleEvent),
      slotOf(&CanvasClient::width),          slotOf(&CanvasClient::height),
      slotOf(&CanvasClient::resize),         slotOf(&CanvasClient::handleBaseWindowMove),
      slotOf(&CanvasClient::idstring),       slotOf(&CanvasClient::contextString),
      slotOf(&CanvasClient::contextCursor),  slotOf(&CanvasClient::handleMouseContainment),
      slotOf(&CanvasClient::drawUnbuffered), slotOf(&CanvasClient::isOpaqueAt)};
  EXPECT_EQ(client[0], 0);
  EXPECT_EQ(client[1], 3);  // after the two destructor entries
  for (size_t i = 2; i < client.size(); ++i) EXPECT_EQ(client[i], client[i - 1] + 1) << i;
}
#endif

TEST(GlobTable, TheExtraFacesCostNoSizeAndFlagsShareAWord) {
  // Two more table pointers (the notification and font faces) are paid for by the canvas,
  // which keeps its rare parts apart.
  EXPECT_EQ(sizeof(Glob), 136u);
}

struct Tree {
  Harness h{400, 300};
  RecordingGlob* top = new RecordingGlob(h.place(10, 10, 200, 200));
  std::vector<RecordingGlob*> kids;
  Tree() {
    for (int i = 0; i < 4; ++i) {
      kids.push_back(new RecordingGlob(GlobCreationInfo(20, 20, top->canvas(), i * 30, 0)));
      kids.back()->set_name("k" + std::to_string(i));
    }
  }
};

std::vector<String> names(const std::vector<Glob*>& gs) {
  std::vector<String> out;
  for (Glob* g : gs) out.push_back(g->get_id());
  return out;
}

TEST(GlobWalks, VisitInTheirOrdersAndStopWhereAsked) {
  Tree t;
  std::vector<Glob*> seen;
  auto record = [&seen](Glob* g) {
    seen.push_back(g);
    return false;
  };
  t.kids[2]->walk_older_siblings(record);
  EXPECT_EQ(names(seen), (std::vector<String>{"k1", "k0"}));
  seen.clear();
  t.kids[1]->walk_younger_siblings(record);
  EXPECT_EQ(names(seen), (std::vector<String>{"k2", "k3"}));
  seen.clear();
  t.kids[1]->walk_siblings(record);
  EXPECT_EQ(names(seen), (std::vector<String>{"k0", "k2", "k3"}));
  seen.clear();
  auto* grand = new RecordingGlob(GlobCreationInfo(5, 5, t.kids[0]->canvas()));
  grand->set_name("g");
  t.top->set_name("top");
  t.top->walk_subtree(record);
  EXPECT_EQ(names(seen), (std::vector<String>{"top", "k0", "g", "k1", "k2", "k3"}));
  seen.clear();
  t.top->walk_postorder(record);
  EXPECT_EQ(names(seen), (std::vector<String>{"g", "k0", "k1", "k2", "k3", "top"}));
  seen.clear();
  grand->walk_ancestors(record);
  EXPECT_EQ(names(seen), (std::vector<String>{"k0", "top", "root"}));
  EXPECT_EQ(t.top->walk_children([](Glob* g) { return g->get_id() == "k2"; }), t.kids[2]);

  EXPECT_EQ(t.top->child_count(), 4);
  EXPECT_EQ(t.kids[0]->sibling_count(), 3);
  EXPECT_EQ(t.top->next_child(nullptr), t.kids[0]);
  EXPECT_EQ(t.top->next_child(t.kids[2]), t.kids[3]);
  EXPECT_EQ(t.top->next_child(t.kids[3]), nullptr);
  EXPECT_EQ(t.top->next_child(grand), nullptr);  // not a child
}

TEST(GlobWalks, CallbacksMayDeleteWhatTheyAreGivenOrItsSiblings) {
  Tree t;
  int calls = 0;
  // Each visit deletes the Glob visited and the next one: the walk skips the dead.
  t.top->walk_children([&](Glob* g) {
    ++calls;
    Glob* next = t.top->next_child(g);
    delete g;
    delete next;
    return false;
  });
  EXPECT_EQ(calls, 2);
  EXPECT_EQ(t.top->child_count(), 0);

  Tree u;
  GlobHandle<> top(u.top);
  // Deleting the Glob walked from, half way through its post-order walk.
  calls = 0;
  u.top->walk_postorder([&](Glob* g) {
    ++calls;
    if (calls == 2) delete top.get();
    return false;
  });
  EXPECT_EQ(calls, 2);
  EXPECT_FALSE(top.alive());
}

TEST(GlobFreeze, HoldsRepaintsAndLayoutsAndPaysThemOnceOnTheLastThaw) {
  Harness h(300, 200);
  struct Counting : RecordingGlob {
    using RecordingGlob::RecordingGlob;
    void reshape() override { ++layouts; }
    int layouts = 0;
  };
  auto* panel = new Counting(h.place(10, 10, 100, 100));
  auto* child = new Counting(GlobCreationInfo(20, 20, panel->canvas(), 5, 5));
  h.paint();

  panel->freeze();
  panel->freeze();  // nested
  child->update();
  panel->update();
  child->make_dirty();
  const int drawsBefore = panel->draws;
  h.paint();
  EXPECT_FALSE(h.drew(child));
  EXPECT_FALSE(h.drew(panel));

  // Changes of size wait too: their repaints and the layouts they ask for.
  child->reshape_canvas(5, 5, 30, 30);
  panel->reshape_canvas(10, 10, 120, 100);
  panel->reshape_myself();
  EXPECT_EQ(panel->layouts, 0);
  EXPECT_EQ(child->layouts, 0);
  EXPECT_TRUE(h.paint().empty());

  panel->unfreeze();  // still frozen once
  EXPECT_EQ(panel->layouts, 0);
  child->update();
  h.paint();
  EXPECT_FALSE(h.drew(child));

  panel->unfreeze();
  EXPECT_EQ(panel->layouts, 1);
  EXPECT_EQ(child->layouts, 1);
  h.paint();
  EXPECT_TRUE(h.drew(panel));
  EXPECT_TRUE(h.drew(child));
  EXPECT_GE(panel->draws, drawsBefore + 1);

  panel->unfreeze();  // unmatched: refused, nothing happens
  EXPECT_FALSE(panel->isFrozen());
  child->update();
  h.paint();
  EXPECT_TRUE(h.drew(child));  // thawed for good
}

TEST(GlobFreeze, AFrozenGlobDeletedStillFrozenLeavesTheRestThawed) {
  Harness h(300, 200);
  auto* a = new RecordingGlob(h.place(0, 0, 50, 50));
  auto* b = new RecordingGlob(h.place(60, 0, 50, 50));
  h.paint();
  a->freeze();
  delete a;
  b->update();
  h.paint();
  EXPECT_TRUE(h.drew(b));
}

TEST(GlobState, ItFlagsNotificationsAndSelfChecks) {
  Harness h(300, 200);
  auto* a = new RecordingGlob(h.place(0, 0, 50, 50));
  auto* b = new RecordingGlob(h.place(60, 0, 50, 50));
  b->set_can_be_it(0);
  h.root().setIt(b);
  EXPECT_EQ(h.root().it(), nullptr);  // refused
  h.root().setIt(a);
  EXPECT_TRUE(a->isIt());
  a->set_can_be_it(0);
  EXPECT_EQ(h.root().it(), nullptr);

  EXPECT_FALSE(a->is_dirty());
  a->make_dirty();
  EXPECT_TRUE(a->is_dirty());
  a->make_clean();
  EXPECT_FALSE(a->is_dirty());
  EXPECT_TRUE(a->m_is_same_type(b));
  EXPECT_FALSE(a->m_is_same_type(&h.root()));
  EXPECT_EQ(a->get_glob_cookie(), a->serial());
  EXPECT_TRUE(a->validate());

  GrowString s;
  a->set_name("alpha");
  a->asString(s);
  EXPECT_EQ(s.str(), "glob \"alpha\" [0 0 50 50]");

  // A Glob on a screen that asks to go goes after the event, not during it.
  GlobHandle<> ha(a);
  a->destroy(NotifyMsg{});
  EXPECT_TRUE(ha.alive());
  h.pump();
  EXPECT_FALSE(ha.alive());

  Kw::Ptr<iRegion> path = b->path();
  ASSERT_TRUE(path);
  EXPECT_EQ(path->bounds(), Kw::Box<int>(0, 0, 50, 50));
  EXPECT_TRUE(b->shape()->contains(XY<int>(61, 1)));
  EXPECT_FALSE(b->shape()->contains(XY<int>(1, 1)));
}

TEST(GlobState, StackingAndScrollingContent) {
  Tree t;
  t.kids[0]->pop_to_top();
  EXPECT_EQ(t.top->children().back(), t.kids[0]);
  t.kids[0]->push_to_bottom();
  EXPECT_EQ(t.top->children().front(), t.kids[0]);
  t.top->translate_canvtree(3, 4);
  EXPECT_EQ(t.kids[1]->canvas()->rect().x0, 33);
  EXPECT_EQ(t.kids[1]->canvas()->rect().y0, 4);
  EXPECT_EQ(t.top->canvas()->rect().x0, 10);  // the Glob itself stays
  EXPECT_EQ(t.top->old_width(), 200);
  t.top->reshape_canvas(10, 10, 150, 120);
  EXPECT_EQ(t.top->old_width(), 200);
  EXPECT_EQ(t.top->old_height(), 200);
}

}  // namespace
