#include <gtest/gtest.h>

#include <functional>
#include <memory>

#include "foundation/TabOrderManager.h"
#include "platform/testing/Harness.h"

namespace {

constexpr unsigned kNone = TabOrderManager::kNone;

// A focusable control: keeps a focus flag for drawing and can run an action on receipt.
class Focusable : public Glob, public TabOrderable {
 public:
  explicit Focusable(const GlobCreationInfo& info) : Glob(info) {}

  bool isTabStopActive() override { return isActive(); }
  void handleTabStopFocusReceipt() override {
    focused = true;
    ++receipts;
    update();
    if (onReceipt) onReceipt();
  }
  void handleTabStopFocusLoss() override {
    focused = false;
    ++losses;
    update();
  }

  bool focused = false;
  int receipts = 0;
  int losses = 0;
  std::function<void()> onReceipt;
};

class Host : public TabOrderableHost {
 public:
  void getTabOrderables(std::vector<TabOrderable*>& out) override { out = stops; }
  std::vector<TabOrderable*> stops;
};

struct TabOrderTest : ::testing::Test {
  Focusable* make() {
    controls.push_back(
        std::make_unique<Focusable>(h.place(static_cast<int>(controls.size()) * 30, 0, 20, 20)));
    return controls.back().get();
  }
  std::vector<unsigned> orders(const TabOrderManager& m) {
    std::vector<unsigned> out;
    for (unsigned i = 0; i < m.numTabStops(); ++i) out.push_back(m.getTabStopTabOrder(i));
    return out;
  }

  Harness h;
  std::vector<std::unique_ptr<Focusable>> controls;
};

}  // namespace

TEST_F(TabOrderTest, OrdersAppendAndShiftToStayUnique) {
  TabOrderManager m(false);
  EXPECT_EQ(m.getLowestTabOrder(), kNone);
  Focusable *a = make(), *b = make(), *c = make(), *d = make(), *e = make();
  EXPECT_TRUE(m.addTabStop(a, TabOrderManager::kAfterLast));
  EXPECT_TRUE(m.addTabStop(b, TabOrderManager::kAfterLast));
  EXPECT_EQ(orders(m), (std::vector<unsigned>{0, 1}));

  // 5 is free: nothing moves. Inserting at 0 pushes 0 and 1 up; 5 stays.
  EXPECT_TRUE(m.addTabStop(*c, 5));
  EXPECT_TRUE(m.addTabStop(*d, 0));
  EXPECT_EQ(orders(m), (std::vector<unsigned>{1, 2, 5, 0}));
  EXPECT_EQ(m.getLowestTabOrder(), 0u);
  EXPECT_EQ(m.getHighestTabOrder(), 5u);

  // No duplicates unless allowed.
  EXPECT_FALSE(m.addTabStop(a, 9));
  EXPECT_FALSE(m.addTabStop(nullptr, 9));

  // Re-ordering makes way the same way, and the moved stop leaves its old order free.
  EXPECT_TRUE(m.setTabOrder(*c, 1));
  EXPECT_EQ(orders(m), (std::vector<unsigned>{2, 3, 1, 0}));
  EXPECT_TRUE(m.setTabOrder(0u, TabOrderManager::kAfterLast));
  EXPECT_EQ(orders(m), (std::vector<unsigned>{4, 3, 1, 0}));
  EXPECT_FALSE(m.setTabOrder(e, 2));  // not a stop here

  // The reserved range.
  EXPECT_FALSE(m.addTabStop(e, 0xFFFFEFFF));
  EXPECT_FALSE(m.addTabStop(e, kNone));
  EXPECT_TRUE(m.addTabStop(e, 0xFFFFEFFE));
  EXPECT_EQ(m.getHighestTabOrder(), 0xFFFFEFFEu);
  // Nothing fits after it, and pushing it would reach the reserved range.
  Focusable* f = make();
  EXPECT_FALSE(m.addTabStop(f, TabOrderManager::kAfterLast));
  EXPECT_FALSE(m.addTabStop(f, 0xFFFFEFFE));
  EXPECT_EQ(m.getTabStopTabOrder(4), 0xFFFFEFFEu);
  EXPECT_EQ(m.numTabStops(), 5u);
}

TEST_F(TabOrderTest, DuplicatesWhenAllowed) {
  TabOrderManager m(true);
  Focusable* a = make();
  EXPECT_TRUE(m.addTabStop(a, TabOrderManager::kAfterLast));
  EXPECT_TRUE(m.addTabStop(a, TabOrderManager::kAfterLast));
  EXPECT_EQ(orders(m), (std::vector<unsigned>{0, 1}));
  EXPECT_TRUE(m.removeTabStop(*a));
  EXPECT_EQ(orders(m), (std::vector<unsigned>{1}));
  EXPECT_TRUE(a->isRegisteredWith(&m));
}

