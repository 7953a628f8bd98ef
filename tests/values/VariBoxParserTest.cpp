// The two parser families driven alone (no box): clamping, stepping at the ends of the range
// and of the type, scaling, text in and out, and what reaches the binding.
#include <cmath>
#include <ios>
#include <limits>

#include "tests/values/ValuesTestSupport.h"
#include "values/DecimalDisplayer.h"
#include "values/IntegerDisplayer.h"
#include "values/VariBoxParserBasic.h"
#include "values/VariBoxParserLog.h"

namespace {

template <typename T>
VariBoxParserLog<T> logParser(T min, T max, double minor, double major, T value, T scale = T{0},
                              int flags = 0, int64_t width = -1, int64_t precision = -1) {
  return VariBoxParserLog<T>(nullptr, min, max, minor, major, value, scale, 0, flags, width,
                             precision);
}

}  // namespace

TEST(VariBoxParserBasic, IntStepsSaturateAtTheTypeAndStopAtTheRange) {
  IntegerDisplayer<int> shown;
  struct Case {
    int min, max, step, value;
    bool up;
    bool changed;
    int result;
  };
  const Case cases[] = {
      {0, 2147483647, 1000, 2147483000, true, true, 2147483647},
      {0, 2147483647, 1000, 2147483647, true, false, 2147483647},  // at max: refused
      {-2147483647 - 1, 0, 2147483647, 0, false, true, -2147483647},
      {-2147483647 - 1, 0, 2147483647, -1, false, true, -2147483647 - 1},
      {0, 100, 30, 90, true, true, 100},  // clamped to max
      {0, 100, 500, 50, false, true, 0},  // a step larger than the range
      {0, 100, 10, 0, false, false, 0},   // at min: refused
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(testing::Message() << c.value << (c.up ? " up " : " down ") << c.step);
    VariBoxParserBasic<int> p(nullptr, &shown, c.min, c.max, c.step, c.step, c.value, 0);
    p.init();
    const WString before = p.getText();
    EXPECT_EQ(c.up ? p.handleMinorInc() : p.handleMinorDec(), c.changed);
    EXPECT_EQ(p.getValue(), c.result);
    if (!c.changed) {
      EXPECT_EQ(p.getText(), before);
    }
  }
}

TEST(VariBoxParserBasic, UnsignedAndFloatingSteps) {
  IntegerDisplayer<unsigned> whole;
  VariBoxParserBasic<unsigned> u(nullptr, &whole, 0, 100, 5, 20, 3, 0);
  u.init();
  EXPECT_TRUE(u.handleMinorDec());
  EXPECT_EQ(u.getValue(), 0u);
  VariBoxParserBasic<unsigned> floor(nullptr, &whole, 2, 100, 5, 20, 3, 0);
  floor.init();
  EXPECT_TRUE(floor.handleMinorDec());
  EXPECT_EQ(floor.getValue(), 2u);  // the target 0 clamps to min

  DecimalDisplayer<double> dec(2);
  const double big = std::numeric_limits<double>::max();
  VariBoxParserBasic<double> d(nullptr, &dec, -big, big, big, big, big / 2, 0);
  d.init();
  EXPECT_TRUE(d.handleMajorInc());
  EXPECT_EQ(d.getValue(), big);
  EXPECT_FALSE(d.handleMajorInc());

  DecimalDisplayer<float> decf(1);
  VariBoxParserBasic<float> f(nullptr, &decf, -1.0f, 1.0f, 0.25f, 0.5f, 0.0f, 0);
  f.init();
  EXPECT_TRUE(f.handleMajorDec());
  EXPECT_EQ(f.getText(), L"-0.5");
}

TEST(VariBoxParserBasic, ScaleMultipliesTheTextAndDividesTheTyping) {
  IntegerDisplayer<int> shown;
  VariBoxParserBasic<int> p(nullptr, &shown, 0, 1000, 1, 10, 5, 100);
  p.init();
  EXPECT_EQ(p.getText(), L"500");
  p.setText(L"250");
  EXPECT_EQ(p.getValue(), 2);
  EXPECT_EQ(p.getText(), L"200");  // the validated text
  p.setText(L"299");
  EXPECT_EQ(p.getValue(), 2);
  EXPECT_EQ(p.getText(), L"200");

  for (int scale : {0, -3}) {  // no scaling: raw values
    VariBoxParserBasic<int> raw(nullptr, &shown, 0, 1000, 1, 10, 5, scale);
    raw.init();
    EXPECT_EQ(raw.getText(), L"5");
  }
}

