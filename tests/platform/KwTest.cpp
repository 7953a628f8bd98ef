#include <gtest/gtest.h>

#include <atomic>
#include <map>
#include <random>
#include <thread>
#include <vector>

#include "platform/kw/AddressCounts.h"
#include "platform/kw/Box.h"
#include "platform/kw/CrossCast.h"
#include "platform/kw/NumRange.h"
#include "platform/kw/Ptr.h"
#include "platform/kw/RWLock.h"
#include "platform/kw/String.h"

TEST(KwString, RoundTripsAndReplacesInvalidUtf8) {
  EXPECT_EQ(Kw::toWide("caf\xC3\xA9"), L"caf\u00E9");
  EXPECT_EQ(Kw::toUtf8(L"caf\u00E9 \U0001F600"), "caf\xC3\xA9 \xF0\x9F\x98\x80");
  // A lone continuation byte, a truncated sequence, an overlong '/', an encoded surrogate.
  EXPECT_EQ(Kw::toWide("a\x80"
                       "b"),
            L"a\uFFFDb");
  EXPECT_EQ(Kw::toWide("x\xE2\x82"), L"x\uFFFD");
  EXPECT_EQ(Kw::toWide("\xC0\xAF"), L"\uFFFD\uFFFD");
  EXPECT_EQ(Kw::toWide("\xED\xA0\x80"), L"\uFFFD");
  EXPECT_EQ(Kw::toWide("\xE2\x28\xA1"), L"\uFFFD(\uFFFD");
  EXPECT_FALSE(Kw::isValidUtf8("\xFF"));
  EXPECT_TRUE(Kw::isValidUtf8("plain \xE2\x82\xAC"));
  EXPECT_EQ(Kw::toUtf8(WString(1, static_cast<wchar_t>(0xD800))), "\xEF\xBF\xBD");
}

namespace {
struct Counted : Kw::RefCounted {
  explicit Counted(int* deaths) : deaths_(deaths) {}
  ~Counted() override { ++*deaths_; }
  int* deaths_;
};
}  // namespace

TEST(KwPtr, SharesAndReleasesOnce) {
  int deaths = 0;
  {
    Kw::Ptr<Counted> a(new Counted(&deaths));
    Kw::Ptr<Counted> b = a;
    EXPECT_EQ(a->refCount(), 2);
    Kw::Ptr<Counted> c = std::move(b);
    EXPECT_FALSE(b);
    a.reset();
    EXPECT_EQ(deaths, 0);
    c = c;  // self-assignment keeps the object
    EXPECT_EQ(c->refCount(), 1);
  }
  EXPECT_EQ(deaths, 1);
}

TEST(KwBox, GeometryIsBottomUpAndHalfOpen) {
  const Kw::Box<int> b = Kw::Box<int>::fromSize(10, 20, 30, 40);
  EXPECT_TRUE(b.contains(XY<int>(10, 20)));
  EXPECT_FALSE(b.contains(XY<int>(40, 20)));
  EXPECT_TRUE(b.intersection(Kw::Box<int>(40, 0, 50, 100)).empty());
  EXPECT_EQ(b.united(Kw::Box<int>()), b);
  NumRange<double, true> r(5.0, -1.0);
  EXPECT_EQ(r.min(), -1.0);
  EXPECT_EQ(r.clamp(9.0), 5.0);
}

// Writers exclude each other and every reader; readers share; a reader may read again while
// it reads. Two writers and two readers hammer one pair of counters that a torn write would
// leave unequal.
TEST(KwRWLock, WritersAreExclusiveAndReadersNeverSeeAHalfWrite) {
  Kw::RWLock lock(1, 100, 1);
  long a = 0, b = 0;
  std::atomic<int> torn{0};
  constexpr int kRounds = 20000;
  auto writer = [&] {
    for (int i = 0; i < kRounds; ++i) {
      Kw::RWLock::WriteGuard g(lock);
      ++a;
      ++b;
    }
  };
  auto reader = [&] {
    for (int i = 0; i < kRounds; ++i) {
      Kw::RWLock::ReadGuard g(lock);
      Kw::RWLock::ReadGuard again(lock);
      if (a != b) torn.fetch_add(1);
    }
  };
  std::vector<std::thread> threads;
  threads.emplace_back(writer);
  threads.emplace_back(reader);
  threads.emplace_back(writer);
  threads.emplace_back(reader);
  for (std::thread& t : threads) t.join();
  EXPECT_EQ(a, 2L * kRounds);
  EXPECT_EQ(b, 2L * kRounds);
  EXPECT_EQ(torn.load(), 0);
  EXPECT_EQ(sizeof(Kw::RWLock), 4u);
}

