#include "gallery/ClipLibrary.h"
#include "gallery/GalleryPages.h"
#include "lists/DataTable.h"

// The sample database of clips in a table: a sticky name column whose rows can be dragged
// into a new order, editable durations and dates, tags picked from a list and editable for
// every tagged row at once.
void buildListsPage(GalleryPage& page) {
  auto* library = new ClipLibrary(page.canvas());
  page.addCard("CLIPS: A DATABASE TABLE, EDITED IN PLACE", 0, GalleryPage::kContentTop, 1000, 420);
  auto* table =
      new DataTable(page.place(16, GalleryPage::kContentTop + 44, 968, 360), &library->supplier());
  table->set_name("clips table");
  DataColumn name(300);
  name.setSticky(true);
  name.setCanSwapItems(true);
  name.setMinWidth(80);
  DataColumn duration(140, TextAlignment::Right);
  DataColumn date(160);
  DataColumn tags(200);
  tags.setCanEditTaggedItems(true);
  table->setColumns({name, duration, date, tags});
  table->setContextString("Click to tag, Shift/Ctrl+click for more, double-click to edit");
}
