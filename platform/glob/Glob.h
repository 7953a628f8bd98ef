#pragma once
// The GUI object: a node of the tree that owns one canvas, draws on it when asked, reacts to
// the events routed to it, and talks to other Globs by string messages.
#include <cstdint>
#include <functional>
#include <memory>
#include <vector>

#include "platform/glob/Canvas.h"
#include "platform/glob/CanvasClient.h"
#include "platform/glob/Drawable.h"
#include "platform/glob/Event.h"
#include "platform/glob/FontUser.h"
#include "platform/glob/GlobCreationInfo.h"
#include "platform/glob/Notifiable.h"
#include "platform/glob/NotifyMsg.h"
#include "platform/glob/Palette.h"
#include "platform/glob/SizeState.h"
#include "platform/kw/GrowString.h"

class CanvasHost;
class DragPayload;
class RootGlob;
class configb;

// The handles of a resizeable Glob: its right edge, its bottom edge and the corner between.
enum class GlobResizeEdge { None, Right, Bottom, Corner };

// Creation flags.
constexpr int kGlobCreateUnmapped = 0x1;  // the canvas starts hidden

// What a walk callback answers: go on, or stop here (the walk then returns the Glob it stopped
// at). The callback may delete the Glob it is given, or others of the tree: walks go over a
// snapshot and skip Globs that died meanwhile.
using GlobWalk = std::function<bool(Glob*)>;

class Glob : public Notifiable, public CanvasClient, public Drawable, public Glib::FontUser {
 public:
  explicit Glob(const GlobCreationInfo& info);
  Glob(unsigned short width, unsigned short height, int flag, Canvas* parent);
  Glob(const Glob&) = delete;
  Glob& operator=(const Glob&) = delete;

  // The table below is the framework's contract with controls: its operations and their order
  // are fixed. Library additions come after it.
  ~Glob() override;

  // --- Notifications ---
  // Something the Glob shows changed: the base repaints.
  virtual void notify(NotifyMsg msg);
  // The Glob is asked to go: on a screen it is deleted once the current event is over,
  // unattached it is deleted at once. Nothing of it may be touched after the call.
  virtual void destroy(NotifyMsg msg);
  // The text buffer the Glob shows was edited: the base repaints.
  virtual void bufNotify(NotifyMsg msg);

  // --- Position constraints (positions are bottom-left corners in the parent, y upward) ---
  // Where the Glob may go when asked to go to (x, y): writes the allowed place and returns
  // true, or returns false to refuse the move (the Glob stays). The base allows every place.
  virtual bool position_constrain(double x, double y, double* allowedX, double* allowedY);
  // The place a user move to `proposed` really takes: position_constrain's answer kept on the
  // screen; the current place when the constraint refuses. `e` is the pointer event, if any.
  virtual XY<double> realPositionConstrain(const XY<double>& proposed, Event* e);

  // --- Tree and geometry ---
  virtual Glob* parent() const;
  // Takes place, size, size state and dumpable children from a record written by dump;
  // false, with what was bad reported and left as it was, for a record of another version or
  // with values out of range.
  virtual bool load(const configb& config);
  // Writes place, size, size state and the dumpable children; keys come from the id path.
  virtual void dump(configb& config);
  // The size before the last change of size (the current one when it never changed).
  virtual unsigned short old_height() const;
  virtual unsigned short old_width() const;
  virtual unsigned short height() const;
  virtual unsigned short width() const;
  // All input, ticks and messages. Returns 1 when the event was consumed. The base starts
  // user moves and resizes of Globs that allow them and consumes nothing else; unconsumed
  // mouse and key events bubble to the parent.
  virtual int react(Event* e);
  // Called after the canvas changed size (held back while frozen, then called once).
  virtual void reshape() {}
  // Lays the Glob out again at its present size.
  virtual void reshape_myself();
  // The outline the Glob covers, in its own coordinates; the base is its whole rectangle.
  virtual Kw::Ptr<iRegion> path();
  // Lays out again and repaints.
  virtual void reshape_and_draw();
  // The version of what dump writes; load refuses newer records.
  virtual int version() const { return 1; }
  // A user move begins (false refuses it), the Glob was moved by the user, the move ended.
  virtual bool pick() { return true; }
  virtual void drop() {}
  virtual void moved() {}
  // The canvas was given to another parent: the base repaints in its new place.
  virtual void set_canvas();
  virtual void set_interest(int mask);
  virtual void clear_interest(int mask);
  virtual void pop_to_top();
  virtual void push_to_bottom();
  virtual void map_canvas();
  virtual void unmap_canvas();
  // Moves and resizes the canvas: bottom-left corner (x, y) in the parent, y upward.
  virtual void reshape_canvas(int x, int y, int width, int height);
  virtual void translate_canvas(int dx, int dy);
  // Moves every child by (dx, dy), leaving this canvas where it is (scrolling its content).
  virtual void translate_canvtree(int dx, int dy);

