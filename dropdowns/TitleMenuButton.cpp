#include "dropdowns/TitleMenuButton.h"

TitleMenuButton::TitleMenuButton(const TitleMenuButtonInitArgs& args)
    : TitledMenuButtonPlain(args.button, args.titleWidth) {}

TitleMenuButton::TitleMenuButton(const WString& title, const std::vector<WString>& entries,
                                 const Colour& colour, unsigned short width, unsigned short height,
                                 Canvas* parent)
    : TitledMenuButtonPlain(title, entries, colour, width, height, parent) {}

TitleMenuButton::TitleMenuButton(const WString& title, const std::vector<WString>& entries,
                                 const GlobCreationInfo& info, int titleWidth)
    : TitledMenuButtonPlain(title, entries, info, titleWidth) {}

int TitleMenuButton::getWidgetValue() {
  const DropDownMenuButton* b = getBtn();
  return b ? b->getSelectedItem() : -1;
}

void TitleMenuButton::setNewWidgetValue(int& value) {
  DropDownMenuButton* b = getBtn();
  if (b && value != b->getSelectedItem()) b->setSelectedItem(value);
}

int TitleMenuButton::handleButtonMessage(const String& msg) {
  if (msg == DropDownMenuButton::dropDownMenuButtonMsg) {
    GlobHandle<TitleMenuButton> self(this);
    const bool accepted = requestSetNewDataValue(getWidgetValue(), kChangeDirect);
    if (!self) return 1;
    // A refused choice: the drop-down goes back to what the model holds.
    if (!accepted) {
      if (auto a = getDataAdaptor()) a->forceWidgetUpdate();
      if (!self) return 1;
    }
  }
  return TitledMenuButtonPlain::handleButtonMessage(msg);
}
