#pragma once
// How panels look: the face; a title strip slightly lighter than the window, lit from above,
// with an etched line under it and the title in bold; a darker bottom strip under a shadow line;
// the border styles; the surrounds drawn round children; and the translucent shade laid over
// the screen behind a modal panel. The frames of radio sets (groups) are drawn here too.
//
// The frame and surround kinds carry the numbers that panels store for them, so a stored
// number converts directly: an unknown frame number draws no border, an unknown surround number
// the framed surround.
#include "platform/glob/Palette.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

namespace Glib {

class Painter;

class PanelLook {
 public:
  enum class Frame : int { None = 0, Raised = 1, Framed = 2, Sunken = 3 };
  enum class Surround : int { None = 0, Raised = 1, Sunken = 2, Framed = 3 };

  // How much of the screen the modal shade hides, of 255.
  static constexpr int kModalShadeAlpha8 = 150;

  explicit PanelLook(const Palette& palette) : palette_(palette) {}

  // --- The panel's canvas ---
  // The face in `colour`, then the title strip (when `title` is not empty) with `titleText`
  // in `titleTextBox`, then the bottom strip (when `bottom` is not empty).
  void background(Painter& p, const Colour& colour, const Kw::Box<int>& title,
                  const WString& titleText, const Kw::Box<int>& titleTextBox,
                  const Kw::Box<int>& bottom) const;
  static void face(Painter& p, const Colour& colour);
  void titleStrip(Painter& p, const Kw::Box<int>& strip) const;
  void titleText(Painter& p, const WString& text, const Kw::Box<int>& box) const;
  void bottomStrip(Painter& p, const Kw::Box<int>& strip) const;

  // The border round the whole canvas.
  void border(Painter& p, Frame frame) const;
  void raisedBorder(Painter& p) const;  // dark outline, 4-pixel raised bevel
  void framedBorder(Painter& p) const;  // outline, raised bevel, flat band, sunken groove
  void sunkenBorder(Painter& p) const;  // 5-pixel sunken well edged inside by a dark line

  // The ring `width` pixels wide just inside `outer`, round a child standing inside it.
  void surround(Painter& p, const Kw::Box<int>& outer, Surround kind, int width) const;

  // --- Groups (radio sets): the face, and a frame `width` pixels wide ---
  void groupFace(Painter& p) const;
  void groupFrame(Painter& p, Frame frame, int width) const;

  // --- The modal shade ---
  Colour modalShadeColour() const;
  static void modalShade(Painter& p, const Colour& colour);

 private:
  const Palette& palette_;
};

}  // namespace Glib
