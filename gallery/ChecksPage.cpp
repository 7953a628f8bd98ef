#include "gallery/GalleryPages.h"

// Until the subsystem lands, the page lists what it will show.
void buildChecksPage(GalleryPage& page) {
  page.showPlanned("the buttons subsystem",
                   {"Check box bound to a true/false value", "Tri-state box",
                    "Radio set of buttons", "Radio set of check boxes"});
}
