#pragma once
// The pop-up menu: a window on the screen that shows menu items as rows, highlights the row
// under the pointer, and reports the chosen row to its owner by sending it the item's message.
//
//   input                          does
//   pointer over a row             highlights it when it is active and not empty, or a header;
//                                  only the two rows whose highlight changed are redrawn
//   click on a header              opens or closes its group (only when there are two or more
//                                  headers); with Shift every later header follows suit
//   click on a row                 multi-choice rows move to their next option; the owner gets
//                                  the item's message; the pop-up closes unless pinned (then
//                                  "menu_itemSelected") or the item keeps it open
//   click on an iconic button      the owner gets the item's message; closes unless pinned
//   choice from a row's drop-down  the item takes the option; the owner gets the item's
//                                  message; closes unless pinned or the item keeps it open
//   wheel over the rows            scrolls by one row per step
//   scroll bar                     "thumbMoved" sets the offset; its arrows step one row
//   press outside the pop-up       closes it
//   "poot"                         closes it; the owner gets "menu_poot" first
//
// Keys are not handled here: while open the pop-up is an input scope of its screen, so keys
// stop at it.
//
// Decisions where the behaviour was left open:
// - Rows are itemHeight() (20) pixels high; the label starts after a glyph column of
//   kGlyphColumn pixels; right-aligned text and the current option of a multi-choice row end
//   kRightMargin pixels from the right edge (the option followed by a small arrow).
// - Iconic items are square buttons in a strip below the title, in list order; the first part
//   of the label names the button's image, the second its pressed image.
// - The width fits the widest label and right-hand text, measured on the kMeasuredItems longest
//   texts only, so that building a very long menu lays out nothing but what it shows.
// - The pop-up opens with its top-left corner at the pointer and is moved onto the screen; when
//   its rows would not fit, it shows as many as the screen holds and scrolls (the limit set by
//   maximum visible rows applies first). It opens only when it has a row or an iconic item.
// - When groups open or close the pop-up keeps its top edge and resizes; it stays on screen.
// - MenuData's two flags: kCloseOnOutsideClick puts a catcher under the pop-up that closes it on
//   a press anywhere else; kShowTitle gives a non-empty title its strip (title mode 2).
// - Any item whose flag bit 1 is set keeps the pop-up open when chosen, as pinning does, and
//   the owner then hears "menu_itemSelected" too.
// - The tooltip of a row is the Glob's context string, so the screen's tooltip shows it.
// - A multi-choice row's drop-down (a flat DropDownMenuButton over its options) covers the
//   right-hand part of the row, in the row's colour; it shows only while its row does.
#include <vector>

#include "foundation/ListViewWidget.h"
#include "menus/MenuData.h"
#include "menus/MenuItem.h"
#include "platform/glib/TextAlignment.h"
#include "platform/glib/TextStyles.h"
#include "platform/glib/iFont.h"
#include "platform/glob/Glob.h"
#include "platform/glob/GlobHandle.h"
#include "platform/kw/Box.h"

class configb;
class ListViewAdaptorBase;
class MenuDismisser;
class RootGlob;
class ScrollBar;

namespace Glib {
class Painter;
}

class Menu : public Glob, public ListViewWidget {
 public:
  struct VisibleMenuItem {
    Kw::Box<int> area;  // in the pop-up's coordinates
    int index = -1;     // into items
  };

  static const char* const itemSelectedMsg_;  // "menu_itemSelected"
  static const char* const pootMsg_;          // "menu_poot"
  static constexpr const char* kPootMsg = "poot";
  static constexpr const char* kFreezeFlipPrefix = "freeze_flip";
  static constexpr const char* kBtnHighlightMsg = "BtnHighlight";
  static constexpr const char* kMaxClickSeparationKey = "max_click_separation";
  static constexpr int kDefaultMaxClickSeparation = 200;

