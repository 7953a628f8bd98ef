#pragma once
// A drop-down button whose entries carry pictures: the face shows the selected entry's picture
// (found by name through the image search path) before its label; the list shows the labels.
//
// Decisions where the behaviour was left open:
// - An entry whose picture is not found shows its label alone; an entry with an empty label
//   shows its picture centred.
// - The entries are the labels for every purpose of the drop-down (selection by name, the
//   messages, stepping); the pictures only dress the face.
#include "dropdowns/DropDownMenuButton.h"

class DropDownImageButton : public DropDownMenuButton {
 public:
  struct Item {
    WString label;
    String image;  // a name for the image search path
  };

  DropDownImageButton(const std::vector<Item>& items, const GlobCreationInfo& info);

  void setStrings(const std::vector<Item>& items);
  // The picture name of the selected entry; empty when none.
  String getSelectedImage() const;
  const char* idstring() const override { return "ddimagebutton"; }

 protected:
  void drawLabel(Glib::Painter& p, const Kw::Box<int>& room) override;

 private:
  std::vector<String> images_;
};
