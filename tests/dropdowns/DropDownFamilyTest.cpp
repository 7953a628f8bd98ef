// The controls built on the drop-down: the titled and bound forms, the picture drop-down, the
// imposter, the menu-button group and the drop-downs of multi-choice menu rows.
#include <gtest/gtest.h>

#include "dropdowns/DropDownButtonImposter.h"
#include "dropdowns/DropDownImageButton.h"
#include "dropdowns/TitleMenuButton.h"
#include "foundation/ValServerAdaptor.h"
#include "panels/MenuButtonGroup.h"
#include "tests/dropdowns/DropDownTestSupport.h"
#include "tests/menus/MenuTestSupport.h"

namespace {

struct DropDownFamilyTest : DropDownFixture {};

// Refuses every odd index, to see a refused choice undone.
class EvenOnly : public ValServerAdaptor<int> {
 public:
  using ValServerAdaptor<int>::ValServerAdaptor;
  bool requestSetNewDataValue(const int& v, DataChangeType why) override {
    return v % 2 == 0 && ValServerAdaptor<int>::requestSetNewDataValue(v, why);
  }
};

TEST_F(DropDownFamilyTest, ATitleMenuButtonKeepsItsModelValueInStep) {
  ValServer<int> model(1);
  auto* t = new TitleMenuButton(L"Colour", {L"Red", L"Green", L"Blue", L"Black"},
                                GlobCreationInfo(220, 24, parent.canvas(), 20, 200));
  Kw::Ptr<ValAdaptorBase<int>> a(new EvenOnly(&model));
  t->setDataAdaptor(a);
  a->forceWidgetUpdate();
  DropDownMenuButton* b = t->getBtn();
  ASSERT_NE(b, nullptr);
  EXPECT_EQ(b->getSelectedItem(), 1);
  EXPECT_GT(b->canvas()->rect().x0, 0);  // beside the title

  model.setValue(3);  // the model drives the drop-down, silently
  EXPECT_EQ(b->getSelectedItem(), 3);
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 0);
  model.setValue(7);  // names no entry: refused there, the drop-down keeps its choice
  EXPECT_EQ(b->getSelectedItem(), 3);

  model.setValue(0);
  h.click(Harness::centreOf(*b));
  h.click(rowCentre(b->dropDown(), 2));
  EXPECT_EQ(model.getValue(), 2);
  EXPECT_EQ(parent.last()->text, DropDownMenuButton::dropDownMenuButtonMsg);
  EXPECT_EQ(parent.last()->sender, t);

  h.click(Harness::centreOf(*b));
  h.click(rowCentre(b->dropDown(), 1));  // refused by the model: the drop-down goes back
  EXPECT_EQ(model.getValue(), 2);
  EXPECT_EQ(b->getSelectedItem(), 2);
}

TEST_F(DropDownFamilyTest, APictureDropDownAndTheImposter) {
  auto* d = new DropDownImageButton({{L"Pin", "pin"}, {L"Gear", "settings"}},
                                    GlobCreationInfo(120, 24, parent.canvas(), 20, 200));
  EXPECT_EQ(d->getSelectedImage(), "pin");
  d->setSelectedItem(L"Gear");
  EXPECT_EQ(d->getSelectedImage(), "settings");
  d->setStrings(std::vector<DropDownImageButton::Item>{{L"Only", ""}});
  EXPECT_EQ(d->getSelectedImage(), "");
  EXPECT_EQ(d->getString(), L"Only");

  auto* imp = new DropDownButtonImposter(L"Mode", "mode", 100, 22, parent.canvas());
  EXPECT_TRUE(imp->getHasDropDownAppearance());
  imp->setHasDropDownAppearance(false);
  imp->setDrawSeparator(true);
  EXPECT_TRUE(imp->getDrawSeparator());
  h.clickOn(*imp);
  EXPECT_EQ(parent.texts(), Texts{"mode"});
}

