#include "dropdowns/ComboBox.h"

#include "dropdowns/ComboNumber.h"
#include "menus/MenuItemList.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/DropDownLook.h"
#include "platform/glob/RootGlob.h"

ComboBox::ComboBox(const DDBtnInitArgs& args) : DropDownMenuButton(args) {
  makeTextBox();
}

ComboBox::ComboBox(const WString& title, const std::vector<WString>& choices,
                   const GlobCreationInfo& info)
    : DropDownMenuButton(title, choices, info) {
  makeTextBox();
}

ComboBox::ComboBox(const WString& title, const std::vector<WString>& choices, const Colour& colour,
                   unsigned short width, unsigned short height, Canvas* parent)
    : DropDownMenuButton(title, choices, colour, width, height, parent) {
  makeTextBox();
}

void ComboBox::makeTextBox() {
  TextBox::InitArgs a;
  a.info = GlobCreationInfo(1, 1, canvas());
  a.text = getSelectedItemNameW();
  auto* box = new TextBox(a);
  Palette p = box->getPalette();
  p.set(Palette::Base, getPalette().windowShade(1));
  box->setPalette(p);
  box->set_name("Combo text");
  box->requestCallback(kReturnPressedMsg, this, TextBoxBase::EnterPressed);
  box->requestCallback(kTextLeftMsg, this, TextBoxBase::FocusLostChanged);
  textBox_ = GlobHandle<TextBox>(box);
  committed_ = a.text;
  placeTextBox();
}

void ComboBox::placeTextBox() {
  TextBox* box = textBox();
  if (!box) return;
  // kButtonRoom narrower than the face; a suffix, whose drawing is ours to choose, takes its
  // room out of the text box rather than out of the arrow column.
  const int w = std::max(1, width() - kButtonRoom - suffixWidth());
  const int h = std::max(1, height() - 2 * kTextBoxInset);
  box->reshape_canvas(kTextBoxInset, kTextBoxInset, w, h);
  box->setAlignment(settings_->suffix.empty() ? TextAlignment::Left : TextAlignment::Right);
}

int ComboBox::suffixWidth() const {
  if (settings_->suffix.empty()) return 0;
  return Glib::fonts().standard()->textWidth(settings_->suffix) + 2 * kTextBoxInset;
}

// --- Choices and text ---

void ComboBox::setChoices(const std::vector<WString>& choices) {
  setStrings(choices);
}

void ComboBox::setChoices(const std::vector<MenuItem>& items) {
  setStrings(items);
}

void ComboBox::selectionShown() {
  setString(getSelectedItemNameW());
}

void ComboBox::setString(const WString& text) {
  Button::setString(text);
  committed_ = text;
  if (TextBox* box = textBox(); box && box->getText() != text) box->setText(text);
}

WString ComboBox::getString() const {
  const TextBox* box = textBox();
  return box ? box->getText() : Button::getString();
}

int ComboBox::getAsInt() const {
  const auto v = ComboNumber::parse(getString(), true);
  return v ? ComboNumber::toInt(*v) : 0;
}

double ComboBox::getAsFloat() const {
  const auto v = ComboNumber::parse(getString(), true);
  return v ? *v : 0.0;
}

bool ComboBox::isSelectedCustom() const {
  return MenuItemList::findByDisplayString(menuData().items, getString()) < 0;
}

// --- Entry ---

void ComboBox::setNumericEntry(bool numeric, int minimum, int maximum, bool allowDecimals) {
  Settings s{numeric, minimum, maximum, allowDecimals, settings_->suffix};
  if (!(s == *settings_)) settings_.edit() = s;
  if (TextBox* box = textBox()) {
    if (numeric) {
      box->setCharacters(ComboNumber::characters(minimum, allowDecimals), TextBoxBase::OnlyListed);
    } else {
      box->setCharacters(WString(), TextBoxBase::NoRestriction);
    }
  }
}

void ComboBox::setSuffix(const WString& suffix) {
  if (suffix == settings_->suffix) return;
  settings_.edit().suffix = suffix;
  placeTextBox();
  update();
}