namespace {
struct Node {
  virtual ~Node() = default;
  int n = 1;
};
struct Stop {
  virtual ~Stop() = default;
  int s = 2;
};
struct Padding {
  virtual ~Padding() = default;
  double p = 3;
};
struct Control : Node, Stop {};
struct Wide : Padding, Node, Stop {};
// Two Node bases: which one the cast starts from changes where the answer is found.
struct Left : Node {};
struct Right : Node, Stop {};
struct Twice : Left, Right {};
}  // namespace

TEST(KwCrossCast, AgreesWithDynamicCastForEveryKindAndStartingPlace) {
  Control c;
  Wide w;
  Node plain;
  Twice t;
  Node* fromLeft = static_cast<Left*>(&t);
  Node* fromRight = static_cast<Right*>(&t);
  // Twice over, so that the second round answers from the remembered displacements.
  for (int round = 0; round < 2; ++round) {
    for (Node* n : {static_cast<Node*>(&c), static_cast<Node*>(&w), &plain, fromLeft, fromRight}) {
      EXPECT_EQ(Kw::crossCast<Stop>(n), dynamic_cast<Stop*>(n)) << "round " << round;
    }
    EXPECT_EQ(Kw::crossCast<Stop>(static_cast<Node*>(&w))->s, 2);
    EXPECT_EQ(Kw::crossCast<Stop>(static_cast<Node*>(nullptr)), nullptr);
  }
  // More kinds than the table holds: older answers are worked out again, never mixed up.
  struct K1 : Node, Stop {};
  struct K2 : Padding, Node, Stop {};
  struct K3 : Node {};
  K1 k1;
  K2 k2;
  K3 k3;
  for (int round = 0; round < 3; ++round) {
    for (Node* n : {static_cast<Node*>(&k1), static_cast<Node*>(&k2), static_cast<Node*>(&k3),
                    static_cast<Node*>(&c), static_cast<Node*>(&w), &plain, fromLeft, fromRight}) {
      EXPECT_EQ(Kw::crossCast<Stop>(n), dynamic_cast<Stop*>(n));
    }
  }
}

TEST(KwAddressCounts, MatchesAReferenceMultisetThroughGrowthAndRemovals) {
  Kw::AddressCounts counts;
  std::map<const void*, unsigned> want;
  // Addresses 16 bytes apart, as heap blocks are, in a range that makes runs collide.
  std::vector<char> arena(16 * 600);
  std::mt19937 rng(7);
  for (int step = 0; step < 20000; ++step) {
    const void* a = &arena[16 * (rng() % 600)];
    if (rng() % 3 != 0) {
      counts.add(a);
      ++want[a];
    } else {
      const bool had = want.count(a) != 0;
      EXPECT_EQ(counts.remove(a), had);
      if (had && --want[a] == 0) want.erase(a);
    }
    if (step % 997 == 0) {
      ASSERT_EQ(counts.size(), want.size());
      for (std::size_t k = 0; k < 600; ++k) {
        const void* p = &arena[16 * k];
        const auto it = want.find(p);
        ASSERT_EQ(counts.count(p), it == want.end() ? 0u : it->second) << "step " << step;
      }
    }
  }
  EXPECT_FALSE(counts.remove(nullptr));
  counts.add(nullptr);  // null is no address
  EXPECT_FALSE(counts.contains(nullptr));
  counts.clear();
  EXPECT_EQ(counts.size(), 0u);
  EXPECT_FALSE(counts.contains(arena.data()));
}
