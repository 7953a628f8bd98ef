#pragma once
// The catcher laid over the whole screen beneath an open pop-up menu: it draws nothing, and a
// press of any button on it closes the pop-up (by sending it "poot") instead of reaching what
// lies beneath. The pop-up owns it and deletes it when it goes.
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"

class Menu;

class MenuDismisser : public Glob {
 public:
  // An unattached catcher the size of `screenSize` for `menu`.
  MenuDismisser(Menu* menu, XY<int> screenSize);

  int react(Event* e) override;
  const char* idstring() const override { return "menu_dismisser"; }

 private:
  GlobHandle<Menu> menu_;
};
