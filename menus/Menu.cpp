#include "menus/Menu.h"

#include <algorithm>
#include <cstdio>

#include "buttons/ImageButton.h"
#include "dropdowns/DropDownMenuButton.h"
#include "foundation/ListViewAdaptorBase.h"
#include "foundation/MenuGlob.h"
#include "menus/MenuDismisser.h"
#include "menus/MenuItemList.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/MenuLook.h"
#include "platform/glob/RootGlob.h"
#include "platform/glob/WindowPlacement.h"
#include "platform/misc/Config.h"
#include "platform/os/OS.h"
#include "values/ScrollBar.h"

const char* const Menu::itemSelectedMsg_ = "menu_itemSelected";
const char* const Menu::pootMsg_ = "menu_poot";

namespace {

constexpr int kTitleMargin = 12;
constexpr int kMinItemHeight = 20;
constexpr int kItemPadding = 5;
const WString kSeparator = L"||";

// The indices of the longest texts offered, at most Menu::kMeasuredItems of them.
class Longest {
 public:
  void offer(size_t length, int index) {
    if (length == 0) return;
    if (n_ == kSize && length <= entries_[n_ - 1].length) return;
    int at = n_ < kSize ? n_++ : kSize - 1;
    while (at > 0 && entries_[at - 1].length < length) {
      entries_[at] = entries_[at - 1];
      --at;
    }
    entries_[at] = Entry{length, index};
  }
  std::vector<int> indices() const {
    std::vector<int> out;
    for (int i = 0; i < n_; ++i) out.push_back(entries_[i].index);
    return out;
  }

 private:
  static constexpr int kSize = Menu::kMeasuredItems;
  struct Entry {
    size_t length = 0;
    int index = -1;
  };
  Entry entries_[kSize];
  int n_ = 0;
};

}  // namespace

// --- Construction ---

Menu::Menu(const MenuData& data, Glob* owner, int width, int height, unsigned flags)
    : Glob(GlobCreationInfo(1, 1, nullptr)) {
  items_ = data.items;
  flags_ = flags;
  hasBaseColour_ = data.hasBaseColour;
  baseColour_ = data.baseColour;
  maxVisibleRows_ = data.maxVisibleRows;
  if (height > 0) maxVisibleRows_ = std::max(1, height / itemHeight_);
  if (owner) setPalette(owner->getPalette());
  init(owner, width, (flags & MenuData::kShowTitle) ? kTitleMode : 0);
}

Menu::Menu(const MenuData& data) : Menu(data, data.owner, data.widthHint, 0, data.flags) {}

Menu::Menu(MenuData&& data) : Glob(GlobCreationInfo(1, 1, nullptr)) {
  items_ = std::move(data.items);
  flags_ = data.flags;
  hasBaseColour_ = data.hasBaseColour;
  baseColour_ = data.baseColour;
  maxVisibleRows_ = data.maxVisibleRows;
  if (data.owner) setPalette(data.owner->getPalette());
  init(data.owner, data.widthHint, (data.flags & MenuData::kShowTitle) ? kTitleMode : 0);
}

Menu::Menu(const std::vector<MenuItem>& items) : Glob(GlobCreationInfo(1, 1, nullptr)) {
  items_ = items;
  init(nullptr, 0, kTitleMode);
}

Menu::Menu(const configb& config) : Glob(GlobCreationInfo(1, 1, nullptr)) {
  init(nullptr, 0, kTitleMode);
  maxClickSeparation_ = config_int(config, kMaxClickSeparationKey, kDefaultMaxClickSeparation);
}

Menu::~Menu() {
  if (RootGlob* screen = root()) screen->removeInputScope(this);
  if (Glob* d = dismisser_.get()) delete d;
}

void Menu::init(Glob* owner, int width, int mode) {
  // draw() covers every pixel, so nothing beneath needs repainting with it.
  canvas()->setOpaque(true);
  highlighted_ = -1;
  secondRow_ = -1;
  owner_ = GlobHandle<>(owner);
  minWidth_ = std::max(minWidth_, width);
  requestedMode_ = mode;
  font_ = Glib::fonts().standard();
  itemHeight_ =
      static_cast<unsigned short>(std::max(kMinItemHeight, font_->height() + kItemPadding));
  maxClickSeparation_ = config_int(kMaxClickSeparationKey, kDefaultMaxClickSeparation);
  titleColour_ = Glib::MenuLook(getPalette()).titleText();
  calcTitleString();
  rebuild();
}

