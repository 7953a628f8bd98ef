// The saturating linear steps of every parser type, and the curve of the logarithmic parsers.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "values/ParserArithmetic.h"

namespace {

template <typename T>
struct StepCase {
  T value;
  T step;
  T up;
  T down;
};

template <typename T>
void checkSteps(const std::vector<StepCase<T>>& cases) {
  for (const StepCase<T>& c : cases) {
    SCOPED_TRACE(testing::Message() << "value " << c.value << " step " << c.step);
    EXPECT_EQ(ParserArithmetic<T>::up(c.value, c.step), c.up);
    EXPECT_EQ(ParserArithmetic<T>::down(c.value, c.step), c.down);
  }
}

constexpr int kIntMax = std::numeric_limits<int>::max();
constexpr int kIntMin = std::numeric_limits<int>::min();
constexpr unsigned kUMax = std::numeric_limits<unsigned>::max();
constexpr double kDMax = std::numeric_limits<double>::max();
constexpr float kFMax = std::numeric_limits<float>::max();

}  // namespace

TEST(ParserArithmetic, SaturatingStepsOfEveryType) {
  checkSteps<int>({
      {2147483000, 1000, kIntMax, 2147482000},  // up saturates from a positive value
      {0, kIntMax, kIntMax, -2147483647},       // from 0 up is plain; down just fits
      {-1, kIntMax, kIntMax - 1, kIntMin},      // down saturates at or below zero
      {5, 3, 8, 2},
      {-2147483000, 1000, -2147482000, kIntMin},
      {1, kIntMax, kIntMax, 1 - kIntMax},         // down from a positive value never saturates
      {kIntMin + 5, -10, kIntMin, kIntMin + 15},  // a negative step cannot overflow
      {kIntMax - 5, -10, kIntMax - 15, kIntMax},
  });
  checkSteps<unsigned>({
      {3, 5, 8, 0},
      {4294967290u, 10, kUMax, 4294967280u},
      {0, kUMax, kUMax, 0},  // up from 0 is plain, and lands on the largest
      {5, 5, 10, 0},
      {1, 4294967294u, kUMax, 0},
  });
  checkSteps<double>({
      {1.0, 0.5, 1.5, 0.5},
      {kDMax / 2, kDMax, kDMax, kDMax / 2 - kDMax},  // down from a positive value is plain
      {-kDMax / 2, kDMax, kDMax / 2, -kDMax},
      {0.0, std::numeric_limits<double>::infinity(), std::numeric_limits<double>::infinity(),
       -kDMax},
  });
  checkSteps<float>({
      {1.0f, 0.25f, 1.25f, 0.75f},
      {kFMax / 2, kFMax, kFMax, kFMax / 2 - kFMax},
      {-kFMax / 2, kFMax, kFMax / 2, -kFMax},
  });
}

TEST(ParserArithmetic, ClampScaleAndLimits) {
  EXPECT_EQ(ParserArithmetic<int>::clamp(50, 0, 10), 10);
  EXPECT_EQ(ParserArithmetic<int>::clamp(-5, 0, 10), 0);
  EXPECT_EQ(ParserArithmetic<int>::clamp(5, 10, 0), 10);  // min above max: min wins
  EXPECT_EQ(ParserArithmetic<double>::clamp(-std::numeric_limits<double>::infinity(), -1, 1), -1.0);
  EXPECT_EQ(ParserArithmetic<float>::lowest(), -3.4028234663852886e38f);
  EXPECT_EQ(ParserArithmetic<double>::lowest(), -1.7976931348623157e308);
  EXPECT_EQ(ParserArithmetic<unsigned>::largest(), 4294967295u);

  EXPECT_EQ(ParserArithmetic<int>::scaleUp(5, 100), 500);
  EXPECT_EQ(ParserArithmetic<int>::scaleUp(kIntMax, 2), -2);  // wraps, as int does
  EXPECT_EQ(ParserArithmetic<int>::scaleDown(299, 100), 2);
  EXPECT_EQ(ParserArithmetic<int>::scaleDown(-299, 100), -2);  // toward zero
  EXPECT_EQ(ParserArithmetic<unsigned>::scaleDown(299, 100), 2u);
}

TEST(ParserArithmetic, PositionsOnBothCurves) {
  using D = ParserArithmetic<double>;
  EXPECT_DOUBLE_EQ(D::linearPosition(25, 0, 100), 0.25);
  EXPECT_DOUBLE_EQ(D::linearPosition(150, 0, 100), 1.5);  // linear positions are not clamped
  EXPECT_EQ(D::linearPosition(5, 5, 5), 0.0);             // an empty range: no division
  EXPECT_EQ(D::linearPosition(5, 10, 0), 0.0);
  EXPECT_EQ(D::linearPosition(0, -kDMax, kDMax), 0.0);  // a span beyond double

  EXPECT_EQ(D::logPosition(0, 0, 1000), 0.0);
  EXPECT_EQ(D::logPosition(1000, 0, 1000), 1.0);
  EXPECT_NEAR(D::logPosition(100, 0, 1000), std::log10(1.9), 1e-12);
  EXPECT_EQ(D::logPosition(-500, 0, 1000), 0.0);  // clamped below
  EXPECT_EQ(D::logPosition(5000, 0, 1000), 1.0);  // and above
  EXPECT_EQ(D::logPosition(3, 3, 3), 0.0);

  EXPECT_NEAR(D::valueAtLogPosition(0.5, 0, 1000), 240.2530733, 1e-6);
  EXPECT_EQ(ParserArithmetic<int>::valueAtLogPosition(0.5, 0, 1000), 240);
  EXPECT_EQ(ParserArithmetic<int>::valueAtLogPosition(0.5, -1000, 0), -759);  // toward zero
  EXPECT_EQ(ParserArithmetic<unsigned>::valueAtLogPosition(0.5, 0, 1000), 240u);
  EXPECT_EQ(ParserArithmetic<unsigned>::valueAtLogPosition(0.52, 0, 1000), 257u);  // nearest
  EXPECT_EQ(ParserArithmetic<int>::valueAtLogPosition(7.0, 0, 10), 10);
  EXPECT_EQ(ParserArithmetic<int>::valueAtLogPosition(-1.0, 0, 10), 0);
  EXPECT_EQ(ParserArithmetic<int>::valueAtLogPosition(std::nan(""), 0, 10), 0);
  EXPECT_EQ(D::valueAtLogPosition(1.0, -kDMax, kDMax), kDMax);  // no overflow to NaN
}