TEST(VariBoxParserBasic, EveryChangeGoesThroughOnePathWithItsFlags) {
  IntegerDisplayer<int> shown;
  Kw::Ptr<RecordingAdaptor<int>> model(new RecordingAdaptor<int>);
  VariBoxParserBasic<int> p(nullptr, &shown, 0, 100, 1, 10, 500, 0);  // stored unclamped
  p.setDataAdaptor(model);
  EXPECT_EQ(p.getValue(), 500);
  p.init();  // clamps, refreshes the text, publishes nothing
  EXPECT_EQ(p.getValue(), 100);
  EXPECT_EQ(p.getText(), L"100");
  EXPECT_TRUE(model->requests.empty());

  EXPECT_TRUE(p.handleMajorDec());
  ASSERT_EQ(model->requests.size(), 1u);
  EXPECT_EQ(model->requests[0].value, 90);
  EXPECT_EQ(model->requests[0].why, kChangeDirect);  // the type the box last set

  int pushed = 42;
  p.setNewWidgetValue(pushed);  // the model's push is shown but never echoed back
  EXPECT_EQ(p.getValue(), 42);
  EXPECT_EQ(p.getText(), L"42");
  EXPECT_EQ(model->requests.size(), 1u);

  EXPECT_TRUE(p.setValue(7));
  EXPECT_FALSE(p.setValue(7));
  EXPECT_EQ(model->requests.size(), 2u);

  EXPECT_TRUE(p.handleNoChange());  // publishes the same value once more
  EXPECT_EQ(model->requests.back().value, 7);
}

TEST(VariBoxParserBasic, NaNAndInfinitiesHaveDefinedResults) {
  DecimalDisplayer<double> dec(1);
  Kw::Ptr<RecordingAdaptor<double>> model(new RecordingAdaptor<double>);
  const double nan = std::numeric_limits<double>::quiet_NaN();
  const double inf = std::numeric_limits<double>::infinity();
  VariBoxParserBasic<double> p(nullptr, &dec, -10, 10, 1, 2, 3, 0);
  p.setDataAdaptor(model);
  p.init();

  double pushed = nan;
  p.setNewWidgetValue(pushed);
  EXPECT_EQ(p.getValue(), 3.0);
  EXPECT_FALSE(p.setValue(nan));
  pushed = inf;
  p.setNewWidgetValue(pushed);
  EXPECT_EQ(p.getValue(), 10.0);
  p.setText(L"oops");  // unreadable: the displayer gives NaN, the old value and text stay
  EXPECT_EQ(p.getValue(), 10.0);
  EXPECT_EQ(p.getText(), L"10.0");
  EXPECT_TRUE(model->requests.empty());

  VariBoxParserBasic<double> wild(nullptr, &dec, nan, nan, nan, nan, nan, nan);
  wild.init();  // the type's limits, value at min, steps of nothing
  EXPECT_EQ(wild.getValue(), std::numeric_limits<double>::lowest());
  EXPECT_FALSE(wild.handleMajorDec());
  EXPECT_EQ(wild.getPositionWithinRange(), 0.0);

  VariBoxParserBasic<double> point(nullptr, &dec, 4, 4, 1, 1, 9, 0);
  point.init();
  EXPECT_EQ(point.getValue(), 4.0);
  EXPECT_EQ(point.getPositionWithinRange(), 0.0);  // max equal to min
  EXPECT_FALSE(point.handleMajorInc());
}

TEST(VariBoxParserBasic, RefreshChangesNothingWhenTheTextMatches) {
  IntegerDisplayer<int> shown;
  VariBoxParserBasic<int> p(nullptr, &shown, 0, 10, 1, 1, 4, 0);
  p.init();
  EXPECT_EQ(p.getText(), L"4");
  p.setText(L"04");  // same value, other text: put back
  EXPECT_EQ(p.getText(), L"4");
  p.setText(L"4");  // equal to the stored text: nothing happens
  EXPECT_EQ(p.getValue(), 4);

  VariBoxParserBasic<int> copy(p);  // copies share the displayer and every setting
  EXPECT_EQ(copy.getValue(), 4);
  EXPECT_EQ(copy.getText(), L"4");
  EXPECT_TRUE(copy.handleMinorInc());
  EXPECT_EQ(copy.getValue(), 5);
  EXPECT_EQ(p.getValue(), 4);
}

