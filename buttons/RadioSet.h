#pragma once
// A one-of-many choice shown as a strip of latching buttons made from a list of labels. When
// the user selects a new button the set calls its parent with "radio_set_message"; the parent
// reads getSelectedItem() during the call.
//
// Choices made here:
// - The set is the RadioSetBase of its buttons, so set_current and setCurrent are available on
//   it directly; the buttons are its children and go with it.
// - The first button is selected when the set is made (none for an empty list).
// - Layout: a row of equal widths when the set is wider than it is tall, else a column of
//   equal heights from the top, inside the border with a 2-pixel gap between buttons.
// - Border styles are those of the panels: raised (5 px), framed (10 px), sunken (6 px), none.
// - Pressing the selected button does not deselect it: it goes straight back down, silently.
// - While set_current switches the members, the previous member's " off" is its going up, not
//   a press of the selected member, whichever member `current` names at that moment.
// - setSelectedItem is a program change: it reports nothing. It returns false, changing
//   nothing, for an index out of range (negative included) or of a deleted button.
#include <vector>

#include "buttons/Button.h"
#include "buttons/RadioSetBase.h"
#include "foundation/MenuGlob.h"
#include "panels/PanelLayoutTypes.h"

class RadioSet : public MenuGlob, public RadioSetBase<Button> {
 public:
  static constexpr int kGap = 2;
  // The message each button reports to the set (with " on" / " off" appended).
  static constexpr const char* kMemberMessage = "radio_member";

  RadioSet(const std::vector<WString>& labels, const GlobCreationInfo& info);
  RadioSet(const std::vector<WString>& labels, unsigned short width, unsigned short height,
           int flag, Canvas* parent);

  static const char* radioSetMessage() { return "radio_set_message"; }

  void set_current(int index, bool flag) override;

  int getSelectedItem() const { return getCurrentButton(); }
  bool setSelectedItem(int index);
  void setBorderStyle(UifTypeOfBorder border);
  UifTypeOfBorder getBorderStyle() const { return border_; }

  void reshape() override;
  void draw() override;
  void setActive(bool active, bool redraw) override;
  int react(Event* e) override;
  const char* idstring() const override { return "radioset"; }
  String describeValue() const override;

 private:
  void build(const std::vector<WString>& labels);
  int reactToMember(Event* e, int index);

  UifTypeOfBorder border_ = UifBorderNone;
  bool switching_ = false;  // inside set_current
};
