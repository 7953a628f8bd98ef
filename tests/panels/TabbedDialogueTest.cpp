#include <gtest/gtest.h>

#include <map>

#include "buttons/Button.h"
#include "foundation/ValServerAdaptor.h"
#include "panels/DialogueTab.h"
#include "panels/LazyTabbedDialogue.h"
#include "panels/StandardTabPage.h"
#include "panels/TabStrip.h"
#include "platform/glob/GlobHandle.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"

namespace {

class CountingDialogue : public LazyTabbedDialogue {
 public:
  using LazyTabbedDialogue::LazyTabbedDialogue;
  void buildPage(const WString& id) override {
    ++builds[id];
    if (Glob* page = getPageBaseGlob(id)) {
      new Button(id, "page button", GlobCreationInfo(60, 20, page->canvas(), 5, 5));
    }
    if (onBuild) onBuild();
  }
  void leavingPage(const WString& id) override { left.push_back(id); }
  std::map<WString, int> builds;
  std::vector<WString> left;
  std::function<void()> onBuild;
};

struct DialogueFixture : ::testing::Test {
  Harness h{600, 400};
  MessageProbe probe{h.place(0, 0, 600, 400)};
  CountingDialogue* dlg = new CountingDialogue(GlobCreationInfo(400, 300, probe.canvas(), 10, 10));

  void addPages(std::initializer_list<const wchar_t*> ids) {
    for (const wchar_t* id : ids) ASSERT_TRUE(dlg->addPageDeferred(id, kTabDefaultColour));
  }
  XY<int> tabCentre(int index) {
    DialogueTab* t = dlg->tabStrip().tabGlob(index);
    EXPECT_TRUE(t);
    return t ? Harness::centreOf(*t) : XY<int>();
  }
};

}  // namespace

TEST_F(DialogueFixture, LazyPagesAreBuiltOnceOnFirstSelection) {
  addPages({L"Mix", L"EQ", L"Dynamics"});
  EXPECT_EQ(dlg->currentPage(), L"Mix");
  EXPECT_TRUE(dlg->pageBuilt(L"Mix"));
  EXPECT_FALSE(dlg->pageBuilt(L"EQ"));
  EXPECT_EQ(dlg->getPageBaseGlob(L"EQ"), nullptr);

  h.click(tabCentre(1));
  EXPECT_EQ(dlg->currentPage(), L"EQ");
  h.click(tabCentre(0));
  h.click(tabCentre(1));
  EXPECT_EQ(dlg->builds[L"EQ"], 1);
  EXPECT_EQ(dlg->builds[L"Mix"], 1);
  EXPECT_EQ(probe.count("TabChanged"), 3);
  ASSERT_TRUE(dlg->getPageBaseGlob(L"EQ"));
  EXPECT_TRUE(dlg->getPageBaseGlob(L"EQ")->isVisible());
  EXPECT_FALSE(dlg->getPageBaseGlob(L"Mix")->isVisible());
  EXPECT_EQ((std::vector<WString>{L"Mix", L"EQ"}),
            std::vector<WString>(dlg->left.begin(), dlg->left.begin() + 2));
}

TEST_F(DialogueFixture, ReselectingInactiveAndUnknownChangeNothing) {
  addPages({L"A", L"B"});
  probe.clear();
  EXPECT_TRUE(dlg->selectPage(L"A", true, true));  // already current
  EXPECT_TRUE(dlg->left.empty());
  EXPECT_FALSE(dlg->selectPage(L"nope", true, true));
  EXPECT_EQ(dlg->currentPage(), L"A");
  dlg->setActive(false, true);
  EXPECT_TRUE(dlg->selectPage(L"B", true, true));
  EXPECT_EQ(dlg->currentPage(), L"A");
  EXPECT_FALSE(dlg->pageBuilt(L"B"));
  EXPECT_TRUE(probe.texts().empty());
}

TEST_F(DialogueFixture, DuplicateIdsAndRemovalOfTheCurrentPage) {
  addPages({L"A", L"B", L"C"});
  EXPECT_FALSE(dlg->addPageDeferred(L"B", kTabDefaultColour));
  EXPECT_FALSE(dlg->addPageDeferred(L"", kTabDefaultColour));
  EXPECT_EQ(dlg->pageCount(), 3u);
  Glob* pageA = dlg->getPageBaseGlob(L"A");
  GlobHandle<> handleA(pageA);
  EXPECT_TRUE(dlg->removePage(L"A", true));
  EXPECT_FALSE(handleA.alive());
  EXPECT_EQ(dlg->currentPage(), L"B");
  EXPECT_TRUE(dlg->pageBuilt(L"B"));
  EXPECT_FALSE(dlg->removePage(7u, true));
  EXPECT_EQ(dlg->findPageIdx(L"C"), 1);
}

TEST_F(DialogueFixture, ABuildThatDeletesTheDialogue) {
  addPages({L"A", L"B"});
  GlobHandle<> handle(dlg);
  dlg->onBuild = [this] { delete dlg; };
  EXPECT_FALSE(dlg->selectPage(L"B", true, true));
  EXPECT_FALSE(handle.alive());
  h.pump();
}

