#pragma once
// A push button dressed as a drop-down button: its label at the left and, with the drop-down
// appearance (the default), a down arrow at its right end (Glib::DropDownLook). It opens
// nothing; it reports like any button, so a group can head itself with something that reads as
// a choice while the choice is made elsewhere.
//
// Decisions where the behaviour was left open:
// - The arrow stays where it is while the button is down; the separator, when asked for, is
//   the drop-down's etched line before the arrow column.
// - Without the drop-down appearance it draws as a plain button with a left-aligned label.
#include "buttons/Button.h"

class DropDownButtonImposter : public Button {
 public:
  static constexpr int kArrowWidth = 14;

  DropDownButtonImposter(const WString& label, const String& message, const GlobCreationInfo& info);
  DropDownButtonImposter(const WString& label, const String& message, unsigned short width,
                         unsigned short height, Canvas* parent);

  void setHasDropDownAppearance(bool on);
  bool getHasDropDownAppearance() const { return dropDownAppearance_; }
  void setDrawSeparator(bool on);
  bool getDrawSeparator() const { return drawSeparator_; }

  void drawText() override;
  const char* idstring() const override { return "ddimposter"; }

 private:
  bool dropDownAppearance_ = true;
  bool drawSeparator_ = false;
};
