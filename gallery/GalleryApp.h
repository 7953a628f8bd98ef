#pragma once
// The gallery window's content: a header, the page selector on the left, one page per
// subsystem (one shown at a time) and the message log along the bottom. It fills its parent
// (the screen) and lays itself out again when the screen changes size.
#include <vector>

#include "gallery/GalleryPage.h"
#include "gallery/MessageLog.h"
#include "gallery/MessageLogView.h"
#include "gallery/PageSelector.h"

class GalleryApp : public Glob {
 public:
  static constexpr int kHeaderHeight = 56;
  static constexpr int kSidebarWidth = 220;
  static constexpr int kLogHeight = 210;
  static constexpr int kMargin = 24;

  GalleryApp(Glob& screen, MessageLog& log);

  int pageCount() const { return static_cast<int>(pages_.size()); }
  int currentPage() const { return current_; }
  GalleryPage* page(int index) const;
  // Shows page `index`; out-of-range numbers are refused and the current page kept.
  void selectPage(int index);
  // Follows the screen's size; false (and nothing done) when it has not changed.
  bool fitToScreen();

  void reshape() override;
  void draw() override;
  const char* idstring() const override { return "gallery"; }
  String describeValue() const override;

 private:
  void layout();

  Glob& screen_;
  MessageLog& log_;
  PageSelector* selector_ = nullptr;
  Glob* pageArea_ = nullptr;
  std::vector<GalleryPage*> pages_;
  MessageLogView* logView_ = nullptr;
  int current_ = -1;
};
