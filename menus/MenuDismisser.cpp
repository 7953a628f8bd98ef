#include "menus/MenuDismisser.h"

#include "menus/Menu.h"

MenuDismisser::MenuDismisser(Menu* menu, XY<int> screenSize)
    : Glob(GlobCreationInfo(static_cast<unsigned short>(screenSize.x),
                            static_cast<unsigned short>(screenSize.y), nullptr)),
      menu_(menu) {}

int MenuDismisser::react(Event* e) {
  if (!mouse_event(e)) return Glob::react(e);
  if (mouse_down_event(e)) {
    if (Menu* m = menu_.get()) send_message_event(this, m, Menu::kPootMsg);
  }
  // Nothing beneath hears the pointer while a pop-up is open.
  return 1;
}
