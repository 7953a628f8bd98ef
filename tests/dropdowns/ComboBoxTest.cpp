// The combo box through the screen: typed text against the choices, numeric entry with its
// characters, bounds and wheel, choice stepping, the suffix, and the titled form.
#include <gtest/gtest.h>

#include "dropdowns/ComboBox.h"
#include "dropdowns/ComboNumber.h"
#include "dropdowns/TitledComboBox.h"
#include "foundation/TabOrderManager.h"
#include "platform/glob/KeyCodes.h"
#include "platform/glob/RootGlob.h"
#include "tests/dropdowns/DropDownTestSupport.h"

namespace {

struct ComboBoxTest : DropDownFixture {
  ComboBox* makeCombo(std::vector<WString> choices) {
    return new ComboBox(L"", choices, GlobCreationInfo(160, 24, parent.canvas(), 20, 200));
  }
  // Gives the text box the focus, replaces its text by typing, and presses Return.
  void typeInto(ComboBox* c, const WString& text) {
    h.click(Harness::centreOf(*c->textBox()));  // takes the focus, which selects everything
    h.type(text);
    h.key(kKeyReturn);
    h.pump();  // Return reaches the owner through the queue
  }
};

TEST(ComboNumber, CharactersParsingClampingAndStepping) {
  EXPECT_EQ(ComboNumber::characters(-10, false), L"0123456789-");
  EXPECT_EQ(ComboNumber::characters(0, true), L"0123456789.");
  struct Case {
    const wchar_t* text;
    bool decimals;
    std::optional<double> value;
  };
  const Case cases[] = {
      {L"12", false, 12.0}, {L"-3", false, -3.0}, {L"2.5", true, 2.5}, {L"2.5", false, {}},
      {L"", false, {}},     {L"-", false, {}},    {L"1-2", false, {}}, {L"1.2.3", true, {}},
      {L".5", true, 0.5},   {L"abc", false, {}},
  };
  for (const Case& c : cases) EXPECT_EQ(ComboNumber::parse(c.text, c.decimals), c.value) << c.text;
  EXPECT_EQ(ComboNumber::toInt(1e30), INT_MAX);
  EXPECT_EQ(ComboNumber::toInt(-2.7), -2);
  EXPECT_EQ(ComboNumber::clamp(50, -10, 10), 10);
  EXPECT_EQ(ComboNumber::clamp(50, 3, 3), 50);       // equal bounds: none
  EXPECT_EQ(ComboNumber::step(10, 0, -10, 10), 10);  // at the maximum
  EXPECT_EQ(ComboNumber::step(10, 1, -10, 10), 9);
  EXPECT_EQ(ComboNumber::step(10, 0, 5, 5), 11);
  EXPECT_EQ(ComboNumber::step(INT_MAX, 0, 0, 0), INT_MAX);
  EXPECT_EQ(ComboNumber::format(12.0), L"12");
  EXPECT_EQ(ComboNumber::format(2.5), L"2.5");
}

TEST_F(ComboBoxTest, TypedTextSelectsAMatchingChoiceOrIsACustomValue) {
  ComboBox* c = makeCombo({L"Small", L"Medium", L"Large"});
  ASSERT_NE(c->textBox(), nullptr);
  EXPECT_EQ(c->getString(), L"Small");
  EXPECT_LE(c->textBox()->width(), c->width() - ComboBox::kButtonRoom);
  EXPECT_FALSE(c->isSelectedCustom());

  typeInto(c, L"Large");
  EXPECT_EQ(c->getSelectedItem(), 2);
  EXPECT_FALSE(c->isSelectedCustom());
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 1);
  EXPECT_EQ(parent.last()->sender, c);

  typeInto(c, L"Huge");
  EXPECT_EQ(c->getString(), L"Huge");
  EXPECT_TRUE(c->isSelectedCustom());
  EXPECT_EQ(c->getSelectedItem(), 2);  // the selection stays
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 2);

  // A choice from the list puts its text in the box.
  h.click(XY<int>(c->canvas()->rootRect().x1 - 6, Harness::centreOf(*c).y));
  ASSERT_TRUE(c->isDropDownValid());
  h.click(rowCentre(c->dropDown(), 1));
  EXPECT_EQ(c->getString(), L"Medium");
  EXPECT_FALSE(c->isSelectedCustom());
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 3);
}

