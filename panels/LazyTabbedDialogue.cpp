#include "panels/LazyTabbedDialogue.h"

#include "panels/StandardTabPage.h"
#include "panels/TabStrip.h"

const char* const LazyTabbedDialogue::tabChangedMsg = "TabChanged";

LazyTabbedDialogue::LazyTabbedDialogue(unsigned short width, unsigned short height,
                                       bool dismissable, Canvas* parent, const WString& startPage)
    : TabbedDialogue(width, height, dismissable, parent), startPage_(startPage) {}

LazyTabbedDialogue::LazyTabbedDialogue(const GlobCreationInfo& info) : TabbedDialogue(info) {}

bool LazyTabbedDialogue::addPageDeferred(const WString& pageId, const Colour& colour,
                                         const WString& description) {
  TabRec rec;
  rec.pageId = pageId;
  rec.face = colour;
  rec.built = false;
  if (!description.empty()) {
    rec.description = description;
    rec.name = description;
  }
  if (!addRecord(std::move(rec))) return false;
  // The first page, or the start page, is shown at once (and so built).
  if (tabStrip().current() < 0 ? startPage_.empty() || startPage_ == pageId
                               : startPage_ == pageId) {
    selectPage(pageId, true, false);
  }
  return true;
}

void LazyTabbedDialogue::setStartPage(const WString& pageId) {
  startPage_ = pageId;
  if (findPageIdx(pageId) >= 0) selectPage(pageId, true, false);
}

bool LazyTabbedDialogue::pageBuilt(const WString& pageId) const {
  const int i = findPageIdx(pageId);
  return i >= 0 && tabStrip().record(i).built;
}

void LazyTabbedDialogue::redrawCurrentPage() {
  if (Glob* g = getPageBaseGlob(currentPage())) g->update();
}

bool LazyTabbedDialogue::selectPage(const WString& pageId, bool redraw, bool notify) {
  // A page to come gets its Glob first, so that the selection can show it.
  TabRec* rec = findRec(pageId);
  if (rec && !rec->getPageBaseGlob() && isActive()) {
    const XY<int> size = getMaxPageSize();
    auto* page =
        new StandardTabPage(GlobCreationInfo::withFlags(static_cast<unsigned short>(size.x),
                                                        static_cast<unsigned short>(size.y),
                                                        kGlobCreateUnmapped, canvas()),
                            false);
    page->set_name(Kw::toUtf8(pageId));
    rec->setPageBaseGlob(page);
    fitPage(page);
  }
  const bool wasCurrent = currentPage() == pageId;
  if (!TabbedDialogue::selectPage(pageId, redraw, notify)) return false;
  if (wasCurrent || !isActive()) return true;

  GlobHandle<> self(this);
  rec = findRec(pageId);
  if (rec && !rec->built) {
    rec->built = true;
    buildPage(pageId);
    if (!self) return false;
    rec = findRec(pageId);
    Glob* page = rec ? rec->getPageBaseGlob() : nullptr;
    if (auto* laidOut = dynamic_cast<StandardTabPage*>(page)) {
      laidOut->resize(1.0, 1.0);
    } else {
      reshapePage(pageId);
      if (!self) return false;
    }
  }
  if (notify) {
    if (Glob* to = parent()) send_message_event(this, to, tabChangedMsg);
  }
  return true;
}
