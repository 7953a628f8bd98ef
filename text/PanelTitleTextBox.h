#pragma once
// The title box of a standard panel (standard-widget flags 0x20 and 0x40): a TextBox in the
// panel's title strip that shows the panel's title and, when editable, hands an edited title
// back to the panel with the message StandardPanel::titleChangedMsg on Enter and when the box
// loses the focus after a change.
//
// `install` makes `create` the panels' title-box factory. A program calls it once at start-up
// (the gallery does); until then panels make no title box, which keeps panels usable without
// the text subsystem.
#include <memory>

#include "panels/PanelTitleBox.h"
#include "platform/glob/GlobHandle.h"
#include "text/TextBox.h"

class PanelTitleTextBox : public PanelTitleBox {
 public:
  static constexpr unsigned char kLeftMargin = 0;
  static constexpr unsigned char kRightMargin = 5;

  explicit PanelTitleTextBox(TextBox* box) : box_(box) {}

  static std::unique_ptr<PanelTitleBox> create(StandardPanel& panel, unsigned short width,
                                               unsigned short height, bool editable);
  static void install();

  Glob* glob() override { return box_.get(); }
  TextBox* box() const { return box_.get(); }
  WString text() const override;
  void setText(const WString& text) override;

 private:
  GlobHandle<TextBox> box_;
};
