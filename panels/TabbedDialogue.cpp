#include "panels/TabbedDialogue.h"

#include <algorithm>

#include "buttons/Checkbox.h"
#include "panels/DialogueTab.h"
#include "panels/StandardTabPage.h"
#include "panels/TabRenameBox.h"
#include "panels/TabStrip.h"
#include "platform/glib/FontCache.h"
#include "platform/glib/Painter.h"
#include "platform/glib/look/TabLook.h"
#include "platform/glob/KeyCodes.h"
#include "platform/misc/Diagnostics.h"

const char* const TabbedDialogue::renamePageMsg = "PageRenamed";
const char* const TabbedDialogue::nameChangedMsg = "name_changed";

namespace {

bool isDefault(const Colour& c) {
  return c.a <= 0.0;
}

}  // namespace

TabbedDialogue::TabbedDialogue(unsigned short width, unsigned short height, bool dismissable,
                               Canvas* parent)
    : StandardPanel(GlobCreationInfo(width, height, parent)) {
  setDismissable(dismissable);
  init();
}

TabbedDialogue::TabbedDialogue(const GlobCreationInfo& info) : StandardPanel(info) {
  init();
}

TabbedDialogue::~TabbedDialogue() = default;

void TabbedDialogue::init() {
  StandardPanel::setBorderStyle(kDefaultBorder);
  strip_ = new TabStrip(GlobCreationInfo(10, TabStrip::kTabHeight, canvas()), *this);
  layoutStrip();
}

bool TabbedDialogue::refuse(const char* what, const WString& pageId) const {
  diagWarning(String("TabbedDialogue:: ") + what + " '" + Kw::toUtf8(pageId) + "'\n");
  return false;
}

// --- Geometry ---

Kw::Box<int> TabbedDialogue::pageArea() const {
  const Kw::Box<int> ua = getUserArea();
  return Kw::Box<int>(ua.x0, ua.y0, ua.x1, std::max(ua.y0, ua.y1 - TabStrip::kTabHeight));
}

XY<int> TabbedDialogue::getMaxPageSize() const {
  const Kw::Box<int> a = pageArea();
  return XY<int>(a.width(), a.height());
}

XY<double> TabbedDialogue::calcSize(XY<double> pageSize) {
  const double b = 2.0 * calcBorderSize(kDefaultBorder);
  return XY<double>(pageSize.x + b, pageSize.y + TabStrip::kTabHeight + b);
}

void TabbedDialogue::fitPage(Glob* page) const {
  if (!page) return;
  const Kw::Box<int> a = pageArea();
  const Kw::Box<int> r = page->canvas()->rect();
  if (r != a) page->reshape_canvas(a.x0, a.y0, a.width(), a.height());
}

void TabbedDialogue::layoutStrip() {
  const Kw::Box<int> ua = getUserArea();
  const int top = ua.y1;
  strip_->reshape_canvas(ua.x0, top - TabStrip::kTabHeight, std::max(0, ua.width()),
                         TabStrip::kTabHeight);
}

void TabbedDialogue::reshape() {
  StandardPanel::reshape();
  if (!strip_) return;
  layoutStrip();
  for (int i = 0; i < strip_->count(); ++i) fitPage(strip_->record(i).getPageBaseGlob());
}

void TabbedDialogue::setBorderStyle(UifTypeOfBorder border) {
  StandardPanel::setBorderStyle(border);
  if (strip_) reshape();
}

// --- Pages ---

bool TabbedDialogue::addRecord(TabRec rec) {
  if (rec.pageId.empty()) return refuse("empty page id", rec.pageId);
  if (strip_->find(rec.pageId) >= 0) return refuse("duplicate page id", rec.pageId);
  if (rec.name.empty()) rec.name = rec.pageId;
  strip_->append(std::move(rec));
  return true;
}

bool TabbedDialogue::addPage(const WString& pageId, const Colour& tabFace, const Colour& tabText,
                             const Colour& pageColour, Glob* page, bool select) {
  if (!page || !is_good_glob_ptr(page) || page == this) return refuse("no page for", pageId);
  TabRec rec;
  rec.pageId = pageId;
  rec.face = tabFace;
  rec.text = tabText;
  rec.setPageBaseGlob(page);
  if (!addRecord(std::move(rec))) return false;
  if (page->parent() != this) page->canvas()->reparent(canvas());
  if (!isDefault(pageColour)) page->setCol(pageColour, false);
  fitPage(page);
  const int index = strip_->count() - 1;
  if (strip_->current() < 0) {
    strip_->setCurrent(index);
    page->map_canvas();
  } else {
    page->unmap_canvas();
    if (select) switchTo(index, true);
  }
  return true;
}

