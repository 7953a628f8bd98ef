#pragma once
// A check box that is one member of a one-of-many row (see CheckboxRadioSetManager). The ticked
// member turns itself inactive, so it cannot be clicked off, yet keeps the enabled text colour
// so it does not look disabled. A member made ticked starts inactive too.
#include "buttons/Checkbox.h"

class RadioSetCheckbox : public Checkbox {
 public:
  RadioSetCheckbox(unsigned short width, unsigned short height, bool ticked, int flag,
                   Canvas* parent);
  RadioSetCheckbox(const GlobCreationInfo& info, bool ticked);
  explicit RadioSetCheckbox(const CheckboxInitArgs& args);

  void setStateInternal(bool value) override;
  Colour getTextColour() override { return textColourFor(true); }
  const char* idstring() const override { return "radiosetcheckbox"; }
};
