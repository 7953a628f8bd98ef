#pragma once
// A rectangular Glob with a face colour: the common base of buttons and panels.
#include "foundation/MenuGlob.h"
#include "platform/kw/Box.h"

class rect : public MenuGlob {
 public:
  explicit rect(const GlobCreationInfo& info);
  rect(unsigned short width, unsigned short height, int flag, Canvas* parent);

  // The face colour; setting it repaints when `redraw` is set and the colour changed.
  virtual void setcol(const Colour& colour, bool redraw);
  virtual const Colour& getcol() const { return face_; }
  // The outline of the face in the Glob's own coordinates.
  virtual Kw::Box<int> facepath() const;
  // Extra outline a subclass adds around the face (a drop-down's arrow strip, say); the base
  // adds nothing and returns an empty box.
  virtual Kw::Box<int> addpath() const { return Kw::Box<int>(); }

  const char* idstring() const override { return "rect"; }

 private:
  Colour face_;
};
