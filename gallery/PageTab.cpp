#include "gallery/PageTab.h"

#include "gallery/GalleryStyle.h"

using namespace GalleryStyle;

PageTab::PageTab(const GlobCreationInfo& info, const String& title, int index, bool ready)
    : Glob(info), title_(title), index_(index), ready_(ready) {
  set_name(title);
}

void PageTab::setSelected(bool selected) {
  if (selected == selected_) return;
  selected_ = selected;
  update();
}

void PageTab::handleMouseContainment(bool inside) {
  if (inside == hover_) return;
  hover_ = inside;
  update();
}

int PageTab::react(Event* e) {
  if (!mouse_left_event(e)) return Glob::react(e);
  if (mouse_down_event(e)) {
    pressed_ = true;
  } else if (mouse_up_event(e) && pressed_) {
    pressed_ = false;
    if (canvas()->localBounds().contains(e->pos) && parent()) send_msg(parent(), selectedMsg);
  }
  return 1;
}

void PageTab::draw() {
  ChromePainter p(*canvas());
  if (!p.active()) return;
  const Kw::Box<int> b = p.bounds();
  if (selected_) {
    p.fillRect(b, kSidebarSelected);
    p.fillRect(Kw::Box<int>(b.x0, b.y0, b.x0 + 3, b.y1), kAccent);
  } else if (hover_) {
    p.fillRect(b, kSidebarHover);
  }
  p.text(title_, Kw::Box<int>(b.x0 + 22, b.y0, b.x1 - 34, b.y1), selected_ ? kBodyBold : kBodyFont,
         selected_ ? kTextStrong : kText);
  // Green: the subsystem's controls are on the page; grey: still to come.
  p.dot(XY<int>(b.x1 - 20, (b.y0 + b.y1) / 2), 3.5, ready_ ? kReady : kPlanned);
}
