#include "panels/ModalShade.h"

#include "platform/glib/Painter.h"
#include "platform/glib/look/PanelLook.h"

ModalShade::ModalShade(Glob& screen, const Colour& colour)
    : Glob(GlobCreationInfo(screen.width(), screen.height(), screen.canvas())), colour_(colour) {}

int ModalShade::react(Event* e) {
  if (mouse_event(e)) return 1;
  return Glob::react(e);
}

void ModalShade::draw() {
  Glib::Painter p(*canvas());
  Glib::PanelLook::modalShade(p, colour_);
}
