#pragma once
// The framed container that panels, dialogues and most composite controls are built on: a
// background and a border of a chosen style, children placed from any of eight origins or
// relative to one another, a row of standard title widgets whose messages become virtual
// operations, modal display over a shade, and a tab order for its children.
//
// Choices made here:
// - The panel is built of pieces: PanelWidgetList keeps the children and places them by the
//   arithmetic of PanelGeometry.h (origins, anchoring at top and right origins, relative
//   placement); PanelStandardWidgets makes, lays out and keeps in step the standard widgets;
//   StandardPanelDrawing.cpp holds the panel's look. Every child is placed again whenever
//   something it depends on changes: the panel's size, border or strips, or its reference
//   widget. Adding a widget places the new one only, so a panel of N children builds in
//   time linear in N.
// - addWidget's last argument names the widget after which the new one goes in the widget
//   list and in the tab order; null (or a widget not in the list) appends.
// - A child that is a TabOrderable joins the panel's tab order when it is added and leaves it
//   when it is removed; a child that is a TabOrderableHost does the same with the stops it
//   hands out, appended in its order. The standard widgets are not tab stops.
// - setWidgetPos and translateWidgetPos on a relatively placed widget turn it into an
//   absolute one from OriginBottomLeft. When a reference widget is removed or deleted, the
//   widgets placed against it stay where they are, likewise from OriginBottomLeft.
// - A child deleted behind the panel's back keeps its entry (with a null widget, counted by
//   numWidgets) until it is removed by address or the panel is destroyed, where it is
//   reported as a double deletion. Every other operation skips it.
// - Destroying the panel deletes the widgets of its list youngest first, then its other
//   children likewise.
// - removeWidget(widget, false) only forgets the widget: it stays a child Glob and keeps its
//   place on the canvas.
// - The size and border of the configuration-record constructor come from the keys "width",
//   "height" (the arguments are their defaults), "x", "y", "border" and "title".
// - Constructors without a canvas make an unattached panel, on no screen, until it is put
//   somewhere: addWidget on another panel, or RootGlob::adopt for the screen. The bool of the
//   palette forms is the panel's initial dismissable state. Panels start pinned (not dismissable)
//   unless told otherwise.
// - Minimum size: reshape_canvas never makes the panel smaller than it (except when
//   minimised); setMinSize grows the panel if it is smaller; resetMinSize removes the limit.
// - Minimising (size flag SizeMinimised) keeps the top edge where it is, shrinks the panel to
//   its border and title strip, and hides the widget-list children and the do-it button; the
//   full size brings back those that were shown.
// - handlePoot's default returns true: the "poot" message is passed on, unhandled.
// - Modal display: setModal returns the depth after the call. Leaving depth 1 removes the
//   shade and restores the pin state and the pin button's active state saved on entry.
//   setModal(false) at depth 0 changes nothing and returns 0. The shade covers the panel's
//   screen, and keeps covering it when the screen changes size; the panel's top-level
//   ancestor (the panel itself for a panel on the screen) is raised above it. While modal the
//   panel is its screen's input scope: keys for a focus behind the shade come to the panel
//   (so Tab moves into its own tab order), and nothing bubbles out of it. A panel on no
//   screen counts depth but shows no shade and holds no input.
// - The pin button latches and is given the message "pin", so that it reports "pin on" and
//   "pin off"; it is kept down while the panel is pinned. The title buttons take the panel's
//   palette; the do-it button keeps the standard button look.
// - The title box is a PanelTitleTextBox that the panel makes itself. One box serves both
//   title flags: editable while 0x40 is set, read-only with 0x20 alone; adding or removing a
//   flag re-styles the box in place, and it goes with the last of the two.
// - "StdPanelTitleChanged" and "pin on"/"pin off" are handled as such only while the panel has
//   a title box or a pin button; otherwise they reach handleMessageEvent like any message.
#include <memory>
#include <vector>

#include "foundation/TabOrderManager.h"
#include "foundation/rect.h"
#include "panels/PanelGeometry.h"
#include "panels/PanelWidgetList.h"
#include "panels/WidgetDetails.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/String.h"

class ModalShade;
class PanelStandardWidgets;
class PanelTitleTextBox;
class configb;

