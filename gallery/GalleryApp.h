#pragma once
// The gallery window's content: a header, the pages in a lazy tabbed dialogue (one page per
// subsystem, built when its tab is first chosen) and the message log along the bottom. It fills its
// parent (the screen) and lays itself out again when the screen changes size.
#include <vector>

#include "gallery/GalleryDialogue.h"
#include "gallery/GalleryPage.h"
#include "gallery/MessageLog.h"
#include "gallery/MessageLogView.h"

class GalleryApp : public Glob {
 public:
  static constexpr int kHeaderHeight = 56;
  static constexpr int kLogHeight = 210;
  static constexpr int kMargin = 24;

  GalleryApp(Glob& screen, MessageLog& log);

  int pageCount() const;
  int currentPage() const;
  GalleryPage* page(int index) const;
  // The title of page `index`'s tab, built or not.
  String pageTitle(int index) const;
  // Shows page `index` (building it on first use); out-of-range numbers are refused and the
  // current page kept.
  void selectPage(int index);
  // Follows the screen's size; false (and nothing done) when it has not changed.
  bool fitToScreen();

  int react(Event* e) override;
  void reshape() override;
  void draw() override;
  const char* idstring() const override { return "gallery"; }
  String describeValue() const override;

 private:
  void layout();

  Glob& screen_;
  MessageLog& log_;
  GalleryDialogue* pages_ = nullptr;
  MessageLogView* logView_ = nullptr;
};
