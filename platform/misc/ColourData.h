#pragma once
// A colour as three components and an alpha in one of a few colour spaces. Components are
// doubles; converting between spaces goes through RGB.
//
//   space             comp1          comp2           comp3           shown as
//   0 ColourSpaceRGB   red 0..1       green 0..1      blue 0..1       integers 0..255
//   1 ColourSpaceHSV   hue 0..1       saturation 0..1 value 0..1      integers 0..255
//   2 ColourSpaceYCbCr luma 0..1      Cb -0.5..0.5    Cr -0.5..0.5    decimals ("%.3lf")
//
// Alpha is 0..1 in every space. Y'CbCr uses the HD-video weights (0.2126, 0.7152, 0.0722);
// its Cb/Cr can go negative, which is why it is shown in decimals rather than as 0..255.
// Converting a Y'CbCr triple that lies outside the RGB cube clamps the RGB result.
// Setters refuse (return false, keep the value) NaN, infinities and values outside the range.
enum ColourSpace : int {
  ColourSpaceRGB = 0,
  ColourSpaceHSV = 1,
  ColourSpaceYCbCr = 2,
};

class ColourData {
 public:
  ColourData() = default;
  // Components out of range or non-finite leave the colour opaque black in RGB.
  ColourData(double c1, double c2, double c3, double alpha = 1.0,
             ColourSpace space = ColourSpaceRGB);

  static bool isValidSpace(int space) {
    return space >= ColourSpaceRGB && space <= ColourSpaceYCbCr;
  }
  // The space whose components are shown as decimals rather than 0..255 integers.
  static bool isDecimalSpace(int space) { return space == ColourSpaceYCbCr; }
  // Range of component 0..2 (comp1..comp3) or 3 (alpha) in `space`; 0..0 for a bad index.
  static double compMin(ColourSpace space, int index);
  static double compMax(ColourSpace space, int index);

  ColourSpace getColourSpace() const { return space_; }
  // Converts the components into `space`. Refused (false) for an unknown space.
  bool setColourSpace(int space);

  double getComp1() const { return c_[0]; }
  double getComp2() const { return c_[1]; }
  double getComp3() const { return c_[2]; }
  double getAlpha() const { return alpha_; }
  bool setComp1(double v) { return setComp(0, v); }
  bool setComp2(double v) { return setComp(1, v); }
  bool setComp3(double v) { return setComp(2, v); }
  bool setAlpha(double v) { return setComp(3, v); }

  // Component by index: 0..2 the colour components, 3 alpha. A bad index reads 0.0 and is
  // refused for writing.
  double getComp(int index) const;
  bool setComp(int index, double value);

  // Same space and every component within 1e-6.
  bool operator==(const ColourData& o) const;

 private:
  ColourSpace space_ = ColourSpaceRGB;
  double c_[3] = {0.0, 0.0, 0.0};
  double alpha_ = 1.0;
};
