#include "panels/DialogueTab.h"

#include "panels/TabStrip.h"

DialogueTab::DialogueTab(const GlobCreationInfo& info, TabStrip& strip)
    : Glob(info), strip_(strip) {}

void DialogueTab::show(int index) {
  if (index == index_) return;
  index_ = index;
  set_name(index >= 0 ? Kw::toUtf8(strip_.record(index).name) : String());
  update();
}

void DialogueTab::setHover(bool hover) {
  if (hover == hover_) return;
  hover_ = hover;
  update();
}

int DialogueTab::react(Event* e) {
  if (mouse_event(e) && mouse_down_event(e) && mouse_left_event(e)) {
    strip_.tabPressed(*this);
    return 1;
  }
  if (mouse_event(e) && !mouse_wheel_event(e)) return 1;
  return Glob::react(e);
}

void DialogueTab::draw() {
  strip_.drawTab(*this);
}
