// The gallery's help: every control shown on a page has a tooltip, a tooltip appears over a
// button after a rest, and the labels page renames its clip through an input box.
#include <gtest/gtest.h>

#include "gallery/GalleryApp.h"
#include "gallery/MessageLog.h"
#include "platform/glob/KeyCodes.h"
#include "platform/testing/Harness.h"
#include "tests/gallery/GalleryTestSupport.h"
#include "text/InputBox.h"
#include "text/KwToolTip.h"
#include "text/TextLabel.h"

namespace {

struct GalleryFixture : ::testing::Test {
  void TearDown() override {
    InputBox::removeAnyExistingInputBox();
    KwToolTip::hide();
  }
  Harness h{1300, 860};
  MessageLog log;
  GalleryApp* app = new GalleryApp(h.root(), log);
};

}  // namespace

TEST_F(GalleryFixture, EveryShownControlOfEveryPageHasHelp) {
  for (int i = 0; i < app->pageCount(); ++i) {
    app->selectPage(i);  // pages are built when first chosen
    GalleryPage* page = app->page(i);
    ASSERT_NE(page, nullptr) << app->pageTitle(i);
    for (Glob* g : page->children()) {
      if (!g->isVisible() || g->get_name().empty()) continue;
      EXPECT_FALSE(g->contextString(XY<int>(), nullptr).empty())
          << page->title() << ": " << g->get_name();
    }
  }
}

TEST_F(GalleryFixture, ATooltipShowsOverAButtonAfterARest) {
  KwToolTip::registerTypes(h.root());
  app->selectPage(pageTitled(*app, "Buttons"));
  Glob* apply = findNamed(*app->page(app->currentPage()), "Apply");
  ASSERT_NE(apply, nullptr);
  h.move(Harness::centreOf(*apply));
  h.advance(KwToolTip::kRestMs + 2 * h.root().tickPeriod());
  ASSERT_NE(KwToolTip::current(), nullptr);
  EXPECT_EQ(KwToolTip::current()->text(), L"Sends \"apply\" when clicked");
  h.render();
  EXPECT_TRUE(h.drew(KwToolTip::current()));
}

TEST_F(GalleryFixture, TheLabelsPageRenamesItsClipThroughAnInputBox) {
  const int index = pageTitled(*app, "Labels & tooltips");
  ASSERT_GE(index, 0);
  app->selectPage(index);
  GalleryPage* page = app->page(index);
  Glob* rename = findNamed(*page, "Rename");
  ASSERT_NE(rename, nullptr);
  h.clickOn(*rename);
  h.pump();
  InputBox* box = InputBox::current();
  ASSERT_NE(box, nullptr);
  h.type(L"Outro");
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(InputBox::current(), nullptr);
  int showing = 0;
  for (Glob* g : findNamed(*page, "label binding")->children()) {
    if (auto* label = dynamic_cast<TextLabel*>(g)) {
      EXPECT_EQ(label->getText(), L"Outro");
      ++showing;
    }
  }
  EXPECT_EQ(showing, 3);
}
