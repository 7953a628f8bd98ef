#include "gallery/LevelMeter.h"

#include <algorithm>

#include "gallery/GalleryLook.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/FaceLook.h"

LevelMeter::LevelMeter(const GlobCreationInfo& info) : Glob(info) {
  setDefaultCursor(kCursorHand);
}

int LevelMeter::levelAt(int x) const {
  const int segment = std::max(1, width() / kLevels);
  return std::clamp(x / segment + 1, 0, kLevels);
}

int LevelMeter::react(Event* e) {
  if (mouse_left_event(e) && (mouse_down_event(e) || mouse_move_event(e))) {
    const DataChangeType why = mouse_down_event(e) ? kChangeDragStart : kChangeDragStep;
    const int wanted = levelAt(e->pos.x);
    if (wanted != level_) requestSetNewDataValue(wanted, why);
    return 1;
  }
  if (mouse_left_event(e) && mouse_up_event(e)) {
    requestSetNewDataValue(level_, kChangeDragRelease);
    return 1;
  }
  return Glob::react(e);
}

void LevelMeter::setNewWidgetValue(int& value) {
  const int v = std::clamp(value, 0, kLevels);
  if (v == level_) return;
  level_ = v;
  update();
}

void LevelMeter::draw() {
  Glib::Painter p(*canvas());
  const GalleryLook look(getPalette());
  Glib::FaceLook(getPalette())
      .meter(p, p.bounds(), kLevels, level_, look.accent(), GalleryLook::kReady);
}
