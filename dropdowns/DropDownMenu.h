#pragma once
// The list a drop-down opens: a pop-up menu (Menu) over the drop-down's entries, with the
// drop-down as its owner, so every choice comes back to the drop-down as the entry's message.
// It watches the drop-down's selection while it is open and marks the selected entry with a
// tick and the embossed text style (TextStyles value 2).
//
// Decisions where the behaviour was left open:
// - No title strip; a press outside closes it, as any pop-up, and so does Escape.
// - The list has keys of its own (while open it is the screen's input scope, so keys reach it
//   and stop there; the pop-up menu it is made from has none):
//     Up / Down             the highlight to the previous / next entry that can be chosen
//                           (headers, entries of closed groups and inactive entries are passed
//                           over); from no highlight, Down goes to the first, Up to the last
//     Home / End            the first / last entry that can be chosen
//     Page Up / Page Down   a page of rows (the rows shown, less one) up / down, to the
//                           nearest entry that can be chosen there, stopping at the ends
//     Return                chooses the highlighted entry, as a click on it does; with no
//                           entry highlighted (nothing, or a header under the pointer) the
//                           list closes without a choice
//     Escape                closes without a choice
//   A highlight moved by a key scrolls its row into view. Other keys are left alone.
// - Its drop-down opens it with the selected entry highlighted and scrolled into view.
#include "menus/DropDownMenuData.h"
#include "menus/Menu.h"
#include "platform/misc/ValClient.h"

// The observer of a drop-down's selected index.
using ValObserverClient = ValClient<int>;

class DropDownMenu : public Menu, public ValObserverClient {
 public:
  // `selection`, when given, is the server of the selected physical index the list follows.
  DropDownMenu(const DropDownMenuData& data, Glob* owner, bool showSelection = true,
               ValServer<int>* selection = nullptr);
  DropDownMenu(const std::vector<MenuItem>& items, Glob* owner);

  int selectedIndex() const { return selected_; }
  // Highlights entry `index` and scrolls it into view; false, with nothing changed, when the
  // entry is no row the user could choose.
  bool highlightEntry(int index);
  bool showsSelection() const { return showSelection_; }

  const char* idstring() const override { return "DropDownMenu"; }
  bool m_is_type(const char* type) const override;
  int react(Event* e) override;
  void valChangedNtfy() override;

 protected:
  void drawMenuItem(Glib::Painter& p, const VisibleMenuItem& row) override;
  using Menu::drawMenuItem;
  void drawRightAlignedText(Glib::Painter& p, const VisibleMenuItem& row) override;
  Glib::TextStyles::TextStyle getTextStyle(int index) const override;
  // A row's face is the entry's own row colour (its drop-down gives entries left at the
  // default the menu colours of the palette around it).
  Colour getItemBackCol(int index) const override;

 private:
  // Whether entry `index` is a row the keys may highlight.
  bool canHighlight(const std::vector<bool>& hidden, int index) const;
  // The entry `count` rows from `from` (up for a negative count) that the keys may highlight,
  // nearest to that place and no further than the ends; -1 when none.
  int entryRowsAway(int from, int count) const;
  bool handleKey(unsigned key);

  int selected_ = -1;
  bool showSelection_ = true;
};
