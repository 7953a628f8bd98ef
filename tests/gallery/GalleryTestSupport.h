#pragma once
// Finding things in the gallery from its tests: a control by its name, a page by its title.
#include "gallery/GalleryApp.h"

// The first Glob named `name` below `under`, depth first; null when there is none.
inline Glob* findNamed(Glob& under, const String& name) {
  for (Glob* g : under.children()) {
    if (g->get_name() == name) return g;
    if (Glob* found = findNamed(*g, name)) return found;
  }
  return nullptr;
}

// The index of the page with this title, or -1.
inline int pageTitled(const GalleryApp& app, const String& title) {
  for (int i = 0; i < app.pageCount(); ++i)
    if (app.pageTitle(i) == title) return i;
  return -1;
}
