#pragma once
// A drop-down's list with an add row at its foot: pressing it tells the list's owner "MenuAdd"
// and closes the list. The drop-down passes "MenuAdd" on to its own owner, which adds the
// entry its own way.
//
// Decisions where the behaviour was left open:
// - The add row is a flat button (message "MenuAdd") across the foot of the list,
//   Glib::DropDownLook::kAddRowHeight pixels high, labelled kDefaultAddLabel unless told, under
//   a rule that parts it from the rows. A long list scrolls above it: the rows and the scroll
//   bar stop at the rule.
#include "dropdowns/DropDownMenu.h"
#include "platform/glib/look/DropDownLook.h"

class Button;

class MenuWithAddButton : public DropDownMenu {
 public:
  static const char* const AddMsg_;  // "MenuAdd"
  static constexpr const wchar_t* kDefaultAddLabel = L"Add...";

  MenuWithAddButton(const DropDownMenuData& data, Glob* owner, int width,
                    const WString& addLabel = kDefaultAddLabel,
                    ValServer<int>* selection = nullptr);

  Button* addButton() const;
  int calculateHeight() const override;
  int react(Event* e) override;
  void draw() override;
  void reshape() override;

 protected:
  int footHeight() const override { return Glib::DropDownLook::kAddRowHeight; }

 private:
  GlobHandle<> addButton_;
};
