#pragma once
// The gallery's pages as a lazy tabbed dialogue: one tab per entry of the page table, each
// page built from its entry the first time its tab is chosen. The built pages are kept by
// page number for the gallery.
#include <vector>

#include "gallery/GalleryPage.h"
#include "gallery/MessageLog.h"
#include "panels/LazyTabbedDialogue.h"

class GalleryDialogue : public LazyTabbedDialogue {
 public:
  GalleryDialogue(const GlobCreationInfo& info, MessageLog& log);

  // The page with that number once built, or null.
  GalleryPage* page(int index) const;
  int pageNumber(const WString& pageId) const;

  void buildPage(const WString& pageId) override;
  void reshapePage(const WString& pageId) override {}
  void reshape() override;

 private:
  void placePage(int index);

  MessageLog& log_;
  std::vector<GalleryPage*> pages_;
};
