#include "dropdowns/TitledComboBox.h"

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/LabelLook.h"

TitledComboBox::TitledComboBox(const TitledComboBoxInitArgs& args)
    : rect(args.info), title_(args.title.toWString()), titleWidth_(std::max(0, args.titleWidth)) {
  make(args.text.toWString(), args.choices);
}

TitledComboBox::TitledComboBox(const UIString& title, const UIString& text,
                               const std::vector<UIString>& choices, const GlobCreationInfo& info)
    : rect(info), title_(title.toWString()) {
  make(text.toWString(), choices);
}

void TitledComboBox::make(const WString& text, const std::vector<UIString>& choices) {
  std::vector<WString> texts;
  texts.reserve(choices.size());
  for (const UIString& c : choices) texts.push_back(c.toWString());
  auto* combo = new ComboBox(text, texts, GlobCreationInfo(1, 1, canvas()));
  combo->set_name(Kw::toUtf8(title_) + " combo box");
  combo_ = GlobHandle<ComboBox>(combo);
  set_name(Kw::toUtf8(title_));
  layout();
}

int TitledComboBox::titleWidth() const {
  if (titleWidth_ > 0) return titleWidth_;
  return Glib::fonts().standard()->textWidth(title_);
}

void TitledComboBox::layout() {
  ComboBox* c = getComboBox();
  if (!c) return;
  const int x = title_.empty() ? 0 : titleWidth() + separator_;
  c->reshape_canvas(x, 0, std::max(1, width() - x), std::max(1, static_cast<int>(height())));
}

void TitledComboBox::reshape() {
  layout();
}

// --- Passed to the combo box ---

void TitledComboBox::setString(const WString& text) {
  if (ComboBox* c = getComboBox()) c->setString(text);
}

WString TitledComboBox::getString() const {
  const ComboBox* c = getComboBox();
  return c ? c->getString() : WString();
}

int TitledComboBox::getAsInt() const {
  const ComboBox* c = getComboBox();
  return c ? c->getAsInt() : 0;
}

double TitledComboBox::getAsFloat() const {
  const ComboBox* c = getComboBox();
  return c ? c->getAsFloat() : 0.0;
}

void TitledComboBox::setChoices(const std::vector<WString>& choices) {
  if (ComboBox* c = getComboBox()) c->setChoices(choices);
}

void TitledComboBox::setNumericEntry(bool numeric, int minimum, int maximum, bool allowDecimals) {
  if (ComboBox* c = getComboBox()) c->setNumericEntry(numeric, minimum, maximum, allowDecimals);
}

void TitledComboBox::setBufferSize(std::uint64_t size) {
  if (ComboBox* c = getComboBox()) c->setBufferSize(size);
}

void TitledComboBox::setCharacters(const WString& characters,
                                   TextBoxBase::CharacterRestriction restriction) {
  if (ComboBox* c = getComboBox()) c->setCharacters(characters, restriction);
}

void TitledComboBox::setTextAlignment(TextAlignment alignment) {
  if (ComboBox* c = getComboBox(); c && c->textBox()) c->textBox()->setAlignment(alignment);
}

void TitledComboBox::setButtonStyle(button_style style, const Colour& colour) {
  if (ComboBox* c = getComboBox()) {
    c->set_style(style);
    c->setCol(colour, true);
  }
}

void TitledComboBox::setBorderStyle(UifTypeOfBorder border) {
  if (ComboBox* c = getComboBox(); c && c->textBox()) c->textBox()->setBorderStyle(border);
}

bool TitledComboBox::isSelectedCustom() const {
  const ComboBox* c = getComboBox();
  return c && c->isSelectedCustom();
}

bool TitledComboBox::isResponsibleFor(const Glob* widget) const {
  if (!widget) return false;
  const ComboBox* c = getComboBox();
  return widget == this || (c && (widget == c || widget == c->textBox()));
}

// --- Glob ---

void TitledComboBox::setActive(bool active, bool redraw) {
  if (active == isActive()) return;
  rect::setActive(active, redraw);
  if (ComboBox* c = getComboBox()) c->setActive(active, redraw);
  if (redraw) update();
}

int TitledComboBox::react(Event* e) {
  if (message_event(e) && getComboBox() && event_to_sender_glob(e) == getComboBox()) {
    if (Glob* to = parent()) send_message_event(this, to, e->text());
    return 1;
  }
  return rect::react(e);
}

void TitledComboBox::draw() {
  Glib::Painter p(*canvas());
  if (!p.active() || title_.empty()) return;
  Glib::LabelLook(getPalette())
      .title(p, title_, Kw::Box<int>(0, 0, titleWidth(), height()), *Glib::fonts().standard(),
             isActive());
}
