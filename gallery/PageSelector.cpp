#include "gallery/PageSelector.h"

#include "gallery/GalleryLook.h"

PageSelector::PageSelector(const GlobCreationInfo& info, MessageLog& log) : Glob(info), log_(log) {
  set_name("Pages");
}

void PageSelector::addEntry(const String& title, bool ready) {
  auto* tab =
      new PageTab(GlobCreationInfo(static_cast<unsigned short>(width()), kEntryHeight, canvas()),
                  title, static_cast<int>(tabs_.size()), ready);
  tabs_.push_back(tab);
  layout();
}

void PageSelector::setSelected(int index) {
  for (PageTab* t : tabs_) t->setSelected(t->index() == index);
}

void PageSelector::reshape() {
  layout();
}

void PageSelector::layout() {
  int top = kFirstEntryTop;
  for (PageTab* t : tabs_) {
    t->reshape_canvas(0, height() - top - kEntryHeight, width(), kEntryHeight);
    top += kEntryHeight;
  }
}

int PageSelector::react(Event* e) {
  if (!message_event(e)) return Glob::react(e);
  log_.record("Gallery", *e);
  Glob* sender = event_to_sender_glob(e);
  for (PageTab* t : tabs_) {
    if (t == sender && e->text() == PageTab::selectedMsg && onChoice_) {
      onChoice_(t->index());
      break;
    }
  }
  return 1;
}

void PageSelector::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const GalleryLook look(getPalette());
  using F = GalleryLook::Font;
  const Kw::Box<int> b = p.bounds();
  p.fillRect(b, look.sidebar());
  p.fillRect(Kw::Box<int>(b.x1 - 1, b.y0, b.x1, b.y1), look.line());
  look.label(p, "SUBSYSTEMS", Kw::Box<int>(22, b.y1 - 38, b.x1 - 16, b.y1 - 14), F::Caption,
             look.faintText());
  look.lamp(p, XY<int>(26, 22), GalleryLook::kReady);
  look.label(p, "ready", Kw::Box<int>(36, 12, 96, 32), F::Small, look.faintText());
  look.lamp(p, XY<int>(104, 22), look.planned());
  look.label(p, "planned", Kw::Box<int>(114, 12, b.x1 - 16, 32), F::Small, look.faintText());
}
