#include "buttons/ImageButton.h"

#include <algorithm>

#include "buttons/ImageSearchPath.h"
#include "platform/glib/Image.h"
#include "platform/glib/Painter.h"

namespace {

XY<int> pictureSize(const WString& name) {
  if (name.empty()) return XY<int>(0, 0);
  const Kw::Ptr<Glib::Image> img = Glib::Image::load(imageSearchPath().resolve(name));
  return img ? XY<int>(img->width(), img->height()) : XY<int>(0, 0);
}

unsigned short clampSize(int v) {
  return static_cast<unsigned short>(std::clamp(v, 0, 0xFFFF));
}

GlobCreationInfo naturalPlacement(const WString& up, const WString& down, Canvas* parent) {
  const XY<int> s = ImageButton::naturalSize(up, down);
  return GlobCreationInfo(clampSize(s.x), clampSize(s.y), parent);
}

ButtonInitArgs sizedArgs(const ImageButtonInitArgs& args) {
  ButtonInitArgs sized = args;
  if (sized.width == 0 || sized.height == 0) {
    const XY<int> s = ImageButton::naturalSize(args.upImage, args.downImage);
    if (sized.width == 0) sized.width = clampSize(s.x);
    if (sized.height == 0) sized.height = clampSize(s.y);
  }
  return sized;
}

}  // namespace

ImageButton::ImageButton(const WString& upImage, const WString& downImage, const String& message,
                         unsigned short width, unsigned short height, Canvas* parent)
    : Button(WString(), message.c_str(), width, height, 0, parent) {
  setImages(upImage, downImage);
}

ImageButton::ImageButton(const WString& image, const String& message, Canvas* parent)
    : Button(WString(), message, naturalPlacement(image, image, parent)) {
  setImages(image, image);
}

ImageButton::ImageButton(const WString& upImage, const WString& downImage, const String& message,
                         Canvas* parent)
    : Button(WString(), message, naturalPlacement(upImage, downImage, parent)) {
  setImages(upImage, downImage);
}

ImageButton::ImageButton(const ImageButtonInitArgs& args) : Button(sizedArgs(args)) {
  setImages(args.upImage, args.downImage);
  transparentBackground = args.transparentBackground;
}

ImageButton::ImageButton(const ImageButton& other)
    : Button(other), transparentBackground(other.transparentBackground) {}

ImageButton& ImageButton::operator=(const ImageButton& other) {
  if (this == &other) return *this;
  Button::operator=(other);
  transparentBackground = other.transparentBackground;
  return *this;
}

XY<int> ImageButton::naturalSize(const WString& upImage, const WString& downImage) {
  const XY<int> a = pictureSize(upImage);
  const XY<int> b = pictureSize(downImage);
  int w = std::max(a.x, b.x), h = std::max(a.y, b.y);
  if (w == 0 || h == 0) w = h = Glib::Image::kPlaceholderSize;
  return XY<int>(w + 2 * kImageMargin, h + 2 * kImageMargin);
}

void ImageButton::setTransparentBackground(bool transparent) {
  if (transparent == transparentBackground) return;
  transparentBackground = transparent;
  update();
}

void ImageButton::setImages(const WString& upImage, const WString& downImage) {
  set_up_icon(Kw::toUtf8(upImage).c_str());
  set_down_icon(Kw::toUtf8(downImage).c_str());
}

void ImageButton::drawBackground() {
  if (!transparentBackground) Button::drawBackground();
}

void ImageButton::drawEdge() {
  if (!transparentBackground || get_state() == kButtonDown || isMouseInside()) Button::drawEdge();
}
