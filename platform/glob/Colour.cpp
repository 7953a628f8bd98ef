#include "platform/glob/Colour.h"

#include <algorithm>
#include <cmath>

namespace {
double clamp01(double v) {
  return std::isnan(v) ? 0.0 : std::clamp(v, 0.0, 1.0);
}
}  // namespace

bool Colour::operator==(const Colour& o) const {
  constexpr double eps = 1e-6;
  return std::fabs(r - o.r) < eps && std::fabs(g - o.g) < eps && std::fabs(b - o.b) < eps &&
         std::fabs(a - o.a) < eps;
}

Colour scale(const Colour& c, double factor) {
  return Colour(clamp01(c.r * factor), clamp01(c.g * factor), clamp01(c.b * factor), c.a);
}

Colour mix(const Colour& a, const Colour& b, double t) {
  t = clamp01(t);
  return Colour(a.r + (b.r - a.r) * t, a.g + (b.g - a.g) * t, a.b + (b.b - a.b) * t,
                a.a + (b.a - a.a) * t);
}
