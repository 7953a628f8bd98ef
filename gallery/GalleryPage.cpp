#include "gallery/GalleryPage.h"

#include "gallery/GalleryLook.h"

GalleryPage::GalleryPage(Canvas* parent, const String& title, const String& summary,
                         MessageLog& log)
    : Glob(GlobCreationInfo(kWidth, kHeight, parent)), title_(title), summary_(summary), log_(log) {
  set_name(title);
}

Kw::Box<int> GalleryPage::boxFromTop(int left, int top, int width, int height) const {
  return Kw::Box<int>::fromSize(left, kHeight - top - height, width, height);
}

GlobCreationInfo GalleryPage::place(int left, int top, int width, int height) const {
  const Kw::Box<int> b = boxFromTop(left, top, width, height);
  return GlobCreationInfo(static_cast<unsigned short>(width), static_cast<unsigned short>(height),
                          canvas(), b.x0, b.y0);
}

void GalleryPage::addCard(const String& title, int left, int top, int width, int height) {
  cards_.push_back(Card{title, boxFromTop(left, top, width, height)});
  update();
}

void GalleryPage::showPlanned(const String& arrivesWith, const std::vector<String>& controls) {
  planned_ = true;
  arrivesWith_ = arrivesWith;
  plannedControls_ = controls;
  update();
}

int GalleryPage::react(Event* e) {
  if (!message_event(e)) return Glob::react(e);
  log_.record(title_, *e);
  return 1;
}

void GalleryPage::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const GalleryLook look(getPalette());
  using F = GalleryLook::Font;
  const int h = height();
  look.label(p, title_, Kw::Box<int>(0, h - 34, kWidth, h), F::PageTitle, look.strongText());
  look.label(p, summary_, Kw::Box<int>(0, h - 60, kWidth, h - 38), F::Body, look.dimText());
  p.fillRect(Kw::Box<int>(0, h - 73, kWidth, h - 72), look.line());
  p.fillRect(Kw::Box<int>(0, h - 74, kWidth, h - 73), look.hover());
  for (const Card& c : cards_) {
    look.card(p, c.box, look.role(Palette::Window));
    look.label(p, c.title, Kw::Box<int>(c.box.x0 + 16, c.box.y1 - 30, c.box.x1 - 16, c.box.y1 - 8),
               F::Caption, look.dimText());
  }
  if (planned_) drawPlanned(p, look);
}

void GalleryPage::drawPlanned(Glib::Painter& p, const GalleryLook& look) {
  using F = GalleryLook::Font;
  const Kw::Box<int> card = boxFromTop(0, kContentTop, 620, 96 + 26 * int(plannedControls_.size()));
  look.well(p, card, look.hover());
  p.fillRect(Kw::Box<int>(card.x0 + 1, card.y0 + 6, card.x0 + 4, card.y1 - 6), look.planned());
  look.label(p, "NOT BUILT YET",
             Kw::Box<int>(card.x0 + 24, card.y1 - 36, card.x1 - 24, card.y1 - 14), F::Caption,
             look.faintText());
  look.label(p, "These controls arrive with " + arrivesWith_ + ".",
             Kw::Box<int>(card.x0 + 24, card.y1 - 62, card.x1 - 24, card.y1 - 40), F::Bold,
             look.text());
  int y = card.y1 - 92;
  for (const String& c : plannedControls_) {
    p.fillRect(Kw::Box<int>(card.x0 + 28, y + 8, card.x0 + 33, y + 13), look.planned());
    look.label(p, c, Kw::Box<int>(card.x0 + 42, y, card.x1 - 24, y + 20), F::Body, look.dimText());
    y -= 26;
  }
}
