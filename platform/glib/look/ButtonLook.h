#pragma once
// How a push button looks: a gentle vertical sheen in the face colour (darker and reversed while
// down), a one-pixel outline, a bevel raised when up and sunken when down, the lamp of a latched
// option button and the keyboard-focus mark. An inactive button's face sinks toward the base
// colour, its bevel loses half its contrast, its label takes the disabled colour and its picture
// fades. Every button-like control (title buttons, image buttons) draws through it.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"

namespace Glib {

class Image;
class Painter;

class ButtonLook {
 public:
  // How much lighter the face is while the pointer is over an active button.
  static constexpr double kHoverBrighten = 1.2;

  explicit ButtonLook(const Palette& palette) : palette_(palette) {}

  // --- Colours ---
  static Colour hovered(const Colour& face) { return scale(face, kHoverBrighten); }
  // The face and label colours as drawn, from the state's colours.
  Colour face(const Colour& stateFace, bool active) const;
  Colour label(const Colour& stateLabel, bool active) const;
  // The outline: the focus colour while the button has the keyboard focus.
  Colour edge(bool focused) const;

  // Content (label, glyph, picture) moves one pixel right and down while a bevelled button is
  // held down, as if pressed into the panel.
  static int pressShift(bool down, bool flat) { return down && !flat ? 1 : 0; }
  static Kw::Box<int> pressed(const Kw::Box<int>& box, bool down, bool flat);

  // --- Recipes, over the whole canvas ---
  void background(Painter& p, const Colour& face, bool down, bool flat) const;
  // The outline in `edge`, then (bevelled buttons with a bevel wider than the outline) the
  // bevel inside it, mixed from `face`.
  void edge(Painter& p, const Colour& edge, const Colour& face, bool down, bool flat, bool active,
            int bevelWidth) const;
  // The lamp along the bottom of `content` that shows a latched option button is down.
  void latchLamp(Painter& p, const Kw::Box<int>& content) const;
  // The dotted keyboard-focus mark round `content`.
  void focusMark(Painter& p, const Kw::Box<int>& content) const;
  // A symbol glyph (see Symbols.h) standing for the label.
  static void glyph(Painter& p, int code, const Kw::Box<int>& box, const Colour& c);
  // The picture inside `room`, shrunk to fit when larger (keeping its shape): centred on
  // `button` when `alone`, else at the left of the room; moved by `shift` as pressed content
  // is, and faded while inactive. Returns the x just right of it (room.x0 when nothing fits).
  static int picture(Painter& p, const Image& img, const Kw::Box<int>& room,
                     const Kw::Box<int>& button, bool alone, int shift, bool active);

 private:
  static constexpr double kInactiveFaceSink = 0.35;      // toward the base colour
  static constexpr double kInactiveBevelContrast = 0.5;  // of the full bevel colours
  static constexpr double kInactivePictureOpacity = 0.45;

  const Palette& palette_;
};

}  // namespace Glib
