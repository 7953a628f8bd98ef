#pragma once
// Workload W6 of the benchmark scene: a pop-up menu of many items on a 1920 x 1080 screen,
// built, shown until its first paint into the screen's image, and scrolled by one page until
// repainted. Each step is one call, so that other benchmarks can run the same steps.
#include <string>
#include <vector>

#include "bench/NumberedLabel.h"
#include "menus/Menu.h"
#include "platform/testing/Harness.h"
#include "platform/testing/MessageProbe.h"
#include "values/ScrollBar.h"

class MenuWorkload {
 public:
  static constexpr int kScreenWidth = 1920;
  static constexpr int kScreenHeight = 1080;

  MenuWorkload() {
    owner_ = new MessageProbe(h_.place(0, 0, kScreenWidth, kScreenHeight));
    h_.render();  // the image exists and is painted before anything is timed
  }

  // The items and the pop-up, not yet on the screen.
  void build(int itemCount) {
    MenuData data;
    data.owner = owner_;
    data.items.reserve(static_cast<size_t>(itemCount));
    for (int i = 0; i < itemCount; ++i) {
      data.items.emplace_back(numberedLabel(L"Item ", i), "item");
    }
    menu_ = new Menu(std::move(data));
  }
  // Pops the menu up at the screen's top-left corner and paints it.
  void show() {
    menu_->popUp(h_.root(), XY<int>(0, kScreenHeight));
    h_.render();
  }
  // One press in the scroll bar's trough below the thumb, its release, and the repaint.
  void scrollPage() {
    const XY<int> p = belowThumb();
    h_.press(p);
    h_.release(p);
    h_.render();
  }
  // True when there is no room for another page below the thumb.
  bool atEnd() const { return menu_->scrollOffset() + pageHeight() >= maxOffset(); }
  // Back to the top, painted.
  void rewind() {
    ScrollBar* bar = menu_->scrollBar();
    bar->setThumbPos(0.0);
    menu_->call_msg(menu_, ScrollBar::thumbMovedMsg.c_str());
    h_.render();
  }
  void close() {
    delete menu_;
    menu_ = nullptr;
    h_.render();
  }
  Menu* menu() const { return menu_; }

 private:
  int pageHeight() const {
    return static_cast<int>(menu_->visibleItems().size() - 1) * menu_->itemHeight();
  }
  int maxOffset() const { return menu_->nonHiddenRowCount() * menu_->itemHeight() - pageHeight(); }
  XY<int> belowThumb() const {
    const ScrollBar* bar = menu_->scrollBar();
    const Kw::Box<int> r = bar->canvas()->rootRect();
    return XY<int>((r.x0 + r.x1) / 2, r.y0 + ScrollBar::thickness() + 2);
  }

  Harness h_{kScreenWidth, kScreenHeight};
  MessageProbe* owner_ = nullptr;
  Menu* menu_ = nullptr;
};
