#include "buttons/BoolRadioSet.h"

BoolRadioSet::~BoolRadioSet() {
  release(true_.get());
  release(false_.get());
}

void BoolRadioSet::release(Checkbox* box) {
  if (box && box->getUserData() == this) box->setUserFunction(nullptr, nullptr);
}

void BoolRadioSet::setWidgets(Checkbox* trueBox, Checkbox* falseBox, bool state) {
  release(true_.get());
  release(false_.get());
  true_ = GlobHandle<Checkbox>(trueBox);
  false_ = GlobHandle<Checkbox>(falseBox);
  if (Checkbox* t = true_.get()) t->setUserFunction(&BoolRadioSet::checkboxCallback, this);
  if (Checkbox* f = false_.get()) f->setUserFunction(&BoolRadioSet::checkboxCallback, this);
  shown_ = !state;  // so that show() paints both boxes
  show(state);
}

void BoolRadioSet::show(bool value) {
  shown_ = value;
  refresh_off();
  // Only the shown state changes: the boxes themselves are not bound to the model.
  if (Checkbox* t = true_.get()) {
    t->setState(value, false);
    t->update();
  }
  if (Checkbox* f = false_.get()) {
    f->setState(!value, false);
    f->update();
  }
  refresh_on();
}

bool BoolRadioSet::getState() {
  return getDataAdaptor() ? getDataValue() : shown_;
}

void BoolRadioSet::setState(bool value) {
  if (value == shown_) return;
  show(value);
  if (getDataAdaptor() && getDataValue() != value) requestSetNewDataValue(value, kChangeUserToggle);
}

void BoolRadioSet::setEnabledState(bool enabled) {
  if (Checkbox* t = true_.get()) t->setActive(enabled, true);
  if (Checkbox* f = false_.get()) f->setActive(enabled, true);
}

void BoolRadioSet::checkboxCallback(Checkbox* box, void* set) {
  if (set) static_cast<BoolRadioSet*>(set)->clicked(box);
}

void BoolRadioSet::clicked(Checkbox* box) {
  const bool value = true_.get() == box;
  if (!value && false_.get() != box) return;
  if (box->getState()) return;  // the ticked box stays ticked
  GlobHandle<Checkbox> clickedBox(box);
  setState(value);
  // The model's answer may have deleted the box, or this set with it.
  if (Checkbox* b = clickedBox.get()) b->sendToggleMessage(false);
}
