#pragma once
// The table of gallery pages, one per subsystem. Each subsystem fills its page in its own file
// (ButtonsPage.cpp, ...) with a build function that places controls on the page; the page is
// their owner, so every message they send lands in the message log.
#include <vector>

#include "gallery/GalleryPage.h"

struct GalleryPageEntry {
  const char* title;
  const char* summary;
  void (*build)(GalleryPage& page);
};

const std::vector<GalleryPageEntry>& galleryPages();

void buildFoundationPage(GalleryPage& page);
void buildButtonsPage(GalleryPage& page);
void buildChecksPage(GalleryPage& page);
void buildTextPage(GalleryPage& page);
void buildLabelsPage(GalleryPage& page);
void buildMenusPage(GalleryPage& page);
void buildDropDownsPage(GalleryPage& page);
void buildValuesPage(GalleryPage& page);
void buildSlidersPage(GalleryPage& page);
void buildListsPage(GalleryPage& page);
void buildPanelsPage(GalleryPage& page);
void buildGroupsPage(GalleryPage& page);
