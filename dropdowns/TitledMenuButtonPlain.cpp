#include "dropdowns/TitledMenuButtonPlain.h"

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/LabelLook.h"

TitledMenuButtonPlain::TitledMenuButtonPlain(const WString& title,
                                             const std::vector<WString>& entries,
                                             const GlobCreationInfo& info, int titleWidth)
    : rect(info), title_(title), titleWidth_(std::max(0, titleWidth)) {
  DDBtnInitArgs a(title, entries, GlobCreationInfo(1, 1, canvas()));
  make(a);
}

TitledMenuButtonPlain::TitledMenuButtonPlain(const WString& title,
                                             const std::vector<WString>& entries,
                                             const Colour& colour, unsigned short width,
                                             unsigned short height, Canvas* parent)
    : rect(width, height, 0, parent), title_(title) {
  DDBtnInitArgs a(title, entries, GlobCreationInfo(1, 1, canvas()));
  make(a);
  if (DropDownMenuButton* b = getBtn()) b->setCol(colour, false);
}

TitledMenuButtonPlain::TitledMenuButtonPlain(const DDBtnInitArgs& args, int titleWidth)
    : rect(args), title_(args.label), titleWidth_(std::max(0, titleWidth)) {
  DDBtnInitArgs a = args;
  static_cast<GlobCreationInfo&>(a) = GlobCreationInfo(1, 1, canvas());
  make(a);
}

void TitledMenuButtonPlain::make(DDBtnInitArgs args) {
  auto* b = new DropDownMenuButton(args);
  b->set_name(Kw::toUtf8(title_) + " drop-down");
  button_ = GlobHandle<DropDownMenuButton>(b);
  set_name(Kw::toUtf8(title_));
  layout();
}

void TitledMenuButtonPlain::setTitle(const WString& title) {
  if (title == title_) return;
  title_ = title;
  layout();
  update();
}

int TitledMenuButtonPlain::titleWidth() const {
  if (titleWidth_ > 0) return titleWidth_;
  return Glib::fonts().standard()->textWidth(title_);
}

void TitledMenuButtonPlain::layout() {
  DropDownMenuButton* b = getBtn();
  if (!b) return;
  const int x = title_.empty() ? 0 : titleWidth() + kSeparator;
  b->reshape_canvas(x, 0, std::max(1, width() - x), std::max(1, static_cast<int>(height())));
}

void TitledMenuButtonPlain::reshape() {
  layout();
}

int TitledMenuButtonPlain::react(Event* e) {
  if (message_event(e) && getBtn() && event_to_sender_glob(e) == getBtn()) {
    return handleButtonMessage(e->text());
  }
  return rect::react(e);
}

int TitledMenuButtonPlain::handleButtonMessage(const String& msg) {
  if (Glob* to = parent()) send_message_event(this, to, msg);
  return 1;
}

void TitledMenuButtonPlain::setActive(bool active, bool redraw) {
  if (active == isActive()) return;
  rect::setActive(active, redraw);
  if (DropDownMenuButton* b = getBtn()) b->setActive(active, redraw);
  if (redraw) update();
}

void TitledMenuButtonPlain::draw() {
  Glib::Painter p(*canvas());
  if (!p.active() || title_.empty()) return;
  const Kw::Box<int> box(0, 0, titleWidth(), height());
  Glib::LabelLook(getPalette()).title(p, title_, box, *Glib::fonts().standard(), isActive());
}
