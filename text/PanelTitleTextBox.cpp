#include "text/PanelTitleTextBox.h"

#include "panels/StandardPanel.h"

namespace {

TextBox::InitArgs titleBoxArgs(StandardPanel& panel, unsigned short width, unsigned short height,
                               bool editable) {
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(width, height, panel.canvas());
  args.info.palette = panel.getPalette();
  args.text = panel.getTitleW();
  args.editable = editable;
  args.leftMargin = PanelTitleTextBox::kLeftMargin;
  args.rightMargin = PanelTitleTextBox::kRightMargin;
  return args;
}

}  // namespace

PanelTitleTextBox::PanelTitleTextBox(StandardPanel& panel, unsigned short width,
                                     unsigned short height, bool editable)
    : TextBox(titleBoxArgs(panel, width, height, editable)) {
  requestCallback(StandardPanel::titleChangedMsg, &panel, FocusLostChanged);
  requestCallback(StandardPanel::titleChangedMsg, &panel, EnterPressed);
}

void PanelTitleTextBox::showTitle(const WString& title) {
  if (getText() != title) setText(title);
}
