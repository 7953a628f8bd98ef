#include "gallery/GalleryPages.h"

// Until the subsystem lands, the page lists what it will show.
void buildValuesPage(GalleryPage& page) {
  page.showPlanned("the values subsystem",
                   {"Value box: typing, dragging and the wheel", "Linear and logarithmic parsers",
                    "Horizontal and vertical sliders", "Scroll bars"});
}
