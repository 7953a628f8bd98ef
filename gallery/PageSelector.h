#pragma once
// The column of page entries at the window's left. It owns the entries, logs their reports
// like a page does, and hands the chosen page's number to the gallery.
#include <functional>
#include <vector>

#include "gallery/MessageLog.h"
#include "gallery/PageTab.h"

class PageSelector : public Glob {
 public:
  static constexpr int kEntryHeight = 36;
  static constexpr int kFirstEntryTop = 46;

  PageSelector(const GlobCreationInfo& info, MessageLog& log);

  void addEntry(const String& title, bool ready);
  void setSelected(int index);
  void setChoiceHandler(std::function<void(int)> handler) { onChoice_ = std::move(handler); }
  const std::vector<PageTab*>& entries() const { return tabs_; }

  int react(Event* e) override;
  void reshape() override;
  void draw() override;
  const char* idstring() const override { return "pageselector"; }

 private:
  void layout();

  MessageLog& log_;
  std::vector<PageTab*> tabs_;
  std::function<void(int)> onChoice_;
};
