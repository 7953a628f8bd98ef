#pragma once
// Drawing on a canvas during its draw(): `Glib::Painter p(*canvas());`. Coordinates are the
// canvas's own, origin at its bottom-left corner and y upward; a box (x0, y0, x1, y1) covers
// the pixels x0..x1-1 and y0..y1-1. Everything is clipped to the canvas and to the damage
// being repainted. A painter made outside a paint pass, or for a canvas that is not the one
// being drawn, is inert: it draws nothing.
#include <cairo.h>
#include <pixman.h>

#include <vector>

#include "platform/glib/TextAlignment.h"
#include "platform/glib/TextStyles.h"
#include "platform/glob/Colour.h"
#include "platform/kw/Box.h"
#include "platform/kw/String.h"

class Canvas;

namespace Glib {

class CairoPaintSession;
class iFont;
class Image;
class TextLayout;

enum class Bevel { Raised, Sunken };

class Painter {
 public:
  explicit Painter(Canvas& canvas);
  ~Painter();
  Painter(const Painter&) = delete;
  Painter& operator=(const Painter&) = delete;

  bool active() const { return session_ != nullptr; }
  int width() const { return width_; }
  int height() const { return height_; }
  Kw::Box<int> bounds() const { return Kw::Box<int>(0, 0, width_, height_); }

  // --- Shapes ---
  void fillRect(const Kw::Box<int>& box, const Colour& c);
  // A frame `thickness` pixels wide just inside `box`.
  void outlineRect(const Kw::Box<int>& box, const Colour& c, int thickness = 1);
  // A line through the centres of the pixels `from` and `to`, both included.
  void line(XY<int> from, XY<int> to, const Colour& c, int lineWidth = 1);
  void verticalGradient(const Kw::Box<int>& box, const Colour& bottom, const Colour& top);
  void horizontalGradient(const Kw::Box<int>& box, const Colour& left, const Colour& right);
  // A bevelled edge `bevelWidth` pixels wide inside `box`: light on the top and left and shadow
  // on the bottom and right when raised, the other way round when sunken. The outermost ring
  // has the full colours and inner rings fade into whatever the face is, so draw the face
  // first. The inside of the box is left untouched.
  void depthBox(const Kw::Box<int>& box, Bevel kind, int bevelWidth, const Colour& light,
                const Colour& shadow);
  // The same look with the face filled too: the rings are mixed with `face` rather than blended
  // over it, which costs much less than blending.
  void depthBox(const Kw::Box<int>& box, Bevel kind, int bevelWidth, const Colour& light,
                const Colour& shadow, const Colour& face);
  // The keyboard-focus mark: a one-pixel dotted frame just inside `box`.
  void focusRect(const Kw::Box<int>& box, const Colour& c);

  // --- Images ---
  // Draws the image with its bottom-left corner at `at`, blending its transparency.
  void image(const Image& img, XY<int> at, double opacity = 1.0);
  // Draws the image magnified by `factor` (smoothly filtered), its top-left corner at the
  // top-left corner of `box` and clipped to `box`, with the given opacity.
  void scaledImage(const Image& img, const Kw::Box<int>& box, double factor, double opacity);

  // --- Text ---
  // One line of text inside `box`: aligned horizontally, centred vertically, clipped to the
  // box. Text wider than the box starts at its left edge whatever the alignment, so its
  // beginning stays readable.
  void text(const WString& s, const Kw::Box<int>& box, const iFont& font, const Colour& c,
            TextAlignment align = TextAlignment::Centred,
            TextStyles::TextStyle style = TextStyles::Normal);
  // One line of text whose line box has its bottom-left corner at `origin` (the line box is
  // font.height() tall, the baseline font.descent() above its bottom).
  void textAt(const WString& s, XY<int> origin, const iFont& font, const Colour& c);

  // --- Symbols (see Symbols.h for the codes) ---
  bool symbol(int code, const Kw::Box<int>& box, const Colour& c);

  // --- Clipping ---
  // Narrows drawing to `box` until the matching popClip (or the painter's end).
  void pushClip(const Kw::Box<int>& box);
  void popClip();

  // The Cairo context, origin at the canvas's top-left corner, y downward, clipped like the
  // painter; null when inert. Set up on first use (plain fills and text never need it).
  cairo_t* cairo();
  // Converts a canvas y (upward, pixel edge) to Cairo's downward y.
  double cairoY(double y) const { return height_ - y; }

 private:
  struct ClipEntry {
    Kw::Box<int> box;  // the effective clip, canvas coordinates
    bool inCairo;      // pushed onto the Cairo context too
  };

  void setSource(const Colour& c);
  void rectPath(const Kw::Box<int>& box);
  // A canvas box in image pixels.
  pixman_box32_t device(const Kw::Box<int>& box) const;
  void fillBoxes(const pixman_box32_t* boxes, int n, const Colour& c);
  // The bevel rings; `face` null blends faded colours over the face already drawn.
  void bevelRings(const Kw::Box<int>& box, Bevel kind, int w, const Colour& light,
                  const Colour& shadow, const Colour* face);
  // Composites shaped text whose layout box has its top-left corner at (left, top), in the
  // canvas's top-down pixels.
  void compositeText(const TextLayout& layout, int left, int top, const Colour& c);
  void narrowTargetClip();

  CairoPaintSession* session_ = nullptr;
  cairo_t* cr_ = nullptr;
  int width_ = 0;
  int height_ = 0;
  std::vector<ClipEntry> clips_;
  pixman_region32_t narrowed_;
};

}  // namespace Glib
