#pragma once
// The colours a Glob draws with, by role. The default palette is the library's look: a neutral
// dark-grey editing-application theme.
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

  // The standard look.
  Palette();
  // A palette whose text roles take `fore` and whose face roles take `back`.
  Palette(const Colour& fore, const Colour& back);

  const Colour& get(Role role) const { return colours_[role]; }
  void set(Role role, const Colour& c) { colours_[role] = c; }

  // The window shades, 0 darkest to 6 lightest, around the window colour.
  Colour windowShade(int level) const;

  bool operator==(const Palette& o) const { return colours_ == o.colours_; }

 private:
  std::array<Colour, RoleCount> colours_;
};
