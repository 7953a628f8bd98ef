#pragma once
// The row of tabs along the top of a tabbed dialogue: the ordered tab records with a current
// one, and the layout that shows them.
//
// Layout: every tab has one width, the dialogue's ideal tab width, shrunk so that all the
// tabs fit but never below kMinTabWidth. When they still do not fit, the strip scrolls: the
// two arrows at its right end (and the wheel over the strip) move the first tab shown by one,
// and the current tab is always scrolled into view. Only the tabs in view have a Glob
// (DialogueTab); they are reused as the strip scrolls.
//
//   input on a tab                 what happens
//   left press                     the dialogue selects the page (as a user switch)
//   second left press within       the dialogue starts renaming the tab
//   kDoubleClickMs, same tab
//   left press on an arrow         scroll by one tab (nothing when already at that end)
//   wheel over the strip           scroll by one tab per step
#include <vector>

#include "panels/TabRec.h"
#include "platform/glob/Glob.h"

class DialogueTab;
class TabbedDialogue;

class TabStrip : public Glob {
 public:
  static constexpr int kTabHeight = 24;
  static constexpr int kMinTabWidth = 60;
  static constexpr int kMaxTabWidth = 180;
  static constexpr int kArrowsWidth = 36;
  static constexpr double kDoubleClickMs = 400.0;
  // Room the check box of a tab takes at the tab's left.
  static constexpr int kCheckboxRoom = 18;

  TabStrip(const GlobCreationInfo& info, TabbedDialogue& owner);

  // --- Records ---
  int count() const { return static_cast<int>(tabs_.size()); }
  TabRec& record(int index) { return tabs_[static_cast<size_t>(index)]; }
  const TabRec& record(int index) const { return tabs_[static_cast<size_t>(index)]; }
  int find(const WString& pageId) const;
  void append(TabRec rec);
  void remove(int index);
  int current() const { return current_; }
  // Makes `index` current (or none with -1) and scrolls it into view.
  void setCurrent(int index);
  void setName(int index, const WString& name);

  // --- Layout ---
  int tabWidth() const { return tabWidth_; }
  int firstShown() const { return first_; }
  int shownCount() const { return shown_; }
  bool scrolls() const { return scrolls_; }
  // The widest name plus the padding, within the limits.
  int idealWidth() const;
  void scrollBy(int tabs);
  void layout();
  // Where tab `index` is on the strip, or an empty box when it is out of view.
  Kw::Box<int> tabBox(int index) const;
  // The tab Glob showing `index`, or null when it is out of view.
  DialogueTab* tabGlob(int index) const;

  // --- From the tabs ---
  void tabPressed(DialogueTab& tab);
  void drawTab(DialogueTab& tab);

  int react(Event* e) override;
  void reshape() override { layout(); }
  void draw() override;
  const char* idstring() const override { return "tabstrip"; }

 private:
  Kw::Box<int> arrowsBox() const;
  void placeCheckboxes();
  void measure(TabRec& rec) const;

  TabbedDialogue& owner_;
  std::vector<TabRec> tabs_;
  std::vector<DialogueTab*> pool_;
  int current_ = -1;
  int first_ = 0;
  int shown_ = 0;
  int tabWidth_ = kMinTabWidth;
  bool scrolls_ = false;
  int widest_ = 0;
  // The last press on a tab, for telling double clicks.
  int lastPressIndex_ = -1;
  double lastPressAt_ = -1e9;
};
