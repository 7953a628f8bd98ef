#include "dropdowns/DropDownImageButton.h"

#include "buttons/ImageSearchPath.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Image.h"
#include "platform/glib/Painter.h"

namespace {

std::vector<WString> labelsOf(const std::vector<DropDownImageButton::Item>& items) {
  std::vector<WString> out;
  out.reserve(items.size());
  for (const auto& it : items) out.push_back(it.label);
  return out;
}

}  // namespace

DropDownImageButton::DropDownImageButton(const std::vector<Item>& items,
                                         const GlobCreationInfo& info)
    : DropDownMenuButton(WString(), labelsOf(items), info) {
  for (const auto& it : items) images_.push_back(it.image);
}

void DropDownImageButton::setStrings(const std::vector<Item>& items) {
  images_.clear();
  for (const auto& it : items) images_.push_back(it.image);
  DropDownMenuButton::setStrings(labelsOf(items));
  update();
}

String DropDownImageButton::getSelectedImage() const {
  const int i = getSelectedItem();
  return i >= 0 && static_cast<size_t>(i) < images_.size() ? images_[i] : String();
}

void DropDownImageButton::drawLabel(Glib::Painter& p, const Kw::Box<int>& room) {
  const String name = getSelectedImage();
  const Kw::Ptr<Glib::Image> img =
      name.empty() ? Kw::Ptr<Glib::Image>() : Glib::Image::load(imageSearchPath().resolve(name));
  if (!img) {
    DropDownMenuButton::drawLabel(p, room);
    return;
  }
  const WString& text = shownLabel();
  const int right = drawIcon(p, *img, text.empty());
  if (text.empty()) return;
  DropDownMenuButton::drawLabel(p, Kw::Box<int>(right, room.y0, room.x1, room.y1));
}
