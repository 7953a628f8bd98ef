#pragma once
// A titled drop-down bound to a model value: the selected entry's index is its widget value
// (ValWidget<int>), so an adaptor over a ValServer<int> keeps model and drop-down in step.
//
// Decisions where the behaviour was left open:
// - The user's choice (the drop-down's "ddMenuBtnMsg") asks the adaptor for the new index as
//   a direct change and is then passed on to the parent as the control's own message; a
//   refused request puts the model's value back on the drop-down. A value
//   pushed from the model selects silently; an index that names no entry is refused there and
//   the drop-down keeps its selection.
// - It follows the drop-down by its messages rather than by observing the selection server, so
//   the model's own pushes never echo back to the adaptor.
#include "dropdowns/TitledMenuButtonPlain.h"
#include "foundation/ValWidget.h"

struct TitleMenuButtonInitArgs {
  DDBtnInitArgs button;  // place, title (label), entries, selection, settings
  int titleWidth = 0;    // 0: measured
};

class TitleMenuButton : public TitledMenuButtonPlain, public ValWidget<int> {
 public:
  explicit TitleMenuButton(const TitleMenuButtonInitArgs& args);
  TitleMenuButton(const WString& title, const std::vector<WString>& entries, const Colour& colour,
                  unsigned short width, unsigned short height, Canvas* parent);
  TitleMenuButton(const WString& title, const std::vector<WString>& entries,
                  const GlobCreationInfo& info, int titleWidth = 0);

  int getWidgetValue() override;
  void setNewWidgetValue(int& value) override;
  void setEnabledState(bool enabled) override { setActive(enabled, true); }
  const char* idstring() const override { return "titlemenubutton"; }

 protected:
  int handleButtonMessage(const String& msg) override;
};
