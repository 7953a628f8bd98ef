#pragma once
// A tabbed dialogue whose pages are built when first selected, so that a dialogue with many
// pages opens quickly: addPageDeferred makes only the tab; the first selectPage of the page
// makes its page Glob (a StandardTabPage), marks it built and calls buildPage once.
//
//   selectPage(id, redraw, notify)    as TabbedDialogue (with `notify` as its leaving flag);
//                                     then, for a page not yet built, buildPage(id) and
//                                     reshapePage(id) (a StandardTabPage is resized by 1.0,
//                                     1.0 instead, as it lays itself out); then "TabChanged"
//                                     to the parent when `notify` is set
//
// Choices made here:
// - A buildPage that deletes the dialogue ends the selection: selectPage returns false and
//   touches nothing more.
// - setStartPage names the page shown first: it is selected (and built) at once when it
//   exists, or when it is added later. Without a start page the first page added is.
// - Tabs that users press report "TabChanged" (a user switch notifies).
// - addPageDeferred's colour is the tab's face; an empty description keeps the page id as the
//   tab's name, otherwise the description is stored on the tab and shown as its name.
#include "panels/TabbedDialogue.h"

class LazyTabbedDialogue : public TabbedDialogue {
 public:
  static const char* const tabChangedMsg;  // "TabChanged"

  LazyTabbedDialogue(unsigned short width, unsigned short height, bool dismissable, Canvas* parent,
                     const WString& startPage = WString());
  explicit LazyTabbedDialogue(const GlobCreationInfo& info);

  bool selectPage(const WString& pageId, bool redraw, bool notify) override;
  // Fills the page `pageId` (its page Glob is getPageBaseGlob(pageId)).
  virtual void buildPage(const WString& pageId) = 0;
  virtual void reshapePage(const WString& pageId) {}
  virtual void updatePage(const WString& pageId) {}

  bool addPageDeferred(const WString& pageId, const Colour& colour,
                       const WString& description = WString());
  void setStartPage(const WString& pageId);
  const WString& getStartPage() const { return startPage_; }
  bool pageBuilt(const WString& pageId) const;
  bool currentPageBuilt() const { return pageBuilt(currentPage()); }
  void redrawCurrentPage();
  const char* idstring() const override { return "lazytabbeddialogue"; }

 private:
  WString startPage_;
};