TEST_F(DropDownFamilyTest, AMenuButtonGroupFitsItsButtonAndTellsItsOwner) {
  auto* g = new MenuButtonGroup(GlobCreationInfo(300, 120, parent.canvas(), 20, 100), L"Mode",
                                {L"Stereo", L"Mono", L"Five point one surround"});
  DropDownMenuButton* b = g->getBtn();
  ASSERT_NE(b, nullptr);
  EXPECT_EQ(g->getNumItems(), 3);
  EXPECT_EQ(g->getSelectedItemNameW(), L"Stereo");
  const int narrow = b->width();
  EXPECT_EQ(narrow, DropDownMenuButton::calcWidth(L"Stereo", *b->labelFont()));

  h.click(Harness::centreOf(*b));
  h.click(rowCentre(b->dropDown(), 2));
  EXPECT_EQ(g->getSelectedItem(), 2);
  EXPECT_GT(b->width(), narrow);
  // The press that opened the list passes through; the choice comes as the group's click.
  EXPECT_EQ(parent.texts(), (Texts{DropDownMenuButton::dropDownMenuButtonClickedMsg,
                                   MenuButtonGroup::buttonClickedMsg}));
  EXPECT_EQ(parent.last()->sender, g);

  g->setAutoSizeButton(false);
  EXPECT_TRUE(g->setSelectedItem(L"Mono"));
  EXPECT_GT(b->width(), narrow);  // kept
  EXPECT_FALSE(g->setSelectedItem(5));
  EXPECT_FALSE(g->setSelectedItem(L"Quad"));
  EXPECT_EQ(g->getSelectedItem(), 1);
}

struct MenuRowDropDown : MenuFixture {};

TEST_F(MenuRowDropDown, AMultiChoiceRowsDropDownChoosesItsOption) {
  owner->addMenuItem(L"Zoom||[Fit] 100% [200%]", "zoom");
  owner->addMenuItem(L"Other", "other");
  Menu* m = openAt(XY<int>(60, 150));
  ASSERT_NE(m, nullptr);
  auto* dd = dynamic_cast<DropDownMenuButton*>(m->widgetForItem(0));
  ASSERT_NE(dd, nullptr);
  EXPECT_EQ(m->findItemFromWidget(dd), 0);
  EXPECT_TRUE(dd->isVisible());
  EXPECT_EQ(dd->getSelectedItem(), 1);
  EXPECT_EQ(dd->getString(), L"100%");

  // The owner changing the choice and a click on the label both move the drop-down too.
  EXPECT_TRUE(owner->setMenuItemChoice(L"Zoom", 2));
  EXPECT_EQ(dd->getSelectedItem(), 2);

  h.click(Harness::centreOf(*dd));
  ASSERT_TRUE(dd->isDropDownValid());
  EXPECT_EQ(owner->openMenu(), m);  // the pop-up stays under its row's list
  h.click(rowCentre(dd->dropDown(), 0));
  EXPECT_EQ(owner->heard, (std::vector<String>{"zoom", Menu::pootMsg_}));
  EXPECT_EQ(owner->menuItems()[0].curOption(), 0u);
  EXPECT_EQ(owner->openMenu(), nullptr);
  EXPECT_EQ(h.root().inputScope(), nullptr);
}

TEST_F(MenuRowDropDown, ARowThatKeepsThePopUpOpenAndRowsScrolledAway) {
  MenuItem stays(L"Mode||a [b]", "mode");
  stays.setFlags(MenuItem::kActive | MenuItem::kStaysOpen);
  owner->addMenuItem(stays);
  for (int i = 0; i < 10; ++i) owner->addMenuItem(L"Row " + std::to_wstring(i), "row");
  Menu* m = openAt(XY<int>(60, 210));
  ASSERT_NE(m, nullptr);
  auto* dd = dynamic_cast<DropDownMenuButton*>(m->widgetForItem(0));
  ASSERT_NE(dd, nullptr);
  h.click(Harness::centreOf(*dd));
  h.click(rowCentre(dd->dropDown(), 1));
  EXPECT_EQ(owner->openMenu(), m);
  EXPECT_EQ(m->getCurrentChoice(L"Mode"), L"b");
  EXPECT_EQ(owner->heard, (std::vector<String>{"mode", Menu::itemSelectedMsg_}));

  m->setMaxVisibleRows(3);
  ASSERT_NE(m->scrollBar(), nullptr);
  EXPECT_TRUE(m->scrollToItem(8));
  EXPECT_FALSE(dd->isVisible());  // its row scrolled away
  EXPECT_TRUE(m->scrollToItem(0));
  EXPECT_TRUE(dd->isVisible());
  EXPECT_FALSE(m->scrollToItem(99));
}

}  // namespace