  // --- Walks: each calls `fn` in turn and stops at the first Glob for which it says true ---
  // Siblings below (older) or above (younger) this one in stacking order, nearest first.
  virtual Glob* walk_older_siblings(const GlobWalk& fn);
  virtual Glob* walk_younger_siblings(const GlobWalk& fn);
  // Every sibling, oldest first, this Glob left out.
  virtual Glob* walk_siblings(const GlobWalk& fn);
  virtual Glob* walk_children(const GlobWalk& fn);
  // The parent, its parent, ... up to the screen.
  virtual Glob* walk_ancestors(const GlobWalk& fn);
  // This Glob, then its descendants, parents before children.
  virtual Glob* walk_subtree(const GlobWalk& fn);
  // Descendants, then this Glob, children before parents: a callback may delete what it is
  // given.
  virtual Glob* walk_postorder(const GlobWalk& fn);
  virtual int sibling_count() const;
  virtual int child_count() const;
  // The child after `child` in stacking order; the first for null; null after the last or
  // for a Glob that is not a child.
  virtual Glob* next_child(Glob* child) const;

  // --- Freezing: no repaint or layout while frozen, one of each owed on the last unfreeze ---
  virtual void freeze();
  virtual void unfreeze();

  // --- Flags ---
  // Movable: the user drags the Glob (its move handle, see isMoveHandleAt).
  virtual void set_movable(int movable);
  virtual int get_movable() const { return movable_; }
  // Reparentable: a user move may drop the Glob into another Glob that allows re-parenting.
  virtual void set_reparent(int reparent);
  virtual int get_reparent() const { return reparent_; }
  // Resizeable: the right edge, the bottom edge and the bottom-right corner resize it.
  virtual void set_resizeable(int resizeable);
  // Dumpable: dump writes the Glob (default on).
  virtual void set_dumpable(int dumpable);
  virtual int get_dumpable() const { return dumpable_; }
  // Dumped only when dumped itself, not as part of its parent's dump.
  virtual void set_dump_ifnot_subglob(int only);
  virtual int get_dump_ifnot_subglob() const { return dumpIfNotSubglob_; }
  // Quick drawing: a user resize of the Glob repaints it at every step but lays it out
  // (reshape) only once, at the release, for Globs whose layout is too dear to follow the
  // pointer. Resizes by code are laid out at once as always.
  virtual void set_quickdraw(int quick);
  virtual int get_quickdraw() const { return quickdraw_; }
  // Dirty: the Glob holds changes not yet saved. Marking it dirty repaints it.
  virtual void make_dirty();
  virtual void make_clean();
  virtual bool is_dirty() const { return dirty_; }
  virtual void set_kbd_focus();
  // The outline the Glob covers in root coordinates.
  virtual Kw::Ptr<iRegion> shape();
  // Whether the Glob could be deleted now: not while it, or a Glob inside it, is being moved,
  // resized or dragged, holds the pointer grab or is frozen. `reason` is the caller's and
  // ignored by the base.
  virtual bool is_currently_trashable(int reason);

  // --- "It": the one Glob of a screen the user last picked up (see RootGlob::it) ---
  virtual bool can_be_it() const { return canBeIt_; }
  virtual void set_can_be_it(int canBeIt);
  // Becomes "it" when the user moves it.
  virtual void set_becomes_it_if_moved(int becomes);
  // The Glob became or stopped being "it"; isIt() tells which. The base repaints.
  virtual void handle_it();

  virtual bool m_is_type(const char* type) const;
  virtual bool m_is_same_type(Glob* other) const;
  // Brings back inside this Glob every movable child that lies partly outside it.
  virtual void glob_tidy();
  // Delivers `msg` to `target` now and returns its react result; -1 when the target is gone
  // or the nesting of synchronous messages is too deep.
  virtual int call_msg(Glob* target, const char* msg);
  // Moves the Glob so that as much of it as possible lies on its screen.
  virtual void constrain_within_screen();
  // Called when this Glob gains or loses the keyboard focus; hasKbdFocus() tells which.
  virtual void handle_kbd_focus() {}
  // A number that names this Glob for the whole run (see serial()).
  virtual uint64_t get_glob_cookie() const { return serial_; }
  // Adds the files the Glob (and its subtree) reads or writes to `out`. The base adds none of
  // its own.
  virtual void getDataFiles(std::vector<String>& out);
  virtual String get_id() const;
  virtual String get_name() const { return extras_ ? extras_->name : String(); }
  // Appends a one-line description: type word, name, rectangle in the root.
  virtual void asString(GrowString& out);
  // Checks the Glob's own bookkeeping; false, with a diagnostic for each fault, when broken.
  virtual bool validate();
  virtual void setActive(bool active, bool redraw);
  virtual void setVisible(bool visible);
  virtual void setPalette(const Palette& palette);
  virtual void setCol(const Colour& colour, bool redraw);
  // Records the size state without laying out.
  virtual void setSizeState(size_state state);
  // Takes the size state and lays out for it.
  virtual void set_size_flag(size_state state);
  // Leaves the parent: the Glob becomes unattached and is no longer deleted with it.
  virtual void detachFromParent();

