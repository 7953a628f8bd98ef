#pragma once
// The GUI object: a node of the tree that owns one canvas, draws on it when asked, reacts to
// the events routed to it, and talks to other Globs by string messages.
#include <cstdint>
#include <memory>
#include <vector>

#include "platform/glob/Canvas.h"
#include "platform/glob/CanvasClient.h"
#include "platform/glob/Drawable.h"
#include "platform/glob/Event.h"
#include "platform/glob/GlobCreationInfo.h"
#include "platform/glob/Palette.h"

class CanvasHost;
class RootGlob;

// Creation flags.
constexpr int kGlobCreateUnmapped = 0x1;  // the canvas starts hidden

class Glob : public CanvasClient, public Drawable {
 public:
  explicit Glob(const GlobCreationInfo& info);
  Glob(unsigned short width, unsigned short height, int flag, Canvas* parent);
  ~Glob() override;
  Glob(const Glob&) = delete;
  Glob& operator=(const Glob&) = delete;

  // --- Tree ---
  virtual Glob* parent() const;
  virtual unsigned short height() const;
  virtual unsigned short width() const;
  // All input, ticks and messages. Returns 1 when the event was consumed. The base consumes
  // nothing; unconsumed mouse and key events bubble to the parent.
  virtual int react(Event* e);
  // Called after the canvas changed size.
  virtual void reshape() {}
  virtual void set_interest(int mask);
  virtual void clear_interest(int mask);
  virtual void pop_to_top();
  virtual void push_to_bottom();
  virtual void map_canvas();
  virtual void unmap_canvas();
  // Moves and resizes the canvas: bottom-left corner (x, y) in the parent, y upward.
  virtual void reshape_canvas(int x, int y, int width, int height);
  virtual void translate_canvas(int dx, int dy);
  virtual int child_count() const;
  virtual void set_kbd_focus();
  // Delivers `msg` to `target` now and returns its react result; -1 when the target is gone
  // or the nesting of synchronous messages is too deep.
  virtual int call_msg(Glob* target, const char* msg);
  // Called when this Glob gains or loses the keyboard focus; hasKbdFocus() tells which.
  virtual void handle_kbd_focus() {}
  virtual String get_id() const;
  virtual String get_name() const { return extras_ ? extras_->name : String(); }
  virtual void setActive(bool active, bool redraw);
  virtual void setVisible(bool visible);
  virtual void setPalette(const Palette& palette);
  virtual void setCol(const Colour& colour, bool redraw);
  // Leaves the parent: the Glob becomes unattached and is no longer deleted with it.
  virtual void detachFromParent();
  virtual bool m_is_type(const char* type) const;
  virtual void set_can_be_it(int canBeIt) { canBeIt_ = canBeIt != 0; }
  virtual bool can_be_it() const { return canBeIt_; }
  // The label or value the Glob shows, for tools that list the tree (empty when none).
  virtual String describeValue() const { return String(); }

  // --- CanvasClient ---
  const char* idstring() const override { return "glob"; }
  Glob* asGlob() override { return this; }
  String contextString(const XY<int>& pos, CanvasClient* asker) override;
  MouseCursorID contextCursor(const XY<int>& pos) override;
  void handleMouseContainment(bool inside) override {}

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
  // What few Globs set: made on the first setting that differs from the default.
  struct Extras {
    String name;
    String contextText;
  };
  Extras& extras();

  // The canvas lives inside its Glob: one allocation per Glob, not two. Mutable because a
  // Glob's constness does not reach its canvas.
  mutable Canvas canvas_;
  uint64_t serial_ = 0;
  Palette palette_;
  std::unique_ptr<Extras> extras_;
  int interest_ = 0;
  bool active_ = true;
  bool canBeIt_ = true;
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
