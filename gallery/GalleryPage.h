#pragma once
// One page of the gallery: a sheet of fixed size on which a subsystem shows its controls. The
// page is the owner of the controls made on it: every message event it receives goes to the
// message log. It also draws the page's heading and the titled cards that group controls.
#include <vector>

#include "gallery/MessageLog.h"
#include "platform/glob/Glob.h"

class GalleryLook;
namespace Glib {
class Painter;
}

class GalleryPage : public Glob {
 public:
  static constexpr int kWidth = 1000;
  static constexpr int kHeight = 520;
  // Where cards may start, below the heading.
  static constexpr int kContentTop = 84;

  GalleryPage(Canvas* parent, const String& title, const String& summary, MessageLog& log);

  // A creation record for a child whose top-left corner is `left` across and `top` down from
  // the sheet's top-left corner.
  GlobCreationInfo place(int left, int top, int width, int height) const;
  // A titled card drawn behind the controls, placed as above.
  void addCard(const String& title, int left, int top, int width, int height);
  // Marks the page as waiting for its subsystem: it shows what will come instead of controls.
  void showPlanned(const String& arrivesWith, const std::vector<String>& controls);
  bool isPlanned() const { return planned_; }
  const String& title() const { return title_; }

  int react(Event* e) override;
  void draw() override;
  const char* idstring() const override { return "gallerypage"; }
  String describeValue() const override { return title_; }

 private:
  struct Card {
    String title;
    Kw::Box<int> box;
  };
  Kw::Box<int> boxFromTop(int left, int top, int width, int height) const;
  void drawPlanned(Glib::Painter& p, const GalleryLook& look);

  String title_;
  String summary_;
  MessageLog& log_;
  std::vector<Card> cards_;
  bool planned_ = false;
  String arrivesWith_;
  std::vector<String> plannedControls_;
};
