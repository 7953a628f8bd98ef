#include "gallery/PageTab.h"

#include "gallery/GalleryLook.h"

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
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const GalleryLook look(getPalette());
  using F = GalleryLook::Font;
  const Kw::Box<int> b = p.bounds();
  if (selected_) {
    p.fillRect(b, look.role(Palette::Window));
    p.fillRect(Kw::Box<int>(b.x0, b.y0, b.x0 + 3, b.y1), look.accent());
  } else if (hover_) {
    p.fillRect(b, look.hover());
  }
  look.label(p, title_, Kw::Box<int>(b.x0 + 22, b.y0, b.x1 - 34, b.y1),
             selected_ ? F::Bold : F::Body, selected_ ? look.strongText() : look.text());
  // Green: the subsystem's controls are on the page; grey: still to come.
  look.lamp(p, XY<int>(b.x1 - 20, (b.y0 + b.y1) / 2),
            ready_ ? GalleryLook::kReady : look.planned());
}
