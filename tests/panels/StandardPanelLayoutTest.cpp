#include <gtest/gtest.h>

#include <memory>

#include "panels/StandardPanel.h"
#include "platform/misc/Diagnostics.h"
#include "platform/misc/configb.h"
#include "platform/testing/Harness.h"
#include "tests/panels/PanelTestSupport.h"

namespace {

using Box = Kw::Box<int>;

struct PanelLayout : ::testing::Test {
  PanelLayout() { panel->setBorderStyle(UifBorderRaised); }
  Child* child(int w, int h) { return new Child(panel->canvas(), w, h); }

  Harness h{640, 480};
  std::unique_ptr<StandardPanel> panel = std::make_unique<StandardPanel>(h.place(50, 40, 200, 100));
};

}  // namespace

TEST_F(PanelLayout, WidgetsFromEachOriginAndTheirAnchoringOnResize) {
  Child* bl = child(30, 20);
  Child* tr = child(30, 20);
  Child* innerTl = child(30, 20);
  Child* innerBr = child(30, 20);
  ASSERT_TRUE(panel->addWidget(bl, XY<int>(4, 3), OriginBottomLeft));
  ASSERT_TRUE(panel->addWidget(tr, 4, 3, OriginTopRight));
  ASSERT_TRUE(panel->addWidget(innerTl, XY<int>(4, 3), OriginInnerTopLeft));
  ASSERT_TRUE(panel->addWidget(innerBr, XY<int>(4, 3), OriginInnerBottomRight));
  EXPECT_EQ(bl->box(), Box(4, 3, 34, 23));
  EXPECT_EQ(tr->box(), Box(166, 77, 196, 97));
  EXPECT_EQ(innerTl->box(), Box(9, 72, 39, 92));
  EXPECT_EQ(innerBr->box(), Box(161, 8, 191, 28));

  // Widgets follow their corner when the panel grows.
  panel->reshape_canvas(50, 40, 300, 150);
  EXPECT_EQ(bl->box(), Box(4, 3, 34, 23));
  EXPECT_EQ(tr->box(), Box(266, 127, 296, 147));
  EXPECT_EQ(innerTl->box(), Box(9, 122, 39, 142));
  EXPECT_EQ(innerBr->box(), Box(261, 8, 291, 28));

  // Strips and border move the inner origins, and the widgets with them.
  panel->addStandardWidgets(StdDoItButton);
  EXPECT_EQ(innerBr->box(), Box(261, 35, 291, 55));
  panel->setBorderStyle(UifBorderFramed);
  EXPECT_EQ(innerTl->box(), Box(14, 117, 44, 137));
  EXPECT_EQ(tr->box(), Box(266, 127, 296, 147));
  EXPECT_EQ(panel->getUserArea(), Box(10, 37, 290, 140));
}

TEST_F(PanelLayout, MovingWidgetsKeepsTheirOrigin) {
  Child* tr = child(30, 20);
  ASSERT_TRUE(panel->addWidget(tr, XY<int>(4, 3), OriginTopRight));
  ASSERT_TRUE(panel->translateWidgetPos(tr, -10, -5));  // left and down: further in
  EXPECT_EQ(panel->getWidget(tr)->pos, XY<int>(14, 8));
  EXPECT_EQ(tr->box(), Box(156, 72, 186, 92));
  ASSERT_TRUE(panel->setWidgetPos(tr, XY<int>(0, 0)));
  EXPECT_EQ(tr->box(), Box(170, 80, 200, 100));
  ASSERT_TRUE(panel->setWidgetPos(tr, XY<int>(1, 2), OriginInnerBottomLeft));
  EXPECT_EQ(tr->box(), Box(6, 7, 36, 27));
  EXPECT_FALSE(panel->setWidgetPos(tr, XY<int>(1, 2), static_cast<CoordinateOrigin>(9)));
  EXPECT_EQ(panel->getWidget(tr)->origin, OriginInnerBottomLeft);
}

