#pragma once
// A push button dressed as a drop-down button: its label at the left and a down arrow at its
// right end. It opens nothing; it reports like any button, so a group can head itself with
// something that reads as a choice while the choice is made elsewhere.
#include "buttons/Button.h"

class DropDownButtonImposter : public Button {
 public:
  static constexpr int kArrowWidth = 14;

  DropDownButtonImposter(const WString& label, const String& message, const GlobCreationInfo& info);

  void drawText() override;
  const char* idstring() const override { return "ddimposter"; }
};
