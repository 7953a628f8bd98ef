#include "lists/ChoiceList.h"

#include <algorithm>

#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/TableLook.h"
#include "platform/glob/KeyCodes.h"
#include "platform/glob/RootGlob.h"

const char* const ChoiceList::pickedMsg = "ChoiceList::picked";
const char* const ChoiceList::cancelledMsg = "ChoiceList::cancelled";

namespace {
constexpr int kFrame = 1;
}

ChoiceList* ChoiceList::open(Glob& owner, const Kw::Box<int>& rootBox,
                             const std::vector<WString>& choices, const WString& current) {
  RootGlob* root = owner.root();
  if (!root || choices.empty()) return nullptr;
  const auto font = Glib::fonts().standard();
  int width = rootBox.width();
  for (const WString& c : choices) width = std::max(width, font->textWidth(c) + 12);
  width = std::min(width, static_cast<int>(root->width()));
  const int rows = std::min(static_cast<int>(choices.size()), kMaxShown);
  const int height = rows * kRowHeight + 2 * kFrame;

  GlobCreationInfo info(static_cast<unsigned short>(width), static_cast<unsigned short>(height),
                        nullptr);
  info.palette = owner.getPalette();
  const auto at = std::find(choices.begin(), choices.end(), current);
  auto* list = new ChoiceList(info, owner, choices,
                              at == choices.end() ? 0 : static_cast<int>(at - choices.begin()));
  int y = rootBox.y0 - height;  // below the box; above it when there is no room
  if (y < 0) y = std::min(rootBox.y1, static_cast<int>(root->height()) - height);
  const int x = std::clamp(rootBox.x0, 0, std::max(0, static_cast<int>(root->width()) - width));
  if (!root->adopt(list, XY<int>(x, std::max(0, y)))) {
    delete list;
    return nullptr;
  }
  root->setFocus(list);
  return list;
}

ChoiceList::ChoiceList(const GlobCreationInfo& info, Glob& owner, std::vector<WString> choices,
                       int highlighted)
    : Glob(info), owner_(&owner), choices_(std::move(choices)) {
  highlight(highlighted);
}

int ChoiceList::shown() const {
  return std::min(static_cast<int>(choices_.size()), kMaxShown);
}

int ChoiceList::choiceAt(XY<int> pos) const {
  const int fromTop = height() - kFrame - 1 - pos.y;
  if (fromTop < 0 || pos.x < 0 || pos.x >= width()) return -1;
  const int i = first_ + fromTop / kRowHeight;
  return fromTop / kRowHeight < shown() && i < static_cast<int>(choices_.size()) ? i : -1;
}

void ChoiceList::highlight(int index) {
  const int n = static_cast<int>(choices_.size());
  if (n == 0) return;
  highlighted_ = std::clamp(index, 0, n - 1);
  if (highlighted_ < first_) first_ = highlighted_;
  if (highlighted_ >= first_ + shown()) first_ = highlighted_ - shown() + 1;
  update();
}

void ChoiceList::pick(int index) {
  if (finished_ || index < 0 || index >= static_cast<int>(choices_.size())) return;
  finished_ = true;
  Glob* owner = owner_.get();
  if (!owner) return;
  Event e = make_message_event(this, owner, pickedMsg);
  e.setPayload(Kw::toUtf8(choices_[static_cast<size_t>(index)]));
  event_send(&e, false);
}

void ChoiceList::cancel() {
  if (finished_) return;
  finished_ = true;
  if (Glob* owner = owner_.get()) send_message_event(this, owner, cancelledMsg);
}

int ChoiceList::react(Event* e) {
  if (mouse_event(e)) {
    if (mouse_wheel_event(e)) {
      const int maxFirst = static_cast<int>(choices_.size()) - shown();
      first_ = std::clamp(first_ - e->wheelSteps(), 0, std::max(0, maxFirst));
      update();
      return 1;
    }
    const int at = choiceAt(e->pos);
    if (mouse_move_event(e) && at >= 0 && at != highlighted_) highlight(at);
    if (mouse_left_event(e) && mouse_down_event(e) && at >= 0) pick(at);
    return 1;
  }
  if (key_press_event(e)) {
    const unsigned key = e->keyCode();
    if (key == kKeyUp)
      highlight(highlighted_ - 1);
    else if (key == kKeyDown)
      highlight(highlighted_ + 1);
    else if (key == kKeyPageUp)
      highlight(highlighted_ - kMaxShown);
    else if (key == kKeyPageDown)
      highlight(highlighted_ + kMaxShown);
    else if (key == kKeyHome)
      highlight(0);
    else if (key == kKeyEnd)
      highlight(static_cast<int>(choices_.size()) - 1);
    else if (key == kKeyReturn)
      pick(highlighted_);
    else if (key == kKeyEscape)
      cancel();
    return 1;  // the list holds the keys while it is open
  }
  return Glob::react(e);
}

void ChoiceList::handle_kbd_focus() {
  if (!hasKbdFocus()) cancel();
}

void ChoiceList::draw() {
  Glib::Painter p(*canvas());
  const Glib::TableLook look(getPalette());
  look.choiceFace(p, p.bounds());
  const auto font = Glib::fonts().standard();
  for (int i = 0; i < shown(); ++i) {
    const int top = height() - kFrame - i * kRowHeight;
    const int index = first_ + i;
    look.choice(p, Kw::Box<int>(kFrame, top - kRowHeight, width() - kFrame, top),
                choices_[static_cast<size_t>(index)], *font, index == highlighted_);
  }
}
