#include "foundation/GlobTabStop.h"

#include "platform/glob/Glob.h"
#include "platform/glob/RootGlob.h"

bool GlobTabStop::isTabStopActive() {
  return self_.isActive() && canvas_is_mapped_to_root(self_.canvas());
}

void GlobTabStop::handleTabStopFocusReceipt() {
  self_.set_kbd_focus();
}

void GlobTabStop::handleTabStopFocusLoss() {
  if (!self_.hasKbdFocus()) return;
  if (Glob* p = self_.parent()) {
    p->set_kbd_focus();
  } else if (RootGlob* r = self_.root()) {
    r->setFocus(nullptr);
  }
}

bool GlobTabStop::hasKeyboardFocus() const {
  return self_.hasKbdFocus();
}