  // --- Library additions ---
  // The label or value the Glob shows, for tools that list the tree (empty when none).
  virtual String describeValue() const { return String(); }
  // Whether a press at `pos` (own coordinates) may start a user move; the base: anywhere.
  virtual bool isMoveHandleAt(const XY<int>& pos) { return true; }
  // The smallest size a user resize leaves.
  virtual XY<int> minimumSize() const;
  // Drag and drop. A source offers a payload for a drag that leaves it, pressed at `pressPos`
  // (own coordinates); the base offers none.
  virtual bool dragPayload(const XY<int>& pressPos, DragPayload& out) { return false; }
  // A target says whether it would take `payload`; the base takes nothing.
  virtual bool acceptsDrop(const DragPayload& payload) { return false; }
  // The drag hovers over this accepting target (true) or left it (false): the base records it
  // (isDropHovered) and repaints, so the target's draw can show that it would take the drop.
  virtual void handleDropHover(bool hovering);
  // The payload was let go over this target at `pos` (own coordinates); true when taken.
  virtual bool receiveDrop(const DragPayload& payload, const XY<int>& pos) { return false; }

  // --- CanvasClient ---
  // Hands `e` to this Glob now, outside the tree's routing and without bubbling: the event
  // is addressed to this Glob and its react result returned (not consumed for a null event).
  EventHandlerRc handleEvent(Event* e) override;
  void resize(double width, double height) override;
  void handleBaseWindowMove() override;
  const char* idstring() const override { return "glob"; }
  Glob* asGlob() override { return this; }
  String contextString(const XY<int>& pos, CanvasClient* asker) override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  void handleMouseContainment(bool inside) override {}
  // Paints the bounding box of `area` (own coordinates; null for the whole Glob) into the
  // screen's image at once, with whatever lies above it. Without an image, while frozen or
  // while redraws are held back, the area is repainted with the next frame instead.
  void drawUnbuffered(Kw::Ptr<iRegion> area) override;
  bool isOpaqueAt(const XY<int>& pos) override;

  // --- Drawable ---
  void update() override;
  void update(const Kw::Box<int>& localArea);
  void draw() override {}
  bool canDraw() override;

  // --- Non-virtual helpers ---
  Canvas* canvas() const { return &canvas_; }
  // Position of the canvas's bottom-left corner in the root.
  double get_x() const;
  double get_y() const;
  void set_name(const String& name);
  bool isActive() const { return active_; }
  bool isVisible() const { return canvas_.isMapped(); }
  const Palette& getPalette() const { return palette_; }
  int interest() const { return interest_; }
  void ensure_canvas_is_mapped() { map_canvas(); }
  std::vector<Glob*> children() const;
  // The screen this Glob is on, or null while it is unattached.
  RootGlob* root() const;
  // Whether this Glob holds the keyboard focus of its own screen.
  bool hasKbdFocus() const;
  // The help text shown by tooltips; the base contextString returns it.
  void setContextString(const String& text);
  // The cursor the base contextCursor returns.
  void setDefaultCursor(MouseCursorID id);
  MouseCursorID defaultCursor() const { return static_cast<MouseCursorID>(cursor_); }
  int get_resizeable() const { return resizeable_; }
  bool becomesItIfMoved() const { return becomesItIfMoved_; }
  bool isIt() const;
  bool isDropHovered() const { return dropHover_; }
  // Frozen itself (not counting its parents).
  bool isFrozen() const { return extras_ && extras_->freezeCount > 0; }
  size_state getSizeState() const { return extras_ ? extras_->sizeState : SizeFull; }
  void setMinimumSize(XY<int> size);
  // The id path from the screen down: the ids of the Globs above and this one, joined by '/'.
  String idPath() const;
  // The resize handle under `pos` (own coordinates) of a resizeable Glob.
  GlobResizeEdge resizeEdgeAt(const XY<int>& pos) const;

