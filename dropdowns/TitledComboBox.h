#pragma once
// A title beside a combo box. The title is drawn by the control itself at its left; the combo
// box (getComboBox) fills the rest, and the combo box's operations pass straight to it. What
// the combo box reports reaches the control's parent as the control's own message.
//
// Decisions where the behaviour was left open:
// - The title takes its measured width (or the width given), then separator_ pixels, then the
//   combo box to the right edge, at full height.
// - The second text of the construction is the combo box's text while nothing is chosen.
#include <vector>

#include "dropdowns/ComboBox.h"
#include "foundation/rect.h"
#include "panels/PanelLayoutTypes.h"
#include "platform/misc/UIString.h"

struct TitledComboBoxInitArgs {
  GlobCreationInfo info;
  UIString title;
  UIString text;  // shown while no choice is selected
  std::vector<UIString> choices;
  int titleWidth = 0;  // 0: measured
};

class TitledComboBox : public rect {
 public:
  static constexpr int separator_ = 5;

  explicit TitledComboBox(const TitledComboBoxInitArgs& args);
  TitledComboBox(const UIString& title, const UIString& text, const std::vector<UIString>& choices,
                 const GlobCreationInfo& info);

  ComboBox* getComboBox() const { return combo_.get(); }
  const WString& getTitle() const { return title_; }

  // --- Passed to the combo box ---
  void setString(const WString& text);
  WString getString() const;
  int getAsInt() const;
  double getAsFloat() const;
  void setChoices(const std::vector<WString>& choices);
  void setNumericEntry(bool numeric, int minimum = 0, int maximum = 0, bool allowDecimals = false);
  void setBufferSize(std::uint64_t size);
  void setCharacters(const WString& characters, TextBoxBase::CharacterRestriction restriction);
  void setTextAlignment(TextAlignment alignment);
  void setButtonStyle(button_style style, const Colour& colour);
  void setBorderStyle(UifTypeOfBorder border);
  bool isSelectedCustom() const;
  // Whether `widget` is this control or one of its parts.
  bool isResponsibleFor(const Glob* widget) const;

  void setActive(bool active, bool redraw) override;
  int react(Event* e) override;
  void reshape() override;
  void draw() override;
  const char* idstring() const override { return "titledcombobox"; }
  String describeValue() const override { return Kw::toUtf8(title_); }

 private:
  void make(const WString& text, const std::vector<UIString>& choices);
  void layout();
  int titleWidth() const;

  WString title_;
  int titleWidth_ = 0;
  GlobHandle<ComboBox> combo_;
};