class StandardPanel : public rect {
 public:
  static const char* const doItMsg;          // "do_it"
  static const char* const titleChangedMsg;  // "StdPanelTitleChanged"
  static constexpr unsigned kTabKey = 9;
  // The diagnostic level of the double-deletion report.
  static constexpr int kDoubleDeletionLevel = 8;

  StandardPanel(unsigned short width, unsigned short height);
  StandardPanel(unsigned short width, unsigned short height, const Palette& palette,
                bool dismissable, Canvas* parent);
  explicit StandardPanel(XY<int> size);
  StandardPanel(XY<int> size, const Palette& palette, bool dismissable, Canvas* parent);
  StandardPanel(const configb& config, unsigned short width, unsigned short height,
                Canvas* parent = nullptr);
  explicit StandardPanel(const GlobCreationInfo& info);
  ~StandardPanel() override;

  // --- Virtual operations, in slot order ---
  void setCol(const Colour& colour, bool redraw) override;
  virtual void set_size_flag(size_state state);
  WString getMenuTitle() override { return title_; }
  void setcol(const Colour& colour, bool redraw) override;
  virtual void setBorderStyle(UifTypeOfBorder border);
  virtual void setMinSize(unsigned width, unsigned height);
  virtual void setTitle(const WString& title);
  virtual XY<int> getOriginXY(CoordinateOrigin origin) const;
  virtual Kw::Box<int> getUserArea() const;
  // Messages that the panel does not handle itself; 1 consumes, 0 passes on to the base.
  virtual int handleMessageEvent(const String& msg, Glob* sender) { return 0; }
  // Key presses other than Tab and Shift+Tab, with their modifier bits; 1 consumes.
  virtual int handleKeyboardEvent(int keyCode) { return 0; }
  virtual int handleMouseEvent(Event* e) { return 0; }
  // The close button was pressed. Returning false consumes the message; true passes it on.
  virtual bool handlePoot() { return true; }
  // The size button was pressed; the default flips between the full and the minimised size.
  virtual void handleFlipSize();
  virtual int handleTimerEvent() { return 0; }
  // The title box changed the title (already stored).
  virtual void handleTitleChange() {}
  // The live children of the widget list, in list order.
  virtual void getChildren(std::vector<Glob*>& out) const;
  virtual void drawBackground();
  virtual void drawBorder();
  virtual void drawWidgets();
  virtual void handleWidgetAdded(const WidgetDetails& details) {}

  // --- Glob ---
  int react(Event* e) override;
  void draw() override;
  void reshape() override;
  void reshape_canvas(int x, int y, int width, int height) override;
  const char* idstring() const override { return "standard_panel"; }
  String describeValue() const override { return getTitle(); }
  // A panel with a title strip is moved by it; one without, from anywhere.
  bool isMoveHandleAt(const XY<int>& pos) override;
  XY<int> minimumSize() const override;

  // --- Layout queries; the static forms work from a frame description ---
  static XY<int> getOriginXY(CoordinateOrigin origin, int flags, XY<int> size,
                             UifTypeOfBorder border);
  static Kw::Box<int> getUserArea(int flags, XY<int> size, UifTypeOfBorder border);
  static int calcBorderSize(UifTypeOfBorder border) { return PanelGeometry::borderSize(border); }
  PanelFrame frame() const;
  UifTypeOfBorder getBorderStyle() const { return border_; }
  XY<int> getMinSize() const { return minSize_; }
  void resetMinSize() { minSize_ = XY<int>(); }
  const WString& getTitleW() const { return title_; }
  String getTitle() const { return Kw::toUtf8(title_); }

