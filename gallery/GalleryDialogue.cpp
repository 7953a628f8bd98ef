#include "gallery/GalleryDialogue.h"

#include "gallery/GalleryPages.h"
#include "gallery/GalleryTooltips.h"

namespace {
constexpr int kMargin = 20;
}

GalleryDialogue::GalleryDialogue(const GlobCreationInfo& info, MessageLog& log)
    : LazyTabbedDialogue(info), log_(log) {
  set_name("Pages");
  setBorderStyle(UifBorderNone);
  pages_.assign(galleryPages().size(), nullptr);
  for (const GalleryPageEntry& entry : galleryPages()) {
    addPageDeferred(Kw::toWide(entry.title), kTabDefaultColour);
  }
}

GalleryPage* GalleryDialogue::page(int index) const {
  return index >= 0 && index < static_cast<int>(pages_.size()) ? pages_[index] : nullptr;
}

int GalleryDialogue::pageNumber(const WString& pageId) const {
  return findPageIdx(pageId);
}

void GalleryDialogue::buildPage(const WString& pageId) {
  const int index = pageNumber(pageId);
  Glob* base = getPageBaseGlob(pageId);
  if (index < 0 || !base || index >= static_cast<int>(pages_.size())) return;
  const GalleryPageEntry& entry = galleryPages()[index];
  auto* p = new GalleryPage(base->canvas(), entry.title, entry.summary, log_);
  pages_[index] = p;
  entry.build(*p);
  GalleryTooltips::explain(*p);
  placePage(index);
}

void GalleryDialogue::placePage(int index) {
  GalleryPage* p = page(index);
  Glob* base = p ? p->parent() : nullptr;
  if (!base) return;
  // Pages keep their top-left corner under the tabs, whatever the window's height.
  p->reshape_canvas(kMargin, base->height() - kMargin - GalleryPage::kHeight, GalleryPage::kWidth,
                    GalleryPage::kHeight);
}

void GalleryDialogue::reshape() {
  LazyTabbedDialogue::reshape();
  for (int i = 0; i < static_cast<int>(pages_.size()); ++i) placePage(i);
}
