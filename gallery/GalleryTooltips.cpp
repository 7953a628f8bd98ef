#include "gallery/GalleryTooltips.h"

#include "gallery/GalleryPage.h"

void GalleryTooltips::explain(GalleryPage& page) {
  for (Glob* g : page.children()) {
    if (!g->isVisible() || g->get_name().empty()) continue;
    if (!g->contextString(XY<int>(), nullptr).empty()) continue;
    g->setContextString(g->get_name() + " (" + g->idstring() + ")");
  }
}
