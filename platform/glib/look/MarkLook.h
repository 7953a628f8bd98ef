#pragma once
// How check boxes and switches look. A tick box is a sunken well (dark outline, a shadowed
// top-left ring and a lit bottom-right one) holding the tick glyph, or a character in its
// place, or the horizontal bar of the indeterminate state. A switch is a flat track whose knob
// sits at the left when clear, at the right on a lit track when ticked and in the middle when
// indeterminate; the knob over a clear track takes whichever bevel colour (light or shadow)
// stands out more from the well, so it shows on dark and on pale wells alike. The well lightens
// under the pointer; inactive, it and its outline fade halfway into what the box stands on, and the
// marks take the disabled colour.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"

namespace Glib {

class Painter;

class MarkLook {
 public:
  explicit MarkLook(const Palette& palette) : palette_(palette) {}

  // The label: `text`, or the disabled colour while inactive.
  Colour label(const Colour& text, bool active) const;
  // Ticks, bars and lit tracks.
  Colour mark(bool active) const;
  // The knob over a clear track.
  Colour knob() const;

  // The empty well or track in `box`; `back` is the colour the box stands on.
  void well(Painter& p, const Kw::Box<int>& box, const Colour& back, bool hover, bool active,
            bool isSwitch) const;
  // The tick in a well: the tick glyph when `tickCharacter` is 0, else that character.
  void tick(Painter& p, const Kw::Box<int>& box, char tickCharacter, bool active) const;
  // The indeterminate bar across a well.
  void mixedBar(Painter& p, const Kw::Box<int>& box, bool active) const;
  // The switch's knob and track over a clear track, for the three states.
  void switchOff(Painter& p, const Kw::Box<int>& track, bool active) const;
  void switchOn(Painter& p, const Kw::Box<int>& track, bool active) const;
  void switchMixed(Painter& p, const Kw::Box<int>& track, const Colour& back, bool active) const;
  // The dotted keyboard-focus mark round `box`.
  void focusMark(Painter& p, const Kw::Box<int>& box) const;

 private:
  static constexpr int kKnobInset = 2;  // between the track's edge and the knob

  const Palette& palette_;
};

}  // namespace Glib
