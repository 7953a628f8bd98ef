#include "platform/glib/UiScale.h"

#include <cmath>

#include "platform/glob/Canvas.h"
#include "platform/misc/Diagnostics.h"

namespace Glib {

namespace {
double gFactor = 1.0;
}

double UiScale::factor() {
  return gFactor;
}

bool UiScale::setFactor(double factor) {
  if (!(factor >= 0.5 && factor <= 4.0)) {
    diagWarning("UiScale: scale outside 0.5..4 refused\n");
    return false;
  }
  gFactor = factor;
  return true;
}

}  // namespace Glib

void glib_rescalecanvas(Canvas* canvas) {
  const double f = Glib::UiScale::factor();
  if (!canvas || f == 1.0) return;
  const Kw::Box<int>& r = canvas->rect();
  auto s = [f](int v) { return static_cast<int>(std::lround(v * f)); };
  canvas->reshape(Kw::Box<int>(s(r.x0), s(r.y0), s(r.x1), s(r.y1)));
}
