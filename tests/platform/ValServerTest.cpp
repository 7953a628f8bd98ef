#include <gtest/gtest.h>

#include <functional>
#include <memory>

#include "platform/misc/ListClient.h"
#include "platform/misc/ListServer.h"
#include "platform/misc/ValClient.h"
#include "platform/misc/ValServer.h"

namespace {

// A client that logs what it hears and can run an action from inside a notification.
struct Recorder : ValClient<int> {
  std::vector<String> log;
  std::function<void()> onChange;
  int seenOnPreChange = -1;

  void valPreChangedNtfy() override {
    log.push_back("pre");
    seenOnPreChange = getValServer(0) ? getValServer(0)->getValue() : -1;
  }
  void valChangedNtfy() override {
    log.push_back("changed");
    if (onChange) onChange();
  }
  void valServerDestroyedNtfy(ValServerBase*) override { log.push_back("gone"); }
};

struct ListRecorder : ListClient {
  std::vector<String> log;
  void itemAdded(unsigned i) override { log.push_back("add " + std::to_string(i)); }
  void itemDeleted(unsigned i) override { log.push_back("del " + std::to_string(i)); }
  void itemUpdated(unsigned i) override { log.push_back("upd " + std::to_string(i)); }
  void listServerDestroyedNtfy() override { log.push_back("gone"); }
};

}  // namespace

TEST(ValServer, NotifiesAfterChangesAndBeforeOnlyOnRequest) {
  ValServer<int> server(5);
  Recorder plain, early;
  early.requestPreChangeNtfy(true);
  EXPECT_TRUE(plain.registerWith(&server));
  EXPECT_TRUE(early.registerWith(&server));
  EXPECT_FALSE(plain.registerWith(&server));  // already following
  EXPECT_FALSE(plain.registerWith(nullptr));

  EXPECT_TRUE(server.setValue(7));
  EXPECT_EQ(plain.log, (std::vector<String>{"changed"}));
  EXPECT_EQ(early.log, (std::vector<String>{"pre", "changed"}));
  EXPECT_EQ(early.seenOnPreChange, 5);  // told before the value moved

  // An equal value tells no one.
  EXPECT_FALSE(server.setValue(7));
  EXPECT_EQ(plain.log.size(), 1u);

  EXPECT_TRUE(plain.deregisterFrom(&server));
  EXPECT_FALSE(plain.deregisterFrom(&server));
  server.setValue(8);
  EXPECT_EQ(plain.log.size(), 1u);
  EXPECT_EQ(server.numValClients(), 1u);
}

TEST(ValServer, ClientsFollowSeveralServersByIndex) {
  auto a = std::make_unique<ValServer<int>>(1);
  ValServer<int> b(2);
  Recorder c;
  c.registerWith(a.get());
  c.registerWith(&b);
  EXPECT_EQ(c.getValServer(0), a.get());
  EXPECT_EQ(c.getValServer(1), &b);
  EXPECT_EQ(c.getValServer(2), nullptr);

  // The first server dies: the client forgets it and the second moves to index 0.
  a.reset();
  EXPECT_EQ(c.log, (std::vector<String>{"gone"}));
  EXPECT_EQ(c.numValServers(), 1u);
  EXPECT_EQ(c.getValServer(0), &b);
}

TEST(ValServer, ClientDestroyedFirstLeavesNothingBehind) {
  ValServer<int> server;
  {
    Recorder c;
    c.registerWith(&server);
    EXPECT_EQ(server.numValClients(), 1u);
  }
  EXPECT_EQ(server.numValClients(), 0u);
  server.setValue(3);  // would reach a dead client if it were still listed
}

TEST(ValServer, NotificationSurvivesClientsLeavingAndDyingMidway) {
  ValServer<int> server;
  Recorder first;
  auto second = std::make_unique<Recorder>();
  Recorder third;
  first.registerWith(&server);
  second->registerWith(&server);
  third.registerWith(&server);

  // The first client's handler deletes the second and deregisters the third.
  first.onChange = [&] {
    second.reset();
    third.deregisterFrom(&server);
  };
  server.setValue(1);
  EXPECT_EQ(first.log.size(), 1u);
  EXPECT_TRUE(third.log.empty());
  EXPECT_EQ(server.numValClients(), 1u);

  // A client that deregisters itself while being notified, then re-registers for later.
  first.onChange = [&] { first.deregisterFrom(&server); };
  server.setValue(2);
  EXPECT_EQ(server.numValClients(), 0u);
  first.onChange = nullptr;
  first.registerWith(&server);
  server.setValue(3);
  EXPECT_EQ(first.log.size(), 3u);
}

TEST(ValServer, ServerDestroyedByItsOwnNotification) {
  auto server = std::make_unique<ValServer<int>>(0);
  Recorder killer, after;
  killer.registerWith(server.get());
  after.registerWith(server.get());
  killer.onChange = [&] { server.reset(); };
  ValServer<int>* raw = server.get();
  raw->setValue(1);
  EXPECT_EQ(server, nullptr);
  EXPECT_EQ(killer.numValServers(), 0u);
  EXPECT_EQ(after.numValServers(), 0u);
  // The walk stopped with the server: the later client heard of its end, not of the change.
  EXPECT_EQ(after.log, (std::vector<String>{"gone"}));
}

TEST(ListServer, ReportsEachEditByIndexAndItsOwnEnd) {
  auto list = std::make_unique<ListServer>();
  ListRecorder r;
  EXPECT_TRUE(r.registerWith(list.get()));
  EXPECT_EQ(list->addItem(L"b"), 0u);
  EXPECT_EQ(list->addItem(L"a", 0), 0u);
  EXPECT_EQ(list->addItem(L"z", 99), 2u);  // past the end appends
  EXPECT_TRUE(list->setItem(1, L"B"));
  EXPECT_TRUE(list->setItem(1, L"B"));  // unchanged: silent
  EXPECT_FALSE(list->setItem(3, L"x"));
  EXPECT_FALSE(list->removeItem(3));
  EXPECT_TRUE(list->removeItem(0));
  EXPECT_EQ(list->item(0), L"B");
  EXPECT_EQ(list->item(9), L"");
  EXPECT_EQ(r.log, (std::vector<String>{"add 0", "add 0", "add 2", "upd 1", "del 0"}));

  list.reset();
  EXPECT_EQ(r.getListServer(), nullptr);
  EXPECT_EQ(r.log.back(), "gone");
}