void Menu::calcTitleString() {
  WString t = setTitle_;
  if (t.empty()) {
    if (auto* owner = dynamic_cast<MenuGlob*>(owner_.get())) {
      try {
        t = owner->getMenuTitle();
      } catch (...) {
        std::fputs("Invalid cookie container in Menu::getTitle()\n", stdout);
        std::fflush(stdout);
        t.clear();
      }
    }
  }
  title_ = t;
  titleMode_ = requestedMode_ == kTitleMode && !title_.empty() ? kTitleMode : 0;
}

// --- Showing ---

bool Menu::popUp(RootGlob& screen, XY<int> pointer) {
  if (shown_ || (rows_.empty() && iconicCount_ == 0)) return false;
  setPalette(screen.getPalette());
  if (Glob* o = owner_.get()) setPalette(o->getPalette());
  screenRows_ = std::max(1, (screen.height() - titlePart() - iconStripHeight()) / itemHeight_);
  screenSize_ = XY<int>(screen.width(), screen.height());
  relayout();
  shown_ = true;
  const XY<int> size(width(), height());
  const XY<int> at =
      WindowPlacement::keepOnScreen(screen, size, XY<int>(pointer.x, pointer.y - size.y));
  if (flags_ & MenuData::kCloseOnOutsideClick) {
    auto* catcher = new MenuDismisser(this, XY<int>(screen.width(), screen.height()));
    screen.adopt(catcher, XY<int>(0, 0));
    screen.followScreenSize(catcher);
    dismisser_ = GlobHandle<>(catcher);
  }
  screen.adopt(this, at);
  screen.addInputScope(this);
  mouseInside_ = canvas()->rootRect().contains(screen.pointer());
  calcHighlightItem(pointerInside());
  return true;
}

// --- Items ---

void Menu::redisplay(const std::vector<MenuItem>& items) {
  if (&items != &items_) items_ = items;
  rebuild();
}

bool Menu::changeItem(const WString& oldText, const WString& newText) {
  const int i = MenuItemList::findByDisplayString(items_, oldText);
  if (i < 0) return false;
  items_[i].label(newText);
  itemChangedById(items_[i].id());
  return true;
}

bool Menu::changeMessage(const WString& label, const String& msg) {
  const int i = MenuItemList::findByDisplayString(items_, label);
  if (i < 0) return false;
  items_[i].msg(msg);
  return true;
}

bool Menu::setCurrentChoice(const WString& label, uint64_t n) {
  const int i = MenuItemList::findByDisplayString(items_, label);
  if (i < 0 || n >= items_[i].options().size() || items_[i].curOption() == n) return false;
  items_[i].setCurOption(n);
  if (auto* dd = dynamic_cast<DropDownMenuButton*>(widgetForItem(i))) {
    dd->setSelectedItem(static_cast<int>(n));
  }
  redrawItem(i);
  return true;
}

int Menu::getCurrentChoiceIndex(const WString& label) const {
  const int i = MenuItemList::findByDisplayString(items_, label);
  return i < 0 || items_[i].options().empty() ? -1 : static_cast<int>(items_[i].curOption());
}

WString Menu::getCurrentChoice(const WString& label) const {
  const int i = MenuItemList::findByDisplayString(items_, label);
  return i < 0 ? WString() : items_[i].getCurOptionStr();
}

void Menu::itemChangedById(uint32_t id) {
  const int i = MenuItemList::findById(items_, id);
  if (i >= 0) redrawItem(i);
}

// --- Presentation ---

void Menu::setTitle(const WString& title, const Colour& colour) {
  setTitle_ = title;
  titleColour_ = colour;
  calcTitleString();
  contentWidth_ = measureWidth();
  relayout();
}

void Menu::setMinWidth(int width) {
  if (width == minWidth_ || width < 0) return;
  minWidth_ = width;
  relayout();
}