StandardTabPage* TabbedDialogue::createStandardPage(const WString& pageId, const Colour& colour) {
  const XY<int> size = getMaxPageSize();
  auto* page = new StandardTabPage(GlobCreationInfo::withFlags(static_cast<unsigned short>(size.x),
                                                               static_cast<unsigned short>(size.y),
                                                               kGlobCreateUnmapped, canvas()),
                                   false);
  page->set_name(Kw::toUtf8(pageId));
  if (!addPage(pageId, kTabDefaultColour, kTabDefaultColour, colour, page, false)) {
    delete page;
    return nullptr;
  }
  return page;
}

StandardTabPage* TabbedDialogue::createTaggableStandardPage(const WString& pageId,
                                                            const Colour& colour) {
  const XY<int> size = getMaxPageSize();
  auto* page = new StandardTabPage(GlobCreationInfo::withFlags(static_cast<unsigned short>(size.x),
                                                               static_cast<unsigned short>(size.y),
                                                               kGlobCreateUnmapped, canvas()),
                                   true);
  page->set_name(Kw::toUtf8(pageId));
  if (!addPage(pageId, kTabDefaultColour, kTabDefaultColour, colour, page, false)) {
    delete page;
    return nullptr;
  }
  setCheckboxState(pageId, false);
  return page;
}

rect* TabbedDialogue::createAndInsertRectPage(const WString& pageId, const Colour& colour) {
  const XY<int> size = getMaxPageSize();
  auto* page = new rect(GlobCreationInfo::withFlags(static_cast<unsigned short>(size.x),
                                                    static_cast<unsigned short>(size.y),
                                                    kGlobCreateUnmapped, canvas()));
  page->set_name(Kw::toUtf8(pageId));
  if (!addPage(pageId, kTabDefaultColour, kTabDefaultColour, colour, page, false)) {
    delete page;
    return nullptr;
  }
  return page;
}

bool TabbedDialogue::removePage(unsigned index, bool destroy) {
  if (index >= pageCount()) return false;
  if (renaming_ >= 0) finishRenaming(false);
  const bool wasCurrent = static_cast<int>(index) == strip_->current();
  GlobHandle<> page = strip_->record(static_cast<int>(index)).page;
  strip_->remove(static_cast<int>(index));
  if (Glob* g = page.get()) {
    if (destroy) {
      delete g;
    } else {
      g->unmap_canvas();
    }
  }
  if (wasCurrent && strip_->count() > 0) {
    const int next = std::min(static_cast<int>(index), strip_->count() - 1);
    GlobHandle<> self(this);
    selectPage(strip_->record(next).pageId, true, false);
    if (!self) return true;
    if (strip_->current() < 0) switchTo(next, true);
  }
  update();
  return true;
}

bool TabbedDialogue::removePage(const WString& pageId, bool destroy) {
  const int index = findPageIdx(pageId);
  return index >= 0 && removePage(static_cast<unsigned>(index), destroy);
}

int TabbedDialogue::findPageIdx(const WString& pageId) const {
  return strip_->find(pageId);
}

unsigned TabbedDialogue::pageCount() const {
  return static_cast<unsigned>(strip_->count());
}

WString TabbedDialogue::getPageID(unsigned index) const {
  return index < pageCount() ? strip_->record(static_cast<int>(index)).pageId : WString();
}

bool TabbedDialogue::setPageID(unsigned index, const WString& pageId) {
  if (index >= pageCount() || pageId.empty()) return false;
  const int other = strip_->find(pageId);
  if (other >= 0 && other != static_cast<int>(index)) return refuse("duplicate page id", pageId);
  strip_->record(static_cast<int>(index)).pageId = pageId;
  return true;
}

WString TabbedDialogue::getTabName(unsigned index) const {
  return index < pageCount() ? strip_->record(static_cast<int>(index)).name : WString();
}

bool TabbedDialogue::setTabName(unsigned index, const WString& name) {
  if (index >= pageCount() || name.empty()) return false;
  strip_->setName(static_cast<int>(index), name);
  return true;
}

