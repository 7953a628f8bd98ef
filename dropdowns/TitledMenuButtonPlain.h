#pragma once
// A title beside a drop-down button: the title is drawn by the control itself at its left, the
// drop-down (getBtn) fills the rest. Everything the drop-down reports reaches the control's
// parent as the control's own message; its entries and selection are reached through getBtn.
//
// Decisions where the behaviour was left open:
// - A title width of 0 takes the title's measured width; the drop-down starts kSeparator
//   pixels after it and takes the rest of the width, at full height.
// - The title is plain label text (Glib::LabelLook::title), dimmed while inactive.
#include "dropdowns/DropDownMenuButton.h"
#include "foundation/rect.h"

class TitledMenuButtonPlain : public rect {
 public:
  static constexpr int kSeparator = 5;

  TitledMenuButtonPlain(const WString& title, const std::vector<WString>& entries,
                        const GlobCreationInfo& info, int titleWidth = 0);
  TitledMenuButtonPlain(const WString& title, const std::vector<WString>& entries,
                        const Colour& colour, unsigned short width, unsigned short height,
                        Canvas* parent);
  explicit TitledMenuButtonPlain(const DDBtnInitArgs& args, int titleWidth = 0);

  DropDownMenuButton* getBtn() const { return button_.get(); }
  const WString& getTitle() const { return title_; }
  void setTitle(const WString& title);
  int titleWidth() const;

  int react(Event* e) override;
  void reshape() override;
  void draw() override;
  void setActive(bool active, bool redraw) override;
  const char* idstring() const override { return "titledmenubutton"; }
  String describeValue() const override { return Kw::toUtf8(title_); }

 protected:
  // A message from the drop-down; the base passes it on to the parent as ours.
  virtual int handleButtonMessage(const String& msg);

 private:
  void make(DDBtnInitArgs args);
  void layout();

  WString title_;
  int titleWidth_ = 0;  // 0: measured
  GlobHandle<DropDownMenuButton> button_;
};
