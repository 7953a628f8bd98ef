#include "gallery/ZoomStrip.h"

#include <algorithm>
#include <cmath>
#include <cstdio>

#include "gallery/GalleryLook.h"
#include "platform/glib/Painter.h"
#include "values/ScrollBar.h"

namespace {
constexpr double kPanStep = 0.05;
constexpr double kZoomStep = 0.8;
constexpr double kNarrowest = 0.02;
}  // namespace

ZoomStrip::ZoomStrip(const GlobCreationInfo& info) : Glob(info) {
  ScrollBarInitArgs args(GlobCreationInfo(width(), 0, canvas(), 0, 0), kHorizontal);
  args.resizableThumb = true;
  bar_ = new ScrollBar(args);
  bar_->set_name("zoom bar");
  bar_->setThumbSize(0.4);
  bar_->setThumbPos(0.3);
}

void ZoomStrip::zoom(double factor) {
  const double size = bar_->getThumbSize();
  const double centre = bar_->getThumbPos() + size / 2.0;
  const double wanted = std::clamp(size * factor, kNarrowest, 1.0);
  bar_->setThumbSize(wanted);
  bar_->setThumbPos(centre - wanted / 2.0);
}

int ZoomStrip::react(Event* e) {
  if (message_event(e) && ScrollBar::isScrollBarMsg(e->text())) {
    const String& m = e->text();
    if (m == ScrollBar::leftButtonPressedMsg) bar_->setThumbPosDelta(-kPanStep);
    if (m == ScrollBar::rightButtonPressedMsg) bar_->setThumbPosDelta(kPanStep);
    if (m == ScrollBar::upButtonPressedMsg) zoom(kZoomStep);
    if (m == ScrollBar::downButtonPressedMsg) zoom(1.0 / kZoomStep);
    update();
    if (Glob* page = parent()) send_msg(page, m.c_str());
    return 1;
  }
  if (mouse_wheel_event(e)) return bar_->react(e);
  return Glob::react(e);
}

String ZoomStrip::describeValue() const {
  char text[64];
  const double from = bar_->getThumbPos() * kSpanSeconds;
  const double to = (bar_->getThumbPos() + bar_->getThumbSize()) * kSpanSeconds;
  std::snprintf(text, sizeof text, "%.1f s to %.1f s", from, to);
  return text;
}

void ZoomStrip::draw() {
  Glib::Painter p(*canvas());
  const GalleryLook look(getPalette());
  const int barH = ScrollBar::thickness();
  const Kw::Box<int> ruler(0, barH + 4, width(), height());
  look.well(p, ruler, look.role(Palette::Base));
  const double from = bar_->getThumbPos() * kSpanSeconds;
  const double span = std::max(1e-9, bar_->getThumbSize() * kSpanSeconds);
  // A tick per second where they fit, else per 5 or 10 seconds; every other one is labelled.
  const double step = span <= 12 ? 1.0 : (span <= 50 ? 5.0 : 10.0);
  const double px = (width() - 2) / span;
  for (double t = std::ceil(from / step) * step; t <= from + span; t += step) {
    const int x = 1 + static_cast<int>(std::lround((t - from) * px));
    const bool major = std::fmod(t, step * 2.0) < 1e-9;
    p.fillRect(Kw::Box<int>(x, ruler.y1 - (major ? 12 : 6), x + 1, ruler.y1 - 1), look.line());
    if (major) {
      look.label(p, std::to_string(static_cast<int>(t)) + " s",
                 Kw::Box<int>(x + 3, ruler.y0 + 2, x + 60, ruler.y0 + 20), GalleryLook::Font::Small,
                 look.role(Palette::Text));
    }
  }
  look.label(p, describeValue(),
             Kw::Box<int>(ruler.x1 - 130, ruler.y0 + 2, ruler.x1 - 6, ruler.y0 + 20),
             GalleryLook::Font::Small, look.dimText(), TextAlignment::Right);
}
