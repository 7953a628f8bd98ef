#include <gtest/gtest.h>

#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"
#include "platform/testing/Harness.h"
#include "tests/platform/GlobTestSupport.h"

namespace {

struct Scene {
  Harness h{400, 300};
  // panel at (10,10) 200x100; a button inside it at (20,20) 50x30 (root 30..80, 30..60).
  RecordingGlob* panel = new RecordingGlob(h.place(10, 10, 200, 100));
  RecordingGlob* button = new RecordingGlob(GlobCreationInfo(50, 30, panel->canvas(), 20, 20));
};

}  // namespace

TEST(GlobRouting, MouseGoesToDeepestMappedGlobInLocalCoordinates) {
  Scene s;
  s.h.click(XY<int>(35, 40));
  ASSERT_EQ(s.button->count(kEventLeftDown), 1);
  EXPECT_EQ(s.button->seen[s.button->seen.size() - 2].pos, XY<int>(5, 10));
  EXPECT_EQ(s.panel->count(kEventLeftDown), 0);

  // Unmapped: the click lands on the panel instead.
  s.button->unmap_canvas();
  s.h.click(XY<int>(35, 40));
  EXPECT_EQ(s.button->count(kEventLeftDown), 1);
  EXPECT_EQ(s.panel->count(kEventLeftDown), 1);

  // Outside every child: the root, which consumes nothing.
  s.h.click(XY<int>(390, 290));
  EXPECT_EQ(s.panel->count(kEventLeftDown), 1);
}

TEST(GlobRouting, UnconsumedInputBubblesWithPositionsInEachParent) {
  Scene s;
  s.button->consume = false;
  s.h.press(XY<int>(35, 40));
  ASSERT_EQ(s.panel->count(kEventLeftDown), 1);
  EXPECT_EQ(s.panel->seen.back().pos, XY<int>(25, 30));
  // Messages do not bubble: they were addressed to the button.
  s.panel->seen.clear();
  s.panel->call_msg(s.button, "hello");
  EXPECT_TRUE(s.panel->seen.empty());
}

TEST(GlobRouting, GrabKeepsMovesAndReleaseWithThePressedGlob) {
  Scene s;
  s.h.press(XY<int>(35, 40));
  s.h.move(XY<int>(300, 250));  // far outside the button
  s.h.release(XY<int>(300, 250));
  EXPECT_EQ(s.button->count(kEventLeftMove), 1);
  EXPECT_EQ(s.button->count(kEventLeftUp), 1);
  EXPECT_EQ(s.panel->count(kEventLeftUp), 0);
  // Press offset reported through distance().
  Event last;
  s.button->onEvent = [&](Event* e) {
    last = *e;
    return -1;
  };
  s.h.press(XY<int>(35, 40));
  s.h.move(XY<int>(39, 43));
  EXPECT_EQ(last.distance(), XY<int>(4, 3));
  s.h.release(XY<int>(39, 43));
  // After the release the grab is gone: a move over the panel goes to the panel.
  s.h.move(XY<int>(150, 80));
  EXPECT_EQ(s.panel->count(kEventMouseMove), 1);
}

TEST(GlobRouting, ContainmentFollowsThePointer) {
  Scene s;
  s.h.move(XY<int>(35, 40));
  s.h.move(XY<int>(150, 80));
  s.h.move(XY<int>(151, 80));
  EXPECT_EQ(s.button->containment, (std::vector<bool>{true, false}));
  EXPECT_EQ(s.panel->containment, (std::vector<bool>{true}));
  EXPECT_EQ(glib_getCurrentMouseCanvas(s.panel), s.panel->canvas());
  s.panel->setDefaultCursor(kCursorHand);
  s.panel->setContextString("Panel help");
  EXPECT_EQ(s.h.root().cursorAtPointer(), kCursorHand);
  EXPECT_EQ(s.h.root().contextStringAtPointer(), "Panel help");
  // A Glob without help text defers to its parent's.
  s.h.move(XY<int>(35, 40));
  EXPECT_EQ(s.h.root().contextStringAtPointer(), "Panel help");
}

