#include "menus/MenuItem.h"

#include <algorithm>
#include <cwctype>

#include "platform/glob/Palette.h"
#include "platform/misc/UIString.h"

uint32_t MenuItem::lastID_ = 1;

namespace {

const WString kSeparator = L"||";

WString trimmed(const WString& s) {
  size_t b = 0;
  size_t e = s.size();
  while (b < e && std::iswspace(static_cast<wint_t>(s[b]))) ++b;
  while (e > b && std::iswspace(static_cast<wint_t>(s[e - 1]))) --e;
  return s.substr(b, e - b);
}

WString resourceText(unsigned int id) {
  return UIString(id).toWString();
}

}  // namespace

Colour MenuItem::getDefaultColour() {
  static const Colour colour = Palette().windowShade(3);
  return colour;
}

namespace {
const Colour& defaultTextColour() {
  static const Colour colour = Palette().get(Palette::WindowText);
  return colour;
}
}  // namespace

MenuItem::MenuItem() : col_(getDefaultColour()), fCol_(defaultTextColour()) {
  takeFreshId();
}

MenuItem::MenuItem(WString label, const String& msg, MenuItemType type) : MenuItem() {
  init(std::move(label), msg, type);
}

MenuItem::MenuItem(const WString& label, const String& msg, const Colour& col, MenuItemType type)
    : MenuItem(label, msg, type) {
  col_ = col;
}

MenuItem::MenuItem(const WString& label, const String& msg, const Colour& col, const Colour& fCol,
                   MenuItemType type)
    : MenuItem(label, msg, type) {
  col_ = col;
  fCol_ = fCol;
}

MenuItem::MenuItem(unsigned int resourceId, const String& msg, MenuItemType type)
    : MenuItem(resourceText(resourceId), msg, type) {}

MenuItem::MenuItem(unsigned int resourceId, const String& msg, const Colour& col, MenuItemType type)
    : MenuItem(resourceText(resourceId), msg, col, type) {}

MenuItem::MenuItem(unsigned int resourceId, const String& msg, const std::vector<WString>& options,
                   uint64_t curOption, MenuItemType type)
    : MenuItem(resourceText(resourceId), msg, type) {
  options_ = options;
  curOption_ = options_.empty() ? 0 : std::min<uint64_t>(curOption, options_.size() - 1);
}

MenuItem::MenuItem(const MenuItem& other)
    : type_(other.type_),
      label_(other.label_),
      tooltip_(other.tooltip_),
      msg_(other.msg_),
      col_(other.col_),
      fCol_(other.fCol_),
      options_(other.options_),
      curOption_(other.curOption_),
      textDisplayMode_(other.textDisplayMode_),
      flags_(other.flags_),
      font_(other.font_) {
  takeFreshId();
}

MenuItem& MenuItem::operator=(const MenuItem& other) {
  if (this == &other) return *this;
  type_ = other.type_;
  label_ = other.label_;
  tooltip_ = other.tooltip_;
  msg_ = other.msg_;
  col_ = other.col_;
  fCol_ = other.fCol_;
  options_ = other.options_;
  curOption_ = other.curOption_;
  textDisplayMode_ = other.textDisplayMode_;
  flags_ = other.flags_;
  font_ = other.font_;
  id_ = other.id_;
  return *this;
}

bool MenuItem::operator==(const MenuItem& o) const {
  return type_ == o.type_ && label_ == o.label_ && tooltip_ == o.tooltip_ && msg_ == o.msg_ &&
         col_ == o.col_ && fCol_ == o.fCol_ && options_ == o.options_ &&
         curOption_ == o.curOption_ && textDisplayMode_ == o.textDisplayMode_ &&
         flags_ == o.flags_ && font_ == o.font_;
}

void MenuItem::init(WString label, const String& msg, MenuItemType type) {
  label_ = std::move(label);
  msg_ = msg;
  type_ = type;
  options_.clear();
  curOption_ = 0;
  takeFreshId();
  if (type != SimpleMenuItem && type != GroupedMenuItem) return;
  const size_t sep = label_.find(kSeparator);
  if (sep == WString::npos) return;
  options_ = parseOptions(label_.substr(sep + kSeparator.size()), &curOption_);
}

std::vector<WString> MenuItem::parseOptions(const WString& part, uint64_t* current) {
  std::vector<WString> found;
  bool anyPlain = false;
  uint64_t plainIndex = 0;
  WString plain;
  auto endPlain = [&] {
    WString t = trimmed(plain);
    plain.clear();
    if (t.empty()) return;
    anyPlain = true;
    plainIndex = found.size();
    found.push_back(std::move(t));
  };
  size_t i = 0;
  while (i < part.size()) {
    const wchar_t c = part[i];
    if (c != L'[') {
      plain += c;
      ++i;
      continue;
    }
    const size_t close = part.find(L']', i + 1);
    if (close == WString::npos) {
      plain += part.substr(i);
      break;
    }
    endPlain();
    WString t = trimmed(part.substr(i + 1, close - i - 1));
    if (!t.empty()) found.push_back(std::move(t));
    i = close + 1;
    while (i < part.size() && std::iswspace(static_cast<wint_t>(part[i]))) ++i;
  }
  endPlain();
  if (found.size() < 2) found.clear();
  if (current) *current = found.empty() || !anyPlain ? 0 : plainIndex;
  return found;
}

WString MenuItem::getDisplayString() const {
  if (type_ == IconicMenuItem) return WString();
  const size_t sep = label_.find(kSeparator);
  return sep == WString::npos ? label_ : label_.substr(0, sep);
}

WString MenuItem::getRightAlignedText() const {
  if (!options_.empty()) return WString();
  const size_t sep = label_.find(kSeparator);
  return sep == WString::npos ? WString() : label_.substr(sep + kSeparator.size());
}

WString MenuItem::getCurOptionStr() const {
  return curOption_ < options_.size() ? options_[curOption_] : WString();
}

void MenuItem::incCurOption() {
  if (options_.empty()) return;
  curOption_ = curOption_ + 1 >= options_.size() ? 0 : curOption_ + 1;
}
