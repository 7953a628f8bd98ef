#include "gallery/GalleryPages.h"

// Until the subsystem lands, the page lists what it will show.
void buildMenusPage(GalleryPage& page) {
  page.showPlanned("the menus subsystem", {"Pop-up menu with groups that fold",
                                           "Drop-down list and menu buttons", "Combo box"});
}