TEST(GlobRouting, KeysGoToFocusAndFocusChangesAreAnnounced) {
  Scene s;
  auto* other = new RecordingGlob(s.h.place(250, 10, 40, 40));
  s.button->set_kbd_focus();
  EXPECT_EQ(s.h.root().focus(), s.button);
  s.h.key('a');
  EXPECT_EQ(s.button->count(kEventKeyPress), 1);
  EXPECT_EQ(s.button->seen.back().word2, 'a');

  other->set_kbd_focus();
  EXPECT_EQ(s.button->focusCalls, (std::vector<bool>{true, false}));
  EXPECT_EQ(other->focusCalls, (std::vector<bool>{true}));

  // Unconsumed keys bubble from the focus.
  s.button->set_kbd_focus();
  s.button->consume = false;
  s.h.setModifiers(kKeyCtrl);
  s.h.key('Z');
  EXPECT_EQ(s.panel->count(kEventKeyPress), 1);
  EXPECT_EQ(s.panel->seen.back().word2, kKeyCtrl | 'Z');

  // Unmapping the focus clears it, and the loser hears of it.
  s.button->unmap_canvas();
  EXPECT_EQ(s.h.root().focus(), nullptr);
  EXPECT_FALSE(s.button->focusCalls.back());
}

TEST(GlobRouting, LoserMayMoveFocusElsewhere) {
  Scene s;
  auto* third = new RecordingGlob(s.h.place(250, 10, 40, 40));
  s.button->set_kbd_focus();
  s.button->onEvent = nullptr;
  struct Redirect : RecordingGlob {
    using RecordingGlob::RecordingGlob;
    Glob* to = nullptr;
    void handle_kbd_focus() override {
      RecordingGlob::handle_kbd_focus();
      if (!hasKbdFocus() && to) to->set_kbd_focus();
    }
  };
  auto* r = new Redirect(s.h.place(300, 100, 20, 20));
  r->to = third;
  r->set_kbd_focus();
  s.panel->set_kbd_focus();
  EXPECT_EQ(s.h.root().focus(), third);
  EXPECT_TRUE(s.panel->focusCalls.empty());
}

TEST(GlobMessages, SynchronousBeforeQueuedAndQueuedInOrder) {
  Scene s;
  std::vector<String> order;
  s.panel->onEvent = [&](Event* e) {
    if (message_event(e)) order.push_back(e->text());
    return -1;
  };
  s.button->send_msg(s.panel, "queued 1");
  s.button->send_msg(s.panel, "queued 2");
  EXPECT_EQ(s.button->call_msg(s.panel, "sync"), 1);
  EXPECT_EQ(order, (std::vector<String>{"sync"}));
  EXPECT_EQ(s.h.pump(), 2u);
  EXPECT_EQ(order, (std::vector<String>{"sync", "queued 1", "queued 2"}));

  // Messages posted while the queue is delivered come after, in the same pump.
  s.panel->onEvent = [&](Event* e) {
    if (message_event(e)) {
      order.push_back(e->text());
      if (e->text() == "a") s.panel->send_msg(s.panel, "c");
    }
    return -1;
  };
  order.clear();
  s.button->send_msg(s.panel, "a");
  s.button->send_msg(s.panel, "b");
  s.h.pump();
  EXPECT_EQ(order, (std::vector<String>{"a", "b", "c"}));
}

TEST(GlobMessages, SenderIsKnownUntilItIsDeleted) {
  Scene s;
  Glob* sender = nullptr;
  s.panel->onEvent = [&](Event* e) {
    sender = event_to_sender_glob(e);
    return -1;
  };
  s.button->call_msg(s.panel, "x");
  EXPECT_EQ(sender, s.button);
  s.button->send_msg(s.panel, "y");
  delete s.button;
  s.h.pump();
  EXPECT_EQ(sender, nullptr);
}

TEST(GlobSafety, DeletionInsideOwnReactStopsBubbling) {
  Scene s;
  s.button->onEvent = [&](Event* e) {
    if (mouse_down_event(e)) delete s.button;
    return 0;
  };
  s.h.press(XY<int>(35, 40));
  EXPECT_FALSE(is_good_glob_ptr(s.button));
  EXPECT_EQ(s.panel->count(kEventLeftDown), 0);
  // The release finds no grab and goes to what is under the pointer now.
  s.h.release(XY<int>(35, 40));
  EXPECT_EQ(s.panel->count(kEventLeftUp), 1);
}

TEST(GlobSafety, MessagesToDeletedGlobsAreDroppedWithDiagnostics) {
  Scene s;
  Diagnostics::Capture diags;
  RecordingGlob* target = s.button;
  s.panel->send_msg(target, "late");
  delete target;
  EXPECT_EQ(s.h.pump(), 1u);  // taken off the queue, delivered to nobody
  EXPECT_EQ(s.panel->call_msg(target, "now"), -1);
  s.panel->send_msg(target, "later");
  EXPECT_EQ(s.h.root().queuedCount(), 0u);
  EXPECT_TRUE(diags.contains("deleted Glob"));
  Event e(kEventMessage);
  e.dest = target;
  EXPECT_EQ(event_send(&e, false), 0);
}

