#pragma once
// The headless test harness: a screen of a given size on a manual clock, with pointer and key
// injection in root coordinates (bottom-left origin, y upward), modifier state, time that
// fires ticks as it passes, queue pumping, and a record of which Globs drew.
#include <cstdint>
#include <memory>
#include <vector>

#include "platform/glob/RootGlob.h"

class RootRenderer;

enum class MouseButton { Left = 0x20, Right = 0x40, Middle = 0x10, Chord = 0x80 };

class Harness {
 public:
  explicit Harness(int width = 800, int height = 600);
  ~Harness();
  Harness(const Harness&) = delete;
  Harness& operator=(const Harness&) = delete;

  RootGlob& root() { return *root_; }
  Canvas* canvas() { return root_->canvas(); }
  // A creation record for a child of the screen at (x, y), y upward.
  GlobCreationInfo place(int x, int y, int width, int height) const;

  // --- Pointer ---
  void move(XY<int> p);
  void press(XY<int> p, MouseButton b = MouseButton::Left);
  void release(XY<int> p, MouseButton b = MouseButton::Left);
  void click(XY<int> p, MouseButton b = MouseButton::Left);
  // Press at `from`, move in `steps` equal steps to `to`, release there.
  void drag(XY<int> from, XY<int> to, int steps = 4, MouseButton b = MouseButton::Left);
  void wheel(XY<int> p, int steps);
  // The centre of a Glob in root coordinates.
  static XY<int> centreOf(const Glob& g);
  void clickOn(const Glob& g, MouseButton b = MouseButton::Left) { click(centreOf(g), b); }

  // --- Keyboard ---
  // Sets the modifier keys that the operating-system service reports (kKeyShift, ...).
  void setModifiers(unsigned mods);
  // Press and release of one key code; the modifiers held are added to the code.
  void key(unsigned code);
  void keyPress(unsigned code);
  void keyRelease(unsigned code);
  // One key per character of `text`.
  void type(const WString& text);

  // --- Time and delivery ---
  void advance(int ms) { root_->advanceClock(ms); }
  size_t pump() { return root_->pumpQueue(); }
  static int64_t now();

  // --- Painting ---
  // Runs a repaint pass and returns the Globs asked to draw, in order. Until render() is first
  // called the pass produces no pixels; from then on it paints into the harness's image.
  std::vector<Glob*> paint();
  // Repaints into a real image the size of the root (made on first use, when everything is
  // painted) and returns the Globs asked to draw, in order.
  std::vector<Glob*> render();
  // A pixel of the image as of the last render, at a root position (bottom-up), as
  // 0xAARRGGBB; 0 outside the root or before the first render.
  uint32_t pixelAt(int x, int y) const;
  // The image, made on first use.
  RootRenderer& renderer();
  // A colour as pixelAt reports it when painted opaquely.
  static uint32_t argb(const Colour& c);
  bool drew(const Glob* g) const;
  const std::vector<Glob*>& lastDrawn() const { return drawn_; }

 private:
  unsigned withModifiers(unsigned code) const;

  std::unique_ptr<RootGlob> root_;
  std::unique_ptr<RootRenderer> renderer_;
  std::vector<Glob*> drawn_;
  unsigned modifiers_ = 0;
};
