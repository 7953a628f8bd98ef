#pragma once
// The colours a Glob draws with, by role. Two looks come with the library: dark() (a neutral
// dark-grey editing-application theme, also what Palette() gives) and light() (dark text on
// pale greys, with the same roles). The window shades step further apart in the dark look,
// where small steps would be hard to see.
#include <array>

#include "platform/glob/Colour.h"

class Palette {
 public:
  enum Role {
    Window,           // panel backgrounds
    WindowText,       // labels on panels
    Button,           // button faces
    ButtonText,       // button labels
    Base,             // text entry backgrounds
    Text,             // text entry text
    Highlight,        // selection, ticks, active marks
    HighlightedText,  // text on a selection
    Light,            // bevel light edge
    Shadow,           // bevel dark edge
    Disabled,         // text of inactive controls
    Caret,            // the text caret
    Focus,            // focus marks
    Border,           // panel outlines
    Ghost,            // ghost labels of empty text boxes
    RoleCount
  };

  // The standard look: the dark one.
  Palette();
  static Palette dark();
  static Palette light();
  // A palette whose text roles take `fore` and whose face roles take `back`.
  Palette(const Colour& fore, const Colour& back);

  const Colour& get(Role role) const { return colours_[role]; }
  void set(Role role, const Colour& c) { colours_[role] = c; }

  // The window shades, 0 darkest to 6 lightest, around the window colour (shade 3).
  Colour windowShade(int level) const;

  bool operator==(const Palette& o) const {
    return colours_ == o.colours_ && shadeStep_ == o.shadeStep_;
  }

 private:
  std::array<Colour, RoleCount> colours_;
  double shadeStep_ = 0.12;  // how much darker or lighter each window shade is
};
