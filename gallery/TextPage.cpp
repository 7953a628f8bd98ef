#include "gallery/GalleryPages.h"

// Until the subsystem lands, the page lists what it will show.
void buildTextPage(GalleryPage& page) {
  page.showPlanned("the text subsystem",
                   {"Single-line text box with undo and the clipboard",
                    "Obfuscated (password) entry", "Labels and titled text boxes", "Tooltips"});
}
