#pragma once
// Help for every control of a gallery page: controls that say nothing of their own get a
// tooltip naming them and their kind, so that resting the pointer anywhere on a page shows
// something, whichever session's controls the page holds.
class GalleryPage;

class GalleryTooltips {
 public:
  // Gives each shown, named control on `page` without help of its own a tooltip.
  static void explain(GalleryPage& page);
};
