#include "gallery/GalleryPages.h"

// Until the subsystem lands, the page lists what it will show.
void buildButtonsPage(GalleryPage& page) {
  page.showPlanned("the buttons subsystem", {"Push button: plain, latching and pressure",
                                             "Auto-repeat and keyboard activation",
                                             "Panel title buttons: close, settings, size and pin"});
}