TEST(VariBoxParserLog, CurvePositionsAndSteps) {
  auto p = logParser<int>(0, 1000, 0.01, 0.1, 100);
  p.init();
  EXPECT_NEAR(p.getPositionWithinRange(), std::log10(1.9), 1e-9);
  EXPECT_TRUE(p.setValue(0));
  EXPECT_EQ(p.getPositionWithinRange(), 0.0);
  EXPECT_TRUE(p.setValue(1000));
  EXPECT_EQ(p.getPositionWithinRange(), 1.0);
  EXPECT_FALSE(p.handleMajorInc());  // at max

  auto q = logParser<int>(0, 1000, 0.5, 0.5, 0);
  q.init();
  EXPECT_TRUE(q.handleMajorInc());  // position 0.5
  EXPECT_EQ(q.getValue(), 240);

  auto tiny = logParser<int>(0, 1, 0.01, 0.1, 0);
  tiny.init();
  EXPECT_FALSE(tiny.handleMinorInc());  // the new position maps back to 0
  EXPECT_EQ(tiny.getValue(), 0);

  auto d = logParser<double>(20.0, 20000.0, 0.01, 0.1, 20.0);
  d.init();
  EXPECT_TRUE(d.handleMajorInc());
  EXPECT_NEAR(d.getPositionWithinRange(), 0.1, 1e-9);
  EXPECT_TRUE(d.handleMajorDec());
  EXPECT_NEAR(d.getValue(), 20.0, 1e-9);
  EXPECT_FALSE(d.handleMajorDec());
}

TEST(VariBoxParserLog, AllowedCharactersByRangeTypeAndBase) {
  struct Case {
    int min, max, flags;
    const char* chars;
  };
  const Case cases[] = {
      {0, 10, 0, "0123456789"},
      {-10, 10, 0, "-+0123456789"},
      {-10, 0, 0, "-0123456789"},
      {0, 10, std::ios_base::hex, "0123456789ABCDEF"},
      {0, 10, std::ios_base::oct, "01234567"},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(logParser<int>(c.min, c.max, 0.1, 0.1, 0, 0, c.flags).allowedCharacters(), c.chars);
  }
  EXPECT_EQ(logParser<double>(-1.0, 1.0, 0.1, 0.1, 0.0).allowedCharacters(), "-+.0123456789");
  EXPECT_EQ(logParser<float>(0.f, 1.f, 0.1, 0.1, 0.f).allowedCharacters(), ".0123456789");
  EXPECT_EQ(logParser<unsigned>(0u, 9u, 0.1, 0.1, 0u).allowedCharacters(), "0123456789");
}

TEST(VariBoxParserLog, StreamFormattingAndUnreadableText) {
  auto fixed = logParser<double>(0.0, 100.0, 0.1, 0.1, 2.5, 0.0, std::ios_base::fixed, 7, 2);
  fixed.init();
  EXPECT_EQ(fixed.getText(), L"   2.50");
  auto hex =
      logParser<int>(0, 4096, 0.1, 0.1, 255, 0, std::ios_base::hex | std::ios_base::uppercase);
  hex.init();
  EXPECT_EQ(hex.getText(), L"FF");
  hex.setText(L"FF");  // equal text: nothing
  hex.setText(L"A0");  // read in decimal: unreadable, the old text comes back
  EXPECT_EQ(hex.getValue(), 255);
  EXPECT_EQ(hex.getText(), L"FF");

  Kw::Ptr<RecordingAdaptor<int>> model(new RecordingAdaptor<int>);
  auto p = logParser<int>(0, 1000, 0.1, 0.1, 50, 10);
  p.setDataAdaptor(model);
  p.init();
  EXPECT_EQ(p.getText(), L"500");
  p.setText(L"abc");
  EXPECT_EQ(p.getText(), L"500");
  EXPECT_TRUE(model->requests.empty());
  p.setText(L"129");  // divided by the scale, truncating
  EXPECT_EQ(p.getValue(), 12);
  EXPECT_EQ(p.getText(), L"120");
  ASSERT_EQ(model->requests.size(), 1u);
  p.setText(L"99999999999");  // too large for int: unreadable
  EXPECT_EQ(p.getValue(), 12);

  auto wide = logParser<double>(0.0, 1.0, 0.1, 0.1, 0.5, 0.0, 0, int64_t{1} << 40, 1 << 30);
  wide.init();  // wild widths are held to what a box can show
  EXPECT_LE(wide.getText().size(), 300u);
}
