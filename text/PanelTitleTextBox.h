#pragma once
// The title box of a standard panel (standard-widget flags 0x20 and 0x40): a TextBox in the
// panel's title strip, 20 pixels high, with text margins 0 and 5, that shows the panel's title
// and, when editable, hands an edited title back to the panel with the message
// StandardPanel::titleChangedMsg on Enter and when the box loses the focus after a change.
//
// The panel makes, places, re-styles (read-only or editable) and deletes its box; nothing
// needs installing first.
#include "text/TextBox.h"

class StandardPanel;

class PanelTitleTextBox : public TextBox {
 public:
  static constexpr unsigned char kLeftMargin = 0;
  static constexpr unsigned char kRightMargin = 5;

  // A box on `panel`'s canvas, `width` by `height`, showing the panel's title.
  PanelTitleTextBox(StandardPanel& panel, unsigned short width, unsigned short height,
                    bool editable);

  // Shows `title` without reporting it back to the panel as an edit.
  void showTitle(const WString& title);
};
