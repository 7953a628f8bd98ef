#include "panels/StandardTabPage.h"

#include <cmath>

StandardTabPage::StandardTabPage(const GlobCreationInfo& info, bool taggable)
    : StandardPanel(info), taggable_(taggable) {}

void StandardTabPage::resize(double fx, double fy) {
  if (!(fx > 0.0) || !(fy > 0.0) || !std::isfinite(fx) || !std::isfinite(fy)) return;
  const Kw::Box<int> r = canvas()->rect();
  const int w = static_cast<int>(std::lround(r.width() * fx));
  const int h = static_cast<int>(std::lround(r.height() * fy));
  // The top edge stays where it is.
  if (w != r.width() || h != r.height()) reshape_canvas(r.x0, r.y1 - h, w, h);
  recalculateWidgetPositions();
}