  static constexpr int kTitleStripHeight = 35;
  static constexpr int kIconSize = 24;
  static constexpr int kIconStripHeight = kIconSize + 4;
  static constexpr int kGlyphColumn = 22;
  static constexpr int kColumnGap = 24;
  static constexpr int kRightMargin = 8;
  static constexpr int kChoiceMarkRoom = 14;
  static constexpr int kMeasuredItems = 16;
  static constexpr int kTitleMode = 2;

  Menu(const MenuData& data, Glob* owner, int width, int height, unsigned flags);
  explicit Menu(const MenuData& data);
  // The same, taking the items over rather than copying them.
  explicit Menu(MenuData&& data);
  explicit Menu(const std::vector<MenuItem>& items);
  explicit Menu(const configb& config);
  ~Menu() override;

  // Shows the pop-up on `screen` with its top-left corner at `pointer` (root coordinates),
  // kept on the screen. False, with nothing shown, for an empty menu or one already shown.
  bool popUp(RootGlob& screen, XY<int> pointer);

  // --- Items ---
  const std::vector<MenuItem>& items() const { return items_; }
  void redisplay(const std::vector<MenuItem>& items);
  bool changeItem(const WString& oldText, const WString& newText);
  bool changeMessage(const WString& label, const String& msg);
  bool setCurrentChoice(const WString& label, uint64_t n);
  int getCurrentChoiceIndex(const WString& label) const;
  WString getCurrentChoice(const WString& label) const;

  // --- Presentation ---
  void setTitle(const WString& title, const Colour& colour);
  const WString& title() const { return title_; }
  int titleMode() const { return titleMode_; }
  void setMinWidth(int width);
  void setAlignment(TextAlignment alignment);
  void setOwner(Glob* owner);
  Glob* owner() const { return owner_.get(); }
  void setMaxVisibleRows(int rows);
  int maxVisibleRows() const { return maxVisibleRows_; }
  unsigned short itemHeight() const { return itemHeight_; }
  virtual bool pinned() const { return pinned_; }
  void setPinned(bool pinned) { pinned_ = pinned; }
  int maxClickSeparation() const { return maxClickSeparation_; }

  // --- Group states ---
  void saveGroupStates(const String& key) const;
  void restoreGroupStates(const String& key);
  void ensureAtLeastOneExpandedGroup();
  static String groupPreferenceName(const String& key, const WString& header);

  // --- State, for owners and tests ---
  int highlightedItem() const { return highlighted_; }
  int secondRowIndex() const { return secondRow_; }
  int scrollOffset() const { return scrollOffset_; }
  int nonHiddenRowCount() const { return static_cast<int>(rows_.size()); }
  const std::vector<VisibleMenuItem>& visibleItems() const { return visible_; }
  ScrollBar* scrollBar() const;
  // The row box of item `index` when it is on screen; an empty box otherwise.
  Kw::Box<int> itemArea(int index) const;
  int findItemAtPos(const XY<int>& pos) const;
  // Scrolls as little as needed for item `index` to show whole; false when it is no row.
  bool scrollToItem(int index);
  // The widget made for item `index` (an iconic item's button, a multi-choice row's
  // drop-down), or null.
  Glob* widgetForItem(int index) const;
  int findItemFromWidget(const Glob* widget) const;
  virtual int calculateHeight() const;

  // --- Data adaptor ---
  void setDataAdaptor(Kw::Ptr<ListViewAdaptorBase> a) override;
  void updateFromData();
  void addItemText(unsigned index) override;
  void removeItemText(unsigned index) override;
  void itemChanged(unsigned index) override;
  void setCurrentItem(unsigned index) override {}

  // --- Glob ---
  int react(Event* e) override;
  void draw() override;
  const char* idstring() const override { return "menu"; }
  String contextString(const XY<int>& pos, CanvasClient* asker) override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  void handleMouseContainment(bool inside) override;
  String describeValue() const override { return Kw::toUtf8(title_); }

