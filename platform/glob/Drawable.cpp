#include "platform/glob/Drawable.h"

#include "platform/misc/Diagnostics.h"

namespace {
int gRedrawsDisabled = 0;
int gRefreshOff = 0;
}  // namespace

void Drawable::disableRedraws() {
  ++gRedrawsDisabled;
}

void Drawable::enableRedraws() {
  if (gRedrawsDisabled == 0) {
    diagWarning("Drawable::enableRedraws without a matching disableRedraws ignored\n");
    return;
  }
  --gRedrawsDisabled;
}

bool Drawable::redrawsEnabled() {
  return gRedrawsDisabled == 0 && gRefreshOff == 0;
}

void refresh_off() {
  ++gRefreshOff;
}

void refresh_on() {
  if (gRefreshOff == 0) {
    diagWarning("refresh_on without a matching refresh_off ignored\n");
    return;
  }
  --gRefreshOff;
}

bool refresh_is_on() {
  return gRefreshOff == 0;
}
