#include "gallery/FoundationDemos.h"

#include "foundation/ValServerAdaptor.h"
#include "gallery/FocusChip.h"
#include "gallery/GalleryLook.h"
#include "gallery/LevelMeter.h"
#include "platform/glib/Painter.h"
#include "platform/glob/KeyCodes.h"

BindingDemo::BindingDemo(const GlobCreationInfo& info) : Glob(info) {
  level_.setValue(4);
  Kw::Ptr<ValServerAdaptor<int>> adaptor(new ValServerAdaptor<int>(&level_));
  const int w = width() - 110;
  for (int i = 0; i < 2; ++i) {
    auto* meter = new LevelMeter(GlobCreationInfo(static_cast<unsigned short>(w), 24, canvas(), 100,
                                                  height() - 26 - i * 32));
    meter->set_name(i == 0 ? "level view A" : "level view B");
    meter->setDataAdaptor(adaptor);
  }
  adaptor->forceWidgetUpdate();
}

void BindingDemo::draw() {
  Glib::Painter p(*canvas());
  const GalleryLook look(getPalette());
  for (int i = 0; i < 2; ++i) {
    const Kw::Box<int> row(0, height() - 26 - i * 32, 92, height() - 2 - i * 32);
    look.label(p, i == 0 ? "View A" : "View B", row, GalleryLook::Font::Body, look.text());
  }
}

FocusRow::FocusRow(const GlobCreationInfo& info, int chips) : Glob(info) {
  const int gap = 10;
  const int w = (width() - gap * (chips - 1)) / chips;
  for (int i = 0; i < chips; ++i) {
    auto* chip = new FocusChip(
        GlobCreationInfo(static_cast<unsigned short>(w), height(), canvas(), i * (w + gap), 0),
        "Stop " + std::to_string(i + 1));
    chip->set_name("focus stop " + std::to_string(i + 1));
    order_.addTabStop(chip, 0xFFFFFFFEu);
  }
}

int FocusRow::react(Event* e) {
  if (key_press_event(e) && (e->keyCode() & ~kKeyShift) == kKeyTab) {
    if (e->keyCode() & kKeyShift) {
      order_.decrementTabStop();
    } else {
      order_.incrementTabStop();
    }
    return 1;
  }
  return Glob::react(e);
}
