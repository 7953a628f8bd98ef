#pragma once
// How the tabs of a tabbed dialogue look: a strip along the top of the page area, ending in a
// line that the current tab breaks so that it joins its page; each tab a face with rounded-off
// upper corners in its own colour (lighter for the current one, dimmed while inactive), its
// name centred and clipped; and the pair of scroll arrows shown when the tabs do not fit.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;

class TabLook {
 public:
  // How much lighter the current tab is than the others, and how much darker an inactive one.
  static constexpr double kCurrentLift = 1.18;
  static constexpr double kInactiveDim = 0.8;
  // Room left at each end of a tab's name.
  static constexpr int kTextPadding = 10;

  explicit TabLook(const Palette& palette) : palette_(palette) {}

  // The strip behind the tabs: the window face and the base line along its bottom.
  void strip(Painter& p, const Kw::Box<int>& box) const;
  // One tab filling `box` in `face`, its name in `text`; `hover` lightens it a little.
  void tab(Painter& p, const Kw::Box<int>& box, const Colour& face, const Colour& text,
           const WString& name, bool current, bool hover, bool active) const;
  // The default face and text colours of a tab.
  Colour defaultFace() const;
  Colour defaultText() const;
  // Two arrow buttons side by side in `box`; an arrow that cannot move is drawn dimmed.
  void scrollArrows(Painter& p, const Kw::Box<int>& box, bool canLeft, bool canRight) const;

 private:
  const Palette& palette_;
};

}  // namespace Glib
