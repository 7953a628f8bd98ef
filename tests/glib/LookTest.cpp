// The look layer: the two palettes keep their text readable, and a tree takes the palette of
// its root.
#include <gtest/gtest.h>

#include <cmath>

#include "buttons/Button.h"
#include "buttons/Checkbox.h"
#include "panels/StandardPanel.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/PanelLook.h"
#include "platform/glob/RootGlob.h"
#include "platform/testing/Harness.h"

namespace {

using Glib::PanelLook;

double luminance(const Colour& c) {
  auto lin = [](double v) { return v <= 0.03928 ? v / 12.92 : std::pow((v + 0.055) / 1.055, 2.4); };
  return 0.2126 * lin(c.r) + 0.7152 * lin(c.g) + 0.0722 * lin(c.b);
}

double contrast(const Colour& a, const Colour& b) {
  const double la = luminance(a), lb = luminance(b);
  return (std::max(la, lb) + 0.05) / (std::min(la, lb) + 0.05);
}

double pixelLuminance(uint32_t argb) {
  return luminance(Colour::fromHex(argb & 0xFFFFFF));
}

}  // namespace

TEST(Palette, DefaultIsTheDarkLookAndLightDiffersInEveryRole) {
  EXPECT_EQ(Palette(), Palette::dark());
  const Palette dark = Palette::dark(), light = Palette::light();
  for (int r = 0; r < Palette::RoleCount; ++r) {
    const auto role = static_cast<Palette::Role>(r);
    if (role == Palette::HighlightedText) continue;  // white on the selection in both
    EXPECT_NE(dark.get(role), light.get(role)) << "role " << r;
  }
  // The light look is light: its window and entry backgrounds are pale.
  EXPECT_GT(luminance(light.get(Palette::Window)), 0.6);
  EXPECT_GT(luminance(light.get(Palette::Base)), 0.9);
  // Window shades still run from darkest to lightest.
  for (int i = 0; i < 6; ++i)
    EXPECT_LT(luminance(light.windowShade(i)), luminance(light.windowShade(i + 1)) + 1e-9);
}

TEST(Palette, TextStaysReadableInBothLooks) {
  for (const Palette& p : {Palette::dark(), Palette::light()}) {
    EXPECT_GE(contrast(p.get(Palette::WindowText), p.get(Palette::Window)), 4.5);
    EXPECT_GE(contrast(p.get(Palette::WindowText), p.windowShade(0)), 4.5);
    EXPECT_GE(contrast(p.get(Palette::ButtonText), p.get(Palette::Button)), 4.5);
    EXPECT_GE(contrast(p.get(Palette::Text), p.get(Palette::Base)), 4.5);
    EXPECT_GE(contrast(p.get(Palette::HighlightedText), p.get(Palette::Highlight)), 3.0);
    EXPECT_GE(contrast(p.get(Palette::Disabled), p.get(Palette::Window)), 2.5);
    EXPECT_GE(contrast(p.get(Palette::Caret), p.get(Palette::Base)), 3.0);
    EXPECT_GE(contrast(p.get(Palette::Focus), p.get(Palette::Window)), 3.0);
    EXPECT_GE(contrast(p.get(Palette::Light), p.get(Palette::Shadow)), 2.0);
  }
}

TEST(PaletteInheritance, ControlsTakeTheirParentsPaletteUnlessGivenOne) {
  Harness h(200, 100);
  h.root().setPalette(Palette::light());
  // Both construction forms, without a palette of their own.
  Button* made = new Button(L"Light", "light", h.place(10, 10, 80, 30));
  Button* old = new Button(L"Old", "old", 80, 30, 0, h.canvas());
  old->reshape_canvas(100, 10, 80, 30);
  EXPECT_EQ(made->getPalette(), Palette::light());
  EXPECT_EQ(old->getPalette(), Palette::light());
  // Grandchildren too: a check box inside a panel.
  StandardPanel* panel = new StandardPanel(h.place(0, 50, 200, 50));
  Checkbox* box = new Checkbox(120, 20, false, 0, panel->canvas());
  EXPECT_EQ(box->getPalette(), Palette::light());
  EXPECT_EQ(box->getTextColour(), Palette::light().get(Palette::WindowText));
  // A palette given in the record wins.
  GlobCreationInfo dark = h.place(10, 60, 60, 20);
  dark.palette = Palette::dark();
  Button* own = new Button(L"Dark", "dark", dark);
  EXPECT_EQ(own->getPalette(), Palette::dark());
  // Without a parent, the default look.
  Glob loose(GlobCreationInfo(10, 10, nullptr));
  EXPECT_EQ(loose.getPalette(), Palette());

  // And the pixels follow: a pale face with dark label ink.
  h.render();
  const XY<int> c = Harness::centreOf(*made);
  EXPECT_GT(pixelLuminance(h.pixelAt(c.x - 30, c.y)), 0.5);
  EXPECT_GT(pixelLuminance(h.pixelAt(c.x + 90, c.y - 10)), 0.5);  // the old-style button
  int ink = 0;
  for (int x = 12; x < 88; ++x) ink += pixelLuminance(h.pixelAt(x, c.y)) < 0.1;
  EXPECT_GT(ink, 0) << "no dark label ink on the light button";
}
