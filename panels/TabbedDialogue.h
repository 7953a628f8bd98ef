#pragma once
// A standard panel with a row of named tabs along the top and one page per tab, one page
// shown at a time. Pages are named by a page id; the tab shows a name that the user can edit
// in place (a double click on the current tab).
//
//   input                               what happens
//   left press on a tab                 selectPage(id, true, true): leavingPage for the old
//                                       page, then the new page is shown
//   double click on the current tab     a TabRenameBox opens over it; a changed name arrives
//                                       as "name_changed" and becomes the tab's name
//                                       (renamePage: "PageRenamed" to the parent); an empty
//                                       name is refused and the old one kept
//   Ctrl+Tab / Ctrl+Shift+Tab           the next / previous page, wrapping round
//
// Choices made here:
// - addPage(id, tab face, tab text, page colour, page, select): a colour with alpha 0 stands
//   for the look's default; the page colour is given to the page (setCol) when it is opaque;
//   `select` shows the new page at once. The page becomes a child of the dialogue and fills
//   the page area. A duplicate or empty id, or a null or deleted page, is refused (false,
//   with a diagnostic) and nothing changes. The first page added becomes current.
// - removePage deletes the tab and, when `destroy` is set, the page. Removing the current
//   page selects its right neighbour (else its left one), without leavingPage or a report.
// - createTaggableStandardPage makes a standard page whose tab carries a check box.
// - The check box on a tab reports "TabCheckbox <page id> TICKED" / "CLEAR" to the dialogue's
//   parent, with the dialogue as sender.
// - The dialogue's border is raised (UifBorderRaised) unless changed; calcSize assumes it.
// - Selecting while the dialogue is inactive does nothing and succeeds; presses on its tabs
//   do nothing then.
#include <vector>

#include "panels/StandardPanel.h"
#include "panels/TabRec.h"
#include "panels/TabRenameBox.h"

class LazyTabbedDialogue;
class StandardTabPage;

class TabStrip;

class TabbedDialogue : public StandardPanel {
 public:
  static const char* const renamePageMsg;   // "PageRenamed"
  static const char* const nameChangedMsg;  // "name_changed"
  static constexpr UifTypeOfBorder kDefaultBorder = UifBorderRaised;

  TabbedDialogue(unsigned short width, unsigned short height, bool dismissable, Canvas* parent);
  explicit TabbedDialogue(const GlobCreationInfo& info);
  ~TabbedDialogue() override;

  // --- Virtual operations, in slot order ---
  // Shows the page `pageId`; false for an unknown id. `leaving` calls leavingPage first.
  virtual bool selectPage(const WString& pageId, bool redraw, bool leaving);
  // Draws the tab of `pageId` on `tab` (a Glob of the tab strip).
  virtual void drawTab(Glob* tab, const WString& pageId);
  virtual int getIdealTabWidth();
  virtual void leavingPage(const WString& pageId) {}
  virtual void renamePage(unsigned index, const WString& oldName, const WString& newName);

  // --- Pages ---
  bool addPage(const WString& pageId, const Colour& tabFace, const Colour& tabText,
               const Colour& pageColour, Glob* page, bool select);
  StandardTabPage* createStandardPage(const WString& pageId,
                                      const Colour& colour = kTabDefaultColour);
  StandardTabPage* createTaggableStandardPage(const WString& pageId,
                                              const Colour& colour = kTabDefaultColour);
  rect* createAndInsertRectPage(const WString& pageId, const Colour& colour = kTabDefaultColour);
  bool removePage(unsigned index, bool destroy);
  bool removePage(const WString& pageId, bool destroy);
  int findPageIdx(const WString& pageId) const;
  unsigned pageCount() const;
  WString getPageID(unsigned index) const;
  bool setPageID(unsigned index, const WString& pageId);
  WString getTabName(unsigned index) const;
  bool setTabName(unsigned index, const WString& name);
  bool setPageColour(unsigned index, const Colour& face, const Colour& text);
  Colour getPageColour(unsigned index) const;
  bool setTextColour(const WString& pageId, const Colour& text, bool redraw);
  bool setCheckboxDataAdaptor(const WString& pageId, Kw::Ptr<ValAdaptorBase<bool>> adaptor);
  bool setCheckboxState(const WString& pageId, bool state);
  bool getCheckboxState(const WString& pageId) const;
  Glob* getPageBaseGlob(const WString& pageId) const;
  // The current page's id, or empty.
  WString currentPage() const;
  // The size of the page area.
  XY<int> getMaxPageSize() const;
  // The size of a dialogue whose page area is `pageSize`.
  static XY<double> calcSize(XY<double> pageSize);
  TabStrip& tabStrip() const { return *strip_; }

  // --- Renaming ---
  void startRenaming(unsigned index);
  TabRenameBox* renameBox() const { return renameBox_.get(); }

  // --- Panel and Glob ---
  int react(Event* e) override;
  int handleMessageEvent(const String& msg, Glob* sender) override;
  void reshape() override;
  void setBorderStyle(UifTypeOfBorder border) override;
  const char* idstring() const override { return "tabbeddialogue"; }

 protected:
  // The tab record of `pageId`, or null.
  TabRec* findRec(const WString& pageId);
  // Adds a tab for a page to come (no page Glob yet) as a lazy dialogue does.
  bool addRecord(TabRec rec);
  // The page area, in the dialogue's coordinates.
  Kw::Box<int> pageArea() const;
  void fitPage(Glob* page) const;
  // Shows the given page in place of the current one, in one refresh hold.
  void switchTo(int index, bool redraw);

 private:
  void init();
  void layoutStrip();
  void finishRenaming(bool accept);
  Checkbox* ensureCheckbox(TabRec& rec);
  bool refuse(const char* what, const WString& pageId) const;

  TabStrip* strip_ = nullptr;
  GlobHandle<TabRenameBox> renameBox_;
  int renaming_ = -1;
};
