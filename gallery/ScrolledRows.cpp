#include "gallery/ScrolledRows.h"

#include <algorithm>
#include <cmath>

#include "gallery/GalleryLook.h"
#include "platform/glib/Painter.h"
#include "values/ScrollBar.h"

ScrolledRows::ScrolledRows(const GlobCreationInfo& info, int rows) : Glob(info), rows_(rows) {
  ScrollBarInitArgs args(
      GlobCreationInfo(0, height(), canvas(), width() - ScrollBar::thickness(), 0), kVertical);
  bar_ = new ScrollBar(args);
  bar_->set_name("rows scroll bar");
  bar_->setThumbSize(std::min(1.0, static_cast<double>(visibleRows()) / std::max(1, rows_)));
  showFrom(0);
}

void ScrolledRows::showFrom(int first) {
  first_ = std::clamp(first, 0, std::max(0, rows_ - visibleRows()));
  bar_->setThumbPos(static_cast<double>(first_) / std::max(1, rows_));
  update();
}

int ScrolledRows::react(Event* e) {
  if (message_event(e) && ScrollBar::isScrollBarMsg(e->text())) {
    const String& m = e->text();
    if (m == ScrollBar::upButtonPressedMsg) {
      showFrom(first_ - 1);
    } else if (m == ScrollBar::downButtonPressedMsg) {
      showFrom(first_ + 1);
    } else if (m == ScrollBar::thumbMovedMsg || m == ScrollBar::thumbReleasedMsg) {
      showFrom(static_cast<int>(std::lround(bar_->getThumbPos() * rows_)));
    }
    if (Glob* page = parent()) send_msg(page, m.c_str());
    return 1;
  }
  if (mouse_wheel_event(e)) return bar_->react(e);
  return Glob::react(e);
}

void ScrolledRows::draw() {
  Glib::Painter p(*canvas());
  const GalleryLook look(getPalette());
  const int w = width() - ScrollBar::thickness();
  look.well(p, Kw::Box<int>(0, 0, w, height()), look.role(Palette::Base));
  for (int i = 0; i < visibleRows() && first_ + i < rows_; ++i) {
    const int top = height() - i * kRowHeight;
    const Kw::Box<int> row(1, top - kRowHeight, w - 1, top - 1);
    if ((first_ + i) % 2 == 1) p.fillRect(row, look.hover());
    look.label(p, "  Track " + std::to_string(first_ + i + 1), row, GalleryLook::Font::Body,
               look.role(Palette::Text));
  }
}
