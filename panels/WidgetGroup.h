#pragma once
// The plain widget group: a framed area with a title in its top edge that holds widgets and
// acts on them together (activates or deactivates them as one). It is a standard panel, so
// its widgets are placed by the panel's rules; the inner origins lie inside the frame and
// below the title strip.
//
// Geometry (pixels, y upward):
//   title strip   the top kTitleHeight, the frame's top edge through its middle, the title
//                 kTitleIndent in from the left, breaking the edge
//   frame         kFrameWidth at the left, right and bottom; the user area starts a further
//                 kFrameWidth below the title strip
// so a group is kTitleAndFrame (32) pixels higher than its user area.
//
// Choices made here:
// - setGroupTitle(text, redraw, notify): an unchanged title does nothing; `notify` calls
//   handleTitleChange after the title is stored.
// - setActive(active, redraw) takes the group and every grouped widget with it;
//   setWidgetsActive only the widgets.
// - The edge colour, when none was set, is the palette's shadow colour.
#include "panels/StandardPanel.h"

class WidgetGroup : public StandardPanel {
 public:
  static constexpr int kTitleHeight = 22;
  static constexpr int kFrameWidth = 5;
  static constexpr int kTitleIndent = 8;
  static constexpr int kTitleAndFrame = kTitleHeight + 2 * kFrameWidth;
  // The height of a group shrunk to its title: the title strip and the bottom frame.
  static constexpr int kMinimisedHeight = kTitleHeight + kFrameWidth;

  explicit WidgetGroup(const GlobCreationInfo& info, const WString& title = WString());
  WidgetGroup(unsigned short width, unsigned short height, const WString& title, Canvas* parent);

  void setGroupTitle(const WString& title, bool redraw, bool notify);
  const WString& getGroupTitle() const { return title_; }
  void setEdgeColour(const Colour& c);
  Colour getEdgeColour() const;
  void setWidgetsActive(bool active, bool redraw);

  // --- Panel and Glob ---
  void setActive(bool active, bool redraw) override;
  void drawBorder() override;
  void setBorderStyle(UifTypeOfBorder border) override;
  UifTypeOfBorder getGroupBorderStyle() const { return groupBorder_; }
  const char* idstring() const override { return "widgetgroup"; }
  String describeValue() const override { return Kw::toUtf8(title_); }

 protected:
  // Where the title's text goes (after any lead such as a title widget), and the stretch of
  // the top edge left open for the title and its lead.
  virtual int titleLeadWidth() const { return 0; }
  virtual bool drawsTitleText() const { return true; }
  virtual bool titleBold() const { return false; }
  virtual Colour titleColour() const;
  // The title has just changed (before handleTitleChange, notified or not).
  virtual void titleStored() {}
  Kw::Box<int> titleTextBox() const;
  Kw::Box<int> titleStripBox() const;

  WString title_;

 private:
  void init();

  UifTypeOfBorder groupBorder_ = UifBorderFramed;
  Colour edge_;
  bool edgeSet_ = false;
};
