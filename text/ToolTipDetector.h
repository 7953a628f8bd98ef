#pragma once
// The tooltip's inactivity detector on one screen: an invisible Glob (no size, never hit,
// never drawn) that asks its screen for ticks and hands each one to KwToolTip, keeping what
// the tooltip rules remember between ticks for that screen. KwToolTip::registerTypes makes
// one per screen.
#include <cstdint>

#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"

class KwToolTip;
class RootGlob;

class ToolTipDetector : public Glob {
 public:
  explicit ToolTipDetector(RootGlob& screen);

  int react(Event* e) override;
  const char* idstring() const override { return "tooltip_detector"; }

  // --- What the rules remember ---
  XY<int> lastPointer;
  int64_t restSince = 0;   // when the pointer came to rest
  int64_t shownAt = 0;     // when the current tooltip was shown
  bool dismissed = false;  // a tooltip timed out or was taken away; cleared when the pointer moves
  GlobHandle<KwToolTip> shown;  // the tooltip this detector showed
  bool hadTooltip = false;      // `shown` was set and not removed by the rules
  GlobHandle<> source;          // the Glob whose text it shows
};