void Menu::setAlignment(TextAlignment alignment) {
  if (alignment == alignment_) return;
  alignment_ = alignment;
  update();
}

void Menu::setOwner(Glob* owner) {
  owner_ = GlobHandle<>(owner);
  calcTitleString();
  contentWidth_ = measureWidth();
  relayout();
}

void Menu::setMaxVisibleRows(int rows) {
  maxVisibleRows_ = rows < 0 ? -1 : rows;
  relayout();
}

// --- Rows and geometry ---

void Menu::rebuild() {
  rebuildRows();
  createWidgetsForItems();
  if (highlighted_ >= static_cast<int>(items_.size())) highlighted_ = -1;
  contentWidth_ = measureWidth();
  relayout();
}

void Menu::rebuildRows() {
  rows_.clear();
  rows_.reserve(items_.size());
  iconicCount_ = 0;
  choiceCount_ = 0;
  bool closed = false;  // the nearest header above is compressed
  for (size_t i = 0; i < items_.size(); ++i) {
    const MenuItemType t = items_[i].type();
    if (t == IconicMenuItem) {
      ++iconicCount_;
      continue;
    }
    if (!items_[i].options().empty()) ++choiceCount_;
    if (t == ExpandedGroupItem || t == CompressedGroupItem) closed = t == CompressedGroupItem;
    if (t != GroupedMenuItem || !closed) rows_.push_back(static_cast<int>(i));
  }
}

int Menu::visibleRowCount() const {
  int n = static_cast<int>(rows_.size());
  if (maxVisibleRows_ >= 0) n = std::min(n, maxVisibleRows_);
  if (screenRows_ >= 0) n = std::min(n, screenRows_);
  return n;
}

int Menu::calculateHeight() const {
  return titlePart() + iconStripHeight() + itemHeight_ * visibleRowCount();
}

int Menu::maxOffset() const {
  return std::max(0, (static_cast<int>(rows_.size()) - visibleRowCount()) * itemHeight_);
}

int Menu::rowsTop() const {
  return height() - titlePart() - iconStripHeight();
}

int Menu::rowsRight() const {
  const int right = width() - 1;
  return scrollBar_ ? right - ScrollBar::thickness() : right;
}

int Menu::measureWidth() const {
  // One pass keeps the kMeasuredItems longest labels and right-hand texts; only they are
  // measured.
  Longest labels;
  Longest rights;
  bool anyOptions = false;
  for (size_t i = 0; i < items_.size(); ++i) {
    const MenuItem& it = items_[i];
    if (it.type() == IconicMenuItem) continue;
    const WString& label = it.label();
    const size_t sep = label.find(kSeparator);
    labels.offer(sep == WString::npos ? label.size() : sep, static_cast<int>(i));
    if (!it.options().empty()) {
      anyOptions = true;
      size_t widest = 0;
      for (const WString& o : it.options()) widest = std::max(widest, o.size());
      rights.offer(widest, static_cast<int>(i));
    } else if (sep != WString::npos) {
      rights.offer(label.size() - sep - kSeparator.size(), static_cast<int>(i));
    }
  }
  int labelW = 0;
  for (int i : labels.indices()) {
    labelW = std::max(labelW, fontFor(items_[i])->textWidth(items_[i].getDisplayString()));
  }
  int rightW = 0;
  for (int i : rights.indices()) {
    const MenuItem& it = items_[i];
    const Glib::FontPtr f = fontFor(it);
    if (it.options().empty()) rightW = std::max(rightW, f->textWidth(it.getRightAlignedText()));
    for (const WString& o : it.options()) rightW = std::max(rightW, f->textWidth(o));
  }
  int w = 2 + kGlyphColumn + labelW + kRightMargin;
  if (rightW > 0) w += kColumnGap + rightW + (anyOptions ? kChoiceMarkRoom : 0);
  if (titleMode_ == kTitleMode) w = std::max(w, font_->textWidth(title_) + 2 * kTitleMargin);
  if (iconicCount_ > 0) w = std::max(w, 4 + iconicCount_ * (kIconSize + 2));
  return std::max(w, minWidth_);
}

