// The text box's right-click menu: Cut, Copy and Paste, inactive when they cannot apply, and
// chosen entries acting through the box's own messages.
#include <gtest/gtest.h>

#include "menus/Menu.h"
#include "tests/text/TextBoxTestSupport.h"

namespace {

class TextBoxMenu : public TextBoxFixture {
 protected:
  Menu* openOn(TextBox* box) {
    h.click(Harness::centreOf(*box), MouseButton::Right);
    return box->openMenu();
  }
  static std::vector<bool> activeStates(const Menu* m) {
    std::vector<bool> s;
    for (const MenuItem& it : m->items()) s.push_back(it.getActive());
    return s;
  }
  XY<int> rowCentre(const Menu* m, int index) const {
    const Kw::Box<int> a = m->itemArea(index);
    const XY<int> o = m->canvas()->rootOrigin();
    return XY<int>(o.x + (a.x0 + a.x1) / 2, o.y + (a.y0 + a.y1) / 2);
  }
};

TEST_F(TextBoxMenu, OffersCutCopyPasteAsTheyApply) {
  TextBox* box = makeBox();
  Menu* m = openOn(box);
  ASSERT_NE(m, nullptr);
  std::vector<WString> labels;
  for (const MenuItem& it : m->items()) labels.push_back(it.label());
  EXPECT_EQ(labels, (std::vector<WString>{L"Cut", L"Copy", L"Paste"}));
  EXPECT_EQ(activeStates(m), (std::vector<bool>{false, false, false}));  // empty, no clipboard
  box->removeMenu();

  box->setString(L"hello");
  clipboard.setText(L"clip");
  m = openOn(box);
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(activeStates(m), (std::vector<bool>{true, true, true}));
  box->removeMenu();

  box->setEditable(false);
  m = openOn(box);
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(activeStates(m), (std::vector<bool>{false, true, false}));
  box->removeMenu();

  box->setEditable(true);
  box->setObfuscatedDisplay(true);
  m = openOn(box);
  ASSERT_NE(m, nullptr);
  EXPECT_EQ(activeStates(m), (std::vector<bool>{true, false, true}));
}

TEST_F(TextBoxMenu, ChosenEntriesActOnTheText) {
  TextBox* box = focusedBox(L"hello");
  Menu* m = openOn(box);
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 1));  // Copy: no selection, the whole text
  EXPECT_EQ(box->openMenu(), nullptr);
  EXPECT_EQ(clipboard.getText(), L"hello");

  clipboard.setText(L" world");
  m = openOn(box);
  ASSERT_NE(m, nullptr);
  h.click(rowCentre(m, 2));  // Paste
  EXPECT_NE(box->getString().find(L"world"), WString::npos);
}

TEST_F(TextBoxMenu, AnInactiveBoxShowsNoMenu) {
  TextBox* box = makeBox();
  box->setString(L"hello");
  box->setActive(false, true);
  EXPECT_EQ(openOn(box), nullptr);
}

}  // namespace