TEST_F(TabOrderTest, FocusSkipsDisabledAndInactiveStopsAndWraps) {
  TabOrderManager m(false);
  Focusable *a = make(), *b = make(), *c = make();
  m.addTabStop(a, 10);
  m.addTabStop(b, 20);
  m.addTabStop(c, 30);

  // Nothing focused: forward starts at the lowest order, backward at the highest.
  EXPECT_EQ(m.incrementTabStop(), 0u);
  EXPECT_TRUE(a->focused);
  m.setTabStopFocus(nullptr);
  EXPECT_FALSE(a->focused);
  EXPECT_EQ(m.decrementTabStop(), 2u);
  EXPECT_EQ(m.getCurrentTabOrder(), 30u);

  // Forward from the highest wraps to the lowest; backward from the lowest to the highest.
  EXPECT_EQ(m.incrementTabStop(), 0u);
  EXPECT_EQ(m.decrementTabStop(), 2u);
  EXPECT_TRUE(c->focused);
  EXPECT_FALSE(a->focused);

  // Focusing a disabled or inactive stop fails and leaves the focus where it was.
  m.setTabStopEnabled(b, false);
  EXPECT_FALSE(m.setTabStopFocus(b));
  a->setActive(false, false);
  EXPECT_FALSE(m.setTabStopFocus(0u));
  EXPECT_FALSE(m.setTabStopFocus(7u));
  EXPECT_EQ(m.getCurrentTabStopIndex(), 2u);
  EXPECT_TRUE(c->isTabStopFocus());

  // Stepping skips both: c is the only stop left to go to.
  EXPECT_EQ(m.findNextHighestTabOrder(0, true), 2u);
  EXPECT_EQ(m.findNextLowestTabOrder(30, false), kNone);
  const int losses = c->losses, receipts = c->receipts;
  EXPECT_EQ(m.incrementTabStop(), 2u);
  // Re-focusing the focused stop calls nobody.
  EXPECT_EQ(c->losses, losses);
  EXPECT_EQ(c->receipts, receipts);

  bool found = true;
  EXPECT_FALSE(m.getTabStopEnabled(b, &found));
  EXPECT_TRUE(found);
  EXPECT_FALSE(m.getTabStopEnabled(make(), &found));
  EXPECT_FALSE(found);

  m.setTabStopEnabled(b, true);
  EXPECT_EQ(m.findNextLowestTabOrder(30, true), 2u);
  EXPECT_EQ(m.decrementTabStop(), 1u);
  EXPECT_EQ(c->losses, losses + 1);
  EXPECT_EQ(b->receipts, 1);
}

TEST_F(TabOrderTest, ControlSideRequestsAndRelinquishes) {
  TabOrderManager panel(false), dialog(false);
  Focusable *a = make(), *b = make();
  panel.addTabStop(a, 0);
  panel.addTabStop(b, 1);
  dialog.addTabStop(a, 0);
  EXPECT_EQ(a->getManagers().size(), 2u);

  EXPECT_TRUE(a->requestTabStopFocus());
  EXPECT_TRUE(panel.isTabStopFocus(*a));
  EXPECT_TRUE(dialog.isTabStopFocus(*a));

  // b relinquishing does not take a's focus away.
  b->relinquishTabStopFocus();
  EXPECT_TRUE(panel.isTabStopFocus(*a));
  a->relinquishTabStopFocus();
  EXPECT_FALSE(a->isTabStopFocus());
  EXPECT_EQ(panel.getCurrentTabStopIndex(), kNone);

  // An inactive control cannot ask for focus.
  b->setActive(false, false);
  EXPECT_FALSE(b->requestTabStopFocus());
}

TEST_F(TabOrderTest, RemovalKeepsIndicesAndFocusRight) {
  TabOrderManager m(false);
  Focusable *a = make(), *b = make(), *c = make();
  m.addTabStop(a, 0);
  m.addTabStop(b, 1);
  m.addTabStop(c, 2);
  m.setTabStopFocus(c);
  EXPECT_TRUE(m.removeTabStop(0u));
  EXPECT_EQ(m.getCurrentTabStopIndex(), 1u);
  EXPECT_EQ(m.getTabStopObject(1), c);
  EXPECT_FALSE(a->isRegisteredWith(&m));
  EXPECT_EQ(m.getLowestTabOrder(), 1u);

  // Removing the focused stop clears the focus and tells the control.
  EXPECT_TRUE(m.removeTabStop(c));
  EXPECT_EQ(m.getCurrentTabStopIndex(), kNone);
  EXPECT_FALSE(c->focused);
  EXPECT_FALSE(m.removeTabStop(c));
  EXPECT_FALSE(m.removeTabStop(5u));
  EXPECT_EQ(m.getTabStopObject(5), nullptr);
  EXPECT_EQ(m.getTabStopTabOrder(5), kNone);
}