void Menu::relayout() {
  const bool needBar = static_cast<int>(rows_.size()) > visibleRowCount();
  int w = std::max(contentWidth_, minWidth_) + (needBar ? ScrollBar::thickness() : 0);
  const int h = std::max(1, calculateHeight());
  if (screenSize_.x > 0) w = std::min(w, screenSize_.x);
  const Kw::Box<int> r = canvas()->rect();
  XY<int> at(r.x0, r.y1 - h);  // the top edge stays
  if (shown_) at = WindowPlacement::keepInside(screenSize_, XY<int>(w, h), at);
  reshape_canvas(at.x, at.y, w, h);

  if (needBar && !scrollBar_) addScrollbar();
  if (!needBar && scrollBar_) {
    delete scrollBar_.get();
    scrollBar_.reset();
  }
  if (ScrollBar* bar = scrollBar()) {
    const int t = ScrollBar::thickness();
    const int foot = footHeight();
    bar->reshape_canvas(w - 1 - t, 1 + foot, t,
                        std::max(ScrollBar::minSizePixels(), rowsTop() - 1 - foot));
  }
  int k = 0;
  for (const auto& [index, g] : widgets_) {
    Glob* b = g.get();
    if (b && items_[index].type() == IconicMenuItem) {
      b->reshape_canvas(2 + k * (kIconSize + 2), rowsTop() + 2, kIconSize, kIconSize);
      ++k;
    }
  }
  scrollOffset_ = std::clamp(scrollOffset_, 0, maxOffset());
  updateScrollbar();
  rebuildVisible();
  update();
}

ScrollBar* Menu::scrollBar() const {
  return static_cast<ScrollBar*>(scrollBar_.get());
}

void Menu::addScrollbar() {
  ScrollBarInitArgs args(
      GlobCreationInfo(static_cast<unsigned short>(ScrollBar::thickness()),
                       static_cast<unsigned short>(ScrollBar::minSizePixels()), canvas()),
      kVertical);
  scrollBar_ = GlobHandle<>(new ScrollBar(args));
}

void Menu::updateScrollbar() {
  ScrollBar* bar = scrollBar();
  if (!bar) return;
  const double total = static_cast<double>(rows_.size()) * itemHeight_;
  if (total <= 0) return;
  bar->setThumbSize(visibleRowCount() * itemHeight_ / total);
  bar->setThumbPos(scrollOffset_ / total);
}

void Menu::rebuildVisible() {
  visible_.clear();
  const int top = rowsTop();
  const int right = rowsRight();
  const int ih = itemHeight_;
  for (int r = scrollOffset_ / ih; r < static_cast<int>(rows_.size()); ++r) {
    const int rowTop = top - (r * ih - scrollOffset_);
    if (rowTop <= footHeight()) break;
    visible_.push_back(VisibleMenuItem{Kw::Box<int>(1, rowTop - ih, right, rowTop), rows_[r]});
  }
  if (choiceCount_ > 0) placeChoiceWidgets();
}

void Menu::placeChoiceWidgets() {
  for (const auto& [index, g] : widgets_) {
    Glob* dd = g.get();
    if (!dd || items_[index].type() == IconicMenuItem) continue;
    const Kw::Box<int> area = itemArea(index);
    if (area.height() < itemHeight_) {
      dd->unmap_canvas();  // a row scrolled partly or wholly out of view hides its drop-down
      continue;
    }
    const Glib::FontPtr f = fontFor(items_[index]);
    int widest = 0;
    for (const WString& o : items_[index].options()) widest = std::max(widest, f->textWidth(o));
    const int w = std::min(area.width() / 2, widest + kChoiceMarkRoom + kRightMargin + 16);
    dd->reshape_canvas(area.x1 - w, area.y0 + 1, w - 1, area.height() - 2);
    dd->map_canvas();
  }
}

bool Menu::setScrollOffset(int offset) {
  offset = std::clamp(offset, 0, maxOffset());
  if (offset == scrollOffset_) return false;
  refresh_off();
  scrollOffset_ = offset;
  updateScrollbar();
  rebuildVisible();
  calcHighlightItem(pointerInside());
  update(Kw::Box<int>(0, 0, rowsRight(), rowsTop()));
  refresh_on();
  return true;
}

