#pragma once
// A one-of-many choice shown as a panel of check boxes made from a list of texts, bound to an
// int value: the index of the ticked box. A click on a clear box ticks it, clears the one that
// was ticked, asks the model for the new index and calls the parent with "CRSChanged".
//
// The set recognises its members by their messages, which must keep the check boxes' default
// prefix "Checkbox ": a member whose prefix was changed is not handled here (its message goes
// on to the panel's base handling), unless its user function is checkboxClickCallback with the
// set as data, which selects it directly.
//
// Choices made here:
// - The first member is ticked when members are first added to an empty set (or the InitArgs'
//   `selected` one). The ticked member's clicks are disabled, so it cannot be clicked off.
// - A member turned clear from the keyboard (Return and space always toggle a check box) is
//   ticked again at once: the selection stays, and nothing is reported.
// - Messages from check boxes on the panel that are not members go on unhandled.
// - Layout, inside the panel's user area: a column from the top, kMemberHeight per member, when
//   all members fit stacked that way; otherwise a row of equal widths, vertically centred.
// - A user selection asks the model with the check boxes' change type (kChangeUserToggle).
// - setSelectedItem returns false, changing nothing, for an index out of range or negative,
//   the selected index, or a deleted member.
// - Members are held through GlobHandle: deleted ones are skipped and keep their index.
#include <vector>

#include "buttons/Checkbox.h"
#include "buttons/RadioSetBase.h"
#include "platform/misc/UIString.h"

class CheckboxRadioSet : public StandardPanel, public ValWidget<int> {
 public:
  static const char* const selectionChangedMsg;  // "CRSChanged"
  static constexpr int kMemberHeight = 20;
  static constexpr int kGap = 2;

  struct InitArgs : GlobCreationInfo {
    std::vector<UIString> labels;
    int selected = 0;
    Checkbox::Appearance appearance = Checkbox::BoxLeft;
    UifTypeOfBorder borderStyle = UifBorderNone;
    bool boldWhenTicked = false;

    InitArgs() = default;
    InitArgs(const std::vector<UIString>& l, const GlobCreationInfo& where)
        : GlobCreationInfo(where), labels(l) {}
  };

  explicit CheckboxRadioSet(const GlobCreationInfo& info);
  CheckboxRadioSet(unsigned short width, unsigned short height, int flag, Canvas* parent);
  explicit CheckboxRadioSet(const InitArgs& args);

  // Makes one member per text and lays all members out again.
  void addWidgets(const std::vector<UIString>& labels);
  // The index of the first ticked member; 0 when none is ticked.
  int getSelectedItem() const;
  bool setSelectedItem(int index);
  int memberCount() const { return members_.buttonCount(); }
  Checkbox* member(int index) const { return members_.buttonAt(index); }

  void setActive(bool active, bool redraw) override;
  void setBoldWhenTicked(bool b);
  void setTextColourWhenTicked(const Colour& c);
  void setAppearance(Checkbox::Appearance a);

  int handleMessageEvent(const String& msg, Glob* sender) override;
  static void checkboxClickCallback(Checkbox* box, void* set);

  // --- Value: the selected index ---
  int getWidgetValue() override { return getSelectedItem(); }
  void setNewWidgetValue(int& value) override { setSelectedItem(value); }
  void setEnabledState(bool enabled) override { setActive(enabled, true); }

  void reshape() override;
  const char* idstring() const override { return "checkboxradioset"; }

 private:
  void layoutMembers();
  // Ticks `index` and clears the previous selection, with click enabling to match.
  void select(int index);
  // Asks the model, then calls the parent; either may delete the set.
  void reportSelection();

  RadioSetBase<Checkbox> members_;
  bool boldWhenTicked_ = false;
  bool colourWhenTickedSet_ = false;
  Colour textColourWhenTicked_;
  Checkbox::Appearance appearance_ = Checkbox::BoxLeft;
};