bool TabbedDialogue::setPageColour(unsigned index, const Colour& face, const Colour& text) {
  if (index >= pageCount()) return false;
  TabRec& r = strip_->record(static_cast<int>(index));
  r.face = face;
  r.text = text;
  if (DialogueTab* t = strip_->tabGlob(static_cast<int>(index))) t->update();
  return true;
}

Colour TabbedDialogue::getPageColour(unsigned index) const {
  if (index >= pageCount()) return kTabDefaultColour;
  const Colour& c = strip_->record(static_cast<int>(index)).face;
  return isDefault(c) ? Glib::TabLook(getPalette()).defaultFace() : c;
}

bool TabbedDialogue::setTextColour(const WString& pageId, const Colour& text, bool redraw) {
  TabRec* r = findRec(pageId);
  if (!r) return false;
  r->text = text;
  if (redraw) {
    if (DialogueTab* t = strip_->tabGlob(findPageIdx(pageId))) t->update();
  }
  return true;
}

Checkbox* TabbedDialogue::ensureCheckbox(TabRec& rec) {
  if (Checkbox* box = rec.checkbox.get()) return box;
  const int size = Checkbox::kBoxSize + 2;
  auto* box =
      new Checkbox(GlobCreationInfo::withFlags(size, size, kGlobCreateUnmapped, strip_->canvas()),
                   rec.checkboxState);
  box->setMargin(0);
  box->setMsgPrefix("TabCheckbox " + Kw::toUtf8(rec.pageId) + " ");
  box->set_name(Kw::toUtf8(rec.pageId));
  rec.checkbox = GlobHandle<Checkbox>(box);
  strip_->layout();
  return box;
}

bool TabbedDialogue::setCheckboxDataAdaptor(const WString& pageId,
                                            Kw::Ptr<ValAdaptorBase<bool>> adaptor) {
  TabRec* r = findRec(pageId);
  if (!r) return false;
  r->adaptor = adaptor;
  ensureCheckbox(*r)->setDataAdaptor(adaptor);
  return true;
}

bool TabbedDialogue::setCheckboxState(const WString& pageId, bool state) {
  TabRec* r = findRec(pageId);
  if (!r) return false;
  r->checkboxState = state;
  Checkbox* box = ensureCheckbox(*r);
  if (box->getState() != state) box->setState(state);
  return true;
}

bool TabbedDialogue::getCheckboxState(const WString& pageId) const {
  const int i = findPageIdx(pageId);
  if (i < 0) return false;
  const TabRec& r = strip_->record(i);
  if (const Checkbox* box = r.checkbox.get()) return box->getState();
  return r.checkboxState;
}

Glob* TabbedDialogue::getPageBaseGlob(const WString& pageId) const {
  const int i = findPageIdx(pageId);
  return i < 0 ? nullptr : strip_->record(i).getPageBaseGlob();
}

WString TabbedDialogue::currentPage() const {
  const int c = strip_->current();
  return c < 0 ? WString() : strip_->record(c).pageId;
}

TabRec* TabbedDialogue::findRec(const WString& pageId) {
  const int i = strip_->find(pageId);
  return i < 0 ? nullptr : &strip_->record(i);
}

// --- Selection ---

void TabbedDialogue::switchTo(int index, bool redraw) {
  refresh_off();
  const int old = strip_->current();
  if (old >= 0 && old != index) {
    if (Glob* g = strip_->record(old).getPageBaseGlob()) {
      // A focus on the page going out of sight comes to the dialogue, so that keys such as
      // Ctrl+Tab keep working.
      for (Glob* f = get_kbd_focus(this); f; f = f->parent()) {
        if (f == g) {
          set_kbd_focus();
          break;
        }
      }
      g->unmap_canvas();
    }
  }
  strip_->setCurrent(index);
  if (index >= 0) {
    if (Glob* g = strip_->record(index).getPageBaseGlob()) {
      fitPage(g);
      g->map_canvas();
      if (redraw) g->update();
    }
  }
  if (redraw) strip_->update();
  refresh_on();
}

bool TabbedDialogue::selectPage(const WString& pageId, bool redraw, bool leaving) {
  const int cur = strip_->current();
  if ((cur >= 0 && strip_->record(cur).pageId == pageId) || !isActive()) return true;
  if (leaving && cur >= 0) {
    GlobHandle<> self(this);
    leavingPage(strip_->record(cur).pageId);
    if (!self) return false;
  }
  const int index = strip_->find(pageId);
  if (index < 0) return false;
  if (renaming_ >= 0) finishRenaming(false);
  switchTo(index, redraw);
  return true;
}

