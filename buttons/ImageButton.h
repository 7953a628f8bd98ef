#pragma once
// A button that shows a picture for its up state and another for its down state. Pictures are
// named (e.g. "pin.png") and found through the image search path when drawn; a name found
// nowhere draws the image module's placeholder, reported once. With no down picture the up
// picture serves both states.
//
// The constructors without a size make the button the size of the larger picture plus a
// margin of kImageMargin pixels on every side (the standard bevel, so the picture shows at its
// own size); so does a zero width or height in the initialisation record. A picture larger
// than the room inside the bevel is shrunk to fit. A label, if given, goes to the right of the
// picture.
//
// With a transparent background the face is not painted, and the bevel shows only while the
// button is down or the pointer is over it: the parent shows through, as in a title strip.
#include "buttons/Button.h"

struct ImageButtonInitArgs : ButtonInitArgs {
  WString upImage;
  WString downImage;
  bool transparentBackground = false;

  ImageButtonInitArgs() = default;
  ImageButtonInitArgs(const WString& up, const WString& down, const String& msg,
                      const GlobCreationInfo& where)
      : ButtonInitArgs(WString(), msg, where), upImage(up), downImage(down) {}
};

class ImageButton : public Button {
 public:
  static constexpr int kImageMargin = 4;

  ImageButton(const WString& upImage, const WString& downImage, const String& message,
              unsigned short width, unsigned short height, Canvas* parent);
  ImageButton(const WString& image, const String& message, Canvas* parent);
  ImageButton(const WString& upImage, const WString& downImage, const String& message,
              Canvas* parent);
  explicit ImageButton(const ImageButtonInitArgs& args);
  ImageButton(const ImageButton& other);
  ImageButton& operator=(const ImageButton& other);

  void setTransparentBackground(bool transparent);
  bool getTransparentBackground() const { return transparentBackground; }
  // Empty names are ignored, as for the icons of any button.
  void setImages(const WString& upImage, const WString& downImage);
  WString getUpImage() const { return Kw::toWide(get_up_icon()); }
  WString getDownImage() const { return Kw::toWide(get_down_icon()); }

  // The size of the larger of the two pictures plus the margins (placeholders count as
  // Glib::Image::kPlaceholderSize square).
  static XY<int> naturalSize(const WString& upImage, const WString& downImage);

  void drawBackground() override;
  void drawEdge() override;

 private:
  bool transparentBackground = false;
};
