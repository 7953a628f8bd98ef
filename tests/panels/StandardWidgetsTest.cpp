#include <gtest/gtest.h>

#include <memory>

#include "buttons/Button.h"
#include "buttons/ImageSearchPath.h"
#include "buttons/PinButton.h"
#include "buttons/SizeButton.h"
#include "panels/StandardPanel.h"
#include "platform/testing/GoldenImage.h"
#include "platform/testing/Harness.h"
#include "tests/panels/PanelTestSupport.h"

namespace {

using Box = Kw::Box<int>;

constexpr int kTitleFlags = StdPootButton | StdSettingsButton | StdSizeButton | StdPinButton;

struct StandardWidgets : ::testing::Test {
  StandardWidgets() { panel->setBorderStyle(UifBorderRaised); }
  Glob* w(StandardWidgetFlag f) { return panel->standardWidget(f); }
  Box box(StandardWidgetFlag f) { return w(f) ? w(f)->canvas()->rect() : Box(); }

  Harness h{640, 480};
  std::unique_ptr<RecordingPanel> panel =
      std::make_unique<RecordingPanel>(h.place(20, 20, 300, 150));
};

}  // namespace

TEST_F(StandardWidgets, TitleWidgetsLineUpFromTheTopRightAndDoItSitsInTheBottomStrip) {
  panel->addStandardWidgets(kTitleFlags | StdDoItButton);
  EXPECT_EQ(box(StdPootButton), Box(270, 122, 290, 142));
  EXPECT_EQ(box(StdSizeButton), Box(248, 122, 268, 142));
  EXPECT_EQ(box(StdPinButton), Box(230, 122, 246, 142));
  EXPECT_EQ(box(StdSettingsButton), Box(208, 122, 228, 142));
  EXPECT_EQ(box(StdDoItButton), Box(210, 7, 290, 29));
  EXPECT_EQ(panel->calcMaxTitleWidgetWidth(), 206 - 10);

  // They follow the top-right corner.
  panel->reshape_canvas(20, 20, 400, 200);
  EXPECT_EQ(box(StdPootButton), Box(370, 172, 390, 192));
  EXPECT_EQ(box(StdDoItButton), Box(310, 7, 390, 29));

  // The size button leans on the close button only while that shows; the others on the
  // nearest earlier widget that exists.
  w(StdPootButton)->setVisible(false);
  panel->positionStandardWidgets();
  EXPECT_EQ(box(StdSizeButton), Box(370, 172, 390, 192));
  EXPECT_EQ(box(StdPinButton), Box(352, 172, 368, 192));
  panel->removeStandardWidgets(StdSizeButton | StdPinButton, true);
  EXPECT_EQ(box(StdSettingsButton), Box(348, 172, 368, 192));  // against the hidden close
}

TEST_F(StandardWidgets, NoSecondWidgetForAFlagAlreadyPresent) {
  panel->addStandardWidgets(kTitleFlags | StdDoItButton);
  const int children = panel->child_count();
  Glob* poot = w(StdPootButton);
  panel->addStandardWidgets(StdPootButton | StdDoItButton);
  EXPECT_EQ(panel->child_count(), children);
  EXPECT_EQ(w(StdPootButton), poot);
  EXPECT_EQ(panel->getStandardWidgetFlags(), kTitleFlags | StdDoItButton);

  // One deleted behind the panel's back is made again by the next request; meanwhile
  // positioning skips it.
  delete poot;
  panel->reshape_canvas(20, 20, 320, 150);
  EXPECT_EQ(w(StdPootButton), nullptr);
  panel->addStandardWidgets(StdPootButton);
  ASSERT_NE(w(StdPootButton), nullptr);
  EXPECT_EQ(panel->child_count(), children);
}