TEST_F(ComboBoxTest, NumericEntryTakesOnlyNumbersAndClampsThem) {
  ComboBox* c = makeCombo({});
  c->setNumericEntry(true, -10, 10, false);
  c->setString(L"5");
  h.click(Harness::centreOf(*c->textBox()));
  h.type(L"-3.x7");
  EXPECT_EQ(c->getString(), L"-37");  // "." and "x" are refused
  h.key(kKeyReturn);
  h.pump();
  EXPECT_EQ(c->getString(), L"-10");  // beyond the range: clamped
  EXPECT_EQ(c->getAsInt(), -10);

  typeInto(c, L"-");  // no number: the last value comes back
  EXPECT_EQ(c->getString(), L"-10");

  c->setNumericEntry(true, 0, 100, true);
  typeInto(c, L"2.5");
  EXPECT_EQ(c->getString(), L"2.5");
  EXPECT_DOUBLE_EQ(c->getAsFloat(), 2.5);
  EXPECT_EQ(c->getAsInt(), 2);
}

TEST_F(ComboBoxTest, TheWheelStepsTheNumberWithinItsBoundsOrTheChoices) {
  ComboBox* c = makeCombo({});
  c->setNumericEntry(true, -10, 10);
  c->setString(L"9");
  const XY<int> at = Harness::centreOf(*c);
  h.wheel(at, -1);  // a delta below 1 raises it
  EXPECT_EQ(c->getString(), L"10");
  parent.clear();
  h.wheel(at, -1);  // at the maximum: unchanged and untouched
  EXPECT_EQ(c->getString(), L"10");
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 0);
  h.wheel(at, 1);
  EXPECT_EQ(c->getString(), L"9");
  EXPECT_EQ(parent.count(DropDownMenuButton::dropDownMenuButtonMsg), 1);

  c->setNumericEntry(true, 4, 4);  // equal bounds: none
  c->setString(L"4");
  h.wheel(at, -1);
  h.wheel(at, -1);
  EXPECT_EQ(c->getString(), L"6");

  ComboBox* d = makeCombo({L"A", L"B", L"C"});
  d->reshape_canvas(20, 100, 160, 24);
  const XY<int> dat = Harness::centreOf(*d);
  h.wheel(dat, 1);  // at the first choice, towards the previous: nothing
  EXPECT_EQ(d->getSelectedItem(), 0);
  h.wheel(dat, -1);
  EXPECT_EQ(d->getSelectedItem(), 1);
  EXPECT_EQ(d->getString(), L"B");
  h.wheel(dat, -1);
  h.wheel(dat, -1);  // past the last: nothing
  EXPECT_EQ(d->getSelectedItem(), 2);
}

TEST_F(ComboBoxTest, TheSuffixNarrowsTheTextAndTheTitledFormPassesThrough) {
  ComboBox* c = makeCombo({});
  const int plain = c->textBox()->width();
  c->setSuffix(L" dB");
  EXPECT_LT(c->textBox()->width(), plain);
  EXPECT_EQ(c->textBox()->getAlignment(), TextAlignment::Right);

  TitledComboBoxInitArgs a;
  a.info = GlobCreationInfo(240, 24, parent.canvas(), 20, 100);
  a.title = L"Rate";
  a.choices = {L"44100", L"48000"};
  auto* t = new TitledComboBox(a);
  ComboBox* inner = t->getComboBox();
  ASSERT_NE(inner, nullptr);
  EXPECT_EQ(inner->canvas()->rect().x0,
            Glib::fonts().standard()->textWidth(L"Rate") + TitledComboBox::separator_);
  EXPECT_TRUE(t->isResponsibleFor(inner));
  EXPECT_TRUE(t->isResponsibleFor(inner->textBox()));
  EXPECT_FALSE(t->isResponsibleFor(c));
  t->setNumericEntry(true, 0, 96000);
  EXPECT_EQ(t->getAsInt(), 44100);
  parent.clear();
  h.wheel(Harness::centreOf(*inner), 1);
  EXPECT_EQ(t->getString(), L"44099");
  EXPECT_EQ(parent.texts(), Texts{DropDownMenuButton::dropDownMenuButtonMsg});
  EXPECT_EQ(parent.last()->sender, t);  // as the titled control's own
  t->setActive(false, true);
  EXPECT_FALSE(inner->isActive());
  EXPECT_FALSE(inner->textBox()->isActive());
}

TEST_F(ComboBoxTest, InATabOrderItStandsForItsTextBox) {
  ComboBox* c = makeCombo({L"A", L"B"});
  TabOrderManager tabs(false);
  ASSERT_TRUE(tabs.addTabStop(*c, 0xFFFFFFFE));
  tabs.setTabStopFocus(0u);
  EXPECT_TRUE(c->textBox()->hasKbdFocus());
  tabs.setTabStopFocus(0xFFFFFFFFu);
  EXPECT_FALSE(c->textBox()->hasKbdFocus());
  EXPECT_TRUE(parent.hasKbdFocus());
}

}  // namespace