TEST_F(PanelLayout, RelativeWidgetsFollowTheirReference) {
  Child* a = child(40, 20);
  Child* b = child(10, 6);
  Child* c = child(12, 8);
  ASSERT_TRUE(panel->addWidget(a, XY<int>(10, 10), OriginTopRight));
  ASSERT_TRUE(panel->addWidgetRelative(b, a, 5, PlaceLeftOf, SurroundNone, AlignTop));
  ASSERT_TRUE(panel->addWidgetRelative(c, b, 3, PlaceBelow, SurroundNone, AlignRight));
  EXPECT_EQ(a->box(), Box(150, 70, 190, 90));
  EXPECT_EQ(b->box(), Box(135, 84, 145, 90));
  EXPECT_EQ(c->box(), Box(133, 73, 145, 81));

  panel->translateWidgetPos(a, -20, -30);
  EXPECT_EQ(b->box(), Box(115, 54, 125, 60));
  EXPECT_EQ(c->box(), Box(113, 43, 125, 51));

  // a is anchored top-right, so a resize moves it and the chain behind it.
  panel->reshape_canvas(50, 40, 260, 120);
  EXPECT_EQ(a->box(), Box(190, 60, 230, 80));
  EXPECT_EQ(b->box(), Box(175, 74, 185, 80));
  EXPECT_EQ(c->box(), Box(173, 63, 185, 71));

  // Surrounds widen the outer boxes the gap is measured between.
  ASSERT_TRUE(panel->setWidgetBorderStyle(a, SurroundFramed));
  EXPECT_EQ(b->box(), Box(173, 76, 183, 82));
}

TEST_F(PanelLayout, ExplicitMovesAndLostReferencesMakeRelativeWidgetsAbsolute) {
  Child* a = child(40, 20);
  Child* b = child(10, 6);
  Child* c = child(10, 6);
  panel->addWidget(a, XY<int>(10, 10));
  panel->addWidgetRelative(b, a, 5, PlaceRightOf, SurroundNone, AlignBottom);
  panel->addWidgetRelative(c, b, 5, PlaceRightOf, SurroundNone, AlignBottom);
  ASSERT_EQ(b->box(), Box(55, 10, 65, 16));

  ASSERT_TRUE(panel->translateWidgetPos(b, 0, 10));
  EXPECT_FALSE(panel->getWidget(b)->relative);
  EXPECT_EQ(b->box(), Box(55, 20, 65, 26));
  EXPECT_EQ(c->box(), Box(70, 20, 80, 26));  // still placed against b

  // b leaves: c stays where it is and no longer follows anything.
  ASSERT_TRUE(panel->removeWidget(b, true));
  EXPECT_FALSE(panel->getWidget(c)->relative);
  EXPECT_EQ(c->box(), Box(70, 20, 80, 26));
  panel->translateWidgetPos(a, 5, 0);
  EXPECT_EQ(c->box(), Box(70, 20, 80, 26));
}

TEST_F(PanelLayout, RefusedAdditions) {
  Child* a = child(10, 10);
  Child* b = child(10, 10);
  ASSERT_TRUE(panel->addWidget(a, XY<int>(0, 0)));
  EXPECT_FALSE(panel->addWidget(a, XY<int>(5, 5)));  // already there
  EXPECT_FALSE(panel->addWidget(nullptr, XY<int>(0, 0)));
  EXPECT_FALSE(panel->addWidget(panel.get(), XY<int>(0, 0)));
  EXPECT_FALSE(panel->addWidget(&h.root(), XY<int>(0, 0)));
  EXPECT_FALSE(panel->addWidget(b, XY<int>(0, 0), static_cast<CoordinateOrigin>(8)));
  EXPECT_FALSE(panel->addWidgetRelative(b, b, 2, PlaceAbove));
  EXPECT_FALSE(panel->addWidgetRelative(b, nullptr, 2, PlaceAbove));
  EXPECT_FALSE(panel->addWidgetRelative(b, a, 2, PlaceAbove, SurroundNone, AlignTop));
  EXPECT_FALSE(panel->addWidgetRelative(b, a, 2, static_cast<WidgetRelativity>(7)));
  Child stranger(h.canvas(), 10, 10);  // on the screen, not in the list
  EXPECT_FALSE(panel->addWidgetRelative(b, &stranger, 2, PlaceAbove));
  EXPECT_EQ(panel->numWidgets(), 1u);
  EXPECT_FALSE(panel->isChildWidget(b));

  // An inner panel cannot adopt its own parent.
  auto* inner = new StandardPanel(GlobCreationInfo(50, 50, panel->canvas()));
  ASSERT_TRUE(panel->addWidget(inner, XY<int>(0, 0)));
  EXPECT_FALSE(inner->addWidget(panel.get(), XY<int>(0, 0)));
}

