#pragma once
// A Glob that can own a context menu. The menu itself comes from the menu subsystem; this
// base keeps the hooks that every control inherits: the owner builds its menu lazily
// (initialiseMenu), may adjust it before it shows (reviewMenu), and hears which entry was
// chosen (handleMenuClick).
#include "platform/glob/Glob.h"

class MenuGlob : public Glob {
 public:
  explicit MenuGlob(const GlobCreationInfo& info) : Glob(info) {}
  MenuGlob(unsigned short width, unsigned short height, int flag, Canvas* parent)
      : Glob(width, height, flag, parent) {}

  // Builds the menu the first time it is needed. The base has none.
  virtual void initialiseMenu() {}
  // Called before the menu shows, with the event that asked for it; returns true when the
  // menu should show.
  virtual bool reviewMenu(Event* e) { return false; }
  // The entry `item` of menu `menu` was chosen.
  virtual void handleMenuClick(unsigned short menu, unsigned short item) {}
  // The menu's title; empty for none.
  virtual WString getMenuTitle() { return WString(); }
};
