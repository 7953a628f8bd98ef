// The groups page: a grouped group that minimises re-lays out the groups round it, and what the
// controls inside groups and the page's own tabbed dialogue send reaches the message log.
#include <gtest/gtest.h>

#include "buttons/Button.h"
#include "gallery/GalleryApp.h"
#include "gallery/MessageLog.h"
#include "panels/DialogueTab.h"
#include "panels/LazyTabbedDialogue.h"
#include "panels/MinimizableGroup.h"
#include "panels/TabStrip.h"
#include "platform/testing/Harness.h"
#include "tests/gallery/GalleryTestSupport.h"

namespace {

struct GroupsPageFixture : ::testing::Test {
  void SetUp() override {
    app->selectPage(pageTitled(*app, "Groups"));
    page = app->page(app->currentPage());
    ASSERT_TRUE(page && page->title() == "Groups");
  }
  bool logged(const String& sender, const String& text) const {
    for (const LogEntry& e : log.entries())
      if (e.senderName == sender && e.text == text) return true;
    return false;
  }

  Harness h{1300, 860};
  MessageLog log;
  GalleryApp* app = new GalleryApp(h.root(), log);
  GalleryPage* page = nullptr;
};

}  // namespace

TEST_F(GroupsPageFixture, MinimisingAGroupedGroupMovesItsNeighboursAndShrinksTheChannel) {
  auto* channel = dynamic_cast<MinimizableGroup*>(findNamed(*page, "Channel 1"));
  auto* input = dynamic_cast<MinimizableGroup*>(findNamed(*page, "Input"));
  Glob* comp = findNamed(*page, "Compressor");
  ASSERT_TRUE(channel && input && comp);
  const int channelHeight = channel->height();
  const int compTop = static_cast<int>(comp->get_y()) + comp->height();
  const int inputHeight = input->height();

  h.click(XY<int>(static_cast<int>(input->get_x()) + input->width() - 20,
                  static_cast<int>(input->get_y()) + input->height() - 6));
  ASSERT_TRUE(input->isMinimised());
  const int delta = input->height() - inputHeight;
  EXPECT_EQ(channel->height(), channelHeight + delta);
  EXPECT_EQ(static_cast<int>(comp->get_y()) + comp->height(), compTop - delta);
  EXPECT_TRUE(logged("Channel 1", "MinimizableGroupSizeChange " + std::to_string(delta)));
}

TEST_F(GroupsPageFixture, ControlsInsideGroupsAndTheTabsReportToTheLog) {
  Glob* phase = findNamed(*page, "Phase");
  ASSERT_TRUE(phase);
  h.clickOn(*phase);
  h.pump();
  EXPECT_TRUE(logged("Phase", "phase"));

  auto* tabs = dynamic_cast<LazyTabbedDialogue*>(findNamed(*page, "group tabs"));
  ASSERT_TRUE(tabs);
  Checkbox* tag = tabs->tabStrip().record(tabs->findPageIdx(L"Sends")).checkbox.get();
  ASSERT_TRUE(tag);
  h.clickOn(*tag);
  h.pump();
  EXPECT_TRUE(logged("group tabs", "TabCheckbox Sends TICKED"));
  h.clickOn(*tabs->tabStrip().tabGlob(2));
  h.pump();
  EXPECT_TRUE(logged("group tabs", "TabChanged"));
  // The page built on that choice reports too.
  Glob* on = findNamed(*page, "Inserts on");
  ASSERT_TRUE(on);
  h.clickOn(*on);
  h.pump();
  EXPECT_TRUE(logged("Inserts on", "Inserts on"));
}
