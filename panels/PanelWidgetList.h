#pragma once
// The children of a standard panel in list order, each with the rule that places it: a
// position from one of the eight origins, or a gap and a relation to a reference widget. It
// enters and takes out children, edits their rules, and places them on the panel's canvas by
// the arithmetic of PanelGeometry. The tab order, redraws and the panel's announcements stay
// with the panel.
//
// An entry whose child was deleted behind the panel's back stays, with a null widget, until
// it is removed by its old address; every placement skips it.
#include <memory>
#include <vector>

#include "panels/WidgetDetails.h"
#include "platform/kw/AddressCounts.h"
#include "platform/kw/Box.h"

class Glob;
class StandardPanel;

class PanelWidgetList {
 public:
  // What an edit of a placement rule did.
  enum class Edit { Refused, Unchanged, Changed };

  explicit PanelWidgetList(StandardPanel& panel) : panel_(panel) {}
  PanelWidgetList(const PanelWidgetList&) = delete;
  PanelWidgetList& operator=(const PanelWidgetList&) = delete;

  std::vector<WidgetDetails>::const_iterator begin() const { return list_.begin(); }
  std::vector<WidgetDetails>::const_iterator end() const { return list_.end(); }
  size_t size() const { return list_.size(); }
  const WidgetDetails* at(size_t index) const {
    return index < list_.size() ? &list_[index] : nullptr;
  }

  const WidgetDetails* findLive(const Glob* widget) const;
  // A live entry, else the entry of a deleted child that had this address.
  const WidgetDetails* findAny(const Glob* widget) const;
  // Whether `widget` can join: alive, not the panel or one of its ancestors, not a screen, and
  // not in the list already.
  bool canAdopt(Glob* widget) const;
  bool onPanel(const Glob* widget) const;

  // Moves `d`'s widget onto the panel's canvas, enters it after `insertAfter` (appends when
  // that is null or not in the list) and places it by its rule; the others stay where they
  // are, as nothing they depend on changed. The caller has checked canAdopt.
  const WidgetDetails& insert(const WidgetDetails& d, Glob* insertAfter);
  // Takes the entry of `widget` out (see findAny); the widgets placed against it become
  // absolute. Sets `live` to the widget when it is still alive. False when there is no entry.
  bool remove(const Glob* widget, Glob*& live);

  Edit setPos(const Glob* widget, XY<int> pos, CoordinateOrigin origin);
  // The origin setPos keeps when none is given: the widget's own, OriginBottomLeft for a
  // relative one.
  bool currentOrigin(const Glob* widget, CoordinateOrigin& origin) const;
  Edit translate(const Glob* widget, int dx, int dy);
  Edit setSurround(const Glob* widget, WidgetSurround surround);

  // Places every live child on the panel's canvas by its rule.
  void placeAll();
  // The widget's box grown by its surround ring, where it stands now.
  Kw::Box<int> outerBoxOf(const WidgetDetails& d) const;

  // Empties the list, handing over its entries (for the panel's destruction).
  std::vector<WidgetDetails> takeAll();

 private:
  WidgetDetails* findLiveEntry(const Glob* widget);
  void place(WidgetDetails& d);
  // Where `d`'s rule puts its widget's corner; false when the rule cannot say (a relative
  // entry whose reference is gone becomes absolute and stays where it is).
  bool cornerOf(WidgetDetails& d, XY<int>& corner);
  static void moveTo(Glob& g, XY<int> corner);
  void makeAbsolute(WidgetDetails& d);

  // Whether an entry may hold this address: a miss rules the widget out without a scan.
  bool mayHold(const Glob* widget) const;

  StandardPanel& panel_;
  std::vector<WidgetDetails> list_;
  // How many entries were made for each address (dead ones included); made with the first,
  // as most panels (every check box and text box is one) never list a widget.
  std::unique_ptr<Kw::AddressCounts> addresses_;
};
