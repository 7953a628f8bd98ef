#include "gallery/GalleryPages.h"

// Until the subsystem lands, the page lists what it will show.
void buildListsPage(GalleryPage& page) {
  page.showPlanned("the lists subsystem",
                   {"Data column fed by a data supplier", "Record-set supplier"});
}
