// Repainting: what draws in a frame, in which order, within which clip, and what is presented.
#include <gtest/gtest.h>

#include "platform/backend/RootRenderer.h"
#include "platform/testing/Harness.h"
#include "tests/glib/PaintGlob.h"

namespace {

const Colour kRed = Colour::fromHex(0xC02020);
const Colour kGreen = Colour::fromHex(0x20A040);
const Colour kBlue = Colour::fromHex(0x2040C0);

PaintGlob::Paint fill(const Colour* c) {
  return [c](Glib::Painter& p) { p.fillRect(p.bounds(), *c); };
}

TEST(GlibRedraw, EachDamagedCanvasDrawsOncePerFrame) {
  Harness h(200, 100);
  PaintGlob wide(h.place(0, 0, 200, 20), fill(&kRed));
  PaintGlob other(h.place(0, 50, 30, 30), fill(&kGreen));
  h.render();
  wide.draws = other.draws = 0;
  // Two separate damaged areas on the same canvas.
  wide.update(Kw::Box<int>(0, 0, 10, 10));
  wide.update(Kw::Box<int>(150, 0, 160, 10));
  ASSERT_EQ(h.root().dirty().rects().size(), 2u);
  const auto drawn = h.render();
  EXPECT_EQ(wide.draws, 1);
  EXPECT_EQ(other.draws, 0) << "untouched canvases do not draw";
  EXPECT_EQ(drawn, std::vector<Glob*>{&wide});
  // Both areas were presented, top-down in the image.
  const auto& presented = h.renderer().presentedAreas();
  ASSERT_EQ(presented.size(), 2u);
  EXPECT_TRUE((presented[0] == Kw::Box<int>(0, 90, 10, 100)) ||
              (presented[1] == Kw::Box<int>(0, 90, 10, 100)));
}

TEST(GlibRedraw, DrawingStaysInsideTheDamage) {
  Harness h(100, 100);
  const Colour* colour = &kRed;
  PaintGlob g(h.place(0, 0, 100, 100), [&](Glib::Painter& p) { p.fillRect(p.bounds(), *colour); });
  h.render();
  colour = &kBlue;  // changed without a full update
  g.update(Kw::Box<int>(10, 10, 20, 20));
  h.render();
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(kBlue));
  EXPECT_EQ(h.pixelAt(20, 15), Harness::argb(kRed));
  EXPECT_EQ(h.pixelAt(15, 9), Harness::argb(kRed));
  EXPECT_FALSE(h.renderer().render()) << "nothing left to paint";
}

TEST(GlibRedraw, InvisibleCanvasesCostNothing) {
  Harness h(100, 100);
  PaintGlob empty(h.place(10, 10, 0, 0), fill(&kRed));
  PaintGlob flat(h.place(10, 10, 40, 0), fill(&kRed));
  PaintGlob outside(h.place(150, 20, 30, 30), fill(&kRed));
  PaintGlob below(h.place(20, -60, 30, 30), fill(&kRed));
  PaintGlob hidden(h.place(20, 20, 30, 30), fill(&kRed));
  hidden.unmap_canvas();
  PaintGlob holder(h.place(60, 60, 10, 10), fill(&kGreen));
  PaintGlob clippedAway(GlobCreationInfo(10, 10, holder.canvas(), 20, 0), fill(&kRed));
  h.root().canvas()->damage();
  const auto drawn = h.render();
  EXPECT_EQ(drawn, std::vector<Glob*>{&holder});
  for (auto* g : {&empty, &flat, &outside, &below, &hidden, &clippedAway}) EXPECT_EQ(g->draws, 0);
}

TEST(GlibRedraw, StackingOrderDecidesWhatShows) {
  Harness h(100, 100);
  PaintGlob bottom(h.place(0, 0, 60, 60), fill(&kRed));
  PaintGlob top(h.place(40, 40, 60, 60), fill(&kBlue));
  h.render();
  EXPECT_EQ(h.pixelAt(50, 50), Harness::argb(kBlue));
  // Damage on the lower canvas repaints the upper one over it where they overlap.
  top.draws = 0;
  bottom.update();
  const auto drawn = h.render();
  EXPECT_EQ(drawn, (std::vector<Glob*>{&bottom, &top}));
  EXPECT_EQ(h.pixelAt(50, 50), Harness::argb(kBlue));
  bottom.pop_to_top();
  h.render();
  EXPECT_EQ(h.pixelAt(50, 50), Harness::argb(kRed));
  EXPECT_EQ(h.pixelAt(90, 90), Harness::argb(kBlue));
}

TEST(GlibRedraw, OpaqueChildrenHideTheirParentsPaint) {
  Harness h(60, 60);
  PaintGlob parent(h.place(0, 0, 60, 60), fill(&kRed));
  // This child promises to cover itself but draws nothing: whatever lies under it is left
  // as it was, which shows that the parent did not paint there.
  PaintGlob liar(GlobCreationInfo(20, 20, parent.canvas(), 10, 10), nullptr);
  liar.canvas()->setOpaque(true);
  h.render();
  EXPECT_NE(h.pixelAt(15, 15), Harness::argb(kRed));
  EXPECT_EQ(h.pixelAt(35, 15), Harness::argb(kRed));
  // An opaque child that keeps its promise looks as it would without the promise.
  liar.setPaint(fill(&kGreen));
  liar.update();
  h.render();
  EXPECT_EQ(h.pixelAt(15, 15), Harness::argb(kGreen));
}

TEST(GlibRedraw, HeldBackRedrawsWaitForTheLastEnable) {
  Harness h(40, 40);
  PaintGlob g(h.place(0, 0, 40, 40), fill(&kRed));
  h.render();
  g.draws = 0;
  Drawable::disableRedraws();
  refresh_off();
  g.update();
  EXPECT_TRUE(h.render().empty());
  Drawable::enableRedraws();
  EXPECT_TRUE(h.render().empty());
  refresh_on();
  EXPECT_EQ(h.render(), std::vector<Glob*>{&g});
  EXPECT_EQ(g.draws, 1);
}

TEST(GlibRedraw, FirstRenderPaintsEverythingWhateverWasPaintedBefore) {
  Harness h(40, 40);
  PaintGlob g(h.place(0, 0, 20, 20), fill(&kGreen));
  EXPECT_EQ(h.paint(), std::vector<Glob*>{&g});  // without pixels
  EXPECT_EQ(h.pixelAt(5, 5), 0u);
  h.render();
  EXPECT_EQ(h.pixelAt(5, 5), Harness::argb(kGreen));
  EXPECT_EQ(h.pixelAt(30, 30), Harness::argb(h.root().getPalette().get(Palette::Window)));
  // From now on paint() keeps the pixels current too.
  g.setPaint(fill(&kRed));
  g.update();
  h.paint();
  EXPECT_EQ(h.pixelAt(5, 5), Harness::argb(kRed));
}

TEST(GlibRedraw, ChangedAreasAccumulateUntilTaken) {
  Harness h(100, 100);
  PaintGlob a(h.place(0, 0, 10, 10), fill(&kRed));
  PaintGlob b(h.place(90, 90, 10, 10), fill(&kRed));
  h.render();
  h.renderer().takeChanged();
  a.update();
  h.render();
  b.update();
  h.render();
  EXPECT_EQ(h.renderer().takeChanged(), Kw::Box<int>(0, 0, 100, 100));
  EXPECT_TRUE(h.renderer().takeChanged().empty());
}

}  // namespace
