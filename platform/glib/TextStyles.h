#pragma once
// How a line of text is rendered on top of its colour.

namespace Glib::TextStyles {

enum TextStyle : int {
  Plain = 0,     // the colour only
  Normal = 1,    // the standard control text; the default look renders it as Plain
  Embossed = 2,  // a one-pixel light edge under the text, for labels cut into a panel
  Shadowed = 3,  // a one-pixel dark shadow below and to the right, for text on bright faces
};

}  // namespace Glib::TextStyles