  // --- Children ---
  // Adds `widget` (moving it onto this panel's canvas if it is elsewhere) at `pos` from
  // `origin`. False for a null or deleted widget, the panel itself or one of its ancestors, a
  // widget already in the list, or an origin outside the eight.
  bool addWidget(Glob* widget, XY<int> pos, CoordinateOrigin origin = OriginBottomLeft,
                 WidgetSurround surround = SurroundNone, Glob* insertAfter = nullptr);
  bool addWidget(Glob* widget, int x, int y, CoordinateOrigin origin = OriginBottomLeft,
                 WidgetSurround surround = SurroundNone, Glob* insertAfter = nullptr);
  // Adds `widget` `gap` pixels from `reference`, which must already be in the list. Also
  // false for an alignment across the relation or a relation outside the four.
  bool addWidgetRelative(Glob* widget, Glob* reference, unsigned gap, WidgetRelativity relativity,
                         WidgetSurround surround = SurroundNone,
                         WidgetAlignment alignment = AlignCentre);
  // Takes the widget out of the list (and the tab order); deletes it when `destroy` is set
  // and it is still alive. A widget already deleted can be removed by its old address.
  bool removeWidget(Glob* widget, bool destroy);
  bool setWidgetPos(Glob* widget, XY<int> pos);
  bool setWidgetPos(Glob* widget, XY<int> pos, CoordinateOrigin origin);
  // Moves the widget by (dx, dy), x rightward and y upward whatever its origin.
  bool translateWidgetPos(Glob* widget, int dx, int dy);
  bool setWidgetBorderStyle(Glob* widget, WidgetSurround surround);
  const WidgetDetails* getWidget(const Glob* widget) const;
  const WidgetDetails* getWidget(unsigned index) const;
  unsigned numWidgets() const { return static_cast<unsigned>(widgets_.size()); }
  bool isChildWidget(const Glob* widget) const;
  // Places every child again (after a change the panel cannot see, such as a child's resize).
  void recalculateWidgetPositions();

  // --- Tab order ---
  // The panel's tab order, made when first asked for or when a focusable widget is added.
  TabOrderManager& tabOrder();
  // Move to the next / previous stop, wrapping round; false when there is no stop to go to.
  bool incrementTab();
  bool decrementTab();

  // --- Standard widgets ---
  void addStandardWidgets(int flags);
  // Clears the flags and deletes their widgets; `redraw` repaints the panel afterwards.
  void removeStandardWidgets(int flags, bool redraw);
  int getStandardWidgetFlags() const;
  void positionStandardWidgets();
  // The width left for the title box between the left border and the title buttons.
  int calcMaxTitleWidgetWidth() const;
  // The title box, or null.
  PanelTitleTextBox* titleBox() const;

  // --- Size, pinning and modal display ---
  size_state getSizeState() const { return sizeState_; }
  bool isDismissable() const { return dismissable_; }
  bool isPinned() const { return !dismissable_; }
  void setDismissable(bool dismissable);
  // Adds (true) or removes (false) one level of modal display; returns the depth afterwards.
  int setModal(bool modal);
  int getModalDepth() const { return modalDepth_; }
  bool isModal() const { return modalDepth_ > 0; }
  // The shade behind the panel while modal, or null.
  Glob* modalShade() const;

 protected:
  // A standard title widget, or null: for subclasses that restyle them.
  Glob* standardWidget(StandardWidgetFlag flag) const;
  // Keeps `left` more pixels at the left and `top` more at the top of the user area (see
  // PanelFrame); the children are placed again.
  void setInnerInsets(int left, int top);

 private:
  static constexpr int kTitleMargin = PanelGeometry::kTitleMargin;

  void init();
  // The widget's box grown by its surround ring, where it stands now.
  Kw::Box<int> outerBoxOf(const WidgetDetails& d) const;
  // Enters a new widget in the list and the tab order, places it and announces it.
  void adopt(const WidgetDetails& details, Glob* insertAfter);
  void joinTabOrder(Glob* widget, Glob* insertAfter);
  // Places the children again and repaints after an edit that changed a rule; false when the
  // edit was refused.
  bool relayoutAfter(PanelWidgetList::Edit edit);
  int reactToMessage(Event* e);
  void enterModal();
  void leaveModal();
  void applySizeState(size_state state);
  // The left edge of the title buttons (less the gap), or the right end of the strip.
  int titleButtonsLeft() const;

  UifTypeOfBorder border_ = UifBorderNone;
  PanelWidgetList widgets_{*this};
  XY<int> minSize_;
  XY<int> innerInsets_;
  WString title_;
  // Made on first use: most panels (every check box and text box is one) never have a child
  // that takes focus, never get a title button and are never modal.
  std::unique_ptr<TabOrderManager> tabOrder_;
  std::unique_ptr<PanelStandardWidgets> std_;
  struct ModalState;
  std::unique_ptr<ModalState> modal_;

  // Size.
  size_state sizeState_ = SizeFull;
  int fullHeight_ = 0;
  std::vector<GlobHandle<>> hiddenByMinimise_;

  // Pinning and modal display.
  bool dismissable_ = false;
  int modalDepth_ = 0;
};
