// The screen's own services for what lives on it: taking in a Glob made off-screen, keeping a
// Glob the size of the screen, and input scopes.
#include <gtest/gtest.h>

#include "platform/glob/GlobHandle.h"
#include "platform/testing/Harness.h"
#include "tests/platform/GlobTestSupport.h"

namespace {

using Box = Kw::Box<int>;

struct Screen {
  Harness h{400, 300};
  RecordingGlob* back = new RecordingGlob(h.place(0, 0, 200, 300));
  RecordingGlob* field = new RecordingGlob(GlobCreationInfo(50, 20, back->canvas(), 10, 10));
  RecordingGlob* front = new RecordingGlob(h.place(200, 0, 200, 300));
  RecordingGlob* stop = new RecordingGlob(GlobCreationInfo(50, 20, front->canvas(), 10, 10));
};

}  // namespace

TEST(RootAdopt, PutsAnUnattachedGlobOnTheScreenAndRefusesTheRest) {
  Harness h(400, 300);
  auto* loose = new RecordingGlob(GlobCreationInfo(40, 30, nullptr));
  auto* inner = new RecordingGlob(GlobCreationInfo(10, 10, loose->canvas()));
  inner->set_interest(kInterestTicks);  // asked for off-screen, where no clock runs
  EXPECT_EQ(loose->root(), nullptr);

  EXPECT_FALSE(h.root().adopt(nullptr, XY<int>(0, 0)));
  EXPECT_FALSE(h.root().adopt(&h.root(), XY<int>(0, 0)));
  EXPECT_FALSE(h.root().adopt(inner, XY<int>(0, 0)));  // it has a parent
  EXPECT_EQ(inner->parent(), loose);

  ASSERT_TRUE(h.root().adopt(loose, XY<int>(100, 50)));
  EXPECT_EQ(loose->canvas()->rect(), Box(100, 50, 140, 80));
  EXPECT_EQ(inner->root(), &h.root());
  EXPECT_FALSE(h.root().adopt(loose, XY<int>(0, 0)));
  h.click(XY<int>(120, 70));
  EXPECT_EQ(loose->count(kEventLeftDown), 1);
  h.advance(50);
  EXPECT_GT(inner->count(kEventTick), 0);

  // A Glob deleted meanwhile is refused, not touched.
  auto* gone = new RecordingGlob(GlobCreationInfo(5, 5, nullptr));
  delete gone;
  EXPECT_FALSE(h.root().adopt(gone, XY<int>(0, 0)));
}

TEST(RootScreenSize, AFollowerCoversTheScreenThroughEveryResize) {
  Screen s;
  EXPECT_FALSE(s.h.root().followScreenSize(s.field));  // not a child of the screen
  ASSERT_TRUE(s.h.root().followScreenSize(s.back));
  EXPECT_TRUE(s.h.root().followScreenSize(s.back));  // once is enough
  s.h.root().reshape_canvas(0, 0, 640, 480);
  EXPECT_EQ(s.back->canvas()->rect(), Box(0, 0, 640, 480));
  EXPECT_EQ(s.front->canvas()->rect(), Box(200, 0, 400, 300));  // others keep their place

  delete s.back;
  s.h.root().reshape_canvas(0, 0, 320, 240);  // a follower gone is forgotten
  EXPECT_EQ(s.h.root().width(), 320);
}

TEST(RootInputScope, KeysStayInsideTheNewestScope) {
  Screen s;
  RootGlob& root = s.h.root();
  s.field->set_kbd_focus();
  EXPECT_EQ(root.keyTarget(), s.field);

  EXPECT_FALSE(root.addInputScope(nullptr));
  ASSERT_TRUE(root.addInputScope(s.front));
  EXPECT_FALSE(root.addInputScope(s.front));
  EXPECT_EQ(root.inputScope(), s.front);

  // A focus outside the scope hears nothing: its keys go to the scope.
  s.h.key('a');
  EXPECT_EQ(s.field->count(kEventKeyPress), 0);
  EXPECT_EQ(s.front->count(kEventKeyPress), 1);

  // Inside the scope keys reach the focus, and what it leaves unconsumed stops at the scope.
  root.removeInputScope(s.front);
  auto* knob = new RecordingGlob(GlobCreationInfo(10, 10, s.stop->canvas()));
  ASSERT_TRUE(root.addInputScope(s.stop));
  knob->set_kbd_focus();
  knob->consume = false;
  s.stop->consume = false;
  s.h.key('b');
  EXPECT_EQ(knob->count(kEventKeyPress), 1);
  EXPECT_EQ(s.stop->count(kEventKeyPress), 1);
  EXPECT_EQ(s.front->count(kEventKeyPress), 1);  // only the key from before
  root.removeInputScope(s.stop);
  ASSERT_TRUE(root.addInputScope(s.front));

  // A newer scope applies until it goes; removing the older one first changes nothing.
  ASSERT_TRUE(root.addInputScope(s.back));
  EXPECT_EQ(root.keyTarget(), s.back);
  root.removeInputScope(s.front);
  EXPECT_EQ(root.inputScope(), s.back);
  ASSERT_TRUE(root.addInputScope(s.front));
  delete s.front;  // a scope deleted lets go
  EXPECT_EQ(root.inputScope(), s.back);
  root.removeInputScope(s.back);
  EXPECT_EQ(root.inputScope(), nullptr);
  s.field->set_kbd_focus();
  EXPECT_EQ(root.keyTarget(), s.field);
}

TEST(RootInputScope, ScopeHandlersMayDeleteOrRemoveTheScope) {
  Screen s;
  RootGlob& root = s.h.root();
  ASSERT_TRUE(root.addInputScope(s.front));
  s.front->onEvent = [&](Event*) {
    root.removeInputScope(s.front);
    return 0;
  };
  s.stop->set_kbd_focus();
  s.stop->consume = false;
  s.h.key('c');  // the scope let go while handling it: the key goes on up
  EXPECT_EQ(root.inputScope(), nullptr);

  ASSERT_TRUE(root.addInputScope(s.back));
  GlobHandle<> watch(s.back);
  s.back->onEvent = [&](Event*) {
    delete s.back;
    return 0;
  };
  s.h.key('d');  // focus outside: delivered to the scope, which deletes itself
  EXPECT_FALSE(watch.alive());
  EXPECT_EQ(root.inputScope(), nullptr);
}