TEST_F(TabOrderTest, HostStopsKeepTheirOrder) {
  TabOrderManager m(false);
  Focusable *x = make(), *a = make(), *b = make(), *c = make();
  m.addTabStop(x, 5);
  Host host;
  host.stops = {a, b, c};
  EXPECT_TRUE(m.addTabStops(host, 5));
  EXPECT_EQ(orders(m), (std::vector<unsigned>{8, 5, 6, 7}));

  // A null stop counts as a failure and ends the adding there.
  TabOrderManager n(false);
  host.stops = {a, nullptr, b};
  EXPECT_FALSE(n.addTabStops(host, TabOrderManager::kAfterLast));
  EXPECT_EQ(n.numTabStops(), 1u);
}

TEST_F(TabOrderTest, EitherSideMayDieFirst) {
  auto m = std::make_unique<TabOrderManager>(false);
  TabOrderManager other(false);
  Focusable *a = make(), *b = make();
  m->addTabStop(a, 0);
  m->addTabStop(b, 1);
  other.addTabStop(a, 0);
  m->setTabStopFocus(b);

  // A control destroyed while listed leaves both managers, and the focus with it.
  controls[1].reset();
  EXPECT_EQ(m->numTabStops(), 1u);
  EXPECT_EQ(m->getCurrentTabStopIndex(), kNone);
  EXPECT_EQ(m->incrementTabStop(), 0u);

  // A manager destroyed while listed is forgotten by the control.
  m.reset();
  EXPECT_EQ(a->getManagers(), (std::vector<TabOrderManager*>{&other}));
  EXPECT_FALSE(a->isTabStopFocus());
  EXPECT_TRUE(a->requestTabStopFocus());
  EXPECT_TRUE(other.isTabStopFocus(*a));
}

TEST_F(TabOrderTest, HandlersMayCallBackIntoTheManager) {
  TabOrderManager m(false);
  Focusable *a = make(), *b = make(), *late = make();
  m.addTabStop(a, 0);
  m.addTabStop(b, 1);
  // A read and a write from inside a focus handler: both would deadlock under a held lock.
  bool sawItself = false;
  b->onReceipt = [&] {
    sawItself = m.isTabStopFocus(*b) && b->isTabStopFocus();
    m.addTabStop(late, TabOrderManager::kAfterLast);
  };
  m.setTabStopFocus(a);
  EXPECT_EQ(m.incrementTabStop(), 1u);
  EXPECT_TRUE(sawItself);
  EXPECT_EQ(m.numTabStops(), 3u);
  EXPECT_FALSE(a->focused);

  // A receipt handler that destroys the control losing focus: it is not called after death.
  Focusable* c = make();
  m.addTabStop(c, TabOrderManager::kAfterLast);
  c->onReceipt = [&] { controls[1].reset(); };
  EXPECT_TRUE(m.setTabStopFocus(c));
  EXPECT_EQ(m.getTabStopObject(m.getCurrentTabStopIndex()), c);

  // A receipt handler that destroys the manager itself.
  auto owned = std::make_unique<TabOrderManager>(false);
  owned->addTabStop(a, 0);
  a->onReceipt = [&] { owned.reset(); };
  TabOrderManager* raw = owned.get();
  EXPECT_TRUE(raw->setTabStopFocus(a));
  EXPECT_EQ(owned, nullptr);
  EXPECT_EQ(a->getManagers(), (std::vector<TabOrderManager*>{&m}));
  owned = std::make_unique<TabOrderManager>(false);
  owned->addTabStop(a, 0);
  EXPECT_EQ(owned.get()->incrementTabStop(), kNone);  // gone by the time it would answer
  EXPECT_EQ(owned, nullptr);
}

// The first registration is kept apart from the rest; whichever goes, the others keep their
// order and a duplicate registration leaves one entry at a time.
TEST_F(TabOrderTest, ManagersStayInRegistrationOrderWhicheverLeaves) {
  TabOrderManager first(false), dup(true), last(false);
  Focusable* a = make();
  first.addTabStop(a, 0);
  dup.addTabStop(a, 0);
  dup.addTabStop(a, 1);
  last.addTabStop(a, 0);
  EXPECT_EQ(a->getManagers(), (std::vector<TabOrderManager*>{&first, &dup, &last}));

  EXPECT_TRUE(first.removeTabStop(*a));
  EXPECT_EQ(a->getManagers(), (std::vector<TabOrderManager*>{&dup, &last}));
  EXPECT_TRUE(dup.removeTabStop(0u));
  EXPECT_TRUE(a->isRegisteredWith(&dup));
  EXPECT_TRUE(dup.removeTabStop(0u));
  EXPECT_FALSE(a->isRegisteredWith(&dup));
  EXPECT_EQ(a->getManagers(), (std::vector<TabOrderManager*>{&last}));
  EXPECT_TRUE(a->requestTabStopFocus());
  EXPECT_TRUE(last.isTabStopFocus(*a));
}
