#include "buttons/CheckboxRadioSet.h"

#include <algorithm>

const char* const CheckboxRadioSet::selectionChangedMsg = "CRSChanged";

CheckboxRadioSet::CheckboxRadioSet(const GlobCreationInfo& info) : StandardPanel(info) {}

CheckboxRadioSet::CheckboxRadioSet(unsigned short width, unsigned short height, int flag,
                                   Canvas* parent)
    : StandardPanel(GlobCreationInfo::withFlags(width, height, flag, parent)) {}

CheckboxRadioSet::CheckboxRadioSet(const InitArgs& args)
    : StandardPanel(static_cast<const GlobCreationInfo&>(args)) {
  setBorderStyle(args.borderStyle);
  appearance_ = args.appearance;
  boldWhenTicked_ = args.boldWhenTicked;
  addWidgets(args.labels);
  setSelectedItem(args.selected);
}

void CheckboxRadioSet::addWidgets(const std::vector<UIString>& labels) {
  const bool wasEmpty = memberCount() == 0;
  for (const UIString& text : labels) {
    GlobCreationInfo where(1, 1, canvas());
    where.palette = getPalette();
    auto* box = new Checkbox(where, false);
    box->setLabel(text.toWString());
    box->setAppearance(appearance_);
    box->setBoldWhenTicked(boldWhenTicked_);
    if (colourWhenTickedSet_) box->setTextColourWhenTicked(textColourWhenTicked_);
    box->setActive(isActive(), false);
    if (members_.add_button(box) < 0) {
      delete box;
      break;
    }
    addWidget(box, XY<int>(0, 0), OriginInnerTopLeft);
  }
  layoutMembers();
  if (wasEmpty && memberCount() > 0) select(0);
}

void CheckboxRadioSet::reshape() {
  StandardPanel::reshape();
  layoutMembers();
}

void CheckboxRadioSet::layoutMembers() {
  const int n = memberCount();
  if (n == 0) return;
  const Kw::Box<int> area = getUserArea();
  const int w = std::max(1, area.width()), h = std::max(1, area.height());
  const bool row = n * kMemberHeight + (n - 1) * kGap > h;
  for (int i = 0; i < n; ++i) {
    Checkbox* box = member(i);
    if (!box) continue;
    XY<int> pos, size;
    if (row) {
      const int each = std::max(1, (w - kGap * (n - 1)) / n);
      size = XY<int>(each, std::min(kMemberHeight, h));
      pos = XY<int>(i * (each + kGap), (h - size.y) / 2);
    } else {
      const int each = std::max(1, std::min(kMemberHeight, (h - kGap * (n - 1)) / n));
      size = XY<int>(w, each);
      pos = XY<int>(0, i * (each + kGap));
    }
    box->reshape_canvas(box->canvas()->rect().x0, box->canvas()->rect().y0, size.x, size.y);
    setWidgetPos(box, pos, OriginInnerTopLeft);
  }
  // A member keeping its offset is not placed again by setWidgetPos, yet its size changed.
  recalculateWidgetPositions();
}

int CheckboxRadioSet::getSelectedItem() const {
  for (int i = 0; i < memberCount(); ++i) {
    const Checkbox* box = member(i);
    if (box && box->getState()) return i;
  }
  return 0;
}

bool CheckboxRadioSet::setSelectedItem(int index) {
  if (index < 0 || index >= memberCount() || !member(index)) return false;
  if (index == getSelectedItem() && member(index)->getState()) return false;
  select(index);
  return true;
}

void CheckboxRadioSet::select(int index) {
  refresh_off();
  GlobHandle<CheckboxRadioSet> self(this);
  const int previous = getSelectedItem();
  if (Checkbox* old = member(previous); old && previous != index && old->getState()) {
    old->setState(false);
    // The member's model may have deleted the set or the member.
    if (!self) {
      refresh_on();
      return;
    }
    if ((old = member(previous))) old->setClicksEnabled(true);
  }
  if (Checkbox* box = member(index)) {
    box->setState(true);
    box->setClicksEnabled(false);
  }
  refresh_on();
}

void CheckboxRadioSet::reportSelection() {
  GlobHandle<CheckboxRadioSet> self(this);
  requestSetNewDataValue(getSelectedItem(), kChangeUserToggle);
  if (!self) return;
  if (Glob* p = parent()) call_msg(p, selectionChangedMsg);
}

int CheckboxRadioSet::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg.rfind(Checkbox::kDefaultPrefix, 0) != 0) return 0;
  const int index = members_.indexOf(dynamic_cast<Checkbox*>(sender));
  if (index < 0) return 0;
  Checkbox* box = member(index);
  if (!box->getState()) {
    box->setState(true);
    return 1;
  }
  GlobHandle<CheckboxRadioSet> self(this);
  refresh_off();
  for (int i = 0; i < memberCount(); ++i) {
    Checkbox* other = member(i);
    if (other && other != box && other->getState()) {
      other->setState(false);
      // Its model may have deleted the set or any member: read them again.
      if (!self) {
        refresh_on();
        return 1;
      }
      if ((other = member(i))) other->setClicksEnabled(true);
      break;
    }
  }
  if ((box = member(index))) box->setClicksEnabled(false);
  refresh_on();
  reportSelection();
  return 1;
}

void CheckboxRadioSet::checkboxClickCallback(Checkbox* box, void* set) {
  auto* self = static_cast<CheckboxRadioSet*>(set);
  if (!self || !is_good_glob_ptr(self) || !box || box->getState()) return;
  const int index = self->members_.indexOf(box);
  if (index < 0) return;
  self->select(index);
  self->reportSelection();
}

void CheckboxRadioSet::setActive(bool active, bool redraw) {
  refresh_off();
  StandardPanel::setActive(active, false);
  for (int i = 0; i < memberCount(); ++i)
    if (Checkbox* box = member(i)) box->setActive(active, redraw);
  if (redraw) update();
  refresh_on();
}

void CheckboxRadioSet::setBoldWhenTicked(bool b) {
  boldWhenTicked_ = b;
  for (int i = 0; i < memberCount(); ++i)
    if (Checkbox* box = member(i)) box->setBoldWhenTicked(b);
}

void CheckboxRadioSet::setTextColourWhenTicked(const Colour& c) {
  colourWhenTickedSet_ = true;
  textColourWhenTicked_ = c;
  for (int i = 0; i < memberCount(); ++i)
    if (Checkbox* box = member(i)) box->setTextColourWhenTicked(c);
}

void CheckboxRadioSet::setAppearance(Checkbox::Appearance a) {
  appearance_ = a;
  for (int i = 0; i < memberCount(); ++i)
    if (Checkbox* box = member(i)) box->setAppearance(a);
}
