#pragma once
// The general widget group that the variants build on: a WidgetGroup with an optional
// control in its title (a check box, a button...), a separator under the title strip, a bold
// or coloured title, and layout help: it can fit its height to its widgets (auto-size), give
// its widgets its own width (auto-size children), and re-lay out its widgets when one of them
// is a group whose height changed.
//
//   event                                        what the group does
//   a grouped widget reports a height change     widgets below it move by the change; an
//   ("MinimizableGroupSizeChange <n>")           auto-sized group grows or shrinks with it
//                                                and reports its own change to its parent
//   setGroupTitle(text, true), title changed     sends "GroupRenamed <new title>" to parent
//   resize(w, h)                                 new size, top edge kept; with auto-size
//                                                children, every widget takes the new width
//
// Choices made here:
// - The title widget is a child of the group but not one of its grouped widgets: it is not
//   in the widget list, is not hidden when a group minimises, and is not switched by
//   setWidgetActive. setWidget places it at the start of the title strip (TextAlignment::Left),
//   centred in it, or at its end; `fitToTitle` makes its width follow the title (for widgets
//   that show the title themselves, like a check box's label).
// - Auto-size fits the height to the lowest visible grouped widget (plus the frame), keeping
//   the top edge; it runs when a widget is added and when a grouped widget's height changes.
// - resizeChildren(width): every grouped widget takes `width` (the user area's width when 0
//   or less), keeping its height.
// - recolourChildren(group) gives every grouped widget the group's face colour.
// - The children offset moves the user area's inner left and top origins further in.
// - The separator is drawn along the bottom of the title strip, inside the frame.
#include "panels/WidgetGroup.h"
#include "platform/glib/TextAlignment.h"

class WidgetGroupEx : public WidgetGroup {
 public:
  enum eSeparatorStyle : int { SeparatorNone = 0, SeparatorLine = 1, SeparatorEtched = 2 };

  static const char* const GroupRenamedMsg;      // "GroupRenamed "
  static const char* const heightChangedPrefix;  // "MinimizableGroupSizeChange "
  // The gap between the title widget and the title text.
  static constexpr int kWidgetGap = 4;

  explicit WidgetGroupEx(const GlobCreationInfo& info, const WString& title = WString());
  WidgetGroupEx(unsigned short width, unsigned short height, const WString& title, Canvas* parent);

  // The height of a group holding `rows` rows of `rowHeight` pixels, `gap` apart.
  static int calcHeightForRows(int rows, int rowHeight, int gap);
  // The change of height carried by a height-change message, or 0 when `msg` is none.
  static int parseHeightDelta(const String& msg);

  // --- Title ---
  const WString& getGroupTitle() const { return title_; }
  void setGroupTitle(const WString& title, bool notify);
  using WidgetGroup::setGroupTitle;
  void setWidget(Glob* widget, const WString& title, TextAlignment where, bool fitToTitle);
  Glob* getWidget() const { return titleWidget_.get(); }
  using StandardPanel::getWidget;
  void setBoldText(bool bold);
  void setGroupTitleColour(const Colour& c);
  void setSeparatorStyle(eSeparatorStyle s);
  eSeparatorStyle getSeparatorStyle() const { return separator_; }

  // --- Layout ---
  void setAutoSize(bool on);
  bool getAutoSize() const { return autoSize_; }
  void setAutoSizeChildren(bool on);
  bool getAutoSizeChildren() const { return autoSizeChildren_; }
  void setChildrenOffset(XY<int> offset);
  XY<int> getChildrenOffset() const { return childrenOffset_; }
  void resize(double width, double height);
  void resizeChildren(int width);
  static void recolourChildren(WidgetGroupEx* group);
  void setWidgetActive(bool active, bool redraw) { setWidgetsActive(active, redraw); }
  // Changes the height by `delta`, keeping the top edge (never below the minimised height).
  void changeHeightKeepingTop(int height);

  // --- Panel ---
  void handleTitleChange() override;
  void handleWidgetAdded(const WidgetDetails& details) override;
  int handleMessageEvent(const String& msg, Glob* sender) override;
  void reshape() override;
  void drawBorder() override;
  const char* idstring() const override { return "widgetgroupex"; }

 protected:
  int titleLeadWidth() const override;
  bool drawsTitleText() const override { return !fitToTitle_; }
  bool titleBold() const override { return bold_; }
  Colour titleColour() const override;
  // Sends a height-change message for `delta` to the parent; false when this group is gone
  // afterwards (the parent may delete it).
  bool reportHeightChange(int delta);
  // Places the title widget in the title strip.
  void placeTitleWidget();
  // Fits the height to the grouped widgets when auto-size is on; returns the change.
  int fitHeight();
  // A grouped widget changed height by `delta`: the widgets below it follow.
  void relayoutAfter(Glob* changed, int delta);

 private:
  void init();

  GlobHandle<> titleWidget_;
  TextAlignment widgetPlace_ = TextAlignment::Left;
  bool fitToTitle_ = false;
  bool bold_ = false;
  Colour titleColour_;
  bool titleColourSet_ = false;
  eSeparatorStyle separator_ = SeparatorNone;
  bool autoSize_ = false;
  bool autoSizeChildren_ = false;
  XY<int> childrenOffset_;
};
