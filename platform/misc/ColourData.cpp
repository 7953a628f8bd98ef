#include "platform/misc/ColourData.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr double kKr = 0.2126;
constexpr double kKg = 0.7152;
constexpr double kKb = 0.0722;
constexpr double kCbScale = 2.0 * (1.0 - kKb);  // 1.8556
constexpr double kCrScale = 2.0 * (1.0 - kKr);  // 1.5748

struct Triple {
  double a, b, c;
};

double clamp01(double v) {
  return std::clamp(v, 0.0, 1.0);
}

Triple hsvToRgb(Triple hsv) {
  const double h = hsv.a >= 1.0 ? 0.0 : hsv.a * 6.0;
  const double s = hsv.b;
  const double v = hsv.c;
  if (s <= 0.0) return {v, v, v};
  const int sector = static_cast<int>(std::floor(h));
  const double f = h - sector;
  const double p = v * (1.0 - s);
  const double q = v * (1.0 - s * f);
  const double t = v * (1.0 - s * (1.0 - f));
  switch (sector) {
    case 0:
      return {v, t, p};
    case 1:
      return {q, v, p};
    case 2:
      return {p, v, t};
    case 3:
      return {p, q, v};
    case 4:
      return {t, p, v};
    default:
      return {v, p, q};
  }
}

Triple rgbToHsv(Triple rgb) {
  const double mx = std::max({rgb.a, rgb.b, rgb.c});
  const double mn = std::min({rgb.a, rgb.b, rgb.c});
  const double d = mx - mn;
  double h = 0.0;
  if (d > 0.0) {
    if (mx == rgb.a) {
      h = std::fmod((rgb.b - rgb.c) / d, 6.0);
    } else if (mx == rgb.b) {
      h = (rgb.c - rgb.a) / d + 2.0;
    } else {
      h = (rgb.a - rgb.b) / d + 4.0;
    }
    h /= 6.0;
    if (h < 0.0) h += 1.0;
  }
  return {h, mx > 0.0 ? d / mx : 0.0, mx};
}

Triple rgbToYcc(Triple rgb) {
  // Clamped so that rounding never leaves a component outside its range.
  const double y = clamp01(kKr * rgb.a + kKg * rgb.b + kKb * rgb.c);
  return {y, std::clamp((rgb.c - y) / kCbScale, -0.5, 0.5),
          std::clamp((rgb.a - y) / kCrScale, -0.5, 0.5)};
}

Triple yccToRgb(Triple ycc) {
  const double r = ycc.a + kCrScale * ycc.c;
  const double b = ycc.a + kCbScale * ycc.b;
  const double g = (ycc.a - kKr * r - kKb * b) / kKg;
  return {clamp01(r), clamp01(g), clamp01(b)};
}

Triple toRgb(ColourSpace space, Triple t) {
  switch (space) {
    case ColourSpaceHSV:
      return hsvToRgb(t);
    case ColourSpaceYCbCr:
      return yccToRgb(t);
    default:
      return t;
  }
}

Triple fromRgb(ColourSpace space, Triple rgb) {
  switch (space) {
    case ColourSpaceHSV:
      return rgbToHsv(rgb);
    case ColourSpaceYCbCr:
      return rgbToYcc(rgb);
    default:
      return rgb;
  }
}

}  // namespace

ColourData::ColourData(double c1, double c2, double c3, double alpha, ColourSpace space) {
  if (!isValidSpace(space)) return;
  ColourData probe;
  probe.space_ = space;
  if (probe.setComp(0, c1) && probe.setComp(1, c2) && probe.setComp(2, c3) &&
      probe.setComp(3, alpha)) {
    *this = probe;
  }
}

double ColourData::compMin(ColourSpace space, int index) {
  if (index < 0 || index > 3) return 0.0;
  return space == ColourSpaceYCbCr && (index == 1 || index == 2) ? -0.5 : 0.0;
}

double ColourData::compMax(ColourSpace space, int index) {
  if (index < 0 || index > 3) return 0.0;
  return space == ColourSpaceYCbCr && (index == 1 || index == 2) ? 0.5 : 1.0;
}

bool ColourData::setColourSpace(int space) {
  if (!isValidSpace(space)) return false;
  const ColourSpace to = static_cast<ColourSpace>(space);
  if (to == space_) return true;
  const Triple rgb = toRgb(space_, {c_[0], c_[1], c_[2]});
  const Triple out = fromRgb(to, rgb);
  c_[0] = out.a;
  c_[1] = out.b;
  c_[2] = out.c;
  space_ = to;
  return true;
}

double ColourData::getComp(int index) const {
  if (index >= 0 && index < 3) return c_[index];
  return index == 3 ? alpha_ : 0.0;
}

bool ColourData::setComp(int index, double value) {
  if (index < 0 || index > 3 || !std::isfinite(value)) return false;
  if (value < compMin(space_, index) || value > compMax(space_, index)) return false;
  if (index == 3) {
    alpha_ = value;
  } else {
    c_[index] = value;
  }
  return true;
}

bool ColourData::operator==(const ColourData& o) const {
  if (space_ != o.space_) return false;
  for (int i = 0; i < 4; ++i) {
    if (std::fabs(getComp(i) - o.getComp(i)) > 1e-6) return false;
  }
  return true;
}
