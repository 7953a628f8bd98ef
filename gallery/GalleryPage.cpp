#include "gallery/GalleryPage.h"

#include "gallery/GalleryStyle.h"

using namespace GalleryStyle;

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
  ChromePainter p(*canvas());
  if (!p.active()) return;
  const int h = height();
  p.text(title_, Kw::Box<int>(0, h - 34, kWidth, h), kPageTitleFont, kTextStrong);
  p.text(summary_, Kw::Box<int>(0, h - 60, kWidth, h - 38), kBodyFont, kTextDim);
  p.hline(0, kWidth, h - 72, kCardEdge);
  for (const Card& c : cards_) {
    p.roundedRect(c.box, 5, kCard);
    p.roundedOutline(c.box, 5, kCardEdge);
    p.text(c.title, Kw::Box<int>(c.box.x0 + 16, c.box.y1 - 30, c.box.x1 - 16, c.box.y1 - 8),
           kCaptionFont, kTextDim);
  }
  if (planned_) drawPlanned(p);
}

void GalleryPage::drawPlanned(ChromePainter& p) {
  const Kw::Box<int> card = boxFromTop(0, kContentTop, 620, 96 + 26 * int(plannedControls_.size()));
  p.roundedRect(card, 5, kCardInset);
  p.roundedOutline(card, 5, kCardEdge);
  p.fillRect(Kw::Box<int>(card.x0, card.y0 + 6, card.x0 + 3, card.y1 - 6), kPlanned);
  p.text("NOT BUILT YET", Kw::Box<int>(card.x0 + 24, card.y1 - 36, card.x1 - 24, card.y1 - 14),
         kCaptionFont, kTextFaint);
  p.text("These controls arrive with " + arrivesWith_ + ".",
         Kw::Box<int>(card.x0 + 24, card.y1 - 62, card.x1 - 24, card.y1 - 40), kBodyBold, kText);
  int y = card.y1 - 92;
  for (const String& c : plannedControls_) {
    p.dot(XY<int>(card.x0 + 30, y + 10), 2.5, kPlanned);
    p.text(c, Kw::Box<int>(card.x0 + 42, y, card.x1 - 24, y + 20), kBodyFont, kTextDim);
    y -= 26;
  }
}
