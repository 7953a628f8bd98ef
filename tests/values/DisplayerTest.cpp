// The ready-made displayers: text out, text in, allowed characters.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "values/DecibelDisplayer.h"
#include "values/DecimalDisplayer.h"
#include "values/IntegerDisplayer.h"
#include "values/NumberText.h"
#include "values/PercentDisplayer.h"
#include "values/UnitDisplayer.h"

TEST(NumberText, ReadsStrictlyAndSaturates) {
  struct IntCase {
    const wchar_t* text;
    std::optional<int> value;
  };
  const IntCase ints[] = {
      {L"42", 42},
      {L" -7 ", -7},
      {L"+3", 3},
      {L"12 Hz", 12},
      {L"12Hz", 12},
      {L"", {}},
      {L"-", {}},
      {L"1.5", {}},
      {L"12 kHz", {}},
      {L"0x10", {}},
      {L"99999999999", 2147483647},
      {L"-99999999999", -2147483647 - 1},
  };
  for (const IntCase& c : ints) {
    SCOPED_TRACE(testing::Message() << "text '" << Kw::toUtf8(c.text) << "'");
    EXPECT_EQ(NumberText<int>::parse(c.text, L" Hz"), c.value);
  }
  EXPECT_EQ(NumberText<unsigned>::parse(L"-3", L""), 0u);
  EXPECT_EQ(NumberText<unsigned>::parse(L"99999999999", L""), 4294967295u);
  EXPECT_EQ(NumberText<double>::parse(L"-2.50", L""), -2.5);
  EXPECT_EQ(NumberText<double>::parse(L".5", L""), 0.5);
  EXPECT_EQ(NumberText<double>::parse(L"1e3", L""), std::nullopt);
  EXPECT_EQ(NumberText<double>::parse(L"nan", L""), std::nullopt);
  EXPECT_EQ(NumberText<double>::parse(L"1.2.3", L""), std::nullopt);
  EXPECT_EQ(NumberText<float>::parse(std::wstring(60, L'9'), L""),
            std::numeric_limits<float>::infinity());

  EXPECT_EQ(NumberText<double>::format(-0.004, 2, L""), L"0.00");
  EXPECT_EQ(NumberText<double>::format(1.0 / 0.0, 2, L" s"), L"inf s");
  EXPECT_EQ(NumberText<float>::format(2.5f, 99, L"").size(), 19u);  // decimals held to 17
  EXPECT_EQ(NumberText<unsigned>::allowedCharacters(L" fr"), "0123456789 fr");
  EXPECT_EQ(NumberText<double>::allowedCharacters(L"%"), "0123456789-+.%");
}

TEST(Displayers, FormatParseAndRestore) {
  IntegerDisplayer<int> whole;
  EXPECT_EQ(whole.format(-12), L"-12");
  EXPECT_EQ(whole.parse(L"junk"), -12);  // the value last shown
  EXPECT_EQ(whole.getAllowedCharacters(), "0123456789-+");

  DecimalDisplayer<double> dec(3);
  EXPECT_EQ(dec.format(0.25), L"0.250");
  EXPECT_TRUE(std::isnan(dec.parse(L"x")));

  PercentDisplayer<float> pct(1);
  EXPECT_EQ(pct.format(12.5f), L"12.5%");
  EXPECT_EQ(pct.parse(L"40"), 40.0f);
  EXPECT_EQ(pct.parse(L"40%"), 40.0f);

  UnitDisplayer<unsigned> frames(L" fr", 0, 6);
  EXPECT_EQ(frames.format(25), L"25 fr");
  EXPECT_EQ(frames.getMaxNumChars(), 6);

  DecibelDisplayer<double> db(1);
  EXPECT_EQ(db.format(1.0), L"0.0 dB");
  EXPECT_EQ(db.format(0.5), L"-6.0 dB");
  EXPECT_EQ(db.format(0.0), L"-inf dB");
  EXPECT_NEAR(db.parse(L"-6.0206 dB"), 0.5, 1e-6);
  EXPECT_NEAR(db.parse(L"+6"), 1.99526, 1e-5);
  EXPECT_EQ(db.parse(L"-inf"), 0.0);
  EXPECT_TRUE(std::isnan(db.parse(L"loud")));
}
