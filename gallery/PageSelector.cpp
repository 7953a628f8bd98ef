#include "gallery/PageSelector.h"

#include "gallery/GalleryStyle.h"

using namespace GalleryStyle;

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
  ChromePainter p(*canvas());
  if (!p.active()) return;
  const Kw::Box<int> b = p.bounds();
  p.fillRect(b, kSidebar);
  p.vline(b.x1 - 1, b.y0, b.y1, kLine);
  p.text("SUBSYSTEMS", Kw::Box<int>(22, b.y1 - 38, b.x1 - 16, b.y1 - 14), kCaptionFont, kTextFaint);
  p.dot(XY<int>(26, 22), 3.5, kReady);
  p.text("ready", Kw::Box<int>(36, 12, 96, 32), kSmallFont, kTextFaint);
  p.dot(XY<int>(104, 22), 3.5, kPlanned);
  p.text("planned", Kw::Box<int>(114, 12, b.x1 - 16, 32), kSmallFont, kTextFaint);
}