void ComboBox::setBufferSize(std::uint64_t size) {
  if (TextBox* box = textBox()) box->setSizeLimit(size);
}

void ComboBox::setCharacters(const WString& characters,
                             TextBoxBase::CharacterRestriction restriction) {
  if (TextBox* box = textBox()) box->setCharacters(characters, restriction);
}

// --- Drop-down ---

void ComboBox::informOwner() {
  setString(getSelectedItemNameW());
  tellParent();
}

void ComboBox::tellParent() {
  if (Glob* to = parent()) send_message_event(this, to, dropDownMenuButtonMsg);
}

void ComboBox::handleMouseWheelDelta(int delta) {
  GlobHandle<ComboBox> self(this);
  bool changed = false;
  Drawable::disableRedraws();
  if (settings_->numeric) {
    const int now = getAsInt();
    const int next = ComboNumber::step(now, delta, settings_->minimum, settings_->maximum);
    if (next != now) {
      setString(std::to_wstring(next));
      changed = true;
    }
  } else {
    const int next = getSelectedItem() + (delta < 1 ? 1 : -1);
    if (next >= 0 && next < getNumItems() && !MenuItemList::isGroupHeader(menuData().items, next)) {
      changed = setSelectedItem(next);
      if (self) setString(getSelectedItemNameW());
    }
  }
  Drawable::enableRedraws();
  if (changed && self) tellParent();
}

void ComboBox::commitText(bool always) {
  TextBox* box = textBox();
  if (!box) return;
  WString text = box->getText();
  if (!always && text == committed_) return;
  if (settings_->numeric) {
    const auto v = ComboNumber::parse(text, settings_->allowDecimals);
    if (!v) {
      box->setText(committed_);
      return;
    }
    text = ComboNumber::format(ComboNumber::clamp(*v, settings_->minimum, settings_->maximum));
    if (text != box->getText()) box->setText(text);
  }
  GlobHandle<ComboBox> self(this);
  const int match = MenuItemList::findByDisplayString(menuData().items, text);
  if (match >= 0 && match != getSelectedItem()) setSelectedItem(match);
  if (!self) return;
  setString(text);
  box->clearChanged();
  tellParent();
}

// --- Glob ---

int ComboBox::react(Event* e) {
  if (message_event(e) && textBox() && event_to_sender_glob(e) == textBox()) {
    const String msg = e->text();
    if (msg == kReturnPressedMsg || msg == kTextLeftMsg) {
      commitText(msg == kReturnPressedMsg);
      return 1;
    }
  }
  return DropDownMenuButton::react(e);
}

void ComboBox::reshape() {
  DropDownMenuButton::reshape();
  placeTextBox();
}

void ComboBox::setActive(bool active, bool redraw) {
  DropDownMenuButton::setActive(active, redraw);
  if (TextBox* box = textBox()) box->setActive(active, redraw);
}

void ComboBox::handleTabStopFocusReceipt() {
  if (TextBox* box = textBox()) {
    if (RootGlob* screen = root()) screen->setFocus(box);
    return;
  }
  DropDownMenuButton::handleTabStopFocusReceipt();
}

void ComboBox::handleTabStopFocusLoss() {
  TextBox* box = textBox();
  if (box && box->hasKbdFocus()) {
    if (RootGlob* screen = root()) screen->setFocus(parent());
    return;
  }
  DropDownMenuButton::handleTabStopFocusLoss();
}

void ComboBox::drawLabel(Glib::Painter& p, const Kw::Box<int>& room) {
  if (settings_->suffix.empty()) return;
  const int x0 = kTextBoxInset + std::max(1, width() - kButtonRoom - suffixWidth());
  const Kw::Box<int> box(x0 + kTextBoxInset, room.y0, room.x1, room.y1);
  if (box.empty()) return;
  p.text(settings_->suffix, box, *Glib::fonts().standard(),
         Glib::DropDownLook(getPalette()).suffixText(labelColour()), TextAlignment::Left);
}
