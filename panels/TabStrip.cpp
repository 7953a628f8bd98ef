#include "panels/TabStrip.h"

#include <algorithm>

#include "buttons/Checkbox.h"
#include "panels/DialogueTab.h"
#include "panels/TabbedDialogue.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/TabLook.h"

TabStrip::TabStrip(const GlobCreationInfo& info, TabbedDialogue& owner)
    : Glob(info), owner_(owner) {
  set_name("Tabs");
}

int TabStrip::find(const WString& pageId) const {
  for (size_t i = 0; i < tabs_.size(); ++i) {
    if (tabs_[i].pageId == pageId) return static_cast<int>(i);
  }
  return -1;
}

void TabStrip::measure(TabRec& rec) const {
  // Measured bold, as the current tab shows it, so that a tab never grows when chosen.
  rec.nameWidth = Glib::fonts()
                      .get(Glib::FontDesc(String(), Glib::kDefaultFontSize, Glib::FontDesc::Bold))
                      ->textWidth(rec.name);
}

void TabStrip::append(TabRec rec) {
  measure(rec);
  widest_ = std::max(widest_, rec.nameWidth);
  tabs_.push_back(std::move(rec));
  layout();
}

void TabStrip::remove(int index) {
  if (index < 0 || index >= count()) return;
  if (Checkbox* box = tabs_[index].checkbox.get()) delete box;
  tabs_.erase(tabs_.begin() + index);
  if (current_ == index) {
    current_ = -1;
  } else if (current_ > index) {
    --current_;
  }
  widest_ = 0;
  for (const TabRec& r : tabs_) widest_ = std::max(widest_, r.nameWidth);
  lastPressIndex_ = -1;
  layout();
}

void TabStrip::setCurrent(int index) {
  if (index < -1 || index >= count()) return;
  current_ = index;
  if (index >= 0 && shown_ > 0) {
    if (index < first_) first_ = index;
    if (index >= first_ + shown_) first_ = index - shown_ + 1;
  }
  layout();
  update();
}

void TabStrip::setName(int index, const WString& name) {
  if (index < 0 || index >= count()) return;
  TabRec& r = tabs_[index];
  r.name = name;
  measure(r);
  widest_ = 0;
  for (const TabRec& t : tabs_) widest_ = std::max(widest_, t.nameWidth);
  if (DialogueTab* t = tabGlob(index)) {
    t->set_name(Kw::toUtf8(name));
    t->update();
  }
  layout();
}

int TabStrip::idealWidth() const {
  return std::clamp(widest_ + 2 * Glib::TabLook::kTextPadding, kMinTabWidth, kMaxTabWidth);
}

void TabStrip::layout() {
  const int n = count();
  const int avail = width();
  int w = owner_.getIdealTabWidth();
  if (n > 0 && n * w > avail) w = std::max(kMinTabWidth, avail / n);
  tabWidth_ = std::max(1, w);
  scrolls_ = n * tabWidth_ > avail;
  const int room = scrolls_ ? std::max(0, avail - kArrowsWidth) : avail;
  shown_ = std::min(n, std::max(1, room / tabWidth_));
  first_ = std::clamp(first_, 0, std::max(0, n - shown_));
  if (current_ >= 0) {
    if (current_ < first_) first_ = current_;
    if (current_ >= first_ + shown_) first_ = current_ - shown_ + 1;
  }
  while (static_cast<int>(pool_.size()) < shown_) {
    GlobCreationInfo info = GlobCreationInfo::withFlags(static_cast<unsigned short>(tabWidth_),
                                                        kTabHeight, kGlobCreateUnmapped, canvas());
    pool_.push_back(new DialogueTab(info, *this));
  }
  for (size_t i = 0; i < pool_.size(); ++i) {
    DialogueTab* t = pool_[i];
    const int index = first_ + static_cast<int>(i);
    if (static_cast<int>(i) >= shown_ || index >= n) {
      t->show(-1);
      if (t->isVisible()) t->unmap_canvas();
      continue;
    }
    t->show(index);
    const Kw::Box<int> r = t->canvas()->rect();
    const int x = static_cast<int>(i) * tabWidth_;
    if (r.x0 != x || r.y0 != 0 || r.width() != tabWidth_ || r.height() != height())
      t->reshape_canvas(x, 0, tabWidth_, height());
    if (!t->isVisible()) t->map_canvas();
    t->update();
  }
  placeCheckboxes();
  update();
}

