#pragma once
// The text box inside a value box. Every character it takes passes the parser's allowed set
// (the owner restricts it), Return reaches the owner as "LinecanvasReturnPressed", and, while
// the text box is active, right-button and chord events go to the owner's mouse handler so
// that a right drag over the text adjusts the value; so does every mouse event while the
// owner is dragging. Everything else is ordinary text box handling.
//
// Choices made here:
// - The box is transparent: it draws only its text (in the owner's current text colour) and,
//   while it holds the focus, the value box's focus outline; the owner's well and thermometer
//   show through.
// - While the owner drags, the pointer is the value-drag cursor over the text too.
#include "text/TextBox.h"

class VariBox;

class VariFriendlyTextBox : public TextBox {
 public:
  VariFriendlyTextBox(const InitArgs& args, VariBox* owner);

  int handleMouseEvent(Event* e) override;
  void draw() override;
  Colour getTextColour() const override;
  void setcol(const Colour& colour, bool redraw) override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  const char* idstring() const override { return "varifriendlytextbox"; }

 private:
  VariBox* owner_;
};