bool Menu::scrollToItem(int index) {
  const auto at = std::lower_bound(rows_.begin(), rows_.end(), index);
  if (at == rows_.end() || *at != index) return false;
  const int top = static_cast<int>(at - rows_.begin()) * itemHeight_;
  const int room = visibleRowCount() * itemHeight_;
  if (top < scrollOffset_) {
    setScrollOffset(top);
  } else if (top + itemHeight_ > scrollOffset_ + room) {
    setScrollOffset(top + itemHeight_ - room);
  }
  return true;
}

Kw::Box<int> Menu::itemArea(int index) const {
  for (const VisibleMenuItem& v : visible_) {
    if (v.index == index)
      return v.area.intersection(Kw::Box<int>(0, footHeight(), rowsRight(), rowsTop()));
  }
  return Kw::Box<int>();
}

int Menu::findItemAtPos(const XY<int>& pos) const {
  if (pos.y >= rowsTop() || pos.y < footHeight()) return -1;
  for (const VisibleMenuItem& v : visible_) {
    if (v.area.contains(pos)) return v.index;
  }
  return -1;
}

// --- Widgets of iconic items ---

void Menu::createWidgetsForItems() {
  destroyWidgets();
  if (iconicCount_ == 0 && choiceCount_ == 0) return;
  for (size_t i = 0; i < items_.size(); ++i) {
    if (!items_[i].options().empty() && items_[i].type() != IconicMenuItem) {
      auto* dd =
          new DropDownMenuButton(WString(), items_[i].options(), GlobCreationInfo(1, 1, canvas()));
      dd->set_style(kButtonStyleFlat);
      dd->setCol(items_[i].col(), false);
      dd->setSelectedItem(static_cast<int>(items_[i].curOption()));
      dd->setActive(items_[i].getActive(), false);
      dd->unmap_canvas();  // placeChoiceWidgets shows it with its row
      widgets_.emplace_back(static_cast<int>(i), GlobHandle<>(dd));
      continue;
    }
    if (items_[i].type() != IconicMenuItem) continue;
    const WString& label = items_[i].label();
    const size_t comma = label.find(L',');
    const WString up = label.substr(0, comma);
    const WString down = comma == WString::npos ? WString() : label.substr(comma + 1);
    auto* b = new ImageButton(up, down, items_[i].msg(), kIconSize, kIconSize, canvas());
    b->setActive(items_[i].getActive(), false);
    if (!items_[i].getTooltip().empty()) b->setContextString(Kw::toUtf8(items_[i].getTooltip()));
    widgets_.emplace_back(static_cast<int>(i), GlobHandle<>(b));
  }
}

void Menu::destroyWidgets() {
  for (auto& [index, g] : widgets_) {
    if (Glob* b = g.get()) delete b;
  }
  widgets_.clear();
}

Glob* Menu::widgetForItem(int index) const {
  for (const auto& [i, g] : widgets_) {
    if (i == index) return g.get();
  }
  return nullptr;
}

int Menu::findItemFromWidget(const Glob* widget) const {
  if (!widget) return -1;
  for (const auto& [i, g] : widgets_) {
    if (g.get() == widget) return i;
  }
  return -1;
}

// --- Highlight ---

XY<int> Menu::pointerInside() const {
  RootGlob* screen = root();
  if (!screen) return XY<int>(-1, -1);
  return screen->pointer() - canvas()->rootOrigin();
}

void Menu::calcHighlightItem(const XY<int>& pos) {
  int index = -1;
  if (mouseInside_) {
    index = findItemAtPos(pos);
    if (index >= 0) {
      const MenuItem& it = items_[index];
      const bool usable = !it.getDisplayString().empty() && it.getActive();
      if (!usable && !it.isGroupHeader()) index = -1;
    }
  }
  setHighlight(index);
}

void Menu::setHighlight(int index) {
  if (index == highlighted_) return;
  const int old = highlighted_;
  highlighted_ = index;
  refresh_off();
  redrawItem(old);
  redrawItem(index);
  refresh_on();
}

