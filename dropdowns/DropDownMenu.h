#pragma once
// The list a drop-down opens: a pop-up menu (Menu) over the drop-down's entries, with the
// drop-down as its owner, so every choice comes back to the drop-down as the entry's message.
// It watches the drop-down's selection while it is open and marks the selected entry with a
// tick and the embossed text style (TextStyles value 2).
//
// Decisions where the behaviour was left open:
// - No title strip; a press outside closes it, as any pop-up, and so does Escape (keys go to
//   the open list, the screen's input scope); other keys are left alone.
// - Its drop-down scrolls the selected entry into view when it opens on a long list.
#include "menus/DropDownMenuData.h"
#include "menus/Menu.h"
#include "platform/misc/ValClient.h"

class DropDownMenu : public Menu, public ValClient<int> {
 public:
  // `selection`, when given, is the server of the selected physical index the list follows.
  DropDownMenu(const DropDownMenuData& data, Glob* owner, bool showSelection = true,
               ValServer<int>* selection = nullptr);
  DropDownMenu(const std::vector<MenuItem>& items, Glob* owner);

  int selectedIndex() const { return selected_; }
  bool showsSelection() const { return showSelection_; }

  const char* idstring() const override { return "DropDownMenu"; }
  bool m_is_type(const char* type) const override;
  int react(Event* e) override;
  void valChangedNtfy() override;

 protected:
  void drawMenuItem(Glib::Painter& p, const VisibleMenuItem& row) override;
  using Menu::drawMenuItem;
  Glib::TextStyles::TextStyle getTextStyle(int index) const override;

 private:
  int selected_ = -1;
  bool showSelection_ = true;
};
