#include "gallery/GalleryApp.h"

#include <algorithm>

#include "gallery/GalleryLook.h"
#include "gallery/GalleryPages.h"
#include "gallery/GalleryTooltips.h"
#include "platform/glob/GlobHandle.h"
#include "platform/misc/Diagnostics.h"

GalleryApp::GalleryApp(Glob& screen, MessageLog& log)
    : Glob(GlobCreationInfo(screen.width(), screen.height(), screen.canvas())),
      screen_(screen),
      log_(log) {
  set_name("globkit gallery");
  selector_ = new PageSelector(GlobCreationInfo(kSidebarWidth, 100, canvas()), log_);
  pageArea_ = new Glob(GlobCreationInfo(100, 100, canvas()));
  pageArea_->set_name("Page area");
  for (const GalleryPageEntry& entry : galleryPages()) {
    auto* page = new GalleryPage(pageArea_->canvas(), entry.title, entry.summary, log_);
    entry.build(*page);
    GalleryTooltips::explain(*page);
    page->unmap_canvas();
    pages_.push_back(page);
    selector_->addEntry(entry.title, !page->isPlanned());
  }
  logView_ = new MessageLogView(GlobCreationInfo(100, kLogHeight, canvas()), log_);
  // The view may be gone by the time the log grows: the log outlives the window's Globs.
  GlobHandle<MessageLogView> view(logView_);
  log_.setListener([view] {
    if (MessageLogView* v = view.get()) v->update();
  });
  selector_->setChoiceHandler([this](int index) { selectPage(index); });
  layout();
  selectPage(0);
}

GalleryPage* GalleryApp::page(int index) const {
  return index >= 0 && index < pageCount() ? pages_[index] : nullptr;
}

void GalleryApp::selectPage(int index) {
  if (!page(index)) {
    diagWarning("gallery: no page " + std::to_string(index) + ", page kept\n");
    return;
  }
  if (index == current_) return;
  if (GalleryPage* old = page(current_)) old->unmap_canvas();
  current_ = index;
  pages_[index]->map_canvas();
  selector_->setSelected(index);
  update(Kw::Box<int>(0, height() - kHeaderHeight, width(), height()));
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
  selector_->reshape_canvas(0, 0, kSidebarWidth, below);
  const int contentW = std::max(0, w - kSidebarWidth);
  logView_->reshape_canvas(kSidebarWidth, 0, contentW, std::min(kLogHeight, below));
  const int areaH = std::max(0, below - kLogHeight);
  pageArea_->reshape_canvas(kSidebarWidth, kLogHeight, contentW, areaH);
  // Pages keep their top-left corner under the header, whatever the window's height.
  for (GalleryPage* p : pages_) {
    p->reshape_canvas(kMargin, areaH - kMargin - GalleryPage::kHeight, GalleryPage::kWidth,
                      GalleryPage::kHeight);
  }
}

String GalleryApp::describeValue() const {
  const GalleryPage* p = page(current_);
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
  if (const GalleryPage* cur = page(current_)) {
    const String where = cur->title() + "   \xC2\xB7   page " + std::to_string(current_ + 1) +
                         " of " + std::to_string(pageCount());
    look.label(p, where, Kw::Box<int>(w - 420, head.y0 + 8, w - 24, head.y1 - 8), F::Body,
               look.text(), TextAlignment::Right);
  }
}
