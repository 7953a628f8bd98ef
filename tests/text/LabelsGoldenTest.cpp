// The looks of labels, titled boxes in each style, the input box and a tooltip, in the dark
// palette and, where the recipes differ by palette, the light one.
#include <gtest/gtest.h>

#include "platform/glob/KeyCodes.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "text/InputBox.h"
#include "text/KwToolTip.h"
#include "text/TextLabel.h"
#include "text/TitleTextBox.h"

namespace {

void titledBoxes(Harness& h) {
  TitleTextBoxInitArgs args;
  args.info = GlobCreationInfo(0, 0, h.canvas(), 10, 0);
  args.boxWidth = 120;
  args.title = L"Reel";
  args.titleWidth = 50;
  args.box.text = L"A014";
  auto* beside = new TitleTextBox(args);
  beside->reshape_canvas(10, 100, beside->width(), beside->height());
  args.title = L"Scene";
  args.style = TitleTextBox::StyleTab;
  args.titleWidth = 0;
  args.box.text = L"12";
  auto* tab = new TitleTextBox(args);
  tab->reshape_canvas(10, 64, tab->width(), tab->height());
  args.title = L"Take";
  args.style = TitleTextBox::StyleAbove;
  args.box.text = L"";
  args.box.ghostLabel = L"Next take";
  auto* above = new TitleTextBox(args);
  above->reshape_canvas(10, 8, above->width(), above->height());
}

void tooltipOver(Harness& h) {
  KwToolTip::registerTypes(h.root());
  auto* target = new Glob(h.place(10, 60, 60, 30));
  target->setContextString("Solo this track\nAlt+click: solo it alone");
  h.move(XY<int>(20, 80));
  h.advance(KwToolTip::kRestMs + 2 * h.root().tickPeriod());
}

}  // namespace

TEST(LabelsLook, Labels) {
  Harness h(220, 70);
  new TextLabel(L"Plain label", h.root().getPalette(), 0, false, h.canvas());
  auto* bold = new TextLabel(L"Bold on a colour", Colour::fromHex(0xFFFFFF),
                             Colour::fromHex(0x3D6F9E), 15, true, h.canvas());
  bold->reshape_canvas(10, 24, bold->width(), bold->height());
  auto* inactive = new TextLabel(L"Inactive", h.root().getPalette(), 0, false, h.canvas());
  inactive->reshape_canvas(10, 50, inactive->width(), inactive->height());
  inactive->setActive(false, true);
  EXPECT_TRUE(GoldenImage::check(h, Kw::Box<int>(0, 0, 220, 70), "text_labels"));
}

TEST(LabelsLook, TitledBoxesInEachStyle) {
  Harness h(200, 130);
  titledBoxes(h);
  EXPECT_TRUE(GoldenImage::check(h, Kw::Box<int>(0, 0, 200, 130), "titled_text_boxes"));
}

TEST(LabelsLook, TitledBoxesInTheLightPalette) {
  Harness h(200, 130);
  h.root().setPalette(Palette::light());
  titledBoxes(h);
  EXPECT_TRUE(GoldenImage::check(h, Kw::Box<int>(0, 0, 200, 130), "titled_text_boxes_light"));
}

TEST(LabelsLook, InputBox) {
  Harness h(270, 115);
  auto* requester = new MessageProbe(h.place(0, 0, 270, 115));
  h.move(XY<int>(135, 57));
  InputBox* box = InputBox::make(L"Rename clip", L"Name:", L"Interview 3", "rename:", requester);
  ASSERT_NE(box, nullptr);
  EXPECT_TRUE(GoldenImage::check(h, *box, "input_box"));
  InputBox::removeAnyExistingInputBox();
}

TEST(LabelsLook, ToolTip) {
  Harness h(240, 100);
  tooltipOver(h);
  ASSERT_NE(KwToolTip::current(), nullptr);
  EXPECT_TRUE(GoldenImage::check(h, *KwToolTip::current(), "tooltip"));
  KwToolTip::hide();
}

TEST(LabelsLook, ToolTipInTheLightPalette) {
  Harness h(240, 100);
  h.root().setPalette(Palette::light());
  tooltipOver(h);
  ASSERT_NE(KwToolTip::current(), nullptr);
  EXPECT_TRUE(GoldenImage::check(h, *KwToolTip::current(), "tooltip_light"));
  KwToolTip::hide();
}
