#include "values/VariFriendlyTextBox.h"

#include "platform/glib/Painter.h"
#include "platform/glib/look/ValueBoxLook.h"
#include "values/VariBox.h"

VariFriendlyTextBox::VariFriendlyTextBox(const InitArgs& args, VariBox* owner)
    : TextBox(args), owner_(owner) {
  canvas()->setOpaque(false);
}

int VariFriendlyTextBox::handleMouseEvent(Event* e) {
  const bool ownersEvent =
      isActive() && (mouse_right_event(e) || mouse_chord_event(e) || owner_->isDragging());
  if (ownersEvent) return owner_->handleMouseEvent(e);
  return TextBox::handleMouseEvent(e);
}

void VariFriendlyTextBox::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  drawText(p);
  if (hasKeyboardFocus()) Glib::ValueBoxLook(getPalette()).focusOutline(p, p.bounds());
}

Colour VariFriendlyTextBox::getTextColour() const {
  return owner_->currentTextColour();
}

void VariFriendlyTextBox::setcol(const Colour& colour, bool redraw) {
  TextBox::setcol(colour, redraw);
  canvas()->setOpaque(false);
}

MouseCursorID VariFriendlyTextBox::contextCursor(const XY<int>& pos) {
  return owner_->isDragging() ? kCursorValueDrag : TextBox::contextCursor(pos);
}