int TabbedDialogue::getIdealTabWidth() {
  return strip_->idealWidth();
}

void TabbedDialogue::drawTab(Glob* tab, const WString& pageId) {
  const int index = findPageIdx(pageId);
  if (!tab || index < 0) return;
  Glib::Painter p(*tab->canvas());
  if (!p.active()) return;
  const Glib::TabLook look(getPalette());
  const TabRec& r = strip_->record(index);
  const Colour face = isDefault(r.face) ? look.defaultFace() : r.face;
  const Colour text = isDefault(r.text) ? look.defaultText() : r.text;
  Kw::Box<int> box = p.bounds();
  const bool hover = static_cast<DialogueTab*>(tab)->isHover();
  look.tab(p, box, face, text, r.checkbox.get() ? WString() : r.name, index == strip_->current(),
           hover, isActive());
  if (r.checkbox.get()) {
    // The name goes right of the check box.
    box.x0 += TabStrip::kCheckboxRoom;
    const auto font = Glib::fonts().standard();
    p.text(r.name, Kw::Box<int>(box.x0 + 2, box.y0 + 1, box.x1 - 4, box.y1 - 2), *font,
           isActive() ? text : getPalette().get(Palette::Disabled), TextAlignment::Centred);
  }
}

// --- Renaming ---

void TabbedDialogue::startRenaming(unsigned index) {
  if (index >= pageCount() || !isActive()) return;
  if (renaming_ >= 0) finishRenaming(false);
  if (!strip_->tabGlob(static_cast<int>(index))) strip_->setCurrent(static_cast<int>(index));
  const Kw::Box<int> tab = strip_->tabBox(static_cast<int>(index));
  const Kw::Box<int> s = strip_->canvas()->rect();
  TextBox::InitArgs args;
  args.info = GlobCreationInfo(static_cast<unsigned short>(std::max(10, tab.width() - 10)),
                               static_cast<unsigned short>(tab.height() - 2), canvas(),
                               s.x0 + tab.x0 + 5, s.y0 + tab.y0 + 1);
  args.text = strip_->record(static_cast<int>(index)).name;
  args.alignment = TextAlignment::Centred;
  auto* box = new TabRenameBox(args, *this);
  box->requestCallback(nameChangedMsg, this, TextBoxBase::FocusLostChanged);
  renameBox_ = GlobHandle<TabRenameBox>(box);
  renaming_ = static_cast<int>(index);
  box->set_kbd_focus();
}

void TabbedDialogue::finishRenaming(bool accept) {
  TabRenameBox* box = renameBox_.get();
  const int index = renaming_;
  renaming_ = -1;
  renameBox_.reset();
  if (!box) return;
  const WString name = box->getText();
  delete box;
  if (!accept || index < 0 || index >= strip_->count()) return;
  if (name.empty()) {
    diagWarning("TabbedDialogue:: empty tab name refused\n");
    return;
  }
  const WString old = strip_->record(index).name;
  if (name == old) return;
  strip_->setName(index, name);
  renamePage(static_cast<unsigned>(index), old, name);
}

void TabbedDialogue::renamePage(unsigned index, const WString& oldName, const WString& newName) {
  if (Glob* to = parent()) send_message_event(this, to, renamePageMsg);
}

// --- Events ---

int TabbedDialogue::handleMessageEvent(const String& msg, Glob* sender) {
  TabRenameBox* box = renameBox_.get();
  if (msg == nameChangedMsg || msg == TabRenameBox::closedMsg) {
    // Late reports of a box already closed are dropped.
    if (box && sender == box) finishRenaming(msg == nameChangedMsg);
    return 1;
  }
  return 0;
}

int TabbedDialogue::react(Event* e) {
  if (key_press_event(e) && strip_->count() > 0) {
    const unsigned code = e->keyCode();
    if (code == (kKeyCtrl | kKeyTab) || code == (kKeyCtrl | kKeyShift | kKeyTab)) {
      const int n = strip_->count();
      const int step = (code & kKeyShift) ? n - 1 : 1;
      const int next = (std::max(0, strip_->current()) + step) % n;
      selectPage(strip_->record(next).pageId, true, true);
      return 1;
    }
  }
  return StandardPanel::react(e);
}
