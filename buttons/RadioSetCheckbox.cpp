#include "buttons/RadioSetCheckbox.h"

RadioSetCheckbox::RadioSetCheckbox(unsigned short width, unsigned short height, bool ticked,
                                   int flag, Canvas* parent)
    : Checkbox(width, height, ticked, flag, parent) {
  setActive(!getState(), false);
}

RadioSetCheckbox::RadioSetCheckbox(const GlobCreationInfo& info, bool ticked)
    : Checkbox(info, ticked) {
  setActive(!getState(), false);
}

RadioSetCheckbox::RadioSetCheckbox(const CheckboxInitArgs& args) : Checkbox(args) {
  setActive(!getState(), false);
}

void RadioSetCheckbox::setStateInternal(bool value) {
  Checkbox::setStateInternal(value);
  setActive(!getState(), false);
}
