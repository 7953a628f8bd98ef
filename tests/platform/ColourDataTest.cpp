#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "platform/misc/ColourData.h"

TEST(ColourData, ConvertsBetweenSpacesAndBack) {
  struct Case {
    double r, g, b;
    int space;
    double c1, c2, c3;
  };
  const Case cases[] = {
      {1, 0, 0, ColourSpaceHSV, 0.0, 1.0, 1.0},
      {0, 1, 0, ColourSpaceHSV, 1.0 / 3, 1.0, 1.0},
      {0, 0, 1, ColourSpaceHSV, 2.0 / 3, 1.0, 1.0},
      {1, 0, 1, ColourSpaceHSV, 5.0 / 6, 1.0, 1.0},
      {0.5, 0.5, 0.5, ColourSpaceHSV, 0.0, 0.0, 0.5},
      {1, 1, 1, ColourSpaceYCbCr, 1.0, 0.0, 0.0},
      {0, 0, 1, ColourSpaceYCbCr, 0.0722, 0.5, -0.0722 / 1.5748},
      {1, 0, 0, ColourSpaceYCbCr, 0.2126, -0.2126 / 1.8556, 0.5},
  };
  for (const Case& c : cases) {
    ColourData d(c.r, c.g, c.b, 0.25);
    ASSERT_TRUE(d.setColourSpace(c.space));
    EXPECT_EQ(d.getColourSpace(), c.space);
    EXPECT_NEAR(d.getComp1(), c.c1, 1e-9) << c.r << c.g << c.b << " in " << c.space;
    EXPECT_NEAR(d.getComp2(), c.c2, 1e-9);
    EXPECT_NEAR(d.getComp3(), c.c3, 1e-9);
    EXPECT_DOUBLE_EQ(d.getAlpha(), 0.25);
    ASSERT_TRUE(d.setColourSpace(ColourSpaceRGB));
    EXPECT_EQ(d, ColourData(c.r, c.g, c.b, 0.25));
  }
}

TEST(ColourData, RefusesBadComponentsAndSpaces) {
  ColourData d(0.2, 0.4, 0.6);
  const ColourData before = d;
  EXPECT_FALSE(d.setComp1(std::nan("")));
  EXPECT_FALSE(d.setComp2(std::numeric_limits<double>::infinity()));
  EXPECT_FALSE(d.setComp3(1.0001));
  EXPECT_FALSE(d.setAlpha(-0.1));
  EXPECT_FALSE(d.setComp(4, 0.5));
  EXPECT_FALSE(d.setColourSpace(3));
  EXPECT_FALSE(d.setColourSpace(-1));
  EXPECT_EQ(d, before);
  EXPECT_EQ(d.getComp(7), 0.0);

  // Negative chroma is in range in Y'CbCr only.
  d.setColourSpace(ColourSpaceYCbCr);
  EXPECT_TRUE(d.setComp2(-0.5));
  EXPECT_FALSE(d.setComp2(-0.51));

  // A bad constructor argument leaves opaque black.
  EXPECT_EQ(ColourData(2.0, 0, 0), ColourData());
  EXPECT_EQ(ColourData(0.5, 0.5, 0.5, 1.0, static_cast<ColourSpace>(9)), ColourData());
}

TEST(ColourData, YCbCrOutsideTheCubeClampsOnTheWayBack) {
  ColourData d(0.0, -0.5, 0.5, 1.0, ColourSpaceYCbCr);  // no RGB colour has this
  d.setColourSpace(ColourSpaceRGB);
  for (int i = 0; i < 3; ++i) {
    EXPECT_GE(d.getComp(i), 0.0);
    EXPECT_LE(d.getComp(i), 1.0);
  }
}