void Menu::redrawItem(int index) {
  if (index < 0) return;
  const Kw::Box<int> area = itemArea(index);
  if (!area.empty()) update(area);
}

void Menu::handleMouseContainment(bool inside) {
  mouseInside_ = inside;
  calcHighlightItem(pointerInside());
}

// --- Help under the pointer ---

String Menu::contextString(const XY<int>& pos, CanvasClient* asker) {
  const int index = findItemAtPos(pos);
  if (index < 0 || !items_[index].getActive()) return Glob::contextString(pos, asker);
  const MenuItem& it = items_[index];
  if (it.type() == CompressedGroupItem) {
    WString list;
    const int last = MenuItemList::lastGroupedItem(items_, index);
    for (int i = index + 1; i <= last; ++i) {
      if (items_[i].type() == GroupedMenuItem) list += items_[i].getDisplayString() + L"\n";
    }
    if (!list.empty()) return Kw::toUtf8(list);
  }
  if (!it.getDisplayString().empty() && !it.getTooltip().empty()) {
    return Kw::toUtf8(it.getTooltip());
  }
  return Glob::contextString(pos, asker);
}

MouseCursorID Menu::contextCursor(const XY<int>& pos) {
  const int index = findItemAtPos(pos);
  if (index >= 0 && items_[index].getActive()) {
    const MenuItem& it = items_[index];
    if (!it.getDisplayString().empty()) return kCursorHand;
    if (it.type() == CompressedGroupItem && MenuItemList::lastGroupedItem(items_, index) >= 0) {
      return kCursorHand;
    }
  }
  return Glob::contextCursor(pos);
}

// --- Events ---

int Menu::react(Event* e) {
  if (message_event(e)) {
    if (handleMessageEvent(e->text(), event_to_sender_glob(e)) != 0) return 1;
  } else if (mouse_event(e)) {
    if (handleMouseEvent(e) != 0) return 1;
  }
  return Glob::react(e);
}

int Menu::handleMouseEvent(Event* e) {
  if (mouse_wheel_event(e)) {
    setScrollOffset(scrollOffset_ - e->wheelSteps() * itemHeight_);
    return 1;
  }
  if (mouse_move_event(e)) {
    mouseInside_ = canvas()->localBounds().contains(e->pos);
    calcHighlightItem(e->pos);
    return 1;
  }
  if (!mouse_left_event(e)) return 1;
  if (mouse_down_event(e)) {
    pressedItem_ = findItemAtPos(e->pos);
    return 1;
  }
  if (mouse_up_event(e)) {
    const int index = findItemAtPos(e->pos);
    const bool same = index >= 0 && index == pressedItem_;
    pressedItem_ = -1;
    if (!same) return 1;
    if (items_[index].isGroupHeader()) {
      toggleGroup(index);
    } else {
      chooseItem(index);
    }
  }
  return 1;
}

int Menu::handleMessageEvent(const String& msg, Glob* sender) {
  if (msg == kPootMsg) {
    close();
    return 1;
  }
  if (msg.rfind(kFreezeFlipPrefix, 0) == 0) {
    secondRow_ = -1;
    return 1;
  }
  const int index = findItemFromWidget(sender);
  if (msg == kBtnHighlightMsg && sender) {
    if (index >= 0 && items_[index].type() != IconicMenuItem) setHighlight(index);
    return 1;
  }
  if (index >= 0 && items_[index].type() == IconicMenuItem && sender->m_is_type("button")) {
    chooseIconic(index);
    return 1;
  }
  if (index >= 0 && msg == DropDownMenuButton::dropDownMenuButtonMsg) {
    chooseFromDropDown(index, sender);
    return 1;
  }
  return handleScrollBarMessages(msg);
}