void TabStrip::placeCheckboxes() {
  for (int i = 0; i < count(); ++i) {
    Checkbox* box = tabs_[i].checkbox.get();
    if (!box) continue;
    DialogueTab* t = tabGlob(i);
    if (!t) {
      if (box->isVisible()) box->unmap_canvas();
      continue;
    }
    const Kw::Box<int> b = tabBox(i);
    const int size = Checkbox::kBoxSize + 2;
    box->reshape_canvas(b.x0 + 4, (height() - size) / 2, size, size);
    box->pop_to_top();
    if (!box->isVisible()) box->map_canvas();
  }
}

Kw::Box<int> TabStrip::tabBox(int index) const {
  if (index < first_ || index >= first_ + shown_ || index >= count()) return Kw::Box<int>();
  const int x = (index - first_) * tabWidth_;
  return Kw::Box<int>(x, 0, x + tabWidth_, height());
}

DialogueTab* TabStrip::tabGlob(int index) const {
  const int slot = index - first_;
  if (slot < 0 || slot >= shown_ || slot >= static_cast<int>(pool_.size())) return nullptr;
  return pool_[slot]->index() == index ? pool_[slot] : nullptr;
}

void TabStrip::scrollBy(int tabs) {
  const int n = count();
  const int first = std::clamp(first_ + tabs, 0, std::max(0, n - shown_));
  if (first == first_) return;
  first_ = first;
  // Scrolling by hand may leave the current tab out of view: layout() would pull it back.
  const int keep = current_;
  current_ = -1;
  layout();
  current_ = keep;
  for (DialogueTab* t : pool_) t->update();
}

Kw::Box<int> TabStrip::arrowsBox() const {
  return Kw::Box<int>(width() - kArrowsWidth, 0, width(), height());
}

void TabStrip::tabPressed(DialogueTab& tab) {
  const int index = tab.index();
  if (index < 0 || index >= count()) return;
  const double now = Glob::clock();
  const bool second =
      index == lastPressIndex_ && now - lastPressAt_ < kDoubleClickMs && now >= lastPressAt_;
  lastPressIndex_ = second ? -1 : index;
  lastPressAt_ = now;
  const WString id = tabs_[index].pageId;
  if (second && index == current_) {
    owner_.startRenaming(static_cast<unsigned>(index));
    return;
  }
  // The dialogue's owner may do anything here, this strip's deletion included.
  owner_.selectPage(id, true, true);
}

void TabStrip::drawTab(DialogueTab& tab) {
  const int index = tab.index();
  if (index < 0 || index >= count()) return;
  owner_.drawTab(&tab, tabs_[index].pageId);
}

int TabStrip::react(Event* e) {
  if (message_event(e)) {
    // A tab's check box: remember its state and pass its report on to the dialogue's owner.
    Glob* sender = event_to_sender_glob(e);
    for (TabRec& r : tabs_) {
      if (r.checkbox.get() && r.checkbox.get() == sender) {
        r.checkboxState = r.checkbox->getState();
        if (Glob* to = owner_.parent()) send_message_event(&owner_, to, e->text());
        return 1;
      }
    }
    return 0;
  }
  if (mouse_wheel_event(e)) {
    if (scrolls_) scrollBy(e->wheelSteps() > 0 ? -1 : 1);
    return 1;
  }
  if (mouse_event(e) && mouse_down_event(e) && mouse_left_event(e) && scrolls_ &&
      arrowsBox().contains(e->pos)) {
    scrollBy(e->pos.x < (arrowsBox().x0 + arrowsBox().x1) / 2 ? -1 : 1);
    return 1;
  }
  return Glob::react(e);
}

void TabStrip::draw() {
  Glib::Painter p(*canvas());
  if (!p.active()) return;
  const Glib::TabLook look(getPalette());
  look.strip(p, p.bounds());
  if (scrolls_) {
    look.scrollArrows(p, arrowsBox(), first_ > 0, first_ + shown_ < count());
  }
}