 protected:
  // Drawing hooks, in the order they are used.
  virtual void drawBackground(Glib::Painter& p);
  virtual void drawMenuItem(Glib::Painter& p, int index);
  virtual void drawMenuItem(Glib::Painter& p, const VisibleMenuItem& row);
  virtual void drawMenuItemText(Glib::Painter& p, const VisibleMenuItem& row);
  virtual void drawRightAlignedText(Glib::Painter& p, const VisibleMenuItem& row);
  virtual Glib::TextStyles::TextStyle getTextStyle(int index) const;
  virtual Colour getItemBackCol(int index) const;
  // Called when the item with `id` changed in place.
  virtual void itemChangedById(uint32_t id);

  virtual int handleMessageEvent(const String& msg, Glob* sender);
  virtual int handleScrollBarMessages(const String& msg);
  virtual int handleMouseEvent(Event* e);
  // Room at the foot of the pop-up, below the rows, that rows and the scroll bar keep clear of
  // (a subclass's own strip); the subclass counts it in calculateHeight.
  virtual int footHeight() const { return 0; }
  // For subclasses that drive the rows from elsewhere (a list's own keys).
  void setHighlight(int index);
  void chooseItem(int index);

 private:
  void init(Glob* owner, int width, int mode);
  void calcTitleString();
  // Rebuilds the row list, the widgets and the geometry after the items changed.
  void rebuild();
  void rebuildRows();
  void rebuildVisible();
  void createWidgetsForItems();
  void destroyWidgets();
  // Puts each multi-choice row's drop-down over its row, or hides it with its row.
  void placeChoiceWidgets();
  void chooseFromDropDown(int index, Glob* dropDown);
  int measureWidth() const;
  // Sets the size and the scroll bar from the items; keeps the top edge where it is.
  void relayout();
  void addScrollbar();
  void updateScrollbar();
  int visibleRowCount() const;
  int maxOffset() const;
  bool setScrollOffset(int offset);
  int titlePart() const { return titleMode_ == kTitleMode ? kTitleStripHeight : 1; }
  int iconStripHeight() const { return iconicCount_ > 0 ? kIconStripHeight : 0; }
  int rowsTop() const;
  int rowsRight() const;
  void calcHighlightItem(const XY<int>& pos);
  void redrawItem(int index);
  void toggleGroup(int index);
  void chooseIconic(int index);
  // Sends the owner `msg`; false when the pop-up is gone afterwards.
  bool tellOwner(const String& msg);
  void closeAfterChoice(bool keepOpen);
  void close();
  XY<int> pointerInside() const;
  Glib::FontPtr fontFor(const MenuItem& item) const;

  std::vector<MenuItem> items_;
  GlobHandle<> owner_;
  int highlighted_ = -1;
  int secondRow_ = -1;
  unsigned short itemHeight_ = 20;
  int maxVisibleRows_ = -1;
  int screenRows_ = -1;  // rows the screen holds; negative before the pop-up is shown
  XY<int> screenSize_;   // the screen's size once shown
  int scrollOffset_ = 0;
  std::vector<VisibleMenuItem> visible_;
  WString title_;
  Colour titleColour_;
  WString setTitle_;  // the title given by setTitle; the owner's is asked when empty
  int titleMode_ = 0;
  int requestedMode_ = kTitleMode;
  int minWidth_ = 0;
  TextAlignment alignment_ = TextAlignment::Left;
  bool mouseInside_ = false;

  std::vector<int> rows_;  // the item index of every non-hidden row, in order
  int iconicCount_ = 0;
  int choiceCount_ = 0;                                // items with options
  int contentWidth_ = 0;                               // measureWidth() as of the last rebuild
  std::vector<std::pair<int, GlobHandle<>>> widgets_;  // rows' own widgets, by item index
  GlobHandle<> scrollBar_;                             // a ScrollBar
  GlobHandle<> dismisser_;                             // a MenuDismisser
  unsigned flags_ = MenuData::kCloseOnOutsideClick | MenuData::kShowTitle;
  bool hasBaseColour_ = false;
  Colour baseColour_;
  bool pinned_ = false;
  int maxClickSeparation_ = kDefaultMaxClickSeparation;
  int pressedItem_ = -1;
  bool shown_ = false;
  bool closing_ = false;
  Glib::FontPtr font_;
};
