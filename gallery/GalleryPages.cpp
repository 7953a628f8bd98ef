#include "gallery/GalleryPages.h"

const std::vector<GalleryPageEntry>& galleryPages() {
  static const std::vector<GalleryPageEntry> pages = {
      {"Foundation",
       "Globs, message delivery and the keyboard: the ground every control stands on.",
       buildFoundationPage},
      {"Buttons", "Push, latching and pressure buttons, and the buttons of a panel's title strip.",
       buildButtonsPage},
      {"Check boxes & radio sets", "Check boxes, tri-state boxes and one-of-many choices.",
       buildChecksPage},
      {"Text", "Single-line text entry, labels, titled text and tooltips.", buildTextPage},
      {"Labels & tooltips",
       "Labels bound to a value, titled text boxes, the input box and tooltips.", buildLabelsPage},
      {"Menus", "Pop-up menus and the menus of text boxes.", buildMenusPage},
      {"Drop-downs",
       "Drop-down buttons and combo boxes, each bound to a model value shown on the page.",
       buildDropDownsPage},
      {"Values", "Value boxes with their parsers, sliders and scroll bars.", buildValuesPage},
      {"Sliders & scroll bars",
       "Sliders with a point of interest, and scroll bars that ask their owner where to go.",
       buildSlidersPage},
      {"Lists", "Cells addressed by column and row, fed by a data supplier.", buildListsPage},
      {"Panels", "Standard panels, tabbed dialogues and widget groups.", buildPanelsPage},
      {"Groups",
       "Widget groups inside each other, groups switched from their title, and renameable tabs.",
       buildGroupsPage},
  };
  return pages;
}