TEST_F(DialogueFixture, RenamingInPlace) {
  addPages({L"Mix", L"EQ"});
  h.click(tabCentre(0));
  h.advance(100);
  h.click(tabCentre(0));
  TabRenameBox* box = dlg->renameBox();
  ASSERT_TRUE(box);
  EXPECT_TRUE(box->hasKbdFocus());
  EXPECT_EQ(box->getText(), L"Mix");
  EXPECT_EQ(box->width(), dlg->tabStrip().tabWidth() - 10);

  h.key(kKeyEnd);
  h.type(L"er");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_FALSE(dlg->renameBox());
  EXPECT_EQ(dlg->getTabName(0), L"Mixer");
  EXPECT_EQ(dlg->getPageID(0), L"Mix");
  EXPECT_EQ(probe.count("PageRenamed"), 1);

  // An empty name is refused.
  dlg->startRenaming(0);
  ASSERT_TRUE(dlg->renameBox());
  h.key(kKeyCtrl | 'A');
  h.key(kKeyBackspace);
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(dlg->getTabName(0), L"Mixer");
  EXPECT_EQ(probe.count("PageRenamed"), 1);

  // Escape closes the box without a change.
  dlg->startRenaming(0);
  h.type(L"zz");
  h.key(kKeyEscape);
  h.pump();
  EXPECT_FALSE(dlg->renameBox());
  EXPECT_EQ(dlg->getTabName(0), L"Mixer");
}

TEST_F(DialogueFixture, CtrlTabCyclesAndTabsScrollWhenTheyDoNotFit) {
  for (int i = 0; i < 30; ++i) {
    ASSERT_TRUE(dlg->addPageDeferred(L"Page " + std::to_wstring(i), kTabDefaultColour));
  }
  const TabStrip& strip = dlg->tabStrip();
  EXPECT_TRUE(strip.scrolls());
  EXPECT_EQ(strip.tabWidth(), TabStrip::kMinTabWidth);
  EXPECT_LT(strip.shownCount(), 30);

  h.clickOn(*dlg->getPageBaseGlob(L"Page 0"));
  dlg->getPageBaseGlob(L"Page 0")->set_kbd_focus();
  h.key(kKeyCtrl | kKeyShift | kKeyTab);
  EXPECT_EQ(dlg->currentPage(), L"Page 29");
  EXPECT_TRUE(strip.tabGlob(29));  // scrolled into view
  EXPECT_FALSE(strip.tabGlob(0));
  h.key(kKeyCtrl | kKeyTab);
  EXPECT_EQ(dlg->currentPage(), L"Page 0");
  EXPECT_EQ(strip.firstShown(), 0);
}

TEST(TabbedDialogueSizes, CalcSizeMatchesThePageArea) {
  Harness h(600, 400);
  const XY<double> size = TabbedDialogue::calcSize(XY<double>(300, 200));
  TabbedDialogue dlg(h.place(0, 0, static_cast<int>(size.x), static_cast<int>(size.y)));
  EXPECT_EQ(dlg.getMaxPageSize(), XY<int>(300, 200));
  StandardTabPage* page = dlg.createTaggableStandardPage(L"Tagged");
  ASSERT_TRUE(page);
  EXPECT_EQ(page->width(), 300);
  EXPECT_FALSE(dlg.getCheckboxState(L"Tagged"));
  EXPECT_TRUE(dlg.setCheckboxState(L"Tagged", true));
  EXPECT_TRUE(dlg.getCheckboxState(L"Tagged"));
  EXPECT_FALSE(
      dlg.addPage(L"Tagged", kTabDefaultColour, kTabDefaultColour, kTabDefaultColour, page, false));
  EXPECT_FALSE(dlg.addPage(L"Null", kTabDefaultColour, kTabDefaultColour, kTabDefaultColour,
                           nullptr, false));
}

TEST_F(DialogueFixture, ATabsCheckBoxReportsItsPageWhenClicked) {
  addPages({L"Mix"});
  ASSERT_TRUE(dlg->createTaggableStandardPage(L"Sends"));
  ValServer<bool> enabled(false);
  ASSERT_TRUE(dlg->setCheckboxDataAdaptor(L"Sends", new ValServerAdaptor<bool>(&enabled)));
  Checkbox* box = dlg->tabStrip().record(dlg->findPageIdx(L"Sends")).checkbox.get();
  ASSERT_TRUE(box && box->isVisible());
  probe.clear();

  h.clickOn(*box);
  h.pump();
  ASSERT_EQ(probe.texts(), std::vector<String>{"TabCheckbox Sends TICKED"});
  EXPECT_EQ(probe.last()->sender, dlg);
  EXPECT_TRUE(dlg->getCheckboxState(L"Sends"));
  EXPECT_TRUE(enabled.getValue());
  // Ticking a tab's box is not choosing its page.
  EXPECT_EQ(dlg->currentPage(), L"Mix");

  h.clickOn(*box);
  h.pump();
  EXPECT_EQ(probe.texts(),
            (std::vector<String>{"TabCheckbox Sends TICKED", "TabCheckbox Sends CLEAR"}));
  EXPECT_FALSE(dlg->getCheckboxState(L"Sends"));
  EXPECT_FALSE(enabled.getValue());
  EXPECT_EQ(probe.count("TabChanged"), 0);
}

TEST(TabCheckboxReports, TheReceiverMayDeleteTheDialogue) {
  struct Deleter : Glob {
    using Glob::Glob;
    int react(Event* e) override {
      if (!message_event(e)) return Glob::react(e);
      texts.push_back(e->text());
      delete event_to_sender_glob(e);
      return 1;
    }
    std::vector<String> texts;
  };
  Harness h(400, 300);
  auto* owner = new Deleter(h.place(0, 0, 400, 300));
  auto* dlg = new TabbedDialogue(GlobCreationInfo(300, 200, owner->canvas(), 10, 10));
  ASSERT_TRUE(dlg->createTaggableStandardPage(L"Tagged"));
  GlobHandle<> handle(dlg);
  h.clickOn(*dlg->tabStrip().record(0).checkbox.get());
  h.pump();
  EXPECT_FALSE(handle.alive());
  EXPECT_EQ(owner->texts, std::vector<String>{"TabCheckbox Tagged TICKED"});
  h.pump();
}
