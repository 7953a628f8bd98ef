#pragma once
// The colours a Glob draws with, by role. Two looks come with the library: dark() (a neutral
// dark-grey editing-application theme, also what Palette() gives) and light() (dark text on
// pale greys, with the same roles). The window shades step further apart in the dark look,
// where small steps would be hard to see.
//
// A palette is a handle on a shared record of colours: copies share it, and the first change
// through set() gives the changed palette a record of its own. The two standard looks are one
// record each for the whole process, so a Glob left with a standard palette costs a pointer.
// Records are counted without atomics: palettes belong to the GUI thread.
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

  Palette(const Palette& o);
  Palette(Palette&& o) noexcept;
  Palette& operator=(const Palette& o);
  Palette& operator=(Palette&& o) noexcept;
  ~Palette();

  const Colour& get(Role role) const { return record_->colours[role]; }
  void set(Role role, const Colour& c);

  // The window shades, 0 darkest to 6 lightest, around the window colour (shade 3).
  Colour windowShade(int level) const;

  bool operator==(const Palette& o) const;

 private:
  struct Record {
    std::array<Colour, RoleCount> colours;
    double shadeStep = 0.12;  // how much darker or lighter each window shade is
    mutable unsigned refs = 1;
  };

  explicit Palette(Record* shared);
  static Record* darkRecord();
  static Record* lightRecord();
  // Gives this palette a record that no other palette shares.
  Record& own();
  void release();

  Record* record_;
};
