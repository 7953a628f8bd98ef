#include "buttons/TriStateBox.h"

void TriStateBox::setTriState(bool value, bool redraw) {
  if (value == triState) return;
  triState = value;
  if (redraw) update();
}

void TriStateBox::draw() {
  Checkbox::draw();
  if (triState) drawTick(false);
}

String TriStateBox::describeValue() const {
  return triState ? Kw::toUtf8(getLabel()) + " [mixed]" : Checkbox::describeValue();
}
