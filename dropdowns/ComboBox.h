#pragma once
// A combo box: a drop-down button whose face is an editable text box, so that the user types a
// value or picks one from the list. With numeric entry the text box takes only numbers, the
// wheel steps the number within the bounds, and a suffix (a unit) is drawn after it.
//
//   input                           does
//   typing                          edits the text (numeric entry: digits, "-" when the minimum
//                                   is negative, "." when decimals are allowed)
//   Return in the text, focus lost  commits the text (below) and tells the parent
//   after a change                  "ddMenuBtnMsg"
//   press on the arrow column       opens the list; a choice selects it, puts its text in the
//                                   box and tells the parent "ddMenuBtnMsg"
//   wheel, Up, Down                 numeric: the number +1 for a delta below 1, else -1,
//                                   clamped; otherwise the next or previous choice
//
// Decisions where the behaviour was left open:
// - Committing typed text: text that is exactly the display string of a choice selects that
//   choice; any other text is a custom value, which isSelectedCustom() then reports while the
//   selection stays where it was. Numeric entry clamps a number beyond the bounds and writes
//   the clamped number back; text that is no number is replaced by the last committed text.
// - A wheel step that changes the value, numeric or choice, also tells the parent
//   "ddMenuBtnMsg", so owners hear every change of the value one way.
// - The suffix is drawn after the number in the suffix colour of Glib::DropDownLook, between
//   the text box and the arrow column; with a suffix the text box is narrower by the suffix's
//   width and aligns its text to the right, so the number and its unit read as one.
// - The text box is kTextBoxInset pixels in from the face's left, top and bottom edges and
//   kButtonRoom narrower than the face (less the suffix), in the default font, on the
//   palette's child-window colour (window shade 1).
// - In a tab order the combo box stands for its text box: receiving the tab focus gives the
//   text box the keyboard focus.
#include "dropdowns/DropDownMenuButton.h"
#include "text/TextBox.h"

class ComboBox : public DropDownMenuButton {
 public:
  static constexpr const char* kReturnPressedMsg = "LinecanvasReturnPressed";
  static constexpr const char* kTextLeftMsg = "ComboBox::textLeft";
  static constexpr int kButtonRoom = 22;
  static constexpr int kTextBoxInset = 2;

  explicit ComboBox(const DDBtnInitArgs& args);
  ComboBox(const WString& title, const std::vector<WString>& choices, const GlobCreationInfo& info);
  ComboBox(const WString& title, const std::vector<WString>& choices, const Colour& colour,
           unsigned short width, unsigned short height, Canvas* parent);

  // --- Choices and text ---
  void setChoices(const std::vector<WString>& choices);
  void setChoices(const std::vector<MenuItem>& items);
  void setString(const WString& text) override;
  WString getString() const;
  int getAsInt() const;
  double getAsFloat() const;
  // Whether the text differs from every choice.
  bool isSelectedCustom() const;
  TextBox* textBox() const { return textBox_.get(); }

  // --- Entry ---
  void setNumericEntry(bool numeric, int minimum = 0, int maximum = 0, bool allowDecimals = false);
  bool isNumericEntry() const { return settings_->numeric; }
  int getMinimum() const { return settings_->minimum; }
  int getMaximum() const { return settings_->maximum; }
  void setSuffix(const WString& suffix);
  const WString& getSuffix() const { return settings_->suffix; }
  void setBufferSize(std::uint64_t size);
  void setCharacters(const WString& characters, TextBoxBase::CharacterRestriction restriction);

  // --- Drop-down ---
  void informOwner() override;
  void handleMouseWheelDelta(int delta) override;

  // --- Glob ---
  int react(Event* e) override;
  void reshape() override;
  void setActive(bool active, bool redraw) override;
  void handleTabStopFocusReceipt() override;
  void handleTabStopFocusLoss() override;
  const char* idstring() const override { return "combobox"; }
  String describeValue() const override { return Kw::toUtf8(getString()); }

 protected:
  void selectionShown() override;
  void drawLabel(Glib::Painter& p, const Kw::Box<int>& room) override;

 private:
  struct Settings {
    bool numeric = false;
    int minimum = 0;
    int maximum = 0;
    bool allowDecimals = false;
    WString suffix;
    bool operator==(const Settings&) const = default;
  };

  void makeTextBox();
  void placeTextBox();
  int suffixWidth() const;
  // Commits the typed text and tells the parent; unless `always`, only text that changed since
  // the last commit (Return also takes the focus away, which must not commit twice).
  void commitText(bool always);
  void tellParent();

  GlobHandle<TextBox> textBox_;
  Kw::SharedRecord<Settings> settings_;
  WString committed_;  // the last text taken as the value
};
