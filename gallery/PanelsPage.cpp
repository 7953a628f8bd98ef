#include "gallery/GalleryPages.h"

// Until the subsystem lands, the page lists what it will show.
void buildPanelsPage(GalleryPage& page) {
  page.showPlanned("the panels subsystem",
                   {"Standard panel with title widgets", "Tabbed dialogue with lazily built pages",
                    "Widget groups"});
}
