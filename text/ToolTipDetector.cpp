#include "text/ToolTipDetector.h"

#include "platform/glob/RootGlob.h"
#include "platform/glob/RuntimeClock.h"
#include "text/KwToolTip.h"

ToolTipDetector::ToolTipDetector(RootGlob& screen) : Glob(GlobCreationInfo(0, 0, screen.canvas())) {
  set_name("tooltip detector");
  lastPointer = screen.pointer();
  restSince = RuntimeClock::now();
  set_interest(kInterestTicks);
}

int ToolTipDetector::react(Event* e) {
  if (tick_event(e)) {
    KwToolTip::handleTimerTick(*this);
    return 0;
  }
  return Glob::react(e);
}
