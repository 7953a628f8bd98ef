#include "gallery/FocusChip.h"

#include "gallery/GalleryLook.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/FaceLook.h"
#include "platform/kw/String.h"

FocusChip::FocusChip(const GlobCreationInfo& info, const String& label)
    : Glob(info), label_(label) {
  setDefaultCursor(kCursorHand);
}

int FocusChip::react(Event* e) {
  if (mouse_left_event(e) && mouse_down_event(e)) {
    requestTabStopFocus();
    return 1;
  }
  return Glob::react(e);
}

void FocusChip::handleTabStopFocusLoss() {
  if (hasKbdFocus()) {
    if (Glob* p = parent()) p->set_kbd_focus();
  }
}

void FocusChip::draw() {
  Glib::Painter p(*canvas());
  const GalleryLook look(getPalette());
  const bool focused = hasKbdFocus();
  look.card(p, p.bounds(), focused ? look.hover() : look.role(Palette::Button));
  look.label(p, label_, p.bounds(), GalleryLook::Font::Body,
             focused ? look.strongText() : look.text());
  if (focused) Glib::FaceLook::focusRing(p, p.bounds(), look.accent());
}