TEST_F(StandardWidgets, RemovingWidgetsClearsTheirFlagsAndStrips) {
  panel->addStandardWidgets(StdPootButton | StdDoItButton);
  EXPECT_EQ(panel->getUserArea(), Box(5, 32, 295, 119));
  GlobHandle<> doIt(w(StdDoItButton));
  panel->removeStandardWidgets(StdDoItButton | StdPinButton, true);  // the pin was never there
  EXPECT_FALSE(doIt.alive());
  EXPECT_EQ(panel->getStandardWidgetFlags(), StdPootButton);
  EXPECT_EQ(panel->getUserArea(), Box(5, 5, 295, 119));
  panel->removeStandardWidgets(StdPootButton, false);
  EXPECT_EQ(panel->getUserArea(), Box(5, 5, 295, 145));
  EXPECT_EQ(panel->child_count(), 0);
}

TEST_F(StandardWidgets, ButtonsDriveThePanel) {
  panel->addStandardWidgets(kTitleFlags | StdDoItButton);
  auto* doIt = static_cast<Button*>(w(StdDoItButton));
  EXPECT_EQ(doIt->getString(), L"OK");
  h.clickOn(*doIt);
  h.clickOn(*w(StdPootButton));
  EXPECT_EQ(panel->calls, (std::vector<String>{"msg:do_it", "poot"}));

  // The size button flips the panel and shows the way back.
  auto* size = static_cast<SizeButton*>(w(StdSizeButton));
  h.clickOn(*size);
  EXPECT_EQ(panel->getSizeState(), SizeMinimised);
  EXPECT_TRUE(size->get_size());
  EXPECT_FALSE(doIt->isVisible());
  h.clickOn(*size);
  EXPECT_EQ(panel->getSizeState(), SizeFull);
  EXPECT_FALSE(size->get_size());
  EXPECT_TRUE(doIt->isVisible());
  // Flipping in code keeps the button in step.
  panel->set_size_flag(SizeMinimised);
  EXPECT_TRUE(size->get_size());

  // The pin button shows the pin state and changes it.
  auto* pin = static_cast<PinButton*>(w(StdPinButton));
  panel->set_size_flag(SizeFull);
  EXPECT_TRUE(panel->isPinned());
  EXPECT_EQ(pin->get_state(), kButtonDown);
  h.clickOn(*pin);
  EXPECT_TRUE(panel->isDismissable());
  EXPECT_EQ(pin->get_state(), kButtonUp);
  h.clickOn(*pin);
  EXPECT_TRUE(panel->isPinned());
  panel->setDismissable(true);
  EXPECT_EQ(pin->get_state(), kButtonUp);
  EXPECT_EQ(panel->calls.size(), 4u);  // flips only: pin messages never reach the handlers
}

TEST_F(StandardWidgets, ModalDisplayPinsAndLocksThePinButtonThenRestoresBoth) {
  panel->addStandardWidgets(StdPinButton);
  Glob* pin = w(StdPinButton);
  panel->setDismissable(true);

  panel->setModal(true);
  EXPECT_TRUE(panel->isPinned());
  EXPECT_FALSE(pin->isActive());
  h.clickOn(*pin);  // locked: no way to unpin a modal panel
  EXPECT_TRUE(panel->isPinned());
  panel->setModal(true);
  panel->setModal(false);
  EXPECT_FALSE(pin->isActive());
  panel->setModal(false);
  EXPECT_TRUE(panel->isDismissable());
  EXPECT_TRUE(pin->isActive());

  // A pin button that was inactive before stays so.
  pin->setActive(false, false);
  panel->setModal(true);
  panel->setModal(false);
  EXPECT_FALSE(pin->isActive());
}

TEST(StandardWidgetsGolden, PanelWithEveryTitleWidget) {
  imageSearchPath().addDirectory(String(GLOBKIT_SOURCE_DIR) + "/gallery/icons");
  Harness h(260, 120);
  StandardPanel panel(h.place(0, 0, 260, 120));
  panel.setBorderStyle(UifBorderRaised);
  panel.setTitle(L"Channel strip");
  panel.addStandardWidgets(kTitleFlags | StdDoItButton);
  auto r = GoldenImage::check(h, panel, "panel_title_widgets");
  EXPECT_TRUE(r) << r.message;
}
