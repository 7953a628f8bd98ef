#include "text/PanelTitleTextBox.h"

#include "panels/StandardPanel.h"

std::unique_ptr<PanelTitleBox> PanelTitleTextBox::create(StandardPanel& panel, unsigned short width,
                                                         unsigned short height, bool editable) {
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(width, height, panel.canvas());
  args.info.palette = panel.getPalette();
  args.text = panel.getTitleW();
  args.editable = editable;
  args.leftMargin = kLeftMargin;
  args.rightMargin = kRightMargin;
  auto* box = new TextBox(args);
  box->requestCallback(StandardPanel::titleChangedMsg, &panel, TextBoxBase::FocusLostChanged);
  box->requestCallback(StandardPanel::titleChangedMsg, &panel, TextBoxBase::EnterPressed);
  return std::make_unique<PanelTitleTextBox>(box);
}

void PanelTitleTextBox::install() {
  StandardPanel::setTitleBoxFactory(&PanelTitleTextBox::create);
}

WString PanelTitleTextBox::text() const {
  TextBox* b = box_.get();
  return b ? b->getText() : WString();
}

void PanelTitleTextBox::setText(const WString& text) {
  if (TextBox* b = box_.get()) {
    if (b->getText() != text) b->setText(text);
  }
}