TEST_F(PanelLayout, AddingAdoptsWidgetsFromElsewhereAndInsertsInOrder) {
  Child* a = child(10, 10);
  Child* c = child(10, 10);
  auto* b = new Child(h.canvas(), 10, 10);  // made on the screen
  panel->addWidget(a, XY<int>(0, 0));
  panel->addWidget(c, XY<int>(20, 0));
  ASSERT_TRUE(panel->addWidget(b, XY<int>(40, 0), OriginBottomLeft, SurroundNone, a));
  EXPECT_EQ(b->parent(), panel.get());
  EXPECT_EQ(panel->getWidget(1u)->get(), b);
  EXPECT_EQ(panel->getWidget(2u)->get(), c);
  EXPECT_EQ(panel->getWidget(3u), nullptr);
  std::vector<Glob*> kids;
  panel->getChildren(kids);
  EXPECT_EQ(kids, (std::vector<Glob*>{a, b, c}));
  // Removing without deleting leaves the Glob where it is.
  ASSERT_TRUE(panel->removeWidget(b, false));
  EXPECT_FALSE(panel->isChildWidget(b));
  EXPECT_EQ(b->parent(), panel.get());
  EXPECT_FALSE(panel->removeWidget(b, false));
}

TEST_F(PanelLayout, MinimumSizeHoldsAgainstShrinking) {
  panel->setMinSize(150, 120);
  EXPECT_EQ(panel->height(), 120);  // grown to the minimum
  EXPECT_EQ(panel->width(), 200);
  panel->reshape_canvas(50, 40, 100, 50);
  EXPECT_EQ(panel->width(), 150);
  EXPECT_EQ(panel->height(), 120);
  panel->resetMinSize();
  panel->reshape_canvas(50, 40, 100, 50);
  EXPECT_EQ(panel->width(), 100);
  EXPECT_EQ(panel->getMinSize(), XY<int>(0, 0));
}

TEST_F(PanelLayout, MinimisingKeepsTheTopEdgeAndHidesTheChildren) {
  panel->addStandardWidgets(StdSizeButton);
  Child* shown = child(10, 10);
  Child* hidden = child(10, 10);
  panel->addWidget(shown, XY<int>(2, 2), OriginInnerBottomLeft);
  panel->addWidget(hidden, XY<int>(20, 2), OriginInnerBottomLeft);
  hidden->setVisible(false);
  panel->setMinSize(100, 100);

  panel->set_size_flag(SizeMinimised);
  EXPECT_EQ(panel->canvas()->rect(), Box(50, 104, 250, 140));  // 2 x 5 + 26 high, top at 140
  EXPECT_FALSE(shown->isVisible());
  panel->set_size_flag(SizeFull);
  EXPECT_EQ(panel->canvas()->rect(), Box(50, 40, 250, 140));
  EXPECT_TRUE(shown->isVisible());
  EXPECT_FALSE(hidden->isVisible());
  EXPECT_EQ(shown->box(), Box(7, 7, 17, 17));
}

TEST(PanelConstruction, FromAConfigurationRecord) {
  Harness h;
  configb config;
  config.loadText("width = 320\nheight = 90\nborder = 2\ntitle = Mixer\nx = 12\n");
  StandardPanel a(config, 100, 100);
  EXPECT_EQ(a.canvas()->rect(), Box(12, 0, 332, 90));
  EXPECT_EQ(a.getBorderStyle(), UifBorderFramed);
  EXPECT_EQ(a.getTitleW(), L"Mixer");
  EXPECT_EQ(a.root(), nullptr);  // no canvas given: on no screen until it is put on one
  ASSERT_TRUE(h.root().adopt(&a, XY<int>(12, 0)));
  EXPECT_EQ(a.parent(), &h.root());

  // Bad values fall back to the defaults given, with a report.
  Diagnostics::Capture capture;
  configb bad;
  bad.loadText("width = wide\nheight = 70000\n");
  StandardPanel b(bad, 100, 60, h.canvas());
  EXPECT_EQ(b.width(), 100);
  EXPECT_EQ(b.height(), 60);
  EXPECT_TRUE(capture.contains("width"));
  EXPECT_TRUE(capture.contains("height 70000"));
}