  // Queues `msg` for `target`; it is delivered by the loop, in order, if the target still
  // exists then.
  void send_msg(Glob* target, const char* msg);

  // The runtime clock in milliseconds.
  static int clock();

  // A number no other Glob of this run has, for telling a live Glob from a new one that
  // happens to reuse a deleted one's address.
  uint64_t serial() const { return serial_; }

 protected:
  // The screen's own Glob: its canvas is a root canvas reporting to `host`.
  Glob(CanvasHost* host, int width, int height);

  // Deletes every child Glob, youngest first; children that are not Globs are left unattached.
  void deleteChildren();

  // The Glob owning a canvas, or null when the canvas belongs to something else.
  static Glob* globOf(const Canvas* c);

 private:
  // Holds back and then pays the layout of a quickdraw Glob during a user resize.
  friend class GlobMoveSession;

  // What few Globs set: made on the first setting that differs from the default.
  struct Extras {
    String name;
    String contextText;
    int freezeCount = 0;
    size_state sizeState = SizeFull;
    unsigned short oldWidth = 0, oldHeight = 0;
    bool hasOldSize = false;
    XY<int> minSize{8, 8};
    // Root area whose repaint a frozen Glob owes for moves and resizes inside it.
    Kw::Box<int> owedArea;
  };
  Extras& extras();
  // The frozen Glob that holds this one's repaints and layouts back (itself or an ancestor),
  // or null.
  Glob* frozenHolder() const;
  // Gives the canvas a new rectangle in its parent; while frozen, the old and new places are
  // owed to the frozen holder instead of repainted now.
  void placeCanvas(const Kw::Box<int>& rectInParent);
  // Whether a child takes part in its parent's dump and load.
  bool joinsParentLayout() const { return dumpable_ && !dumpIfNotSubglob_; }

  // The canvas lives inside its Glob: one allocation per Glob, not two. Mutable because a
  // Glob's constness does not reach its canvas.
  mutable Canvas canvas_;
  uint64_t serial_ = 0;
  Palette palette_;
  std::unique_ptr<Extras> extras_;
  int interest_ = 0;
  // Flags in one word: a Glob pays nothing for the ones it never sets.
  bool active_ : 1 = true;
  bool canBeIt_ : 1 = true;
  bool movable_ : 1 = false;
  bool reparent_ : 1 = false;
  bool resizeable_ : 1 = false;
  bool dumpable_ : 1 = true;
  bool dumpIfNotSubglob_ : 1 = false;
  bool quickdraw_ : 1 = false;
  bool dirty_ : 1 = false;
  bool becomesItIfMoved_ : 1 = false;
  bool redrawOwed_ : 1 = false;  // an update arrived while frozen
  bool layoutOwed_ : 1 = false;  // a change of size arrived while frozen
  bool dropHover_ : 1 = false;
  bool layoutHeld_ : 1 = false;    // a user resize of a quickdraw Glob is going on
  uint8_t cursor_ = kCursorArrow;  // a MouseCursorID; every one fits a byte
};

// --- Liveness ---
// True when `p` points at a Glob that has not been deleted.
bool is_good_glob_ptr(const void* p);
bool glob_serial_is_alive(const Glob* g, uint64_t serial);

// --- Delivery ---
// Sends `e` to its destination (e->dest, or the Glob of e->canvas). Synchronous when `queued`
// is false: returns the react result, after bubbling for unconsumed input. Queued events are
// copied and delivered by the loop in order; the call then returns 0.
int event_send(Event* e, bool queued);

// --- Messages ---
// A message event from `from` to `to` carrying `text` and the modifier word.
Event make_message_event(Glob* from, Glob* to, const String& text, uint32_t modifiers = 0);
// Sends that event synchronously; returns the receiver's react result (0 when `to` is gone).
// The receiver may delete `from`.
int send_message_event(Glob* from, Glob* to, const String& text, uint32_t modifiers = 0);

// --- Focus ---
// The keyboard focus of the screen that `g` is on; null when g is unattached or gone.
Glob* get_kbd_focus(const Glob* g);

// --- Geometry queries ---
bool canvas_is_mapped_to_root(const Canvas* c);
// The canvas under the pointer on the screen that `g` is on, or null.
Canvas* glib_getCurrentMouseCanvas(const Glob* g);
// The Glob nearest to `g` other than `g` itself and `exclude`: the deepest Glob of the screen
// whose canvas contains g's centre. Null when there is none.
Glob* find_nearest_glob(Glob* g, Glob* exclude);
// Negative when b's canvas contains a's centre (minus the distance to b's nearest edge),
// otherwise the distance from a's centre to b's canvas. Large when either is unusable.
double glob_pseudo_distance(Glob* a, Glob* b);
