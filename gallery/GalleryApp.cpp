#include "gallery/GalleryApp.h"

#include <algorithm>

#include "gallery/GalleryLook.h"
#include "gallery/GalleryPages.h"
#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"

GalleryApp::GalleryApp(Glob& screen, MessageLog& log)
    : Glob(GlobCreationInfo(screen.width(), screen.height(), screen.canvas())),
      screen_(screen),
      log_(log) {
  set_name("globkit gallery");
  pages_ = new GalleryDialogue(GlobCreationInfo(100, 100, canvas()), log_);
  logView_ = new MessageLogView(GlobCreationInfo(100, kLogHeight, canvas()), log_);
  // The view may be gone by the time the log grows: the log outlives the window's Globs.
  GlobHandle<MessageLogView> view(logView_);
  log_.setListener([view] {
    if (MessageLogView* v = view.get()) v->update();
  });
  layout();
  selectPage(0);
}

int GalleryApp::pageCount() const {
  return static_cast<int>(pages_->pageCount());
}

String GalleryApp::pageTitle(int index) const {
  return index >= 0 && index < pageCount()
             ? Kw::toUtf8(pages_->getTabName(static_cast<unsigned>(index)))
             : String();
}

int GalleryApp::currentPage() const {
  return pages_->pageNumber(pages_->currentPage());
}

GalleryPage* GalleryApp::page(int index) const {
  return pages_->page(index);
}

void GalleryApp::selectPage(int index) {
  if (index < 0 || index >= pageCount()) {
    diagWarning("gallery: no page " + std::to_string(index) + ", page kept\n");
    return;
  }
  pages_->selectPage(pages_->getPageID(static_cast<unsigned>(index)), true, false);
  update(Kw::Box<int>(0, height() - kHeaderHeight, width(), height()));
}

int GalleryApp::react(Event* e) {
  if (!message_event(e)) return Glob::react(e);
  // The dialogue's reports (a tab chosen, renamed...) are the gallery's own news.
  log_.record("Gallery", *e);
  update(Kw::Box<int>(0, height() - kHeaderHeight, width(), height()));
  return 1;
}

bool GalleryApp::fitToScreen() {
  if (screen_.width() == width() && screen_.height() == height()) return false;
  reshape_canvas(0, 0, screen_.width(), screen_.height());
  return true;
}

void GalleryApp::reshape() {
  layout();
}

void GalleryApp::layout() {
  const int w = width(), h = height();
  const int below = std::max(0, h - kHeaderHeight);
  logView_->reshape_canvas(0, 0, w, std::min(kLogHeight, below));
  const int areaH = std::max(0, below - kLogHeight);
  pages_->reshape_canvas(0, kLogHeight, w, areaH);
}

String GalleryApp::describeValue() const {
  const GalleryPage* p = page(currentPage());
  return p ? p->title() : String();
}

void GalleryApp::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const GalleryLook look(getPalette());
  using F = GalleryLook::Font;
  const int w = width(), h = height();
  p.fillRect(p.bounds(), look.backdrop());
  const Kw::Box<int> head(0, h - kHeaderHeight, w, h);
  look.strip(p, head);
  // The mark: three stacked bars in the accent colour.
  for (int i = 0; i < 3; ++i) {
    const int y = head.y0 + 17 + i * 8;
    const Colour bar = i == 1 ? look.role(Palette::Focus) : look.accent();
    p.fillRect(Kw::Box<int>(22, y, 22 + 22 - i * 5, y + 5), bar);
  }
  look.label(p, "globkit", Kw::Box<int>(56, head.y0 + 8, 150, head.y1 - 8), F::Title,
             look.strongText());
  look.label(p, "Widget gallery", Kw::Box<int>(142, head.y0 + 8, 330, head.y1 - 8), F::Body,
             look.dimText());
  if (const GalleryPage* cur = page(currentPage())) {
    const String where = cur->title() + "   \xC2\xB7   page " + std::to_string(currentPage() + 1) +
                         " of " + std::to_string(pageCount());
    look.label(p, where, Kw::Box<int>(w - 420, head.y0 + 8, w - 24, head.y1 - 8), F::Body,
               look.text(), TextAlignment::Right);
  }
}
