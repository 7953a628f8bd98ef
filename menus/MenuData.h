#pragma once
// What a pop-up menu is made from: the items, the owner that hears the choices, size hints and
// the two presentation flags.
#include <vector>

#include "menus/MenuItem.h"
#include "platform/glob/Colour.h"

class Glob;

struct MenuData {
  // The presentation flags (an owner's menu options carry them as bits 0 and 4).
  static constexpr unsigned kCloseOnOutsideClick = 1;  // a press outside closes the pop-up
  static constexpr unsigned kShowTitle = 16;           // a title, when there is one, gets a strip

  std::vector<MenuItem> items;
  Glob* owner = nullptr;
  int widthHint = 0;        // the least width; 0 for none
  int maxVisibleRows = -1;  // negative: as many as the screen allows
  unsigned flags = kCloseOnOutsideClick | kShowTitle;
  bool hasBaseColour = false;  // else the look's face
  Colour baseColour;
};
