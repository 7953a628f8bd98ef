#pragma once
// The tooltip: a small borderless panel on the screen that shows the help text of the control
// under the pointer once the pointer has rested over it. There is at most one at a time, and
// everything about it is driven from the screen's ticks (see ToolTipDetector).
//
// On each tick, with the pointer where it is now:
//
//   state                  pointer still                       pointer moved
//   disabled               nothing                             rest starts now
//   showing                gone after kShowMs: dismissed;      gone; rest starts now
//                          gone at once when its control is
//                          deleted or no longer under it
//   not showing            shows when not dismissed, the       not dismissed; rest starts now
//                          screen is ready and the rest is
//                          over kRestMs, if there is a text
//
// Choices made here:
// - The text is the context string of the Glob under the pointer, or of the nearest of its
//   parents that has one (getTooltipText); every control offers its help through the generic
//   contextString, so a control needs nothing else to get a tooltip.
// - The screen is ready when no mouse button is held and the pointer is on it.
// - The tick period is the screen's. registerTypes puts one detector on a screen; calling it
//   again for the same screen adds none. The settings (enable) are the process's; the rest is
//   remembered per screen, so two screens keep their own pointers and timings.
// - A tooltip taken away other than by the rules above (hide, enable(false), deleted by its
//   owner) counts as dismissed until the pointer moves.
// - Margins: kMarginX (10) across, kMarginY (4) up and down, half on each side. Lines are laid
//   out by ToolTipLayout (breaks, wrapping and limits for overlong texts), no wider than
//   kMaxLineWidth nor than the screen leaves room for.
// - Placement: the top kPointerGap below the pointer, left edge at the pointer, moved onto the
//   screen by the window placement; when that would cover the pointer the tooltip goes above
//   it instead. It takes the palette of its screen and rises above everything, modal shades
//   included.
#include <vector>

#include "text/ToolTipLayout.h"

#include "panels/StandardPanel.h"
#include "platform/glib/iFont.h"
#include "platform/glob/GlobHandle.h"

class RootGlob;
class ToolTipDetector;

class KwToolTip : public StandardPanel {
 public:
  static constexpr int kRestMs = 300;
  static constexpr int kShowMs = 5000;
  static constexpr int kPointerGap = 20;
  static constexpr int kMarginX = 10;
  static constexpr int kMarginY = 4;
  static constexpr int kMaxLineWidth = ToolTipLayout::kMaxLineWidth;

  // --- Class-wide control ---
  // Puts the inactivity detector on `screen` (once per screen) and returns it.
  static ToolTipDetector* registerTypes(RootGlob& screen);
  static void enable(bool on);
  static bool isEnabled() { return enabled_; }
  // Removes the tooltip that shows, if any.
  static void hide();
  static KwToolTip* current() { return theToolTip_.get(); }
  static void handleTimerTick(ToolTipDetector& detector);
  // The help text at a root position of `screen`; empty when there is none.
  static WString getTooltipText(RootGlob& screen, XY<int> pos);

  // An unattached tooltip sized for `text`, its lines at most `maxLineWidth` wide.
  explicit KwToolTip(const WString& text, const Palette& palette = Palette(),
                     int maxLineWidth = kMaxLineWidth);
  ~KwToolTip() override;

  const WString& text() const { return text_; }
  const std::vector<WString>& lines() const { return lines_; }

  void draw() override;
  const char* idstring() const override { return "tooltip"; }
  String describeValue() const override { return Kw::toUtf8(text_); }

 private:
  // Shows `text` for the Glob `source` at the pointer `at` of the detector's screen.
  static void show(ToolTipDetector& detector, RootGlob& screen, const WString& text, Glob* source,
                   XY<int> at);
  static void remove(ToolTipDetector& detector);
  static bool screenReady(const RootGlob& screen);

  static bool enabled_;
  static GlobHandle<KwToolTip> theToolTip_;

  WString text_;
  std::vector<WString> lines_;
  Glib::FontPtr font_;
};