TEST(GlobSafety, ReentrantCallMsgIsBoundedNotFatal) {
  Scene s;
  Diagnostics::Capture diags;
  int depth = 0;
  int deepest = 0;
  s.panel->onEvent = [&](Event* e) {
    if (!message_event(e)) return -1;
    ++depth;
    deepest = std::max(deepest, depth);
    const int r = s.panel->call_msg(s.panel, "again");  // recurses until refused
    --depth;
    return r == -1 ? 7 : r;
  };
  EXPECT_EQ(s.button->call_msg(s.panel, "start"), 7);
  EXPECT_EQ(deepest, 64);
  EXPECT_TRUE(diags.contains("nested too deeply"));
}

TEST(GlobSafety, HandlesTellReusedAddressesApart) {
  Harness h;
  auto* a = new RecordingGlob(h.place(0, 0, 10, 10));
  GlobHandle<RecordingGlob> handle(a);
  EXPECT_EQ(handle.get(), a);
  delete a;
  EXPECT_EQ(handle.get(), nullptr);
  // Even if the allocator hands the same address to a new Glob, the old handle stays dead.
  auto* b = new RecordingGlob(h.place(0, 0, 10, 10));
  EXPECT_EQ(handle.get(), nullptr);
  EXPECT_TRUE(is_good_glob_ptr(b));
}

TEST(GlobSafety, ParentDeletesChildrenAndDetachedChildrenSurvive) {
  Harness h;
  auto* parent = new RecordingGlob(h.place(0, 0, 100, 100));
  auto* kept = new RecordingGlob(GlobCreationInfo(10, 10, parent->canvas()));
  auto* owned = new RecordingGlob(GlobCreationInfo(10, 10, parent->canvas()));
  kept->detachFromParent();
  EXPECT_EQ(kept->parent(), nullptr);
  delete parent;
  EXPECT_FALSE(is_good_glob_ptr(owned));
  EXPECT_TRUE(is_good_glob_ptr(kept));
  delete kept;
}

TEST(GlobTicks, ManualClockFiresTicksAsTimePasses) {
  Harness h;
  auto* g = new RecordingGlob(h.place(0, 0, 10, 10));
  std::vector<int> at;
  g->onEvent = [&](Event* e) {
    if (tick_event(e)) at.push_back(Glob::clock());
    return -1;
  };
  const int start = Glob::clock();
  h.advance(25);
  EXPECT_TRUE(at.empty());  // not subscribed
  g->set_interest(kInterestTicks);
  g->set_interest(kInterestTicks);  // twice is once
  h.advance(30);
  ASSERT_EQ(at.size(), 3u);
  EXPECT_EQ(at[0], start + 30);
  EXPECT_EQ(at[2], start + 50);
  EXPECT_EQ(Glob::clock(), start + 55);
  g->clear_interest(kInterestTicks);
  h.advance(100);
  EXPECT_EQ(at.size(), 3u);
}

TEST(GlobTicks, TickHandlerMayDeleteItselfOrOthers) {
  Harness h;
  auto* a = new RecordingGlob(h.place(0, 0, 10, 10));
  auto* b = new RecordingGlob(h.place(20, 0, 10, 10));
  a->onEvent = [&](Event* e) {
    if (tick_event(e)) {
      delete b;
      delete a;
    }
    return 1;
  };
  a->set_interest(kInterestTicks);
  b->set_interest(kInterestTicks);
  h.advance(50);
  EXPECT_FALSE(is_good_glob_ptr(a));
  EXPECT_FALSE(is_good_glob_ptr(b));
}

TEST(GlobGeometry, NearestGlobAndPseudoDistance) {
  Scene s;
  // A Glob on a surface that is no Glob, under the others; its centre (45, 45) lies inside the
  // button.
  PlainSurface surface(s.h.canvas(), Kw::Box<int>(0, 0, 400, 300));
  RecordingGlob loose(GlobCreationInfo(10, 10, surface.canvas(), 40, 40));
  EXPECT_EQ(find_nearest_glob(&loose, nullptr), s.button);
  EXPECT_LT(glob_pseudo_distance(&loose, s.button), 0.0);
  EXPECT_EQ(find_nearest_glob(&loose, s.button), s.panel);
  RecordingGlob far(GlobCreationInfo(10, 10, surface.canvas(), 350, 250));
  EXPECT_EQ(find_nearest_glob(&far, nullptr), &s.h.root());
  EXPECT_GT(glob_pseudo_distance(&far, s.panel), 0.0);
}
