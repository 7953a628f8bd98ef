#include "buttons/RadioSet.h"

#include <algorithm>

#include "panels/PanelGeometry.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/PanelLook.h"
#include "platform/glob/GlobHandle.h"

RadioSet::RadioSet(const std::vector<WString>& labels, const GlobCreationInfo& info)
    : MenuGlob(info) {
  build(labels);
}

RadioSet::RadioSet(const std::vector<WString>& labels, unsigned short width, unsigned short height,
                   int flag, Canvas* parent)
    : MenuGlob(GlobCreationInfo::withFlags(width, height, flag, parent)) {
  build(labels);
}

void RadioSet::build(const std::vector<WString>& labels) {
  for (const WString& label : labels) {
    GlobCreationInfo where(1, 1, canvas());
    where.palette = getPalette();
    auto* b = new Button(label, kMemberMessage, where);
    b->set_latching(true);
    if (add_button(b) < 0) {
      delete b;
      break;
    }
  }
  set_current(0, true);
  reshape();
}

void RadioSet::set_current(int index, bool flag) {
  GlobHandle<RadioSet> self(this);
  const bool outer = !switching_;
  switching_ = true;
  RadioSetBase<Button>::set_current(index, flag);
  if (self && outer) switching_ = false;
}

bool RadioSet::setSelectedItem(int index) {
  if (!buttonAt(index)) return false;
  set_current(index, true);
  return true;
}

void RadioSet::setBorderStyle(UifTypeOfBorder border) {
  if (border == border_) return;
  border_ = border;
  reshape();
  update();
}

void RadioSet::reshape() {
  const int b = PanelGeometry::borderSize(border_);
  const int n = buttonCount();
  if (n == 0) return;
  const int w = std::max(0, width() - 2 * b), h = std::max(0, height() - 2 * b);
  const bool row = width() > height();
  const int span = (row ? w : h) - kGap * (n - 1);
  for (int i = 0; i < n; ++i) {
    Button* btn = buttonAt(i);
    if (!btn) continue;
    // Spread the remainder over the first members so the strip fills exactly.
    const int start = i * (span / n) + std::min(i, span % n) + i * kGap;
    const int size = std::max(1, span / n + (i < span % n ? 1 : 0));
    if (row) {
      btn->reshape_canvas(b + start, b, size, std::max(1, h));
    } else {
      btn->reshape_canvas(b, height() - b - start - size, std::max(1, w), size);
    }
  }
}

void RadioSet::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::PanelLook look(getPalette());
  look.groupFace(p);
  look.groupFrame(p, static_cast<Glib::PanelLook::Frame>(border_),
                  PanelGeometry::borderSize(border_));
}

void RadioSet::setActive(bool active, bool redraw) {
  refresh_off();
  MenuGlob::setActive(active, false);
  for (int i = 0; i < buttonCount(); ++i)
    if (Button* b = buttonAt(i)) b->setActive(active, redraw);
  if (redraw) update();
  refresh_on();
}

int RadioSet::react(Event* e) {
  if (message_event(e)) {
    Glob* sender = event_to_sender_glob(e);
    const int index = sender ? indexOf(dynamic_cast<Button*>(sender)) : -1;
    if (index >= 0) return reactToMember(e, index);
  }
  return MenuGlob::react(e);
}

int RadioSet::reactToMember(Event* e, int index) {
  const String& text = e->text();
  if (text.find(latchingBtnDownSuffix_) != String::npos) {
    set_current(index, true);
    // The parent answers synchronously and may delete the set: nothing is touched afterwards.
    if (Glob* p = parent()) call_msg(p, radioSetMessage());
    return 1;
  }
  // An " off": the previous button going up is swallowed; the selected one pressed again is
  // put back down.
  if (!switching_ && index == getCurrentButton()) {
    if (Button* b = buttonAt(index)) b->switch_state(kButtonDown, true);
  }
  return 1;
}

String RadioSet::describeValue() const {
  const Button* b = buttonAt(getCurrentButton());
  return b ? Kw::toUtf8(b->getString()) : String();
}