int Menu::handleScrollBarMessages(const String& msg) {
  if (!ScrollBar::isScrollBarMsg(msg)) return 0;
  const int ih = itemHeight_;
  const int total = ih * static_cast<int>(rows_.size());
  if (msg == ScrollBar::thumbMovedMsg) {
    const ScrollBar* bar = scrollBar();
    if (!bar) return 1;
    const int offset = static_cast<int>(bar->getThumbPos() * total + 0.5);
    if (offset != scrollOffset_) setScrollOffset(offset);
    return 1;
  }
  int offset = scrollOffset_;
  if (msg == ScrollBar::downButtonPressedMsg) {
    offset += ih;
  } else if (msg == ScrollBar::upButtonPressedMsg) {
    if (offset > 0) offset -= ih;
  } else {
    return 1;
  }
  setScrollOffset(offset);
  return 1;
}

// --- Choosing ---

void Menu::toggleGroup(int index) {
  if (MenuItemList::headerCount(items_) <= 1) return;
  const MenuItemType next =
      items_[index].type() == ExpandedGroupItem ? CompressedGroupItem : ExpandedGroupItem;
  items_[index].type(next);
  if (OS()->keyboard().isKeyDown(OSKeyboard::kShift)) {
    for (size_t i = static_cast<size_t>(index) + 1; i < items_.size(); ++i) {
      if (items_[i].isGroupHeader()) items_[i].type(next);
    }
  }
  refresh_off();
  redisplay(items_);
  calcHighlightItem(pointerInside());
  refresh_on();
}

bool Menu::tellOwner(const String& msg) {
  GlobHandle<Menu> self(this);
  if (Glob* o = owner_.get()) send_message_event(this, o, msg);
  return self.alive();
}

void Menu::chooseItem(int index) {
  MenuItem& it = items_[index];
  if (!it.getActive() || it.getDisplayString().empty()) return;
  if (!it.options().empty()) {
    it.incCurOption();
    if (auto* dd = dynamic_cast<DropDownMenuButton*>(widgetForItem(index))) {
      dd->setSelectedItem(static_cast<int>(it.curOption()));
    }
    redrawItem(index);
  }
  const bool keepOpen = (it.getFlags() & MenuItem::kStaysOpen) != 0;
  if (!tellOwner(it.msg())) return;
  closeAfterChoice(keepOpen);
}

void Menu::chooseFromDropDown(int index, Glob* dropDown) {
  auto* dd = dynamic_cast<DropDownMenuButton*>(dropDown);
  MenuItem& it = items_[index];
  if (!dd || it.options().empty()) return;
  const int choice = dd->getSelectedItem();
  if (choice >= 0) it.setCurOption(static_cast<uint64_t>(choice));
  redrawItem(index);
  const bool keepOpen = (it.getFlags() & MenuItem::kStaysOpen) != 0;
  if (!tellOwner(it.msg())) return;
  closeAfterChoice(keepOpen);
}

void Menu::chooseIconic(int index) {
  if (!items_[index].getActive()) return;
  if (!tellOwner(items_[index].msg())) return;
  closeAfterChoice(false);
}

void Menu::closeAfterChoice(bool keepOpen) {
  if (pinned() || keepOpen) {
    tellOwner(itemSelectedMsg_);
    return;
  }
  send_message_event(this, this, kPootMsg);
}

void Menu::close() {
  if (closing_) return;
  closing_ = true;
  GlobHandle<Menu> self(this);
  if (Glob* o = owner_.get()) send_message_event(this, o, pootMsg_);
  // The owner may have removed the pop-up already.
  if (self) delete this;
}

// --- Data adaptor ---

void Menu::setDataAdaptor(Kw::Ptr<ListViewAdaptorBase> a) {
  ListViewWidget::setDataAdaptor(a);
  updateFromData();
}

void Menu::updateFromData() {
  const unsigned n = getSize();
  if (n <= items_.size()) return;
  const Colour row = hasBaseColour_ ? baseColour_ : Glib::MenuLook(getPalette()).itemFace();
  const Colour text = getPalette().get(Palette::WindowText);
  for (unsigned i = static_cast<unsigned>(items_.size()); i < n; ++i) {
    const WString t = (*this)[i];
    items_.emplace_back(t, "Selected:" + Kw::toUtf8(t), row, text, SimpleMenuItem);
  }
  rebuild();
}

void Menu::addItemText(unsigned) {
  updateFromData();
}

void Menu::removeItemText(unsigned) {
  update();
}

void Menu::itemChanged(unsigned) {
  update();
}
